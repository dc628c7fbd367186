#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "pos/cozinha/pedidos_cozinha.h"

#include <QDialog>
#include <QList>
#include <QTreeWidget>

namespace brasel::pos {

// The kitchen orders waiting for release ("Pedidos da Cozinha"), opened from the order screen:
// the checked rows are released to the kitchen printer or dropped, and a row's note is edited
// by double-touching it.
class APedidos : public QDialog {
    Q_OBJECT
  public:
    APedidos(app::Estado& estado, MessagePort& mensagens, cozinha::EditorTexto& editor,
             QWidget* pai = nullptr);

    QTreeWidget* lvwPedidos() const { return lista_; }

  private:
    void refresh();
    QList<qint64> marcados() const;
    void imprimir();
    void eliminar();
    void editaObs(QTreeWidgetItem* item);

    app::Estado& estado_;
    cozinha::PedidosCozinha pedidos_;
    QTreeWidget* lista_;
};

}  // namespace brasel::pos
