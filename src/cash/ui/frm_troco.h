#pragma once

#include "app/estado.h"
#include "cash/pagamento.h"
#include "cash/troco.h"
#include "common/message_port.h"
#include "pos/teclado.h"

#include <QButtonGroup>
#include <QDialog>
#include <QLabel>
#include <QLineEdit>
#include <QWidget>

#include <functional>
#include <memory>
#include <optional>

namespace brasel::cash {

// The payment and change screen of a closing: the payment methods as picture buttons on the
// right, the amounts in large figures on the left, each changed on the keypad by the button
// beside it, and the currency of the tendered amount chosen in the currency lookup.
class frmTroco : public QDialog {
    Q_OBJECT
  public:
    frmTroco(app::Estado& estado, MessagePort& mensagens, pos::PedeValor& teclado,
             QWidget* pai = nullptr);
    ~frmTroco() override;

    // Shows the screen modally for a document of `cliente` totalling `totalDoc`; a discount
    // percent given here is applied through `aplicaDesconto`. What was confirmed, or nullopt
    // when the cashier cancelled.
    std::optional<Pagamento> Abrir(const QString& cliente, Currency totalDoc,
                                   std::function<std::optional<Currency>(double)> aplicaDesconto);

  private:
    QWidget* criaValores();
    QWidget* criaFormas();
    void CarregarFPagamento(const QString& cliente);
    void mostra();
    void altEntregou();
    void altTotalDoc();
    void descontoPer();
    void cambio();
    void fechaDiv();

    app::Estado& estado_;
    MessagePort& mensagens_;
    pos::PedeValor& teclado_;
    std::unique_ptr<Troco> troco_;
    std::optional<Pagamento> pagamento_;
    QLineEdit* evalTotalDoc_;
    QLineEdit* evalDescontoPer_;
    QLineEdit* evalValor_Pagar_;
    QLineEdit* evalDesconto_;
    QLineEdit* evalEntregou_;
    QLineEdit* evalTroco_;
    QLineEdit* txtPagaComo_;
    QLabel* lblPagaComo_;
    QLineEdit* txtCambio_;
    QLabel* lblCambio_;
    QLineEdit* txtObserva_;
    QWidget* lvwPagaComo_;
    QButtonGroup* formas_;
};

}  // namespace brasel::cash
