#include "documents/preco_medio_custo.h"

#include "db/procedimentos/saldo_produto_sp.h"

namespace brasel::documents {

namespace {

// The lines the average is taken over: the product's, up to the movement's date and registry
// number, of its warehouse when the average is kept per warehouse.
struct Filtro {
    QString sql;
    QVariantList valores;
};

Filtro filtroLinhas(const MovimentoCusto& mov, bool porArmazem) {
    Filtro f{QStringLiteral("Codigo=?"), {mov.Produto}};
    if (!mov.Data.isEmpty()) {
        f.sql += QStringLiteral(" and Data<=?");
        f.valores << mov.Data;
    }
    if (mov.NumRegisto > 0) {
        f.sql += QStringLiteral(" and NumRegisto<=?");
        f.valores << QVariant::fromValue<qlonglong>(mov.NumRegisto);
    }
    if (porArmazem) {
        f.sql += QStringLiteral(" and Armazem=?");
        f.valores << mov.Armazem;
    }
    return f;
}

Currency porUnidade(Currency valor, Currency quantidade) {
    return Currency::mulDiv(valor, Currency(1), quantidade);
}

std::optional<Currency> metodoTotais(db::Connection& conn, const MovimentoCusto& mov,
                                     bool porArmazem) {
    const Filtro f = filtroLinhas(mov, porArmazem);
    const QString sinal = QStringLiteral("CASE WHEN AfectaStk='E+' THEN 1 ELSE -1 END*");
    const auto linha = conn.firstRow(
        QStringLiteral("select COALESCE(SUM(%1QuantNormal),0), COALESCE(SUM(%1ValorIliq),0), "
                       "COALESCE(SUM(%1TotalDesconto),0), COALESCE(SUM(%1ValDespesa),0), "
                       "COALESCE(SUM(%1COALESCE(CalculoFacturaDesconto,0)),0) from MovProduto "
                       "where AfectaStk IN ('E+','E-') and %2")
            .arg(sinal, f.sql),
        f.valores);
    if (!linha) return std::nullopt;
    Currency quant = Currency::fromVariant(linha->value(0));
    Currency valor = Currency::fromVariant(linha->value(1));
    const Currency desconto = Currency::fromVariant(linha->value(2));
    const Currency despesa = Currency::fromVariant(linha->value(3));
    const Currency descontoFactura = Currency::fromVariant(linha->value(4));
    const QString efeito = mov.AfectaStk.trimmed().toUpper();
    if (efeito == u"E+") {
        quant += mov.Quantidade;
        valor += mov.Quantidade * mov.Preco;
    } else if (efeito == u"E-") {
        quant -= mov.Quantidade;
        valor -= mov.Quantidade * mov.Preco;
    }
    if (quant.isZero()) return Currency();
    return porUnidade(valor, quant) - porUnidade(desconto, quant) + porUnidade(despesa, quant) -
           porUnidade(descontoFactura, quant);
}

// One entry into the stock: the new average of what is then in stock.
void entrada(Currency& existencia, Currency& media, Currency valor, Currency quantidade) {
    const Currency nova = existencia + quantidade;
    if (nova.isZero()) {
        if (!quantidade.isZero()) media = porUnidade(valor, quantidade);
    } else {
        media = porUnidade(existencia * media + valor, nova);
    }
    existencia = nova;
}

std::optional<Currency> metodoMediaMovel(db::Connection& conn, const MovimentoCusto& mov,
                                         bool porArmazem) {
    const Filtro f = filtroLinhas(mov, porArmazem);
    auto rs = conn.exec(QStringLiteral("select AfectaStk, QuantNormal, ValorIliq, TotalDesconto, "
                                       "ValDespesa, COALESCE(CalculoFacturaDesconto,0) from "
                                       "MovProduto where AfectaStk<>'NA' and %1 "
                                       "order by Data, NumRegisto")
                            .arg(f.sql),
                        f.valores);
    if (!rs) return std::nullopt;
    Currency existencia;
    Currency media;
    while (rs->next()) {
        const QString efeito = rs->value(0).toString().trimmed().toUpper();
        const Currency quantidade = Currency::fromVariant(rs->value(1));
        if (efeito == u"E+") {
            const Currency liquido =
                Currency::fromVariant(rs->value(2)) - Currency::fromVariant(rs->value(3)) +
                Currency::fromVariant(rs->value(4)) - Currency::fromVariant(rs->value(5));
            entrada(existencia, media, liquido, quantidade);
        } else {
            const int sinal = db::SinalStock(efeito);
            if (sinal > 0) existencia += quantidade;
            if (sinal < 0) existencia -= quantidade;
        }
    }
    if (mov.AfectaStk.trimmed().toUpper() == u"E+")
        entrada(existencia, media, mov.Quantidade * mov.Preco, mov.Quantidade);
    return media;
}

}  // namespace

std::optional<Currency> PrecoMedioCusto_Calcular(db::Sessao& sessao, const MovimentoCusto& mov,
                                                 FormulaPMC formula, bool porArmazem,
                                                 db::Connection* conn) {
    db::Connection& ligacao = sessao.ligacao(conn);
    try {
        return formula == FormulaPMC::MediaMovel ? metodoMediaMovel(ligacao, mov, porArmazem)
                                                 : metodoTotais(ligacao, mov, porArmazem);
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
}

}  // namespace brasel::documents
