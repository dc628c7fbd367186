#pragma once

#include "app/acessos.h"
#include "app/estado.h"
#include "app/ui/frm_login.h"
#include "app/ui/frm_sel_empresa.h"
#include "common/message_port.h"

#include <QList>
#include <QObject>
#include <QPointer>
#include <QWidget>

#include <functional>

namespace brasel::app {

// The way into the program: company selection, then login, then the main window; closing the
// main window returns to the login, Cancel in the login to the company selection, and Cancel in
// the company selection ends the program (terminado).
class FluxoEntrada : public QObject {
    Q_OBJECT

  public:
    // Builds the main window of the user just logged in (never nullptr). The flow shows it, deletes
    // it when it is closed, and then shows the login again; the main window clears the user's
    // in-use flag and closes the connections when it closes.
    using CriaJanelaPrincipal = std::function<QWidget*(Estado&)>;

    FluxoEntrada(Estado& estado, MessagePort& mensagens, QString linhaComando,
                 FornecedorJanelas janelas, CriaJanelaPrincipal criaPrincipal,
                 QObject* pai = nullptr);
    ~FluxoEntrada() override;

    // Shows the company selection.
    void iniciar();

    // The window of each stage while it exists (nullptr otherwise).
    frmSelEmpresa* seleccao() const { return seleccao_; }
    frmLogin* login() const { return login_; }
    QWidget* principal() const { return principal_; }

  Q_SIGNALS:
    void terminado();

  private:
    void mostrarSeleccao();
    void mostrarLogin(bool automatico);
    void mostrarPrincipal();

    Estado& estado_;
    MessagePort& mensagens_;
    QString linhaComando_;
    FornecedorJanelas janelas_;
    CriaJanelaPrincipal criaPrincipal_;
    QPointer<frmSelEmpresa> seleccao_;
    QPointer<frmLogin> login_;
    QPointer<QWidget> principal_;
};

}  // namespace brasel::app
