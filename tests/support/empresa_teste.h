#pragma once

#include "app/estado.h"

#include <QString>
#include <QTemporaryDir>

namespace brasel::testing {

// A temporary embedded company "0001" in a folder of its own, removed at destruction. Its
// schema is complete; with `demo` it also holds the demo restaurant. The company is a copy of a
// model built once per test process, so making one costs a file copy.
class EmpresaTeste {
  public:
    explicit EmpresaTeste(bool demo = false);
    ~EmpresaTeste();
    EmpresaTeste(const EmpresaTeste&) = delete;
    EmpresaTeste& operator=(const EmpresaTeste&) = delete;

    // gConn open on the company as the login below, gEmpresa "0001", gServidor the folder,
    // gUtilizador "01", the parameters and the user's settings loaded.
    app::Estado& estado() { return estado_; }
    QString pasta() const { return pasta_.path(); }

    // Every login of the folder (the demo's SUPERVISOR, ANA and RUI too) has this password.
    static QString login() { return QStringLiteral("SUPERVISOR"); }
    static QString password() { return QStringLiteral("teste-brasel"); }

  private:
    QTemporaryDir pasta_;
    app::Estado estado_;
};

}  // namespace brasel::testing
