#pragma once

#include "app/estado.h"
#include "common/currency.h"

#include <QDialog>
#include <QLabel>
#include <QString>
#include <QWidget>

namespace brasel::cash {

// The change shown in large figures after the document is recorded, until the closing closes
// it; it does not block the order screen.
class frmTrocoEspera : public QDialog {
    Q_OBJECT
  public:
    frmTrocoEspera(app::Estado& estado, QWidget* pai = nullptr);

    // "ABRIR" shows `documento` (type, "Nº " and number, date, a line each) and the amounts;
    // "FECHAR" closes the screen.
    void Abrir(const QString& documento, const QString& modo, Currency total, Currency entregou,
               Currency troco);

  private:
    app::Estado& estado_;
    QLabel* lblDocumento_;
    QLabel* lblTotalDoc_;
    QLabel* lblEntregou_;
    QLabel* lblTroco_;
};

}  // namespace brasel::cash
