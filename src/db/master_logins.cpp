#include "db/master_logins.h"

#include <QDir>
#include <QFileInfo>
#include <QMutex>
#include <QSet>
#include <QSqlDatabase>
#include <QSqlError>
#include <QSqlQuery>
#include <QUuid>

#include <openssl/crypto.h>
#include <openssl/evp.h>
#include <openssl/rand.h>

namespace brasel::db {

namespace {

constexpr int kIteracoes = 60000;
constexpr int kHashBytes = 32;

QByteArray pbkdf2(const QString& password, const QByteArray& salt, int iterations) {
    const QByteArray utf8 = password.toUtf8();
    QByteArray out(kHashBytes, '\0');
    PKCS5_PBKDF2_HMAC(utf8.constData(), static_cast<int>(utf8.size()),
                      reinterpret_cast<const unsigned char*>(salt.constData()),
                      static_cast<int>(salt.size()), iterations, EVP_sha256(), kHashBytes,
                      reinterpret_cast<unsigned char*>(out.data()));
    return out;
}

// Logins verified in this process: every login opens three connections to the same company,
// and the hash is deliberately slow.
QSet<QByteArray>& verificados() {
    static QSet<QByteArray> set;
    return set;
}
QMutex& verificadosMutex() {
    static QMutex mutex;
    return mutex;
}

// A short-lived connection of its own to master.sqlite.
class MasterDb {
  public:
    explicit MasterDb(const QString& file)
        : name_(QStringLiteral("master-") + QUuid::createUuid().toString(QUuid::WithoutBraces)) {
        QSqlDatabase db = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), name_);
        db.setDatabaseName(file);
        db.setConnectOptions(QStringLiteral("QSQLITE_BUSY_TIMEOUT=30000"));
        ok_ = db.open();
        if (ok_) {
            QSqlQuery q(db);
            ok_ = q.exec(QStringLiteral(
                "create table if not exists Logins (Nome TEXT PRIMARY KEY COLLATE NOCASE, "
                "Sal BLOB NOT NULL, Hash BLOB NOT NULL, Iteracoes INTEGER NOT NULL, "
                "SysAdmin INTEGER NOT NULL DEFAULT 0)"));
        }
    }
    ~MasterDb() {
        { QSqlDatabase::database(name_, false).close(); }
        QSqlDatabase::removeDatabase(name_);
    }
    bool ok() const { return ok_; }
    QSqlDatabase db() const { return QSqlDatabase::database(name_, false); }

  private:
    QString name_;
    bool ok_ = false;
};

}  // namespace

MasterLogins::MasterLogins(QString folder) : folder_(std::move(folder)) {}

QString MasterLogins::filePath() const {
    return QDir(folder_).filePath(QStringLiteral("master.sqlite"));
}

bool MasterLogins::exists() const {
    return QFileInfo::exists(filePath());
}

bool MasterLogins::criar(const QString& login, const QString& password, bool sysAdmin,
                         QString* erro) {
    const QString nome = login.trimmed();
    if (nome.isEmpty()) {
        if (erro) *erro = QStringLiteral("O nome do utilizador não pode ser vazio.");
        return false;
    }
    if (!QDir().mkpath(folder_)) {
        if (erro) *erro = QStringLiteral("Não foi possível criar a pasta ") + folder_;
        return false;
    }
    MasterDb master(filePath());
    if (!master.ok()) {
        if (erro) *erro = master.db().lastError().text();
        return false;
    }
    QByteArray salt(16, '\0');
    RAND_bytes(reinterpret_cast<unsigned char*>(salt.data()), static_cast<int>(salt.size()));
    QSqlQuery q(master.db());
    q.prepare(QStringLiteral(
        "insert into Logins (Nome, Sal, Hash, Iteracoes, SysAdmin) values (?,?,?,?,?) "
        "on conflict(Nome) do update set Sal=excluded.Sal, Hash=excluded.Hash, "
        "Iteracoes=excluded.Iteracoes, SysAdmin=excluded.SysAdmin"));
    q.addBindValue(nome);
    q.addBindValue(salt);
    q.addBindValue(pbkdf2(password, salt, kIteracoes));
    q.addBindValue(kIteracoes);
    q.addBindValue(sysAdmin ? 1 : 0);
    if (!q.exec()) {
        if (erro) *erro = q.lastError().text();
        return false;
    }
    QMutexLocker lock(&verificadosMutex());
    verificados().clear();
    return true;
}

bool MasterLogins::existe(const QString& login) const {
    if (!exists()) return false;
    MasterDb master(filePath());
    QSqlQuery q(master.db());
    q.prepare(QStringLiteral("select Nome from Logins where Nome=?"));
    q.addBindValue(login.trimmed());
    return master.ok() && q.exec() && q.next();
}

bool MasterLogins::sysAdmin(const QString& login) const {
    if (!exists()) return false;
    MasterDb master(filePath());
    QSqlQuery q(master.db());
    q.prepare(QStringLiteral("select SysAdmin from Logins where Nome=?"));
    q.addBindValue(login.trimmed());
    return master.ok() && q.exec() && q.next() && q.value(0).toInt() == 1;
}

bool MasterLogins::verificar(const QString& login, const QString& password,
                             const QString& autenticacao) const {
    if (!exists()) return false;
    const bool windows = autenticacao.compare(QStringLiteral("WIN"), Qt::CaseInsensitive) == 0;
    if (windows) return existe(login);
    const QByteArray chave =
        (folder_ + QChar(0) + login.trimmed().toLower() + QChar(0) + password).toUtf8();
    {
        QMutexLocker lock(&verificadosMutex());
        if (verificados().contains(chave)) return true;
    }
    MasterDb master(filePath());
    if (!master.ok()) return false;
    QSqlQuery q(master.db());
    q.prepare(QStringLiteral("select Sal, Hash, Iteracoes from Logins where Nome=?"));
    q.addBindValue(login.trimmed());
    if (!q.exec() || !q.next()) return false;
    const QByteArray esperado = q.value(1).toByteArray();
    const QByteArray obtido = pbkdf2(password, q.value(0).toByteArray(), q.value(2).toInt());
    if (esperado.size() != obtido.size() ||
        CRYPTO_memcmp(esperado.constData(), obtido.constData(), esperado.size()) != 0) {
        return false;
    }
    QMutexLocker lock(&verificadosMutex());
    verificados().insert(chave);
    return true;
}

QStringList MasterLogins::logins() const {
    QStringList result;
    if (!exists()) return result;
    MasterDb master(filePath());
    QSqlQuery q(master.db());
    if (master.ok() && q.exec(QStringLiteral("select Nome from Logins order by Nome"))) {
        while (q.next())
            result << q.value(0).toString();
    }
    return result;
}

}  // namespace brasel::db
