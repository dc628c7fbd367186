#include "pricing/descontos_tabelas.h"

#include "db/query_helpers.h"
#include "pricing/configuracao_utilizador.h"
#include "pricing/desconto.h"
#include "pricing/leitura.h"

#include <optional>

namespace brasel::pricing {

namespace {

// Three discount columns of the row `sql` finds.
std::optional<DescontosLinha> tresDescontos(app::Estado& estado, const QString& sql,
                                            const QString& chave, db::Connection* conn) {
    const auto linha = db::primeiraLinha(estado.ligacao(conn), sql, {chave});
    if (!linha) return std::nullopt;
    return DescontosLinha{percentagem(linha->value(0)), percentagem(linha->value(1)),
                          percentagem(linha->value(2))};
}

// Position k takes discount n of the source, n being what the user's Desconto k holds.
DescontosLinha colocados(const std::optional<DescontosLinha>& origem,
                         const std::array<int, 3>& posicoes) {
    DescontosLinha d{};
    if (!origem) return d;
    for (std::size_t k = 0; k < d.size(); ++k) {
        const int n = posicoes[k];
        if (n >= 1 && n <= 3) d[k] = (*origem)[static_cast<std::size_t>(n - 1)];
    }
    return d;
}

QString codigoConjunto(app::Estado& estado, const QString& tabela, const QString& codigo,
                       db::Connection* conn) {
    return db::Select_Campo_str(estado, tabela, QStringLiteral("COALESCE(DescontoTabelado,'')"),
                                QStringLiteral("Codigo"), codigo, {}, conn)
        .trimmed();
}

std::optional<DescontosLinha> conjunto(app::Estado& estado, const QString& codigo,
                                       db::Connection* conn) {
    if (codigo.isEmpty()) return std::nullopt;
    return tresDescontos(estado,
                         QStringLiteral("select Desconto1,Desconto2,Desconto3 from "
                                        "TabDescontosTabelados where Codigo=?"),
                         codigo, conn);
}

std::optional<DescontosLinha> conjuntoDoProduto(app::Estado& estado, const QString& produto,
                                                db::Connection* conn) {
    return conjunto(estado, codigoConjunto(estado, QStringLiteral("Produtos"), produto, conn),
                    conn);
}

}  // namespace

DescontosLinha GET_DescontosProdutos(app::Estado& estado, const QString& TipoTerceiro,
                                     const QString& Terceiro, const QString& Produto,
                                     Currency Preco, const QString& TipoMovimento,
                                     db::Connection* conn) {
    const auto util = LerConfigUtilizador(estado, conn);
    if (!util) return {};
    const QString tipo = TipoTerceiro.trimmed().toUpper();
    const QString& modo = util->descontos;
    if (tipo == u"C") {
        if (modo == u"T") return DescontosTabelados(estado, Terceiro, Produto, conn);
        if (modo == u"Z") {
            return DescontosPatamares(estado, tipo, Terceiro, Produto, Preco, TipoMovimento, conn);
        }
        if (modo == u"P") {
            return colocados(tresDescontos(estado,
                                           QStringLiteral("select DescontoVenda1,DescontoVenda2,"
                                                          "DescontoVenda3 from Produtos where "
                                                          "Codigo=?"),
                                           Produto, conn),
                             util->posicoes);
        }
        if (modo == u"C") {
            return colocados(tresDescontos(estado,
                                           QStringLiteral("select Desconto1,Desconto2,Desconto3 "
                                                          "from Clientes where Codigo=?"),
                                           Terceiro, conn),
                             util->posicoes);
        }
        return {};
    }
    if (tipo != u"F") return {};
    if (modo == u"T" || modo == u"Z")
        return conjuntoDoProduto(estado, Produto, conn).value_or(DescontosLinha{});
    if (util->descFFpro == u"P") {
        return colocados(tresDescontos(estado,
                                       QStringLiteral("select DescontoCompra1,DescontoCompra2,"
                                                      "DescontoCompra3 from Produtos where "
                                                      "Codigo=?"),
                                       Produto, conn),
                         util->posicoes);
    }
    return colocados(tresDescontos(estado,
                                   QStringLiteral("select desconto1,desconto2,desconto3 from "
                                                  "Fornece where codigo=?"),
                                   Terceiro, conn),
                     util->posicoes);
}

DescontosLinha DescontosTabelados(app::Estado& estado, const QString& Terceiro,
                                  const QString& Produto, db::Connection* conn) {
    const auto util = LerConfigUtilizador(estado, conn);
    if (!util || util->descontos != u"T") return {};
    const auto doCliente =
        conjunto(estado, codigoConjunto(estado, QStringLiteral("Clientes"), Terceiro, conn), conn);
    const auto doProduto = conjuntoDoProduto(estado, Produto, conn);
    if (!doCliente || !doProduto) return doProduto.value_or(doCliente.value_or(DescontosLinha{}));
    // The sets are compared on what they take from the same test amount.
    const auto tira = [](const DescontosLinha& d) {
        return DescontoCascata(Currency(100000), d[0], d[1], d[2]);
    };
    try {
        return tira(*doCliente) < tira(*doProduto) ? *doCliente : *doProduto;
    } catch (const CurrencyOverflow&) {
        return {};
    }
}

DescontosLinha DescontosPatamares(app::Estado& estado, const QString& TipoTerceiro,
                                  const QString& Terceiro, const QString& Produto, Currency Preco,
                                  const QString& TipoMovimento, db::Connection* conn) {
    const QString tipo = TipoTerceiro.trimmed().toUpper();
    if (tipo == u"F") return conjuntoDoProduto(estado, Produto, conn).value_or(DescontosLinha{});
    if (tipo != u"C") return {};
    db::Connection& c = estado.ligacao(conn);
    const auto classificacao = db::primeiraLinha(
        c, QStringLiteral("select TipoPatamarCliente from TabPatamaresDescontos where "
                          "PatamarCliente<>'' limit 1"));
    if (!classificacao) return {};
    const QString tabela = classificacao->value(0).toString().trimmed().toUpper();
    QString coluna;
    if (tabela == u"TABGRUPOCLI") coluna = QStringLiteral("Grupo");
    if (tabela == u"TABFAMCLI") coluna = QStringLiteral("Familia");
    if (tabela == u"TABSUBFAMCLI") coluna = QStringLiteral("Subfamilia");
    if (coluna.isEmpty()) return {};
    const QString patamar = db::Select_Campo_str(estado, QStringLiteral("Clientes"), coluna,
                                                 QStringLiteral("Codigo"), Terceiro, {}, conn);
    const QString codigo = codigoConjunto(estado, QStringLiteral("Produtos"), Produto, conn);
    auto linhas = c.exec(QStringLiteral("select LimiteMinimoPreco,LimiteMaximoPreco,DescontoVenda1,"
                                        "DescontoVenda2,DescontoVenda3 from TabPatamaresDescontos "
                                        "where TipoPatamarCliente=? and PatamarCliente=? and "
                                        "CodigoDesconto=? and TipoMovimento=? order by NumRegisto"),
                         {classificacao->value(0).toString(), textoSql(patamar), textoSql(codigo),
                          textoSql(TipoMovimento)});
    if (!linhas) return {};
    while (linhas->next()) {
        if (Currency::fromVariant(linhas->value(0)) <= Preco &&
            Preco <= Currency::fromVariant(linhas->value(1))) {
            return {percentagem(linhas->value(2)), percentagem(linhas->value(3)),
                    percentagem(linhas->value(4))};
        }
    }
    return {};
}

}  // namespace brasel::pricing
