#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "common/message_port.h"
#include "lookups/pesquisa_tabelas.h"
#include "pos/adicionar_produto_lote.h"
#include "pos/teclado.h"

#include <QDialog>
#include <QLabel>
#include <QLineEdit>
#include <QTreeWidget>
#include <QWidget>

#include <optional>
#include <vector>

namespace brasel::pos {

// The lot of a lot-controlled product being added to a tab: the lots in stock in the tab's
// warehouse with their dates and balances (touching one takes it), or another lot searched in
// the lot table, and its fabrication and expiry dates, typed or on the touch keyboard. The
// quantity the tab already holds of the product is shown. OK (cmdOK) takes a valid choice,
// cmdCancelar none.
class frmLote : public QDialog {
    Q_OBJECT
  public:
    frmLote(app::Estado& estado, MessagePort& mensagens, lookups::PesquisaTabelas& pesquisa,
            PedeTexto& teclado, const QString& produto, Currency jaLancado, QWidget* pai = nullptr);

    // Shows the form modally: the lot with its dates, nullopt when cancelled.
    std::optional<LoteEscolhido> escolher();

    QTreeWidget* lvwLotes() const { return lvwLotes_; }
    QLineEdit* txtLote() const { return txtLote_; }
    QLineEdit* txtDataFabrico() const { return txtDataFabrico_; }
    QLineEdit* txtDataValidade() const { return txtDataValidade_; }
    QLabel* lblJaLancado() const { return lblJaLancado_; }

  private:
    void carregaLotes(const QString& produto);
    void escolheLote(const QString& lote);
    void pesquisaLote();
    void pedeData(QLineEdit* campo, const QString& titulo);
    void confirmar();

    app::Estado& estado_;
    MessagePort& mensagens_;
    lookups::PesquisaTabelas& pesquisa_;
    PedeTexto& teclado_;
    std::vector<LoteDisponivel> lotes_;
    LoteEscolhido escolhido_;
    QTreeWidget* lvwLotes_;
    QLineEdit* txtLote_;
    QLineEdit* txtDataFabrico_;
    QLineEdit* txtDataValidade_;
    QLabel* lblJaLancado_;
};

}  // namespace brasel::pos
