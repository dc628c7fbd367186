#pragma once

#include "app/acessos.h"

#include <QList>
#include <QWidget>

#include <functional>

namespace brasel::app {

// The windows the main window opens, each with the caption its access check uses. The rights
// editor creates a user's full set of rights from it, describing each window as built.
class CatalogoJanelas {
  public:
    using Fabrica = std::function<QWidget*(QWidget* pai)>;

    void registar(const QString& caption, Fabrica fabrica);
    // Every registered window with its buttons (each window is built hidden and thrown away).
    QList<JanelaAcesso> descricoes() const;

  private:
    struct Entrada {
        QString caption;
        Fabrica fabrica;
    };
    QList<Entrada> entradas_;
};

}  // namespace brasel::app
