// A product's other taxes seen from its prices: what one unit carries and what a tier shows.
#include "db/query_helpers.h"
#include "pricing/impostos.h"

namespace brasel::pricing {

Currency Impostos::precoComImpostos(const QString& produto, int escalao, bool todos) {
    if (escalao < 1 || escalao > 7) return Currency();
    const auto linha = db::primeiraLinha(
        ligacao(), QStringLiteral("select PrecoVenda%1 from Produtos where Codigo=?").arg(escalao),
        {produto});
    const auto defs = definicoes(produto, {}, true);
    if (!linha || !defs) return Currency();
    try {
        const Currency preco = Currency::fromVariant(linha->value(0));
        Currency total = preco;
        for (const DefinicaoImposto& d : *defs) {
            if (todos || d.convertePV[static_cast<std::size_t>(escalao - 1)]) {
                total += ImpostoUnitario(d, preco);
            }
        }
        return ArredondaValor(total, estado_.param.casadecpreco, ArredondaProximo);
    } catch (const CurrencyOverflow&) {
        return Currency();
    }
}

Currency Impostos::PrecoVenda_ComImposto_cur(const QString& Produto, int Escalao) {
    return precoComImpostos(Produto, Escalao, false);
}

Currency Impostos::PrecoVenda_ComImposto_Apenas_Para_Etiquetas_cur(const QString& Produto,
                                                                   int Escalao) {
    return precoComImpostos(Produto, Escalao, true);
}

Currency Impostos::Produto_Valor_Imposto_cur(const QString& Produto, Currency Preco) {
    const auto defs = definicoes(Produto, {}, true);
    if (!defs) return Currency();
    try {
        Currency total;
        for (const DefinicaoImposto& d : *defs)
            total += ImpostoUnitario(d, Preco);
        return total;
    } catch (const CurrencyOverflow&) {
        return Currency();
    }
}

QString Impostos::Produto_Descricoes_Impostos_str(const QString& Produto) {
    const auto defs = definicoes(Produto, {}, true);
    if (!defs) return {};
    QStringList codigos;
    for (const DefinicaoImposto& d : *defs)
        codigos << d.codigo;
    return codigos.join(u'/');
}

}  // namespace brasel::pricing
