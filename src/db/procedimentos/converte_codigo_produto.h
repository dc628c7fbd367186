#pragma once

#include "db/connection.h"

#include <QString>

namespace brasel::db {

// The company's code-conversion procedure: turns a typed code (@Produto, in and out, 15
// characters) into the code of the product it stands for. A registered barcode gives its base
// product; any other code comes back as typed, cut to the parameter's size. False only when the
// database cannot be read; `produto` is then left as it was.
bool ConverteCodigoProduto(Connection& conn, QString& produto);

}  // namespace brasel::db
