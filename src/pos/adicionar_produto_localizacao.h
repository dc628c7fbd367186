#pragma once

#include "db/connection.h"

#include <QString>

#include <optional>

namespace brasel::pos {

// The storage location a product is sold from in a warehouse.
struct LocalizacaoEncontrada {
    QString codigo;         // "" when no location holds the product there
    bool registada = true;  // the code is a row of Localizacao
};

// Looks up where a product is stored in the warehouse its line is posted to: of the locations
// that hold it there, the one with the most stock (the lowest code on a tie). When no location
// holds any, the line carries none and takes from the warehouse as a whole. A location that is
// not (or no longer) a row of Localizacao is reported so that the sale can be refused.
// nullopt when the database cannot be read.
std::optional<LocalizacaoEncontrada> LocalizacaoProduto_Procura(db::Connection& conn,
                                                                const QString& produto,
                                                                const QString& armazem);

}  // namespace brasel::pos
