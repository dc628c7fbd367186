#include "db/procedimentos/converte_codigo_produto.h"

#include <QSqlRecord>
#include <QVariant>

namespace brasel::db {

namespace {

constexpr int kTamanhoProduto = 15;

}  // namespace

bool ConverteCodigoProduto(Connection& conn, QString& produto) {
    const QString codigo = produto.left(kTamanhoProduto);
    auto rs = conn.exec(
        QStringLiteral("select ProdutoBase from ProdutosCodigosBarras where CodigoBarras=?"),
        {codigo});
    if (!rs) return false;
    produto = rs->next() ? rs->value(0).toString().left(kTamanhoProduto) : codigo;
    rs->finish();
    return true;
}

}  // namespace brasel::db
