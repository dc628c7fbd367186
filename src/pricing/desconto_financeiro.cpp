#include "pricing/desconto_financeiro.h"

#include "db/query_helpers.h"
#include "pricing/arredonda_terceiro.h"
#include "pricing/leitura.h"

namespace brasel::pricing {

namespace {

std::optional<int> contagem(db::Connection& c, const QString& tabela) {
    const auto linha = db::primeiraLinha(c, QStringLiteral("select count(*) from %1").arg(tabela));
    if (!linha) return std::nullopt;
    return linha->value(0).toInt();
}

struct Classificacao {
    QString grupo;
    QString familia;
    QString subFamilia;
};

Classificacao classificacao(db::Connection& c, const QString& tabela, const QString& codigo) {
    const auto linha = db::primeiraLinha(
        c, QStringLiteral("select Grupo,Familia,SubFamilia from %1 where Codigo=?").arg(tabela),
        {codigo});
    if (!linha) return {};
    return {linha->value(0).toString(), linha->value(1).toString(), linha->value(2).toString()};
}

// The percent of one product: by classification (an empty column matches anything) or by the
// customer-and-product row; 0 when nothing matches.
double percentagemDaLinha(db::Connection& c, bool porClassificacao, const QString& cliente,
                          const Classificacao& doCliente, const QString& produto) {
    std::optional<QSqlRecord> linha;
    if (porClassificacao) {
        const Classificacao p = classificacao(c, QStringLiteral("Produtos"), produto);
        linha = db::primeiraLinha(
            c,
            QStringLiteral(
                "select DescontoFinanceiro from TabDescontosFinanceirosPatamares where "
                "(GrupoCli='' or GrupoCli=?) and (FamiliaCli='' or FamiliaCli=?) and "
                "(SubFamiliaCli='' or SubFamiliaCli=?) and (GrupoPro='' or GrupoPro=?) and "
                "(FamiliaPro='' or FamiliaPro=?) and (SubFamiliaPro='' or SubFamiliaPro=?) "
                "order by NumRegisto limit 1"),
            {textoSql(doCliente.grupo), textoSql(doCliente.familia), textoSql(doCliente.subFamilia),
             textoSql(p.grupo), textoSql(p.familia), textoSql(p.subFamilia)});
    } else {
        linha = db::primeiraLinha(c,
                                  QStringLiteral("select DescontoFinanceiro from "
                                                 "TabDescontosFinanceiros where Cliente=? and "
                                                 "Produto=?"),
                                  {cliente, produto});
    }
    return linha ? percentagem(linha->value(0)) : 0.0;
}

}  // namespace

std::optional<DescontoFinanceiro> DescontoFinanceiro_Calcular(
    app::Estado& estado, const QString& Cliente, const QString& Tipo, const QString& Ano,
    const QString& Numero, Currency Base, db::Connection* conn) {
    db::Connection& c = estado.ligacao(conn);
    const auto patamares = contagem(c, QStringLiteral("TabDescontosFinanceirosPatamares"));
    const auto porProduto = contagem(c, QStringLiteral("TabDescontosFinanceiros"));
    if (!patamares || !porProduto) return std::nullopt;
    const auto arredonda = [&](Currency valor) {
        return Arredonda(LerArredondamentos(estado, QStringLiteral("C"), Cliente, conn),
                         DescontoGeral, valor, estado.param.casadec);
    };
    try {
        DescontoFinanceiro d;
        if (*patamares == 0 && *porProduto == 0) {
            const auto linha = db::primeiraLinha(
                c, QStringLiteral("select DescontoFinanceiroPERC from Clientes where Codigo=?"),
                {Cliente});
            d.percentagem = linha ? percentagem(linha->value(0)) : 0.0;
            if (d.percentagem > 0.0) d.valor = arredonda(Base.percentOf(d.percentagem));
            return d;
        }
        // Tab lines hold the login of their user, not the user's code.
        auto linhas = c.exec(
            QStringLiteral("select Codigo,ValorIliq,TotalDesconto,COALESCE(SelecFecha,0) from "
                           "MovProduto where Tipo=? and Numero=? and Ano=? and CliFor='C' and "
                           "Terceiro=? and Utilizador=? order by NumRegisto"),
            {textoSql(Tipo), textoSql(Numero), textoSql(Ano), textoSql(Cliente),
             textoSql(estado.gLogin)});
        if (!linhas) return std::nullopt;
        const Classificacao doCliente = classificacao(c, QStringLiteral("Clientes"), Cliente);
        Currency soma;
        while (linhas->next()) {
            if (linhas->value(3).toInt() == 0) continue;
            const double p = percentagemDaLinha(c, *patamares > 0, Cliente, doCliente,
                                                linhas->value(0).toString());
            const Currency liquido =
                Currency::fromVariant(linhas->value(1)) - Currency::fromVariant(linhas->value(2));
            soma += liquido.percentOf(p);
        }
        d.valor = arredonda(soma);
        return d;
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
}

}  // namespace brasel::pricing
