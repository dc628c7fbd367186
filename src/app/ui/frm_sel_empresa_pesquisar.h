#pragma once

#include "app/empresas.h"

#include <QDialog>
#include <QList>

class QLineEdit;
class QTreeWidget;

namespace brasel::app {

// Search within the company list by code or name: the rows that match what is typed; OK (or a
// double touch) chooses one.
class frmSelEmpresaPesquisar : public QDialog {
    Q_OBJECT

  public:
    explicit frmSelEmpresaPesquisar(QList<LinhaEmpresa> linhas, QWidget* pai = nullptr);

    // The index in the company list of the chosen row; -1 when none is chosen.
    int escolhida() const;

  private:
    void procurar();

    QList<LinhaEmpresa> linhas_;
    QLineEdit* txtPesquisa_;
    QTreeWidget* lvwResultado_;
};

}  // namespace brasel::app
