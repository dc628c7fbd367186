#include "pricing/documento.h"

#include "pricing/desconto.h"

#include <algorithm>

namespace brasel::pricing {

namespace {

Currency valorAposDescontosLinha(const LinhaLista& l, bool precoAplicado, Currency& descontos) {
    const Currency bruto = (precoAplicado ? l.precoAplicado : l.preco) * l.quantidade;
    descontos = DescontoCascata(bruto, l.desc1, l.desc2, l.desc3);
    return bruto - descontos;
}

// The slot of a code, taking the first free one; nullptr when all four hold other codes.
SlotIva* slotDe(std::array<SlotIva, 4>& slots, const QString& codigo) {
    for (SlotIva& s : slots) {
        if (s.tabIva == codigo) return &s;
    }
    for (SlotIva& s : slots) {
        if (s.vazio()) {
            s.tabIva = codigo;
            return &s;
        }
    }
    return nullptr;
}

double taxaArredondada(double taxa) {
    return ArredondaValor(CCur(taxa), 2, ArredondaProximo).toDouble();
}

}  // namespace

bool PodeJuntarIva(const TotaisDocumento& totais, const QString& codigo) {
    return std::any_of(totais.slots.begin(), totais.slots.end(),
                       [&](const SlotIva& s) { return s.vazio() || s.tabIva == codigo; });
}

bool CalcularDescontos(ListaLinhas& lista, Currency ValorDesconto, double PercDesconto,
                       const DefinicoesDocumento& definicoes) {
    try {
        // The total the typed amount refers to: the selected lines with their own discounts and
        // VAT, before any document discount (a second discount typed over a first one shares
        // the new amount, not the new amount over the already reduced total).
        Currency total;
        for (const LinhaLista& l : lista.linhas) {
            if (!l.seleccionada) continue;
            Currency descontos;
            const Currency valor = valorAposDescontosLinha(l, definicoes.precoAplicado, descontos);
            total += valor + valor.percentOf(l.ivaTaxa);
        }
        std::vector<LinhaLista> linhas = lista.linhas;
        for (LinhaLista& l : linhas) {
            if (!l.seleccionada) continue;
            Currency descontos;
            Currency valor = valorAposDescontosLinha(l, definicoes.precoAplicado, descontos);
            Currency geral;
            if (PercDesconto > 0.0) {
                geral = valor.percentOf(PercDesconto);
            } else if (!total.isZero()) {
                geral = Currency::mulDiv(ValorDesconto, valor, total);
            }
            valor -= geral;
            const Currency iva = valor.percentOf(l.ivaTaxa);
            l.incidIRS = valor;
            l.valorIRS = ArredondaValor(valor.percentOf(l.taxaIRS), 2, ArredondaProximo);
            l.valorDesconto = descontos + geral;
            l.valDescGeral = geral;
            l.valorIva = iva;
            l.valorLinha = valor + iva;
        }
        lista.linhas = std::move(linhas);
        return true;
    } catch (const CurrencyOverflow&) {
        return false;
    }
}

bool CalculosGerais(ListaLinhas& lista, const DefinicoesDocumento& definicoes,
                    const CalculoDescontoFinanceiro& descontoFinanceiro) {
    TotaisDocumento& t = lista.totais;
    t = TotaisDocumento{};
    try {
        TotaisDocumento novos;
        const ArredondamentosTerceiro& arr = definicoes.arredondamentos;
        const int casadec = definicoes.casadec;
        for (const LinhaLista& l : lista.linhas) {
            if (!l.seleccionada) continue;
            novos.mercadoria += l.qtyPreco + l.outImpostosSujeitos;
            novos.desconto += l.valorDesconto;
            novos.iva += l.valorIva + l.ivaOutImpostos;
            novos.naoSujeitos += l.outImpostosNaoSujeitos;
            novos.incidIRS += l.incidIRS;
            novos.valorIRS += l.valorIRS;
        }
        novos.mercadoria = Arredonda(arr, MercadoriaGeral, novos.mercadoria, casadec);
        novos.desconto = Arredonda(arr, DescontoGeral, novos.desconto, casadec);
        novos.iva = Arredonda(arr, IvaGeral, novos.iva, casadec);
        novos.total = Arredonda(
            arr, TotalGeral,
            novos.mercadoria - novos.desconto + novos.iva + novos.naoSujeitos - novos.valorIRS,
            casadec);

        for (const LinhaLista& l : lista.linhas) {
            if (!l.seleccionada || l.ivaTabela.isEmpty()) continue;
            SlotIva* s = slotDe(novos.slots, l.ivaTabela);
            if (s == nullptr) return false;
            s->taxa = l.ivaTaxa;
            s->incidencia += l.qtyPreco + l.outImpostosSujeitos - l.valorDesconto;
            s->desconto += l.valorDesconto;
            if (definicoes.formulaIVA != 1) s->iva += l.valorIva + l.ivaOutImpostos;
        }
        for (SlotIva& s : novos.slots) {
            if (s.vazio()) continue;
            if (definicoes.formulaIVA == 1) s.iva = s.incidencia.percentOf(s.taxa);
            s.taxa = taxaArredondada(s.taxa);
            s.incidencia = Arredonda(arr, ValorSlot, s.incidencia, casadec);
            s.iva = Arredonda(arr, IvaSlot, s.iva, casadec);
            s.desconto = Arredonda(arr, DescontoSlot, s.desconto, casadec);
        }

        if (descontoFinanceiro) {
            const auto financeiro = descontoFinanceiro(novos.mercadoria - novos.desconto);
            if (financeiro) {
                novos.descontoFinanceiroPerc = financeiro->percentagem;
                novos.descontoFinanceiro = financeiro->valor;
                if (financeiro->valor > Currency()) novos.total -= financeiro->valor;
            }
        }
        t = novos;
        return true;
    } catch (const CurrencyOverflow&) {
        return false;
    }
}

std::optional<CabecalhoVenda> CabecalhoDocumento(const ListaLinhas& lista,
                                                 const DefinicoesDocumento& definicoes) {
    try {
        const TotaisDocumento& t = lista.totais;
        const ArredondamentosTerceiro& arr = definicoes.arredondamentos;
        const int casadec = definicoes.casadec;
        CabecalhoVenda c;
        for (std::size_t n = 0; n < t.slots.size(); ++n) {
            const SlotIva& s = t.slots[n];
            if (s.vazio()) continue;
            c.tabiva[n] = s.tabIva;
            c.taxiva[n] = s.taxa;
            c.valor[n] = Arredonda(arr, ValorSlot, s.incidencia + s.desconto, casadec);
            c.desconto[n] = Arredonda(arr, DescontoSlot, s.desconto, casadec);
            c.valiva[n] = Arredonda(arr, IvaSlot, s.iva, casadec);
        }
        c.valorTotal = Arredonda(arr, MercadoriaGeral, t.mercadoria, casadec);
        c.descontoTotal = Arredonda(arr, DescontoGeral, t.desconto, casadec);
        c.iva = Arredonda(arr, IvaGeral, t.iva, casadec);
        c.totaldoc = Arredonda(arr, TotalGeral, t.total, casadec);
        for (const LinhaLista& l : lista.linhas) {
            if (l.seleccionada) c.descfinval += l.valDescGeral;
        }
        c.incidIRS = t.incidIRS;
        c.valorIRS = t.valorIRS;
        c.descontoFinanceiroPerc = t.descontoFinanceiroPerc;
        c.descontoFinanceiro = t.descontoFinanceiro;
        return c;
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
}

}  // namespace brasel::pricing
