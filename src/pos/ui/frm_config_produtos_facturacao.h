#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "lookups/pesquisa_tabelas.h"

#include <QDateEdit>
#include <QDialog>
#include <QLineEdit>
#include <QTreeWidget>

namespace brasel::pos {

// The dated sets of products that get a button on the order screen: a set's code, description
// and period above, every product below, ticked when it belongs to the set. Typing a set's code
// loads it; a code beginning with "\" or "/" searches the sets by description or code.
class frmConfigProdutosFacturacao : public QDialog {
    Q_OBJECT
  public:
    // `pesquisa` serves the searches of the code box; without it such codes are taken as typed.
    frmConfigProdutosFacturacao(app::Estado& estado, MessagePort& mensagens,
                                lookups::PesquisaTabelas* pesquisa = nullptr,
                                QWidget* pai = nullptr);

    void CarregarProdutos();

    QLineEdit* txtCodigo() const { return txtCodigo_; }
    QLineEdit* txtDescricao() const { return txtDescricao_; }
    QDateEdit* txtDataInicial() const { return txtDataInicial_; }
    QDateEdit* txtDataFinal() const { return txtDataFinal_; }
    QTreeWidget* lvwLista() const { return lista_; }

  private:
    void codigoAlterado();
    void proximo();
    void gravar();

    app::Estado& estado_;
    MessagePort& mensagens_;
    lookups::PesquisaTabelas* pesquisa_;
    QString codigoCarregado_;
    QLineEdit* txtCodigo_;
    QLineEdit* txtDescricao_;
    QDateEdit* txtDataInicial_;
    QDateEdit* txtDataFinal_;
    QTreeWidget* lista_;
};

}  // namespace brasel::pos
