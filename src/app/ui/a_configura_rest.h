#pragma once

#include "app/configuracao_rest.h"
#include "app/estado.h"
#include "common/message_port.h"
#include "lookups/pesquisa_tabelas.h"
#include "lookups/ui/w_pesquisa_nova.h"

#include <QButtonGroup>
#include <QCheckBox>
#include <QColor>
#include <QComboBox>
#include <QDialog>
#include <QFontComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QSpinBox>

namespace brasel::app {

// The restaurant configuration of this workstation ("Configurações"): cash register, look,
// ticket printers, kitchen poll, cash drawer and the order screen's switches. Every setting is
// saved when the window closes; the kitchen poll also at once with its own button.
class AConfiguraRest : public QDialog {
    Q_OBJECT
  public:
    AConfiguraRest(Estado& estado, MessagePort& mensagens, QWidget* pai = nullptr);

    // The settings as the window shows them now.
    ConfiguracaoRest configuracao() const;

    void done(int resultado) override;

  Q_SIGNALS:
    // The settings were written (the main window takes its timer interval and printer again).
    void configuracaoGravada();

  private:
    // A code box, the description beside it, and its table's lookup.
    struct CampoCodigo {
        QLineEdit* codigo;
        QLabel* descricao;
        CodigoConfiguracao tabela;
    };

    QWidget* paginaPosto();
    QWidget* paginaImpressoras();
    QWidget* paginaOpcoes();
    CampoCodigo campoCodigo(const QString& nome, CodigoConfiguracao tabela, QHBoxLayout* linha);
    QButtonGroup* grupoPortas(const QString& nome, QWidget* pai);
    QCheckBox* opcao(const QString& nome, const QString& texto);
    void mostra(const ConfiguracaoRest& c);
    void mostraCor();
    // Validates the typed code, or with `forcar` opens the search window.
    void pesquisa(const CampoCodigo& campo, bool forcar);
    void escolheImagem();
    void escolheCor();
    void gravaTempo();

    Estado& estado_;
    MessagePort& mensagens_;
    lookups::PesquisaEmJanela janelaPesquisa_;
    lookups::PesquisaTabelas pesquisaTabelas_;
    QColor cor_;

    CampoCodigo caixa_;
    QFontComboBox* cmbFonte_;
    QLineEdit* txtImagem_;
    QLabel* lblCor_;
    QButtonGroup* nivelEmenta_;
    CampoCodigo tipoImprimeMesa_;
    CampoCodigo impCozinha_;
    QButtonGroup* portaCozinha_;
    QComboBox* cmbImpCozinhaNome_;
    CampoCodigo impBar_;
    QButtonGroup* portaBar_;
    QSpinBox* spnTempoCozinha_;
    QLineEdit* txtCaixaDinheiro_;
    QCheckBox* chkPrecoIncBrowse_;
    QCheckBox* chkPedePWD_;
    QCheckBox* chkDesactivaPassword_;
    QCheckBox* chkActivaProdutosFacturaREST_;
    QCheckBox* chkLimpaDocAposFechaDoc_;
};

}  // namespace brasel::app
