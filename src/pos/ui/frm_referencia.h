#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "lookups/pesquisa_tabelas.h"
#include "pos/perguntas_tab.h"

#include <QDialog>
#include <QLabel>
#include <QLineEdit>
#include <QWidget>

#include <array>
#include <optional>

namespace brasel::pos {

// The reference of a reference-managed product being added to a tab: its seven attributes
// (estação, sexo, referência, modelo, cor, tamanho, comprimento, captioned as the company names
// them) and its supplier. Each code is typed and checked against its table, or chosen in the
// search window by the button beside it. OK (cmdOK) takes what the fields hold (a missing
// supplier is refused by the caller), cmdCancelar nothing.
class frmReferencia : public QDialog {
    Q_OBJECT
  public:
    // The fields in order: the seven attributes, then the supplier.
    static constexpr int kCampos = 8;

    frmReferencia(app::Estado& estado, lookups::PesquisaTabelas& pesquisa, const QString& produto,
                  QWidget* pai = nullptr);

    // Shows the form modally: the attributes and supplier, nullopt when cancelled.
    std::optional<ReferenciaEscolhida> escolher();

    // txtEstacao .. txtComprimento, txtFornecedor.
    QLineEdit* txtCampo(int i) const { return codigos_[static_cast<std::size_t>(i)]; }
    QLabel* lblCampo(int i) const { return descricoes_[static_cast<std::size_t>(i)]; }

  private:
    void procura(int i, bool forcar);
    void confirmar();

    lookups::PesquisaTabelas& pesquisa_;
    std::array<QLineEdit*, kCampos> codigos_{};
    std::array<QLabel*, kCampos> descricoes_{};
    ReferenciaEscolhida escolhida_;
};

}  // namespace brasel::pos
