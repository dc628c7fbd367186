#pragma once

#include "db/connection.h"

#include <QList>
#include <QString>

#include <optional>

namespace brasel::pos {

// A product and whether it goes to the kitchen (ImpCopa 1, queued) or the bar (printed at once).
struct FlagCozinha {
    QString codigo;
    QString descricao;
    bool cozinha = false;
};

// Every product, ordered by the grouping column of the menu level (any case) and description, or
// by description for an unknown level. nullopt when the database cannot be read.
std::optional<QList<FlagCozinha>> CarregarFlagsCozinha(db::Connection& conn,
                                                       const QString& nivelEmenta);

// Writes every product's flag; all or nothing.
bool GravarFlagsCozinha(db::Connection& conn, const QList<FlagCozinha>& flags);

}  // namespace brasel::pos
