#pragma once

#include "common/currency.h"
#include "db/connection.h"
#include "pos/perguntas_tab.h"

#include <QString>

#include <optional>
#include <vector>

namespace brasel::pos {

// A lot of a product with stock in a warehouse, with the dates its lines carry.
struct LoteDisponivel {
    QString lote;
    QString dataFabrico;
    QString dataValidade;
    Currency saldo;
};

// The lots of `produto` with stock above zero in `armazem`, those that expire first first (lots
// without an expiry date last), then by code. A lot's dates are the latest its lines carry. The
// balance counts every line with a stock effect, open tab lines included. nullopt when the
// database cannot be read.
std::optional<std::vector<LoteDisponivel>> LotesDisponiveis(db::Connection& conn,
                                                            const QString& produto,
                                                            const QString& armazem);

// Checks a lot chosen for a line: a lot must be given, and each date is empty or a real date
// written "yyyy-mm-dd", the expiry not before the fabrication. "" when it may be used, else the
// message for the person.
QString ValidaLote(const LoteEscolhido& lote);

}  // namespace brasel::pos
