#pragma once

#include "app/estado.h"
#include "cash/registo_caixa.h"
#include "cash/ui/lista_formas_valor.h"
#include "common/message_port.h"
#include "lookups/pesquisa_tabelas.h"
#include "lookups/ui/w_pesquisa_nova.h"
#include "pos/teclado.h"

#include <QDateEdit>
#include <QDialog>
#include <QLabel>
#include <QLineEdit>

#include <memory>

class QPrinter;

namespace brasel::cash {

// Paints the register report on `impressora` (a printer, a PDF file or a preview's pages),
// amounts with `casadec` decimals. False when the printer could not be painted on.
bool ImprimeRelatorioCaixa(QPrinter& impressora, const RelatorioCaixa& relatorio, int casadec);

// The count of a cash register on a date: the amount counted for each payment method (typed in
// the cell or on the keypad with cmdValor), recorded by cmdActualizar, and the register report
// (cmdImprimir) on the screen or on a printer.
class frmRegistoDeCaixa : public QDialog {
    Q_OBJECT
  public:
    // `janela` answers the register searches and `teclado` the amounts (the search window and
    // the touch keypad when none are given).
    frmRegistoDeCaixa(app::Estado& estado, MessagePort& mensagens, QWidget* pai = nullptr,
                      lookups::JanelaPesquisa* janela = nullptr, pos::PedeValor* teclado = nullptr);
    ~frmRegistoDeCaixa() override;

    // Lists the payment methods with what was counted for the register and date shown; false
    // when there are none or they cannot be read.
    bool CarregarDados();
    // Shows and returns the sum of the counted amounts; nullopt while one is not a number.
    std::optional<Currency> CalculaTot();

    QString caixa() const { return txtCaixa_->text().trimmed(); }
    QString data() const;

    QLineEdit* txtCaixa() const { return txtCaixa_; }
    QDateEdit* dtpData() const { return dtpData_; }
    ListaFormasValor* lvwFormas() const { return lvwFormas_; }
    QLabel* lblTotal() const { return lblTotal_; }

  protected:
    // The first showing lists the count of the register and date the window opened on.
    void showEvent(QShowEvent* evento) override;

  private:
    void pesquisa(bool forcar);
    void actualizar();
    void imprimir();

    app::Estado& estado_;
    MessagePort& mensagens_;
    lookups::PesquisaEmJanela janelaPropria_;
    lookups::PesquisaTabelas pesquisaTabelas_;
    std::unique_ptr<pos::PedeValor> tecladoProprio_;
    pos::PedeValor& teclado_;
    QLineEdit* txtCaixa_;
    QLabel* lblCaixa_;
    QDateEdit* dtpData_;
    ListaFormasValor* lvwFormas_;
    QLabel* lblTotal_;
    bool carregado_ = false;
};

}  // namespace brasel::cash
