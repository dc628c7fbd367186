#pragma once

#include "db/connection.h"

#include <QString>
#include <QVariant>

#include <optional>

// Small readings shared by the pricing routines that go to the database.
namespace brasel::pricing {

// "Clientes" for "C", "Fornece" for "F" (either case); "" for anything else, which every routine
// treats as a party without a row.
QString tabelaTerceiro(const QString& tipoTerceiro);

// A percentage or rate column: numbers as they come, text through TextoParaNumero, null as 0.
double percentagem(const QVariant& valor);

// A text bound to a statement: a null QString would bind SQL NULL, which no "col=''" condition
// matches and which a text column should not hold.
QString textoSql(const QString& texto);

// A flag column that holds 1 or "1" (or "S" where the column is a yes/no letter).
bool ligado(const QVariant& valor);

// Opens a write transaction on `conn` unless the caller already holds one (a closing posts its
// taxes inside its own transaction); commit() is then left to that caller.
class TransacaoSeNecessaria {
  public:
    explicit TransacaoSeNecessaria(db::Connection& conn);
    bool active() const;
    bool commit();

  private:
    std::optional<db::WriteTransaction> propria_;
};

}  // namespace brasel::pricing
