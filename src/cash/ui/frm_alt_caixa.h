#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "lookups/pesquisa_tabelas.h"
#include "lookups/ui/w_pesquisa_nova.h"

#include <QDialog>
#include <QLabel>
#include <QLineEdit>

namespace brasel::cash {

// Changes the cash register of this workstation: a code of Caixas, typed or chosen in the
// search (cmdPesquisa), kept in the workstation's settings and in memory by OK (cmdOK).
class frmAltCaixa : public QDialog {
    Q_OBJECT
  public:
    // `janela` answers the searches (the search window when none is given).
    frmAltCaixa(app::Estado& estado, MessagePort& mensagens, QWidget* pai = nullptr,
                lookups::JanelaPesquisa* janela = nullptr);

    QLineEdit* txtCaixa() const { return txtCaixa_; }
    QLabel* lblCaixa() const { return lblCaixa_; }

  private:
    void pesquisa(bool forcar);
    void confirma();

    app::Estado& estado_;
    MessagePort& mensagens_;
    lookups::PesquisaEmJanela janelaPropria_;
    lookups::PesquisaTabelas pesquisaTabelas_;
    QLineEdit* txtCaixa_;
    QLabel* lblCaixa_;
};

}  // namespace brasel::cash
