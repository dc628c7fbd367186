#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "devices/linha_serie.h"

#include <QLineEdit>
#include <QTableWidget>
#include <QWidget>

namespace brasel::documents {

// Copies of closed customer documents: the latest documents, filtered by type, number or
// customer, and the key of the one to print (type, number, year). Printing checks the
// signature first; a user who prints tickets ("T") gets the print-choice dialog and the
// receipt, any other user the full A4 page.
class frmFacturaCli2Via : public QWidget {
    Q_OBJECT
  public:
    frmFacturaCli2Via(app::Estado& estado, MessagePort& mensagens, devices::LinhaSerie& linha,
                      QWidget* pai = nullptr);

    // Reads the list again with the filter's text.
    void carregarLista();
    // Prints the document of the key fields; false when nothing was printed.
    bool imprimir();

  private:
    void seleccionou();

    app::Estado& estado_;
    MessagePort& mensagens_;
    devices::LinhaSerie& linha_;
    QLineEdit* txtFiltro_;
    QTableWidget* lvwDocumentos_;
    QLineEdit* txtTipo_;
    QLineEdit* txtNumero_;
    QLineEdit* txtAno_;
};

}  // namespace brasel::documents
