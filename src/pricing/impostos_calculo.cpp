#include "pricing/impostos_calculo.h"

#include "pricing/leitura.h"

namespace brasel::pricing {

DefinicaoImposto DefinicaoImposto::deRegisto(const QSqlRecord& r) {
    DefinicaoImposto d;
    d.codigo = r.value(QStringLiteral("Codigo")).toString().trimmed();
    d.valorUnitario = Currency::fromVariant(r.value(QStringLiteral("ValorUnitario")));
    d.incidIliquido = ligado(r.value(QStringLiteral("Incid_Iliquido")));
    d.incidDesconto = ligado(r.value(QStringLiteral("Incid_Desconto")));
    for (std::size_t k = 0; k < d.factores.size(); ++k) {
        d.factores[k] = percentagem(r.value(QStringLiteral("Factor%1").arg(k + 1)));
    }
    d.sujeitoIva = ligado(r.value(QStringLiteral("ValorResulSujeitoIVA")));
    d.calculaPrecoZero = ligado(r.value(QStringLiteral("CalculaPrecoZero")));
    d.processa = r.value(QStringLiteral("Processa")).toString().trimmed().toUpper();
    d.actUpc = r.value(QStringLiteral("Act_UPC")).toString().trimmed().toUpper();
    for (std::size_t k = 0; k < d.convertePV.size(); ++k) {
        d.convertePV[k] = ligado(r.value(QStringLiteral("ConvertePV%1").arg(k + 1)));
    }
    return d;
}

std::optional<ImpostoLinha> CalculaUmImposto(const DefinicaoImposto& d,
                                             const DadosLinhaImposto& linha,
                                             RegraArredondamento regra) {
    if (linha.preco.isZero() && !d.calculaPrecoZero) return std::nullopt;
    ImpostoLinha r;
    r.codigoImposto = d.codigo;
    r.ivaTabela = linha.ivaTabela;
    r.processa = d.processa;
    r.actUpc = d.actUpc;
    Currency imposto;
    if (!d.valorUnitario.isZero()) {
        r.incidencia = linha.quantidade;
        imposto = linha.quantidade * d.valorUnitario;
    } else {
        if (d.incidIliquido) {
            r.incidencia = linha.valorIliq;
            if (d.incidDesconto) r.incidencia -= linha.totalDesconto;
        }
        bool algum = false;
        imposto = r.incidencia;
        for (double f : d.factores) {
            if (f == 0.0) continue;
            imposto = imposto.percentOf(f);
            algum = true;
        }
        if (!algum) imposto = Currency();
    }
    r.imposto = ArredondaValor(imposto, regra.decimais, regra.modo);
    if (d.sujeitoIva) {
        r.tabIva = linha.ivaTabela;
        r.taxaIva = linha.ivaTaxa;
        r.valorIva = ArredondaValor(r.imposto.percentOf(linha.ivaTaxa), regra.decimais, regra.modo);
    }
    return r;
}

Currency ImpostoUnitario(const DefinicaoImposto& d, Currency preco) {
    DefinicaoImposto semZero = d;
    semZero.calculaPrecoZero = true;
    const auto r = CalculaUmImposto(semZero, {Currency(1), preco, preco, Currency(), {}, 0.0},
                                    {4, ArredondaNenhum});
    return r ? r->imposto : Currency();
}

ColunasImpostos ColunasDaLinha(const std::vector<ImpostoLinha>& impostos) {
    ColunasImpostos c;
    for (const ImpostoLinha& i : impostos) {
        if (i.processa != u"S") continue;
        (i.tabIva.isEmpty() ? c.naoSujeitos : c.sujeitos) += i.imposto;
        c.iva += i.valorIva;
    }
    return c;
}

QStringList CodigosImpostos(const QString& lista) {
    QStringList codigos;
    for (const QString& parte : lista.split(u'§')) {
        if (!parte.trimmed().isEmpty()) codigos << parte.trimmed();
    }
    return codigos;
}

}  // namespace brasel::pricing
