#include "pricing/terceiro_taxas.h"

#include "db/query_helpers.h"
#include "pricing/arredonda.h"
#include "pricing/leitura.h"

namespace brasel::pricing {

std::optional<double> DescontoPP_Percentagem_cur(app::Estado& estado, const QString& TipoTerceiro,
                                                 const QString& Codigo, Currency Valor,
                                                 const QString& TipoMov, db::Connection* conn) {
    if (Valor <= Currency()) return std::nullopt;
    const QString tabela = tabelaTerceiro(TipoTerceiro);
    if (tabela.isEmpty()) return std::nullopt;
    const bool cliente = tabela == u"Clientes";
    const QString efeito =
        db::Select_Campo_str(estado, QStringLiteral("TabTipoMov"),
                             cliente ? QStringLiteral("AfectaCli") : QStringLiteral("AfectaFor"),
                             QStringLiteral("codigo"), TipoMov, {}, conn);
    if (efeito.trimmed().toUpper() != (cliente ? u"D+" : u"C+")) return std::nullopt;
    const auto linha = db::primeiraLinha(
        estado.ligacao(conn),
        QStringLiteral("select DescontoPP from %1 where codigo=?").arg(tabela), {Codigo});
    if (!linha) return std::nullopt;
    return percentagem(linha->value(0));
}

Currency TaxaAgravamento_cur(app::Estado& estado, const QString& Cliente, Currency Valor,
                             db::Connection* conn) {
    const auto linha = db::primeiraLinha(
        estado.ligacao(conn),
        QStringLiteral("select COALESCE(TaxaAgravamento,0) from Clientes where Codigo=?"),
        {Cliente});
    const double taxa = linha ? percentagem(linha->value(0)) : 0.0;
    try {
        const Currency agravado = taxa != 0.0 ? Valor.withPercent(taxa) : Valor;
        return ArredondaValor(agravado, estado.param.casadecpreco, ArredondaProximo);
    } catch (const CurrencyOverflow&) {
        return Valor;
    }
}

}  // namespace brasel::pricing
