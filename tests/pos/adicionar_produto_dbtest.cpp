// Adding a product to a tab: every refusal leaves no line, production or kitchen order behind;
// a stored line carries the right price, VAT and note; pending values apply once.
#include "pos/adicionar_produto.h"
#include "pos/tab_teste.h"
#include "pricing/insere_teste.h"
#include "support/impressao_qt.h"

#include <functional>

namespace brasel::pos {
namespace {

using pricing::teste::insere;
using pricing::teste::T;

class AdicionarProdutoTeste : public teste::TabTeste {
  public:
    void actualiza(const QString& sql, const QVariantList& valores = {}) {
        ASSERT_TRUE(estado().gConn.exec(sql, valores)) << estado().gConn.lastError().toStdString();
    }
    QVariant campo(qint64 numRegisto, const char* coluna) {
        auto r =
            estado().gConn.firstRow(QStringLiteral("select %1 from MovProduto where NumRegisto=?")
                                        .arg(QLatin1String(coluna)),
                                    {numRegisto});
        return r ? r->value(0) : QVariant();
    }
    // Stock of a product in the demo's warehouse, at a location.
    void existencia(const char* produto, const char* quantidade, const char* localizacao,
                    const char* lote = "") {
        insere(estado(), "MovProduto",
               {{"Codigo", T(produto)},
                {"AfectaStk", T("E+")},
                {"QuantNormal", T(quantidade)},
                {"Armazem", T("001")},
                {"Localizacao", T(localizacao)},
                {"Lote", T(lote)},
                {"CliFor", T("F")},
                {"Fechado", T("S")},
                {"Identifica", T(produto) + T(localizacao) + T(lote)}});
    }
    // Four VAT tables on the tab: the demo's three and one more.
    void quatroIvas() {
        insere(estado(), "TabIva", {{"codigo", T("Z4")}, {"Taxa", T("5")}, {"Incluido", 0}});
        insere(estado(), "TabIva", {{"codigo", T("Z5")}, {"Taxa", T("7")}, {"Incluido", 0}});
        actualiza(QStringLiteral("update Produtos set IvaTabVenda='Z4' where Codigo='P018'"));
        actualiza(QStringLiteral("update Produtos set IvaTabVenda='Z5' where Codigo='S009'"));
        for (const char* codigo : {"B001", "B015", "B003", "P018"})
            ASSERT_GT(AdicionarProduto(tab_, p_, QString::fromLatin1(codigo)), 0) << codigo;
    }
};

// Each step that can refuse, set up on its own; the refusal's message and nothing written.
struct Recusa {
    const char* caso;
    std::function<void(AdicionarProdutoTeste&, app::Estado&, teste::PerguntasGravadas&)> prepara;
    const char* produto;
    const char* mensagem;  // "" for a refusal that says nothing (the scale gave no weight)
};

const Recusa kRecusas[] = {
    {"produto inexistente", [](auto&, auto&, auto&) {}, "XPTO",
     "O Registo Não pode ser Movimentado!"},
    {"situação que não movimenta",
     [](auto& t, auto&, auto&) {
         t.actualiza(QStringLiteral("update Produtos set Situacao='I' where Codigo='B001'"));
     },
     "B001", "O Registo Não pode ser Movimentado!"},
    {"referência sem fornecedor",
     [](auto& t, auto& e, auto& p) {
         e.param.prontovestir = 1;
         t.actualiza(QStringLiteral("update Produtos set Referencia=1 where Codigo='B001'"));
         p.referenciaEscolhida = ReferenciaEscolhida{{QStringLiteral("V")}, QString()};
     },
     "B001", "Produto de Referências, mas sem o Fornecedor definido!"},
    {"sem existência",
     [](auto& t, auto&, auto&) {
         t.actualiza(QStringLiteral("update Produtos set ctrlexistencia=1 where Codigo='B001'"));
     },
     "B001", "Não pode Lançar.\r\nProduto sem Existência!"},
    {"localização que não existe", [](auto& t, auto&, auto&) { t.existencia("B001", "5", "XPT"); },
     "B001", "Localização Inexistente"},
    {"lote não escolhido",
     [](auto& t, auto&, auto&) {
         t.actualiza(QStringLiteral("update Produtos set Lote='1' where Codigo='P002'"));
     },
     "P002", "Não seleccionou qualquer Lote"},
    {"validade do lote antes do fabrico",
     [](auto& t, auto&, auto& p) {
         t.actualiza(QStringLiteral("update Produtos set Lote='S' where Codigo='P002'"));
         p.loteEscolhido = LoteEscolhido{QStringLiteral("L1"), QStringLiteral("2026-03-01"),
                                         QStringLiteral("2026-02-28")};
     },
     "P002", "A Data de Validade é anterior à Data de Fabrico!"},
    {"balança sem peso", [](auto&, auto&, auto&) {}, "P010", ""},
    {"produção por configurar",
     [](auto&, auto& e, auto&) {
         insere(e, "Nomenclatura",
                {{"ProdutoAcabado", T("P002")},
                 {"ProdutoPrima", T("B001")},
                 {"Quantidade", T("2")},
                 {"armazem", T("001")}});
     },
     "P002", "As Configurações para produção, estão Incompletas!"},
};

class RecusaAdicaoTeste : public AdicionarProdutoTeste,
                          public ::testing::WithParamInterface<Recusa> {};

TEST_P(RecusaAdicaoTeste, NaoDeixaLinhaProducaoNemPedido) {
    const Recusa& c = GetParam();
    c.prepara(*this, estado(), p_);
    const qint64 antes = linhasMovProduto();
    tab_.pendentes.obs = QStringLiteral("nota");
    EXPECT_EQ(AdicionarProduto(tab_, p_, QString::fromLatin1(c.produto)), 0);
    EXPECT_EQ(linhasMovProduto(), antes);
    EXPECT_EQ(pedidosCozinha(), 0);
    EXPECT_EQ(ligacoes(), 0);
    EXPECT_TRUE(tab_.lista().linhas.empty());
    if (*c.mensagem) {
        EXPECT_TRUE(m_.contem(QString::fromUtf8(c.mensagem)))
            << m_.textos().join(u'|').toStdString();
    } else {
        EXPECT_TRUE(m_.textos().isEmpty()) << m_.textos().join(u'|').toStdString();
    }
    // The pending note waits for the next product.
    EXPECT_EQ(tab_.pendentes.obs, QStringLiteral("nota"));
}

INSTANTIATE_TEST_SUITE_P(Passos, RecusaAdicaoTeste, ::testing::ValuesIn(kRecusas),
                         [](const ::testing::TestParamInfo<Recusa>& i) {
                             return std::string("caso") + std::to_string(i.index);
                         });

TEST_F(AdicionarProdutoTeste, QuintoIvaRecusadoOsQuatroAceites) {
    quatroIvas();
    EXPECT_EQ(tab_.lista().linhas.size(), 4u);
    const qint64 antes = linhasMovProduto();
    EXPECT_EQ(AdicionarProduto(tab_, p_, QStringLiteral("S009")), 0);
    EXPECT_TRUE(
        m_.contem(QStringLiteral("Já ultrapassou os Quatro IVAS possiveis neste Documento.")));
    EXPECT_EQ(linhasMovProduto(), antes);
    // A fifth line of one of the four tables still goes in.
    EXPECT_GT(AdicionarProduto(tab_, p_, QStringLiteral("B002")), 0);
}

TEST_F(AdicionarProdutoTeste, LinhaGuardaLocalizacaoLoteComDatasEReferencia) {
    existencia("P002", "3", "BAR", "L1");
    existencia("P002", "6", "COZ", "L1");
    estado().param.prontovestir = 1;
    actualiza(QStringLiteral("update Produtos set Lote='1', Referencia=1 where Codigo='P002'"));
    p_.loteEscolhido = LoteEscolhido{QStringLiteral("L1"), QStringLiteral("2026-01-31"),
                                     QStringLiteral("2026-12-31")};
    ReferenciaEscolhida ref;
    ref.atributos = {QStringLiteral("V"),   QStringLiteral("M"),  QStringLiteral("REF'1"),
                     QStringLiteral("MOD"), QStringLiteral("AZ"), QStringLiteral("42"),
                     QStringLiteral("L")};
    ref.fornecedor = QStringLiteral("F01");
    p_.referenciaEscolhida = ref;
    const qint64 n = AdicionarProduto(tab_, p_, QStringLiteral("P002"));
    ASSERT_GT(n, 0) << m_.textos().join(u'|').toStdString();
    const std::pair<const char*, const char*> esperados[] = {
        {"Localizacao", "COZ"},
        {"Lote", "L1"},
        {"DataFabrico", "2026-01-31"},
        {"DataValidade", "2026-12-31"},
        {"Estacao", "V"},
        {"Sexo", "M"},
        {"Referencia", "REF'1"},
        {"Modelo", "MOD"},
        {"Cor", "AZ"},
        {"Tamanho", "42"},
        {"Comprimento", "L"},
        {"Fornece", "F01"},
    };
    for (const auto& [coluna, valor] : esperados)
        EXPECT_EQ(campo(n, coluna).toString(), QString::fromLatin1(valor)) << coluna;
    // The lot form was told what the tab held of the product before.
    EXPECT_TRUE(p_.perguntas.contains(QStringLiteral("lote 0")));
}

TEST_F(AdicionarProdutoTeste, ControloDeExistenciaNaLocalizacaoDoProduto) {
    actualiza(QStringLiteral("update Produtos set ctrlexistencia=1 where Codigo='B001'"));
    existencia("B001", "2", "BAR");
    for (int i = 0; i < 2; ++i) {
        const qint64 n = AdicionarProduto(tab_, p_, QStringLiteral("B001"));
        ASSERT_GT(n, 0) << m_.textos().join(u'|').toStdString();
        EXPECT_EQ(campo(n, "Localizacao").toString(), QStringLiteral("BAR"));
    }
    // The bar's stock is sold: nothing is left anywhere in the warehouse.
    EXPECT_EQ(AdicionarProduto(tab_, p_, QStringLiteral("B001")), 0);
    EXPECT_TRUE(m_.contem(QStringLiteral("Não pode Lançar.\r\nProduto sem Existência!")));
}

TEST_F(AdicionarProdutoTeste, LinhaComIvaIncluidoFicaComOPrecoSemIvaEOTotalDoPreco) {
    const qint64 n = AdicionarProduto(tab_, p_, QStringLiteral("B003"));  // 1.80, 23 % included
    ASSERT_GT(n, 0);
    // 1.80 / 1.23 to the three price decimals; the gross value to the customer's two.
    EXPECT_EQ(Currency::fromVariant(campo(n, "Preco")), *Currency::parse(u"1.463"));
    EXPECT_EQ(Currency::fromVariant(campo(n, "ValorIliq")), *Currency::parse(u"1.46"));
    EXPECT_EQ(Currency::fromVariant(campo(n, "PrecoAplicado")), *Currency::parse(u"1.80"));
    EXPECT_EQ(Currency::fromVariant(campo(n, "ValorIva")), *Currency::parse(u"0.34"));
    EXPECT_EQ(campo(n, "Utilizador").toString(), QStringLiteral("SUPERVISOR"));
    EXPECT_EQ(campo(n, "Fechado").toString(), QStringLiteral("N"));
    EXPECT_EQ(campo(n, "Numero").toString(), QString());
    EXPECT_EQ(campo(n, "SelecFecha").toInt(), 1);
    ASSERT_EQ(tab_.lista().linhas.size(), 1u);
    EXPECT_EQ(tab_.lista().totais.total, *Currency::parse(u"1.80"));
    // A drink goes to the bar, not into the kitchen queue.
    EXPECT_EQ(pedidosCozinha(), 0);
}

TEST_F(AdicionarProdutoTeste, PratoEntraNaFilaDaCozinhaComANota) {
    tab_.pendentes.obs = QStringLiteral("sem coentros, 'bem' quente");
    tab_.pendentes.quantidade = Currency(2);
    const qint64 n = AdicionarProduto(tab_, p_, QStringLiteral("P002"));
    ASSERT_GT(n, 0);
    auto r = estado().gConn.firstRow(QStringLiteral(
        "select Produto,Quantidade,Cliente,ObsLinha,PodeImprimir,ANULACAO from HistoricoCopa"));
    ASSERT_TRUE(r);
    EXPECT_EQ(r->value(0).toString(), QStringLiteral("P002"));
    EXPECT_EQ(Currency::fromVariant(r->value(1)), Currency(2));
    EXPECT_EQ(r->value(2).toString(), QStringLiteral("M01"));
    EXPECT_EQ(r->value(3).toString(), QStringLiteral("sem coentros, 'bem' quente"));
    EXPECT_EQ(r->value(4).toInt(), 0);
    EXPECT_EQ(r->value(5).toString(), QStringLiteral("N"));
    EXPECT_EQ(campo(n, "ObsLinha").toString(), QStringLiteral("sem coentros, 'bem' quente"));
    // The pending values served this product only.
    EXPECT_TRUE(tab_.pendentes.obs.isEmpty());
    EXPECT_TRUE(tab_.pendentes.quantidade.isZero());
}

TEST_F(AdicionarProdutoTeste, PrecoPendente) {
    struct Caso {
        const char* caso;
        const char* preco;
        bool definido;
        const char* esperado;  // the line's price without VAT (café: 13 % not included)
    };
    const Caso casos[] = {{"zero com a marca substitui", "0", true, "0"},
                          {"zero sem a marca não conta", "0", false, "0.80"},
                          {"positivo substitui", "0.50", false, "0.50"}};
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.caso);
        tab_.pendentes.preco = *Currency::parse(QString::fromLatin1(c.preco));
        tab_.pendentes.precoDefinido = c.definido;
        const qint64 n = AdicionarProduto(tab_, p_, QStringLiteral("B015"));
        ASSERT_GT(n, 0);
        EXPECT_EQ(Currency::fromVariant(campo(n, "Preco")),
                  *Currency::parse(QString::fromLatin1(c.esperado)));
        EXPECT_FALSE(tab_.pendentes.precoDefinido);
    }
}

