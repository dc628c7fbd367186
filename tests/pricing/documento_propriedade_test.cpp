// Property: for random documents, under every rounding mode and number of decimals, the total of
// CalculosGerais is merchandise - discount + VAT (+ untaxed other taxes - withholding) of its own
// rounded parts, and each rounded figure stays within one rounding step of the exact decimal sum
// it rounds (half a step when rounding to nearest, none when not rounding), on the side its mode
// says. Prices reach past 2^53 ten-thousandths, where a double could not hold the sums.
#include "pricing/documento.h"
#include "pricing/linha.h"

#include <gtest/gtest.h>

#include <random>

namespace brasel::pricing {
namespace {

struct CodigoIva {
    const char* codigo;
    TaxaIva taxa;
};
const CodigoIva kCodigos[] = {
    {"N", {false, 23.0, 0.0}}, {"I", {false, 13.0, 0.0}}, {"R", {false, 6.0, 0.0}},
    {"X", {false, 0.0, 0.0}},  {"T", {true, 23.0, 0.0}},
};

class Gerador {
  public:
    explicit Gerador(unsigned semente) : g_(semente) {}
    std::int64_t entre(std::int64_t a, std::int64_t b) {
        return std::uniform_int_distribution<std::int64_t>(a, b)(g_);
    }
    bool chance(int emCem) { return entre(1, 100) <= emCem; }

