#pragma once

#include "db/dialect.h"
#include "db/server_address.h"

#include <QHash>
#include <QSqlDatabase>
#include <QSqlQuery>
#include <QSqlRecord>
#include <QString>
#include <QVariantList>

#include <optional>

namespace brasel::db {

// What a connection is opened with; the credentials are already plain text here.
struct ConnectionParams {
    ServerAddress server;
    QString baseDados;  // "Vendrola0001", or "Master" for the server's own catalogue
    QString login;
    QString password;
    QString autenticacao;     // "SQL" or "WIN", already checked
    int tempoComando = 0;     // seconds; 0 = no limit
    int tempoLigacao = 60;    // seconds
    bool semPooling = false;  // a connection of its own, not taken from or given back to the pool
    bool criar = false;       // embedded engine: create the file when missing (the admin tool)
};

// One connection to a database. Closed until open() succeeds; closing gives the underlying
// session back to the pool (unless opened without pooling), so a routine that opens and closes
// a connection on every call does not pay for a new session each time.
class Connection {
  public:
    Connection();
    ~Connection();
    Connection(const Connection&) = delete;
    Connection& operator=(const Connection&) = delete;

    bool open(const ConnectionParams& params);
    void close();
    bool isOpen() const;

    Engine engine() const { return dialect_.engine(); }
    const Dialect& dialect() const { return dialect_; }
    const ConnectionParams& params() const { return params_; }
    QSqlDatabase database() const;

    // Runs one statement with its values bound in order. On failure the error text is kept
    // (lastError) and nullopt comes back; nothing is thrown and nothing is shown.
    std::optional<QSqlQuery> exec(const QString& sql, const QVariantList& values = {});
    QString lastError() const { return lastError_; }

    // The first row of a statement, or nullopt when it has none or fails. The statement stays
    // prepared on this connection for the next call with the same text, and is finished before
    // returning, so it holds no lock.
    std::optional<QSqlRecord> firstRow(const QString& sql, const QVariantList& values = {});

    // Whether a write transaction is open on this connection (transactions are never nested).
    bool inTransaction() const { return inTransaction_; }

  private:
    friend class WriteTransaction;
    bool beginWrite();
    bool commit();
    void rollback();
    bool openPhysical(const ConnectionParams& params, const QString& name);

    QString name_;
    ConnectionParams params_;
    QHash<QString, QSqlQuery> prepared_;
    Dialect dialect_{Engine::Sqlite};
    QString lastError_;
    bool open_ = false;
    bool inTransaction_ = false;
};

// Rolls the transaction back unless commit() was called: every multi-row write goes through one.
class WriteTransaction {
  public:
    explicit WriteTransaction(Connection& conn);
    ~WriteTransaction();
    WriteTransaction(const WriteTransaction&) = delete;
    WriteTransaction& operator=(const WriteTransaction&) = delete;

    bool active() const { return active_; }
    bool commit();

  private:
    Connection& conn_;
    bool active_ = false;
};

// The operating-system user, the login of Windows-style authentication.
QString utilizadorSistema();

// The embedded engine's file for a database name inside a server folder.
QString sqliteFilePath(const QString& folder, const QString& baseDados);

}  // namespace brasel::db
