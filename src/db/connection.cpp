#include "db/connection.h"

#include "db/master_logins.h"

#include <QAtomicInt>
#include <QCryptographicHash>
#include <QDir>
#include <QFileInfo>
#include <QHash>
#include <QSqlDriver>
#include <QSqlError>

#include <climits>

#include <pwd.h>
#include <unistd.h>

namespace brasel::db {

namespace {

QAtomicInt nextConnectionNumber;

// Idle sessions by what they were opened with; closing a pooled connection parks its session
// here and the next open with the same credentials takes it back.
QHash<QByteArray, QStringList>& pool() {
    static QHash<QByteArray, QStringList> idle;
    return idle;
}

QByteArray poolKey(const ConnectionParams& p) {
    QCryptographicHash hash(QCryptographicHash::Sha256);
    for (const QString& part :
         {QString::number(static_cast<int>(p.server.engine)), p.server.folder, p.server.host,
          QString::number(p.server.port), p.baseDados.toLower(), p.login.toLower(), p.password,
          p.autenticacao.toUpper(), QString::number(p.tempoComando)}) {
        hash.addData(part.toUtf8());
        hash.addData(QByteArrayView("\0", 1));
    }
    return hash.result();
}

bool isMasterName(const QString& baseDados) {
    return baseDados.compare(QStringLiteral("master"), Qt::CaseInsensitive) == 0;
}

}  // namespace

QString utilizadorSistema() {
    if (const passwd* entry = getpwuid(geteuid()); entry != nullptr && entry->pw_name != nullptr) {
        return QString::fromLocal8Bit(entry->pw_name);
    }
    return qEnvironmentVariable("USER");
}

QString sqliteFilePath(const QString& folder, const QString& baseDados) {
    const QString file = isMasterName(baseDados) ? QStringLiteral("master.sqlite")
                                                 : baseDados + QStringLiteral(".sqlite");
    return QDir(folder).filePath(file);
}

Connection::Connection() = default;

Connection::~Connection() {
    close();
}

bool Connection::isOpen() const {
    return open_ && QSqlDatabase::database(name_, false).isOpen();
}

QSqlDatabase Connection::database() const {
    return QSqlDatabase::database(name_, false);
}

bool Connection::openPhysical(const ConnectionParams& p, const QString& name) {
    const Dialect dialect(p.server.engine);
    QSqlDatabase db = QSqlDatabase::addDatabase(dialect.driverName(), name);
    // Amounts come back as exact decimal text, never through a double.
    db.setNumericalPrecisionPolicy(QSql::HighPrecision);
    switch (p.server.engine) {
        case Engine::Sqlite: {
            const QString file = sqliteFilePath(p.server.folder, p.baseDados);
            if (!p.criar && !QFileInfo::exists(file)) {
                lastError_ = QStringLiteral("A base de dados não existe: ") + file;
                return false;
            }
            const bool windows = p.autenticacao == QStringLiteral("WIN");
            const QString login = windows ? utilizadorSistema() : p.login;
            if (!p.criar &&
                !MasterLogins(p.server.folder).verificar(login, p.password, p.autenticacao)) {
                lastError_ = QStringLiteral("Utilizador ou password inválidos.");
                return false;
            }
            // The command time-out of the embedded engine is how long a writer waits for another.
            const int busyMs = p.tempoComando <= 0 ? INT_MAX : p.tempoComando * 1000;
            db.setDatabaseName(file);
            db.setConnectOptions(QStringLiteral("QSQLITE_BUSY_TIMEOUT=%1").arg(busyMs));
            if (!db.open()) {
                lastError_ = db.lastError().text();
                return false;
            }
            QSqlQuery pragma(db);
            pragma.exec(QStringLiteral("PRAGMA journal_mode=WAL"));
            pragma.exec(QStringLiteral("PRAGMA foreign_keys=OFF"));
            return true;
        }
        case Engine::Postgres: {
            const bool windows = p.autenticacao == QStringLiteral("WIN");
            db.setHostName(p.server.host);
            db.setPort(p.server.port);
            db.setDatabaseName(isMasterName(p.baseDados)
                                   ? QStringLiteral("postgres")
                                   : dialect.physicalDatabaseName(p.baseDados));
            db.setUserName(dialect.physicalLoginName(windows ? utilizadorSistema() : p.login));
            if (!windows) db.setPassword(p.password);
            db.setConnectOptions(QStringLiteral("connect_timeout=%1").arg(qMax(1, p.tempoLigacao)));
            if (!db.open()) {
                lastError_ = db.lastError().text();
                return false;
            }
            QSqlQuery setup(db);
            setup.exec(
                QStringLiteral("SET statement_timeout = %1").arg(qMax(0, p.tempoComando) * 1000));
            setup.exec(QStringLiteral("SET client_min_messages = warning"));
            return true;
        }
        case Engine::SqlServer:
            lastError_ =
                QStringLiteral("O servidor SQL Server ainda não é suportado nesta instalação.");
            return false;
    }
    return false;
}

bool Connection::open(const ConnectionParams& params) {
    close();
    lastError_.clear();
    const QByteArray key = poolKey(params);
    if (!params.semPooling && !params.criar) {
        QStringList& idle = pool()[key];
        while (!idle.isEmpty()) {
            const QString name = idle.takeLast();
            if (QSqlDatabase::database(name, false).isOpen()) {
                name_ = name;
                params_ = params;
                dialect_ = Dialect(params.server.engine);
                open_ = true;
                return true;
            }
            QSqlDatabase::removeDatabase(name);
        }
    }
    const QString name =
        QStringLiteral("brasel-%1").arg(nextConnectionNumber.fetchAndAddRelaxed(1));
    if (!openPhysical(params, name)) {
        QSqlDatabase::removeDatabase(name);
        return false;
    }
    name_ = name;
    params_ = params;
    dialect_ = Dialect(params.server.engine);
    open_ = true;
    return true;
}

void Connection::close() {
    prepared_.clear();
    if (name_.isEmpty()) return;
    if (inTransaction_) rollback();
    const bool reuse = open_ && !params_.semPooling && !params_.criar &&
                       QSqlDatabase::database(name_, false).isOpen();
    if (reuse) {
        QStringList& idle = pool()[poolKey(params_)];
        if (idle.size() < 4) {
            idle.append(name_);
            name_.clear();
            open_ = false;
            return;
        }
    }
    { QSqlDatabase::database(name_, false).close(); }
    QSqlDatabase::removeDatabase(name_);
    name_.clear();
    open_ = false;
}

std::optional<QSqlQuery> Connection::exec(const QString& sql, const QVariantList& values) {
    if (!isOpen()) {
        lastError_ = QStringLiteral("A ligação à base de dados não está aberta.");
        return std::nullopt;
    }
    QSqlQuery query(database());
    query.setForwardOnly(true);
    bool ok = false;
    if (values.isEmpty()) {
        ok = query.exec(sql);
    } else {
        ok = query.prepare(sql);
        if (ok) {
            for (const QVariant& value : values)
                query.addBindValue(value);
            ok = query.exec();
        }
    }
    if (!ok) {
        lastError_ = query.lastError().text();
        return std::nullopt;
    }
    return query;
}

std::optional<QSqlRecord> Connection::firstRow(const QString& sql, const QVariantList& values) {
    if (!isOpen()) {
        lastError_ = QStringLiteral("A ligação à base de dados não está aberta.");
        return std::nullopt;
    }
    // A statement prepared before the table changed may refuse to run again; it is then
    // prepared anew once.
    for (int tentativa = 0; tentativa < 2; ++tentativa) {
        auto found = prepared_.find(sql);
        const bool novo = found == prepared_.end();
        if (novo) {
            QSqlQuery query(database());
            query.setForwardOnly(true);
            if (!query.prepare(sql)) {
                lastError_ = query.lastError().text();
                return std::nullopt;
            }
            // Bounded: the statements a routine repeats are few, the texts built per call many.
            if (prepared_.size() >= 128) prepared_.clear();
            found = prepared_.insert(sql, query);
        }
        QSqlQuery& query = found.value();
        for (int i = 0; i < values.size(); ++i)
            query.bindValue(i, values[i]);
        if (!query.exec()) {
            lastError_ = query.lastError().text();
            prepared_.erase(found);
            if (novo || inTransaction_) return std::nullopt;
            continue;
        }
        std::optional<QSqlRecord> row;
        if (query.next()) row = query.record();
        query.finish();
        return row;
    }
    return std::nullopt;
}

bool Connection::beginWrite() {
    if (inTransaction_) return false;
    if (!exec(dialect_.beginWriteTransaction())) return false;
    inTransaction_ = true;
    return true;
}

bool Connection::commit() {
    if (!inTransaction_) return false;
    const bool ok = exec(QStringLiteral("COMMIT")).has_value();
    if (ok) inTransaction_ = false;
    return ok;
}

void Connection::rollback() {
    if (!inTransaction_) return;
    exec(QStringLiteral("ROLLBACK"));
    inTransaction_ = false;
}

WriteTransaction::WriteTransaction(Connection& conn) : conn_(conn), active_(conn.beginWrite()) {}

WriteTransaction::~WriteTransaction() {
    if (active_) conn_.rollback();
}

bool WriteTransaction::commit() {
    if (!active_) return false;
    if (!conn_.commit()) {
        conn_.rollback();
        active_ = false;
        return false;
    }
    active_ = false;
    return true;
}

}  // namespace brasel::db
