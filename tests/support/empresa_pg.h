#pragma once

#include "app/estado.h"
#include "db/schema/servidor.h"

#include <QString>

namespace brasel::testing {

// A company of its own on the PostgreSQL server of the tests, with the full schema, dropped when
// the object goes. Its code starts with `letra` and carries the process number, so test programs
// running at once never share one. With `demo` it holds the demo restaurant (its users' password
// is the administrator's) and the state is that of its supervisor "01" (login SUPERVISOR) with
// the parameters loaded.
class EmpresaPg {
  public:
    explicit EmpresaPg(QChar letra, bool demo = false);
    ~EmpresaPg();
    EmpresaPg(const EmpresaPg&) = delete;
    EmpresaPg& operator=(const EmpresaPg&) = delete;

    // False when no server is configured (the test skips) or the company could not be made
    // (`erro()` says why).
    bool pronta() const { return pronta_; }
    QString erro() const { return erro_; }

    // gConn open on the company as the server's administrator login.
    app::Estado& estado() { return estado_; }
    QString empresa() const { return empresa_; }
    const db::ServerAddress& servidor() const { return servidor_; }
    const db::schema::Credenciais& admin() const { return admin_; }

  private:
    QString texto_;
    db::ServerAddress servidor_;
    db::schema::Credenciais admin_;
    QString empresa_;
    QString erro_;
    bool criada_ = false;
    bool pronta_ = false;
    app::Estado estado_;
};

}  // namespace brasel::testing
