#pragma once

#include "app/estado.h"
#include "cash/lanca_mov_caixa.h"
#include "cash/ui/lista_formas_valor.h"
#include "common/message_port.h"
#include "pos/teclado.h"

#include <QDialog>
#include <QLabel>

#include <memory>
#include <optional>
#include <vector>

namespace brasel::cash {

// The split of one document's payment across several methods: the methods with their part
// ("Parcial", typed on the keypad with cmdValor or straight into the cell), what is left
// (lblResto), cmdTudo giving the whole remainder to the selected method. OK (cmdOK) only once
// the parts add up to the document total exactly.
class frmLancMovCaixa : public QDialog {
    Q_OBJECT
  public:
    // Without `teclado` the window asks its values on the touch keypad.
    frmLancMovCaixa(app::Estado& estado, MessagePort& mensagens, QWidget* pai = nullptr,
                    pos::PedeValor* teclado = nullptr);
    ~frmLancMovCaixa() override;

    // Lists the methods and shows the window modally for a document of `totalDoc`, the whole
    // total proposed on `proposta` (the method already chosen at payment, "" none): every
    // method's part, or nullopt when the cashier cancelled or the methods could not be listed.
    std::optional<std::vector<ParcialPagamento>> Carregar(Currency totalDoc,
                                                          const QString& proposta = {});

    // Shows what is left of the total; nullopt (and the remainder as it was) while a part is
    // not a number.
    std::optional<Currency> CalculaTot();

    ListaFormasValor* lvwFormas() const { return lvwFormas_; }
    QLabel* lblResto() const { return lblResto_; }

  private:
    void tudo();
    void confirma();

    app::Estado& estado_;
    MessagePort& mensagens_;
    std::unique_ptr<pos::PedeValor> tecladoProprio_;
    pos::PedeValor& teclado_;
    Currency totalDoc_;
    std::vector<ParcialPagamento> resultado_;
    ListaFormasValor* lvwFormas_;
    QLabel* lblTotalDoc_;
    QLabel* lblResto_;
};

}  // namespace brasel::cash
