#include "app/ui/fluxo_entrada.h"

namespace brasel::app {

FluxoEntrada::FluxoEntrada(Estado& estado, MessagePort& mensagens, QString linhaComando,
                           FornecedorJanelas janelas, CriaJanelaPrincipal criaPrincipal,
                           QObject* pai)
    : QObject(pai),
      estado_(estado),
      mensagens_(mensagens),
      linhaComando_(std::move(linhaComando)),
      janelas_(std::move(janelas)),
      criaPrincipal_(std::move(criaPrincipal)) {}

FluxoEntrada::~FluxoEntrada() {
    // The windows are top-level: they go with the flow that made them, without bringing the
    // login back on the way out.
    if (principal_) principal_->disconnect(this);
    delete principal_.data();
    delete login_.data();
    delete seleccao_.data();
}

void FluxoEntrada::iniciar() {
    mostrarSeleccao();
}

void FluxoEntrada::mostrarSeleccao() {
    seleccao_ = new frmSelEmpresa(estado_, mensagens_, linhaComando_);
    connect(seleccao_, &frmSelEmpresa::empresaEscolhida, this, [this] {
        seleccao_->close();
        seleccao_->deleteLater();
        mostrarLogin(true);
    });
    connect(seleccao_, &frmSelEmpresa::cancelado, this, [this] {
        seleccao_->deleteLater();
        Q_EMIT terminado();
    });
    seleccao_->show();
}

void FluxoEntrada::mostrarLogin(bool automatico) {
    if (!login_) {
        login_ = new frmLogin(estado_, mensagens_, janelas_);
        connect(login_, &frmLogin::entrou, this, &FluxoEntrada::mostrarPrincipal);
        connect(login_, &frmLogin::cancelado, this, [this] {
            login_->deleteLater();
            mostrarSeleccao();
        });
    }
    login_->Abrir(automatico);
}

void FluxoEntrada::mostrarPrincipal() {
    principal_ = criaPrincipal_(estado_);
    principal_->setAttribute(Qt::WA_DeleteOnClose);
    // Coming back to the login does not log in again by itself: under Windows authentication
    // that would reopen the main window the user has just closed.
    connect(principal_, &QObject::destroyed, this, [this] { mostrarLogin(false); });
    principal_->show();
}

}  // namespace brasel::app
