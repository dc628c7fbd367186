#include "documents/ultimos_precos.h"

namespace brasel::documents {

std::optional<UltimosPrecos> UltimosPrecosArmazem(db::Sessao& sessao, const QString& Produto,
                                                  const QString& Armazem, const QString& Data,
                                                  db::Connection* conn) {
    db::Connection& ligacao = sessao.ligacao(conn);
    auto rs = ligacao.exec(
        QStringLiteral("select Preco, COALESCE(Armazem_UPCompra,0), COALESCE(Armazem_UPCusto,0), "
                       "COALESCE(Armazem_PMCusto,0) from MovProduto where Codigo=? and Data<=? "
                       "and Armazem=? and AfectaStk='E+' order by Data desc, NumRegisto desc "
                       "limit 1"),
        {Produto, Data, Armazem});
    if (!rs) return std::nullopt;
    UltimosPrecos precos;
    if (!rs->next()) return precos;
    try {
        precos.Preco = Currency::fromVariant(rs->value(0));
        precos.Armazem_UPCompra = Currency::fromVariant(rs->value(1));
        precos.Armazem_UPCusto = Currency::fromVariant(rs->value(2));
        precos.Armazem_PMCusto = Currency::fromVariant(rs->value(3));
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
    return precos;
}

}  // namespace brasel::documents
