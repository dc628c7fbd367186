#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "common/message_port.h"
#include "devices/escolha_impressao.h"
#include "devices/linha_serie.h"

#include <QCheckBox>
#include <QDialog>
#include <QSpinBox>

namespace brasel::devices {

// The print-choice dialog shown before a receipt: no receipt, the purchase ticket, or the
// accounting document (optionally with the observation instead of the lines), how many copies,
// and a button that opens the drawer.
class frmImpresao : public QDialog {
    Q_OBJECT
  public:
    frmImpresao(app::Estado& estado, MessagePort& mensagens, LinhaSerie& linha,
                QWidget* pai = nullptr);

    // Modal. The choice and copies packed as EmpacotaEscolha says (DesempacotaEscolha reads
    // them back); 0 (no receipt) when the user has no POS configuration or the window is closed.
    Currency Abrir(const QString& tipoDocumento);

  private:
    void escolhe(int escolha);

    app::Estado& estado_;
    MessagePort& mensagens_;
    LinhaSerie& linha_;
    EscolhaImpressao escolha_;
    QSpinBox* txtVias_;
    QCheckBox* chkImpObservacao_;
};

}  // namespace brasel::devices
