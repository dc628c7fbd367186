#pragma once

#include "db/connection.h"

#include <QList>
#include <QPair>
#include <QString>
#include <QVariant>

namespace brasel::db::demo {

using Campos = QList<QPair<QString, QVariant>>;

// Writes rows of data given as (column, value) pairs with bound values, and keeps the first
// failure: after one statement fails, the others are skipped, so a load checks once at the end.
class Escritor {
  public:
    explicit Escritor(Connection& conn) : conn_(conn) {}

    void inserir(const QString& tabela, const Campos& campos);
    // Sets the columns on every row of the table (the one-row tables).
    void actualizar(const QString& tabela, const Campos& campos);

    bool ok() const { return erro_.isEmpty(); }
    const QString& erro() const { return erro_; }

  private:
    void executar(const QString& sql, const QVariantList& valores);

    Connection& conn_;
    QString erro_;
};

}  // namespace brasel::db::demo