TEST_F(AdicionarProdutoTeste, FormularioDoCodigoEBalancaDaoPrecoEQuantidade) {
    insere(estado(), "ProdutosCodigosBarras",
           {{"CodigoBarras", T("560123")},
            {"ProdutoBase", T("B015")},
            {"Interactividade", 1},
            {"ActivaPreco", 1},
            {"PrecoVenda", 1}});
    p_.precoQuant.preco = *Currency::parse(u"0.60");
    p_.precoQuant.quantidade = Currency{};  // 0 becomes one unit
    const qint64 n = AdicionarProduto(tab_, p_, QStringLiteral("B015"), QStringLiteral("560123"));
    ASSERT_GT(n, 0);
    EXPECT_TRUE(p_.perguntas.contains(QStringLiteral("precoQuant 560123")));
    EXPECT_EQ(Currency::fromVariant(campo(n, "Preco")), *Currency::parse(u"0.60"));
    EXPECT_EQ(Currency::fromVariant(campo(n, "QuantNormal")), Currency(1));

    // Fish by the kilo at 45.000 (13 % on top): the scale is asked at the price with VAT.
    p_.precoQuant = {};
    p_.peso = *Currency::parse(u"1.25");
    const qint64 peixe = AdicionarProduto(tab_, p_, QStringLiteral("P010"));
    ASSERT_GT(peixe, 0);
    EXPECT_TRUE(p_.perguntas.contains(QStringLiteral("pesa 50.85")));
    EXPECT_EQ(Currency::fromVariant(campo(peixe, "QuantNormal")), *Currency::parse(u"1.25"));
}

