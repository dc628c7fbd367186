#pragma once

#include "db/server_address.h"

#include <QString>

namespace brasel::db {

// What differs between the engines, in one place. Everything else the program writes is
// portable SQL (COALESCE, LIMIT, CAST, ||) that both engines run unchanged.
class Dialect {
  public:
    explicit Dialect(Engine engine) : engine_(engine) {}

    Engine engine() const { return engine_; }
    QString driverName() const;

    // Column types of the schema.
    QString identityColumn() const;  // NumRegisto
    QString textType() const { return QStringLiteral("TEXT"); }
    QString integerType() const { return QStringLiteral("INTEGER"); }
    QString amountType() const { return QStringLiteral("NUMERIC(19,4)"); }
    QString rateType() const { return QStringLiteral("NUMERIC(19,6)"); }
    QString blobType() const;

    // Server date-time as "yyyy-mm-dd HH:MM:SS" text.
    QString serverTimeExpression() const;
    // The statement that starts a write transaction on a connection.
    QString beginWriteTransaction() const;

    // Catalog questions; each statement takes its names as bound values.
    QString tableExistsQuery() const;       // binds: table name
    QString columnExistsQuery() const;      // binds: table name, column name
    QString companyDatabasesQuery() const;  // server engines: names of Vendrola databases
    QString databaseSizeQuery() const;      // binds: database name; size in bytes

    // A condition true when a text column holds a whole number (optionally signed).
    QString numericTextCondition(const QString& column) const;

    // The database name an engine stores for a company database name ("Vendrola0001").
    QString physicalDatabaseName(const QString& name) const;
    // A role or login name as the engine keeps it.
    QString physicalLoginName(const QString& login) const;

  private:
    Engine engine_;
};

}  // namespace brasel::db
