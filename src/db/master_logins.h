#pragma once

#include <QString>
#include <QStringList>

namespace brasel::db {

// The logins of an embedded server folder, kept in its master.sqlite: the embedded engine has
// no users of its own, so opening a company there checks the login here first. Passwords are
// kept as salted PBKDF2-HMAC-SHA256 hashes.
class MasterLogins {
  public:
    explicit MasterLogins(QString folder);

    QString filePath() const;
    bool exists() const;

    // Creates the login, or sets a new password on an existing one.
    bool criar(const QString& login, const QString& password, bool sysAdmin,
               QString* erro = nullptr);
    bool existe(const QString& login) const;
    bool sysAdmin(const QString& login) const;
    // SQL authentication: the password must match. WIN authentication: the login must exist.
    bool verificar(const QString& login, const QString& password,
                   const QString& autenticacao) const;
    QStringList logins() const;

  private:
    QString folder_;
};

}  // namespace brasel::db
