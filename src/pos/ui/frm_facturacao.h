#pragma once

#include "app/estado.h"
#include "common/ui/mensagens_janela.h"
#include "devices/linha_serie.h"
#include "pos/tab.h"
#include "pos/ui/perguntas_fecho_janela.h"
#include "pos/ui/perguntas_janela.h"

#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QTimer>
#include <QTreeWidget>
#include <QWidget>

#include <array>

namespace brasel::pos {

// The order screen ("Movimentos Gerais"): the table and type of the tab on top, the product
// buttons of the chosen group on the left, the tab's lines with their totals on the right, the
// actions below. Opened from the main window's menu; `linha` is the main window's serial control
// (bar tickets and the customer display).
class frmFacturacao : public QWidget {
    Q_OBJECT
  public:
    frmFacturacao(app::Estado& estado, devices::LinhaSerie& linha, QWidget* pai = nullptr);

    Tab& tab() { return tab_; }
    // Puts a code in the table box and opens it, as typing it does.
    void abrirMesa(const QString& codigo);
    // Shows the buttons of one group (family, sub-family) of the menu level.
    void escolherGrupo(const QString& codigo);
    // Fills the product buttons for the current group.
    void CarregarProdutos();
    // Shows the tab's lines and totals as the tab holds them.
    void mostraLista();
    // The busy lamp.
    void Luzes(char cor);

    QTreeWidget* lvwLista() const { return lvwLista_; }
    QListWidget* lvwListaProdutos() const { return lvwListaProdutos_; }
    QLabel* lblTotal() const { return lblTotal_; }

  protected:
    void closeEvent(QCloseEvent* evento) override;

  private:
    QWidget* criaTopo();
    QWidget* criaProdutos();
    QWidget* criaLinhas();
    QWidget* criaAccoes();
    QPushButton* botao(const char* nome, const QString& texto);
    void criaColunas();
    void mostraCabecalho();
    void mostraTotais();
    std::int64_t linhaSeleccionada() const;

    void produtoPremido(QListWidgetItem* item);
    void linhaMarcada(QTreeWidgetItem* item, int coluna);
    void linhaDuploClique(QTreeWidgetItem* item);
    void cmdMesas();
    void cmdGrupo();
    void cmdQty();
    void cmdPreco();
    void cmdObserva();
    void cmdEliminarpro();
    void cmdAltQtyJaLancada();
    void cmdAltCliente();
    void cmdAlterarTipo();
    void cmdImputCodigoBarras();
    void cmdPedidosCozinha();
    void cmdGravarDoc();
    void cmdTalao();
    void cmdImpDocAberto();
    // After a closing: the next customer's table (or none) and its lines.
    void mostraTudo();

    app::Estado& estado_;
    MensagensJanela mensagens_;
    PerguntasJanela perguntas_;
    Tab tab_;
    PerguntasFechoJanela perguntasFecho_;
    QString nivel_;
    QString grupo_ = QStringLiteral("000");
    bool aPreencher_ = false;

    QLineEdit* txtCliente_;
    QLabel* lblCliente_;
    QLineEdit* txtTipo_;
    QLabel* lblTipo_;
    QLabel* lblGrupo_;
    QLabel* shpVerde_;
    QLabel* shpVermelho_;
    QListWidget* lvwListaProdutos_;
    QTreeWidget* lvwLista_;
    QLabel* lblTotal_;
    QLabel* lblResumo_;
    std::array<QLabel*, 4> lblInc_{};
    QPushButton* cmdQty_;
    QPushButton* cmdPreco_;
    QPushButton* cmdAlterarTipo_;
    QPushButton* cmdPedidosCozinha_;
    QTimer timer1_;
};

}  // namespace brasel::pos
