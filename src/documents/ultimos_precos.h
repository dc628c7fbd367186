#pragma once

#include "common/currency.h"
#include "db/sessao.h"

#include <QString>

#include <optional>

namespace brasel::documents {

// The latest entry ("E+") of a product into a warehouse up to a date.
struct UltimosPrecos {
    Currency Preco;
    Currency Armazem_UPCompra;
    Currency Armazem_UPCusto;
    Currency Armazem_PMCusto;
};

// The price and per-warehouse costs of the latest entry of `Produto` into `Armazem` on or before
// `Data` (latest date, then latest registry); all zero when the warehouse has had no entry;
// nullopt when the lines cannot be read.
std::optional<UltimosPrecos> UltimosPrecosArmazem(db::Sessao& sessao, const QString& Produto,
                                                  const QString& Armazem, const QString& Data,
                                                  db::Connection* conn = nullptr);

}  // namespace brasel::documents