TEST_F(AdicionarProdutoTeste, MesaComPlicaNoCodigoGuardadaTalComo) {
    insere(estado(), "Clientes",
           {{"Codigo", T("M'9")}, {"Descricao", T("Mesa d'Ouro")}, {"PrecoStock", 1}});
    ASSERT_TRUE(AbrirMesa(tab_, QStringLiteral("M'9")));
    const qint64 n = AdicionarProduto(tab_, p_, QStringLiteral("B015"));
    ASSERT_GT(n, 0);
    EXPECT_EQ(campo(n, "Terceiro").toString(), QStringLiteral("M'9"));
    EXPECT_EQ(tab_.lista().linhas.size(), 1u);
    EXPECT_EQ(tab_.mesa().descricao, QStringLiteral("Mesa d'Ouro"));
}

TEST_F(AdicionarProdutoTeste, PressaoIgnoradaSemMesaOuEnquantoOcupado) {
    tab_.ocupado = true;
    EXPECT_EQ(PremirProduto(tab_, p_, QStringLiteral("B015")), 0);
    tab_.ocupado = false;
    AbrirMesa(tab_, QStringLiteral("NAOHA"));
    EXPECT_EQ(PremirProduto(tab_, p_, QStringLiteral("B015")), 0);
    EXPECT_EQ(linhasMovProduto(), 0);
    AbrirMesa(tab_, QStringLiteral("M01"));
    tab_.pendentes.produto = QStringLiteral("B001");
    const qint64 n = PremirProduto(tab_, p_, QStringLiteral("B015"));
    ASSERT_GT(n, 0);
    EXPECT_EQ(campo(n, "Codigo").toString(), QStringLiteral("B001"));
    EXPECT_FALSE(tab_.ocupado);
}

}  // namespace
}  // namespace brasel::pos
