#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "pos/perguntas_fecho.h"

#include <QCheckBox>
#include <QDialog>
#include <QLabel>
#include <QLineEdit>

#include <optional>

namespace brasel::pos {

// The walk-in customer's data of a document: tax number, name, attention-of, address, town,
// postal code (with its lookup) and country, with the document's date shown. With the load-data
// box ticked, a tax number typed fills the rest from the newest document that carries it.
class frmDadosCliDiv : public QDialog {
    Q_OBJECT
  public:
    frmDadosCliDiv(app::Estado& estado, MessagePort& mensagens, QWidget* pai = nullptr);

    // Shows the form modally with `propostos` for a document dated `data` ("yyyy-MM-dd"): the
    // data confirmed, or nullopt when cancelled.
    std::optional<DadosClienteDiverso> Abrir(const DadosClienteDiverso& propostos,
                                             const QString& data, bool lancaSemContribuinte);

    QLineEdit* txtContribuinte() const { return txtContribuinte_; }
    QCheckBox* chkCarregaDados() const { return chkCarregaDados_; }
    // What the fields hold now.
    DadosClienteDiverso dados() const;

  private:
    QLineEdit* campo(const char* nome);
    void mostra(const DadosClienteDiverso& d);
    void carregaDados();
    void pesquisaCodPost();
    void fechaDiv();

    app::Estado& estado_;
    MessagePort& mensagens_;
    QString data_;
    bool lancaSemContribuinte_ = false;
    QLineEdit* txtContribuinte_;
    QLineEdit* txtNomeCli_;
    QLineEdit* txtDeferencia_;
    QLineEdit* txtMorada_;
    QLineEdit* txtLocal_;
    QLineEdit* txtCodPost_;
    QLineEdit* txtPais_;
    QLabel* lblData_;
    QCheckBox* chkCarregaDados_;
};

}  // namespace brasel::pos