    Currency preco() {
        if (chance(5))
            return Currency::fromRaw(entre(9'000'000'000'000'000, 9'100'000'000'000'000));
        return Currency::fromRaw(entre(1, 100'000'000));  // up to 10,000.0000
    }
    Currency quantidade() {
        if (chance(10)) return Currency::fromRaw(-entre(1, 50'000));  // a return
        return Currency::fromRaw(entre(1, 100'000));
    }
    double percentagem() {
        if (chance(50)) return 0.0;
        return static_cast<double>(entre(0, 5000)) / 100.0;  // 0.00 .. 50.00
    }

  private:
    std::mt19937_64 g_;
};

// One document of one to eight priced lines, at most four VAT codes.
ListaLinhas documento(Gerador& g, const ArredondamentosTerceiro& linhaArr, int casadec) {
    ListaLinhas lista;
    const auto primeiro = static_cast<std::size_t>(g.entre(0, 1));
    const int linhas = static_cast<int>(g.entre(1, 8));
    for (int i = 0; i < linhas; ++i) {
        const CodigoIva& c = kCodigos[primeiro + static_cast<std::size_t>(g.entre(0, 3))];
        const Currency preco = g.preco();
        const Currency quantidade = g.quantidade();
        const auto v = CalculaLinha(linhaArr, c.taxa, preco, quantidade, g.percentagem(),
                                    g.percentagem(), g.percentagem(), casadec);
        if (!v) continue;
        LinhaLista l;
        l.seleccionada = g.chance(85);
        l.quantidade = quantidade;
        l.preco = preco;
        l.ivaTabela = QString::fromLatin1(c.codigo);
        l.ivaTaxa = c.taxa.taxa;
        l.qtyPreco = v->bruto;
        l.valorDesconto = v->desconto;
        l.valorIva = v->iva;
        l.valorLinha = v->total;
        if (g.chance(20)) {
            l.outImpostosSujeitos = Currency::fromRaw(g.entre(0, 50'000));
            l.ivaOutImpostos = l.outImpostosSujeitos.percentOf(l.ivaTaxa);
            l.outImpostosNaoSujeitos = Currency::fromRaw(g.entre(0, 50'000));
        }
        if (g.chance(15)) {
            l.incidIRS = v->incidencia;
            l.valorIRS = ArredondaValor(v->incidencia.percentOf(25.0), 2, ArredondaProximo);
        }
        lista.linhas.push_back(l);
    }
    return lista;
}

// Checks one rounded figure against the exact sum it rounds.
void confere(const char* nome, Currency arredondado, __int128 exacto, int decimais, int modo) {
    std::int64_t passo = 1;
    for (int k = decimais; k < 4; ++k)
        passo *= 10;
    const __int128 r = arredondado.raw();
    const __int128 diferenca = r - exacto;
    SCOPED_TRACE(testing::Message() << nome << " dec " << decimais << " mode " << modo);
    if (modo != ArredondaNenhum) {
        ASSERT_EQ(r % passo, 0);
    }
    switch (modo) {
        case ArredondaNenhum:
            ASSERT_TRUE(diferenca == 0);
            break;
        case ArredondaProximo:
            ASSERT_TRUE(2 * diferenca > -passo && 2 * diferenca <= passo);
            break;
        case ArredondaExcesso:  // away from zero
            ASSERT_TRUE(diferenca > -passo && diferenca < passo);
            ASSERT_TRUE(exacto >= 0 ? r >= exacto : r <= exacto);
            break;
        default:  // toward zero
            ASSERT_TRUE(diferenca > -passo && diferenca < passo);
            ASSERT_TRUE(exacto >= 0 ? (r <= exacto && r >= 0) : (r >= exacto && r <= 0));
    }
}

TEST(CalculosGeraisPropriedade, TotalIsItsRoundedPartsAndStaysWithinAStep) {
    Gerador g(20240611);
    int documentos = 0;
    for (int modo : {ArredondaProximo, ArredondaTrunca, ArredondaExcesso, ArredondaNenhum}) {
        for (int decimais = 0; decimais <= 3; ++decimais) {
            DefinicoesDocumento d;
            d.arredondamentos = ArredondamentosTerceiro::todos(decimais, modo);
            d.casadec = 4;
            d.formulaIVA = 0;
            for (int n = 0; n < 150; ++n) {
                ListaLinhas lista = documento(g, d.arredondamentos, d.casadec);
                ASSERT_TRUE(CalculosGerais(lista, d));
                ++documentos;
                __int128 mercadoria = 0, desconto = 0, iva = 0, naoSujeitos = 0, irs = 0;
                __int128 somaSlots = 0, ivaSlots = 0;
                for (const LinhaLista& l : lista.linhas) {
                    if (!l.seleccionada) continue;
                    mercadoria += l.qtyPreco.raw() + l.outImpostosSujeitos.raw();
                    desconto += l.valorDesconto.raw();
                    iva += l.valorIva.raw() + l.ivaOutImpostos.raw();
                    naoSujeitos += l.outImpostosNaoSujeitos.raw();
                    irs += l.valorIRS.raw();
                }
                const TotaisDocumento& t = lista.totais;
                for (const SlotIva& s : t.slots) {
                    somaSlots += s.incidencia.raw() + s.desconto.raw();
                    ivaSlots += s.iva.raw();
                }
                confere("merchandise", t.mercadoria, mercadoria, decimais, modo);
                confere("discount", t.desconto, desconto, decimais, modo);
                confere("VAT", t.iva, iva, decimais, modo);
                const __int128 partes = static_cast<__int128>(t.mercadoria.raw()) -
                                        t.desconto.raw() + t.iva.raw() + naoSujeitos - irs;
                confere("total", t.total, partes, decimais, modo);
                ASSERT_EQ(t.total,
                          ArredondaValor(
                              t.mercadoria - t.desconto + t.iva +
                                  Currency::fromRaw(static_cast<std::int64_t>(naoSujeitos - irs)),
                              decimais, modo));
                if (modo == ArredondaNenhum) {
                    // Unrounded, the slots split the document exactly.
                    ASSERT_TRUE(somaSlots == mercadoria);
                    ASSERT_TRUE(ivaSlots == iva);
                }
            }
        }
    }
    EXPECT_EQ(documentos, 4 * 4 * 150);
}

}  // namespace
}  // namespace brasel::pricing
