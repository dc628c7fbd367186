#pragma once

#include "common/currency.h"
#include "db/sessao.h"

#include <QString>

#include <cstdint>
#include <optional>

namespace brasel::documents {

// A movement being posted, as the average cost takes it into account.
struct MovimentoCusto {
    QString Produto;
    QString AfectaStk;  // only "E+" and "E-" change the average
    Currency Quantidade;
    Currency Preco;
    QString Armazem;  // used when the average is held per warehouse
    QString Data;     // "yyyy-mm-dd": the lines up to this date are considered
    // The lines up to this registry number are considered; 0 = all (a movement not yet stored).
    std::int64_t NumRegisto = 0;
};

// ParamGeral.FormulaPrecoMedioCusto 2: moving average in date order; anything else: totals.
enum class FormulaPMC { Totais, MediaMovel };

// The average cost of a product including the movement. Totals: the sums of the entries
// ("E+") minus those of their reversals ("E-"), the movement added or subtracted, then
// value/quantity - discount/quantity + expenses/quantity - invoice discount/quantity, each
// quotient rounded to four decimals; 0 when no quantity is left. Moving average: the lines in
// date and registry order, each entry giving (stock x average + its net value) / (stock +
// quantity), exits and returns moving only the stock; an entry that brings the stock to zero
// from below takes its own unit cost. With `porArmazem` only the movement's warehouse counts.
// nullopt when the lines cannot be read or a sum is out of range.
std::optional<Currency> PrecoMedioCusto_Calcular(db::Sessao& sessao, const MovimentoCusto& mov,
                                                 FormulaPMC formula, bool porArmazem,
                                                 db::Connection* conn = nullptr);

}  // namespace brasel::documents
