#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "db/connection.h"

#include <QString>

#include <array>
#include <vector>

namespace brasel::cash {

// One payment method's part of a document paid by several methods (a row of the split screen).
struct ParcialPagamento {
    QString pagaComo;
    Currency valor;
};

// The cash side of one document: what LancaMovCaixa writes into MovCaixa.
struct MovimentoCaixa {
    QString tipo;
    QString numero;
    QString data;    // "yyyy-MM-dd"; the year is taken from it
    QString afecta;  // "R+", "R-", "P+", "P-" or "NA"
    QString pagaComo;
    Currency valorTotal;
    std::array<Currency, 4> valor;
    std::array<Currency, 4> desconto;
    std::array<Currency, 4> valiva;
    std::array<QString, 4> tabiva;
    std::array<double, 4> taxiva{};
    QString cambio;  // "" or the company's currency: no conversion
    QString observa;
    QString nomeEntidade;
};

// Writes the document's cash movements: one MovCaixa row per method with an amount above 0
// (the split list when one is given, else the single method), rewriting the row a document and
// method already has, and one "CA" log entry. Nothing for the effect "NA". Runs on the caller's
// connection and inside its transaction when it holds one; false when a row could not be
// written.
bool LancaMovCaixa(app::Estado& estado, db::Connection& conn, const MovimentoCaixa& movimento,
                   const std::vector<ParcialPagamento>* divisao = nullptr);

}  // namespace brasel::cash
