#include "pricing/iva.h"

#include "db/query_helpers.h"
#include "pricing/arredonda.h"
#include "pricing/arredonda_terceiro.h"
#include "pricing/leitura.h"

namespace brasel::pricing {

Currency CalculaIva(const TaxaIva& codigo, Currency& valor) {
    if (codigo.incluido) valor = valor.withoutPercent(codigo.taxa);
    return valor.percentOf(codigo.taxa);
}

std::optional<TaxaIva> LerTaxaIva(app::Estado& estado, const QString& codigo,
                                  db::Connection* conn) {
    const auto linha = db::primeiraLinha(
        estado.ligacao(conn),
        QStringLiteral("select Incluido,Taxa,TaxaInerente from TabIva where codigo=?"), {codigo});
    if (!linha) return std::nullopt;
    return TaxaIva{ligado(linha->value(0)), percentagem(linha->value(1)),
                   percentagem(linha->value(2))};
}

Currency IVA_Calcular_IVA_cur(app::Estado& estado, const QString& CodigoIva, Currency& Valor,
                              db::Connection* conn) {
    const auto codigo = LerTaxaIva(estado, CodigoIva, conn);
    if (!codigo) return Currency();
    try {
        Currency base = Valor;
        const Currency iva = CalculaIva(*codigo, base);
        Valor = base;
        return iva;
    } catch (const CurrencyOverflow&) {
        return Currency();
    }
}

Currency Preco_Sem_IVA_cur(app::Estado& estado, const QString& Produto, Currency Preco,
                           const QString& CodigoIva, db::Connection* conn, int Decimais) {
    if (Decimais < 0) Decimais = estado.param.casadecpreco;
    try {
        const auto medicamento = db::primeiraLinha(
            estado.ligacao(conn),
            QStringLiteral("select IvaTaxaCompra from Produtos where Medic=? and codigo=?"),
            {QStringLiteral("1"), Produto});
        if (medicamento) return Preco.withoutPercent(percentagem(medicamento->value(0)));
        const auto codigo = LerTaxaIva(estado, CodigoIva, conn);
        if (!codigo || !codigo->incluido) return Preco;
        return ArredondaValor(Preco.withoutPercent(codigo->taxa), Decimais, ArredondaProximo);
    } catch (const CurrencyOverflow&) {
        return Preco;
    }
}

Currency IVA_IntraComunitario_cur(app::Estado& estado, const QString& CodigoIva, Currency Valor,
                                  const QString& TipoTerceiro, const QString& Codigo,
                                  db::Connection* conn) {
    const auto codigo = LerTaxaIva(estado, CodigoIva, conn);
    if (!codigo || codigo->taxaInerente == 0.0) return Currency();
    RegraArredondamento regra;
    if (TipoTerceiro.trimmed().compare(u"CX", Qt::CaseInsensitive) == 0) {
        const auto k = static_cast<std::size_t>(app::KindCaixa::ivageral);
        regra = {estado.param.caidec[k], estado.param.caiarre[k]};
    } else {
        regra = LerArredondamentos(estado, TipoTerceiro, Codigo, conn).regra(IvaSlot);
    }
    try {
        return ArredondaValor(Valor.percentOf(codigo->taxaInerente), regra.decimais, regra.modo);
    } catch (const CurrencyOverflow&) {
        return Currency();
    }
}

}  // namespace brasel::pricing
