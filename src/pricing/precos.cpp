#include "pricing/precos.h"

#include "db/query_helpers.h"
#include "pricing/configuracao_utilizador.h"
#include "pricing/leitura.h"
#include "pricing/terceiro_taxas.h"

namespace brasel::pricing {

namespace {

// PrecoVenda1..7 of a product; 0 for a tier outside 1..7 or a product without a row.
Currency precoVenda(app::Estado& estado, const QString& produto, int escalao,
                    db::Connection* conn) {
    if (escalao < 1 || escalao > 7) return Currency();
    const auto linha = db::primeiraLinha(
        estado.ligacao(conn),
        QStringLiteral("select PrecoVenda%1 from Produtos where Codigo=?").arg(escalao), {produto});
    return linha ? Currency::fromVariant(linha->value(0)) : Currency();
}

QString textoEscalao(int escalao) {
    return escalao >= 1 && escalao <= 7 ? QString::number(escalao) : QString();
}

}  // namespace

Currency GET_PrecosProdutos_cur(app::Estado& estado, const QString& TipoTerceiro,
                                const QString& Terceiro, const QString& Produto, int& Escalao,
                                db::Connection* conn) {
    const QString tipo = TipoTerceiro.trimmed().toUpper();
    if (tipo == u"F") {
        Escalao = 0;
        const auto linha = db::primeiraLinha(
            estado.ligacao(conn),
            QStringLiteral("select UltPrecoCompra from Produtos where Codigo=?"), {Produto});
        return linha ? Currency::fromVariant(linha->value(0)) : Currency();
    }
    if (tipo != u"C") {
        Escalao = 0;
        return Currency();
    }
    const auto util = LerConfigUtilizador(estado, conn);
    const QString precario = util ? util->precario : QString();
    Escalao = 0;
    if (precario == u"P") {
        Escalao = util->pvp;
    } else if (precario == u"C") {
        Escalao = Terceiro.trimmed().isEmpty()
                      ? 1
                      : db::Select_Campo_str(estado, QStringLiteral("Clientes"),
                                             QStringLiteral("PrecoStock"), QStringLiteral("Codigo"),
                                             Terceiro, {}, conn)
                            .toInt();
    }
    if (Escalao < 1 || Escalao > 7) Escalao = 0;
    return TaxaAgravamento_cur(estado, Terceiro, precoVenda(estado, Produto, Escalao, conn), conn);
}

QString GET_Vendedor_str(app::Estado& estado, const QString& Cliente, const QString& Produto,
                         db::Connection* conn) {
    const auto util = LerConfigUtilizador(estado, conn);
    const auto vendedorCliente = [&] {
        return db::Select_Campo_str(estado, QStringLiteral("Clientes"), QStringLiteral("Vendedor"),
                                    QStringLiteral("Codigo"), Cliente, {}, conn);
    };
    QString vendedor;
    if (util && util->vendDef == u"P") {
        vendedor = db::Select_Campo_str(estado, QStringLiteral("Produtos"),
                                        QStringLiteral("VendedorHabitual"),
                                        QStringLiteral("Codigo"), Produto, {}, conn);
    } else if (util && util->vendDef == u"C") {
        vendedor = vendedorCliente();
    } else if (util && util->vendDef == u"U") {
        vendedor = util->vendedorUtil;
    }
    if (vendedor.trimmed().isEmpty()) vendedor = vendedorCliente();
    return vendedor.trimmed();
}

std::optional<ConfiguracaoTab> ConfigUtil(app::Estado& estado, const QString& Cliente,
                                          db::Connection* conn) {
    const auto util = LerConfigUtilizador(estado, conn);
    if (!util) return std::nullopt;
    const auto cliente = db::primeiraLinha(
        estado.ligacao(conn),
        QStringLiteral("select PrecoStock,Vendedor,Desconto1,Desconto2,Desconto3 from Clientes "
                       "where Codigo=?"),
        {Cliente});
    if (!cliente) return std::nullopt;
    ConfiguracaoTab c;
    if (util->precario == u"C") c.escalao = textoEscalao(cliente->value(0).toInt());
    if (util->precario == u"P") c.escalao = textoEscalao(util->pvp);
    if (util->vendDef == u"C") c.vendedor = cliente->value(1).toString().trimmed();
    if (util->vendDef == u"U") c.vendedor = util->vendedorUtil;
    const int geral = util->descGeral.toInt();
    if (geral >= 1 && geral <= 3) c.descontoGeral = percentagem(cliente->value(1 + geral));
    c.altTipoMov = util->altTipoMov;
    c.portaTalao = util->portaTalao;
    c.impressora = util->impressora;
    c.tipoImpTalao = util->tipoImpTalao;
    return c;
}

}  // namespace brasel::pricing
