#pragma once

#include "app/estado.h"
#include "common/message_port.h"

#include <QDialog>
#include <QTreeWidget>

namespace brasel::pos {

// Which products are made in the kitchen (ticked: queued for the kitchen) and which are served
// at the bar (printed at once). A touch on a row inverts its tick; cmdGravar stores every row.
class frmConfigProdutos : public QDialog {
    Q_OBJECT
  public:
    frmConfigProdutos(app::Estado& estado, MessagePort& mensagens, QWidget* pai = nullptr);

    void CarregarProdutos();
    QTreeWidget* lvwLista() const { return lista_; }

  private:
    void gravar();

    app::Estado& estado_;
    MessagePort& mensagens_;
    QTreeWidget* lista_;
};

}  // namespace brasel::pos
