#pragma once

#include "app/estado.h"
#include "devices/balanca.h"
#include "devices/linha_serie.h"

#include <QComboBox>
#include <QDialog>
#include <QLabel>
#include <QLineEdit>

namespace brasel::devices {

// The weighing dialog: the scale's settings of this workstation, the capture button and what
// the scale answered. Opened by the order screen through PortaBalanca for a product sold by
// weight; OK gives the weight captured (0 when none), Cancel gives 0. The settings are saved
// when it closes.
class frmBalanca : public QDialog, public PortaBalanca {
    Q_OBJECT
  public:
    explicit frmBalanca(app::Estado& estado, QWidget* pai = nullptr);

    Currency pesa(Currency precoUnitario) override;
    // The weight of the last capture (0 after a failed one).
    Currency peso() const { return peso_; }

    void done(int resultado) override;

  private:
    void capturar();
    void actualizaTitulo();
    DefinicoesBalanca definicoes() const;

    LinhaSerie linha_;
    Currency precoUnitario_;
    Currency peso_;
    QLabel* lblPreco_;
    QLineEdit* txtPortaCom_;
    QLineEdit* txtInicializar_;
    QLineEdit* txtTimeOut_;
    QComboBox* cmbTipoBalanca_;
    QLabel* lblEstado_;
};

}  // namespace brasel::devices
