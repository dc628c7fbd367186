#include "pos/adicionar_produto_localizacao.h"

#include "db/procedimentos/saldo_produto_sp.h"
#include "pricing/leitura.h"

#include <QStringList>

namespace brasel::pos {

std::optional<LocalizacaoEncontrada> LocalizacaoProduto_Procura(db::Connection& conn,
                                                                const QString& produto,
                                                                const QString& armazem) {
    const QString codigoArmazem = pricing::textoSql(armazem);
    // "Localizacao>''" rather than "<>''": the same rows, and an index on the product and its
    // location can then skip the lines without one, which in a restaurant are nearly all.
    auto q = conn.exec(QStringLiteral("select distinct Localizacao from MovProduto where "
                                      "Codigo=? and Localizacao>'' and "
                                      "(Armazem=? or ArmazemDest=?) order by Localizacao"),
                       {pricing::textoSql(produto), codigoArmazem, codigoArmazem});
    if (!q) return std::nullopt;
    QStringList locais;
    while (q->next())
        locais << q->value(0).toString();
    q.reset();

    LocalizacaoEncontrada escolhida;
    Currency maior;
    for (const QString& local : locais) {
        const std::optional<Currency> saldo =
            db::SaldoProduto_ProArmLoc(conn, produto, codigoArmazem, local);
        if (!saldo) return std::nullopt;
        // In code order, so the first of equal balances stays.
        if (*saldo > maior) {
            maior = *saldo;
            escolhida.codigo = local;
        }
    }
    if (escolhida.codigo.isEmpty()) return escolhida;
    auto registo = conn.exec(QStringLiteral("select Codigo from Localizacao where Codigo=?"),
                             {escolhida.codigo});
    if (!registo) return std::nullopt;
    escolhida.registada = registo->next();
    return escolhida;
}

}  // namespace brasel::pos
