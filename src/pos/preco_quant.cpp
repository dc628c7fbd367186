#include "pos/preco_quant.h"

#include <QSqlRecord>
#include <QVariant>

namespace brasel::pos {

std::optional<PropostaPrecoQuant> PropostaDoCodigo(db::Connection& conn, const QString& codigo) {
    const auto cb = conn.firstRow(
        QStringLiteral("select Interactividade,ProdutoBase,ActivaPreco,PrecoVenda,PrecoDigitado,"
                       "ActivaQuantidade,Quantidade from ProdutosCodigosBarras where "
                       "CodigoBarras=?"),
        {codigo});
    if (!cb || cb->value(0).toInt() != 1) return std::nullopt;
    PropostaPrecoQuant p;
    p.comPreco = cb->value(2).toInt() == 1;
    p.comQuantidade = cb->value(5).toInt() == 1;
    p.quantidade = Currency::fromVariant(cb->value(6));
    const int precoVenda = cb->value(3).toInt();
    if (precoVenda >= 1 && precoVenda <= 7) {
        const auto pr = conn.firstRow(
            QStringLiteral("select PrecoVenda1,PrecoVenda2,PrecoVenda3,PrecoVenda4,PrecoVenda5,"
                           "PrecoVenda6,PrecoVenda7 from Produtos where Codigo=?"),
            {cb->value(1)});
        if (pr) p.preco = Currency::fromVariant(pr->value(precoVenda - 1));
    } else {
        p.preco = Currency::fromVariant(cb->value(4));
    }
    return p;
}

PrecoQuant AbrirPrecoQuant(db::Connection& conn, JanelaPrecoQuant& janela, const QString& codigo) {
    const auto proposta = PropostaDoCodigo(conn, codigo);
    if (!proposta) return {};
    PrecoQuant dado = janela.pedir(codigo, *proposta);
    if (!proposta->comPreco) dado.preco.reset();
    if (!proposta->comQuantidade) dado.quantidade.reset();
    return dado;
}

}  // namespace brasel::pos
