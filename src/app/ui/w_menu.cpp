#include "app/ui/w_menu.h"

#include "app/actualizador.h"
#include "app/config_cfg.h"
#include "app/definicoes_posto.h"
#include "app/menu_principal.h"
#include "app/ui/a_configura_rest.h"
#include "app/ui/acessos_janela.h"
#include "app/ui/frm_acessos.h"
#include "app/ui/frm_muda_utilizador.h"
#include "app/verifica_versao.h"
#include "cash/ui/frm_alt_caixa.h"
#include "cash/ui/frm_registo_de_caixa.h"
#include "common/ui/estilo_tactil.h"
#include "common/versao.h"
#include "devices/escolha_impressao.h"
#include "devices/mostra_no_display.h"
#include "documents/ui/frm_factura_cli_2via.h"
#include "pos/ui/frm_facturacao.h"

#include <QApplication>
#include <QCloseEvent>
#include <QMdiSubWindow>
#include <QMenuBar>
#include <QMessageBox>
#include <QPixmap>
#include <QPrintDialog>
#include <QPrinter>
#include <QStatusBar>
#include <QToolBar>

#include <memory>

namespace brasel::app {

namespace {

// How often the main window looks whether a newer program updated the database.
constexpr int kIntervaloVersaoMs = 60 * 1000;

}  // namespace

CatalogoJanelas catalogoPrograma(Estado& estado, MessagePort& mensagens,
                                 devices::LinhaSerie& linha) {
    CatalogoJanelas catalogo;
    catalogo.registar(QStringLiteral("Movimentos Gerais"),
                      [&estado, &linha](QWidget* pai) -> QWidget* {
                          return new pos::frmFacturacao(estado, linha, pai);
                      });
    catalogo.registar(QStringLiteral("Segundas Vias de Documentos"),
                      [&estado, &mensagens, &linha](QWidget* pai) -> QWidget* {
                          return new documents::frmFacturaCli2Via(estado, mensagens, linha, pai);
                      });
    catalogo.registar(QStringLiteral("Registo de Caixa"),
                      [&estado, &mensagens](QWidget* pai) -> QWidget* {
                          return new cash::frmRegistoDeCaixa(estado, mensagens, pai);
                      });
    catalogo.registar(QStringLiteral("Configurações"),
                      [&estado, &mensagens](QWidget* pai) -> QWidget* {
                          return new AConfiguraRest(estado, mensagens, pai);
                      });
    catalogo.registar(QStringLiteral("Acessos dos Utilizadores"),
                      [&estado, &mensagens, &linha](QWidget* pai) -> QWidget* {
                          return new frmAcessos(
                              estado, mensagens,
                              [&estado, &mensagens, &linha] {
                                  return catalogoPrograma(estado, mensagens, linha).descricoes();
                              },
                              pai);
                      });
    return catalogo;
}

WMenu::WMenu(Estado& estado, QWidget* pai)
    : QMainWindow(pai),
      estado_(estado),
      mensagens_(this),
      area_(new QMdiArea(this)),
      linha_(MapaPortas::ler(estado.config.mapaPortas)),
      cozinha_(estado, linha_, mensagens_),
      catalogo_(catalogoPrograma(estado, mensagens_, linha_)) {
    setObjectName(QStringLiteral("WMenu"));
    setWindowTitle(QStringLiteral("Brasel"));
    setCentralWidget(area_);
    resize(1024, 768);
    for (int i = 0; i < 5; ++i) {
        auto* painel = new QLabel(this);
        painel->setObjectName(QStringLiteral("Painel%1").arg(i + 1));
        painel->setMargin(4);
        statusBar()->addPermanentWidget(painel, i == 0 ? 2 : 1);
        paineis_.append(painel);
    }
    statusBar()->setSizeGripEnabled(false);
    criarMenu();
    aplicaFonteTactil(this);
    connect(&relogio_, &QTimer::timeout, this, &WMenu::actualizaBarraEstado);
    connect(&versao_, &QTimer::timeout, this, &WMenu::verificaVersao);
    pedidos_.setObjectName(QStringLiteral("tmrPedidos"));
    connect(&pedidos_, &QTimer::timeout, this, [this] { cozinha_.tmrPedidos_Timer(); });
}

void WMenu::criarMenu() {
    // Every entry is also a large button of the touch bar: one action serves both.
    auto* barra = addToolBar(QStringLiteral("Menu"));
    barra->setObjectName(QStringLiteral("barraTactil"));
    barra->setMovable(false);
    barra->setToolButtonStyle(Qt::ToolButtonTextOnly);
    auto accao = [this, barra](QMenu* menu, const char* nome, const QString& texto, auto&& fazer) {
        QAction* a = menu->addAction(texto);
        a->setObjectName(QLatin1String(nome));
        connect(a, &QAction::triggered, this, fazer);
        barra->addAction(a);
        if (QWidget* botao = barra->widgetForAction(a)) botao->setMinimumHeight(64);
        return a;
    };
    QMenu* movimentos = menuBar()->addMenu(QStringLiteral("&Movimentos"));
    movimentos->setObjectName(QStringLiteral("mnuMovimentos"));
    accao(movimentos, "Testes", QStringLiteral("&Mesas / Facturação"),
          [this] { abrirFacturacao(); });
    accao(movimentos, "mnuFacturaCli2Via", QStringLiteral("&Segundas Vias de Documentos..."),
          [this] {
              auto* janela = new documents::frmFacturaCli2Via(estado_, mensagens_, linha_, area_);
              abrirJanela(janela, QStringLiteral("Segundas Vias de Documentos"));
          });
    accao(movimentos, "mnuRegistoCaixa", QStringLiteral("&Registo de Caixa..."), [this] {
        abrirDialogo(new cash::frmRegistoDeCaixa(estado_, mensagens_, this),
                     QStringLiteral("Registo de Caixa"));
    });
    QMenu* utilitarios = menuBar()->addMenu(QStringLiteral("&Utilitários"));
    utilitarios->setObjectName(QStringLiteral("mnuUtilitarios"));
    accao(utilitarios, "DefBott_Fonte", QStringLiteral("&Configurações..."),
          [this] { configurar(); });
    accao(utilitarios, "mnuAcessos", QStringLiteral("&Acessos dos Utilizadores..."),
          [this] { editarAcessos(); });
    accao(utilitarios, "mnuAbreCaixa", QStringLiteral("Abrir &Gaveta"), [this] { abrirGaveta(); });
    accao(utilitarios, "mnuAlterarCaixa", QStringLiteral("Alterar &Caixa..."), [this] {
        cash::frmAltCaixa janela(estado_, mensagens_, this);
        if (janela.exec() == QDialog::Accepted) actualizaBarraEstado();
    });
    accao(utilitarios, "mnuDefImpressorass", QStringLiteral("Definir &Impressora..."),
          [this] { configurarImpressora(); });
    QMenu* utilizador = menuBar()->addMenu(QStringLiteral("U&tilizador"));
    utilizador->setObjectName(QStringLiteral("mnuUtilizador"));
    accao(utilizador, "AlterarUtil", QStringLiteral("&Alterar Utilizador..."),
          [this] { mudarUtilizador(); });
    accao(utilizador, "LogOff", QStringLiteral("&Terminar Sessão"), [this] { close(); });
    QMenu* ajuda = menuBar()->addMenu(QStringLiteral("A&juda"));
    ajuda->setObjectName(QStringLiteral("mnuAjuda"));
    accao(ajuda, "Informa", QStringLiteral("&Acerca do Brasel"), [this] { acercaDe(); });
}

bool WMenu::carregar() {
    devices::MostraAguardeNoDisplay(estado_, linha_);
    if (!carregarMenuPrincipal(estado_, mensagens_)) return false;
    aplicaUtilizador();
    // The menu and the touch bar stand on the user's colour: their texts are light.
    for (QWidget* barra :
         {static_cast<QWidget*>(menuBar()), findChild<QWidget*>(QStringLiteral("barraTactil"))}) {
        QPalette paleta = barra->palette();
        paleta.setColor(QPalette::ButtonText, Qt::white);
        paleta.setColor(QPalette::WindowText, Qt::white);
        barra->setPalette(paleta);
    }
    aplicaFundo();
    actualizaBarraEstado();
    relogio_.start(1000);
    versao_.start(kIntervaloVersaoMs);
    programaCozinha();
    return true;
}

void WMenu::programaCozinha() {
    pedidos_.start(posto::ConfigRest_TempoImpTalaoCozinha.ler() * 1000);
}

void WMenu::abrirGaveta() {
    // The drawer may take a moment (a driver job): the hourglass says the press was taken.
    QApplication::setOverrideCursor(Qt::WaitCursor);
    devices::AbreGavetaTalao(estado_, linha_, QString(), true);
    QApplication::restoreOverrideCursor();
}

void WMenu::aplicaFundo() {
    const QPixmap imagem(posto::ConfigRest_BotaoIMG.ler());
    if (imagem.isNull()) {
        area_->setBackground(palette().brush(QPalette::Window));
    } else {
        area_->setBackground(QBrush(imagem));
    }
}

bool WMenu::abrirJanela(QWidget* janela, const QString& caption) {
    if (!verificarAcesso(estado_, janela, caption, mensagens_)) {
        delete janela;
        return false;
    }
    janela->setAttribute(Qt::WA_DeleteOnClose);
    QMdiSubWindow* sub = area_->addSubWindow(janela);
    sub->show();
    return true;
}

bool WMenu::abrirDialogo(QDialog* dialogo, const QString& caption) {
    const std::unique_ptr<QDialog> dono(dialogo);
    if (!verificarAcesso(estado_, dialogo, caption, mensagens_)) return false;
    dialogo->exec();
    return true;
}

void WMenu::abrirFacturacao() {
    auto* janela = new pos::frmFacturacao(estado_, linha_, area_);
    if (abrirJanela(janela, QStringLiteral("Movimentos Gerais"))) janela->showMaximized();
}

void WMenu::configurar() {
    auto* janela = new AConfiguraRest(estado_, mensagens_, this);
    connect(janela, &AConfiguraRest::configuracaoGravada, this, [this] {
        aplicaFundo();
        programaCozinha();
    });
    abrirDialogo(janela, QStringLiteral("Configurações"));
}

void WMenu::editarAcessos() {
    abrirDialogo(new frmAcessos(
                     estado_, mensagens_, [this] { return catalogo_.descricoes(); }, this),
                 QStringLiteral("Acessos dos Utilizadores"));
}

void WMenu::mudarUtilizador() {
    frmMudaUtilizador janela(estado_, mensagens_, this);
    if (janela.Muda_de_Utilizador()) {
        aplicaUtilizador();
        actualizaBarraEstado();
    }
}

void WMenu::aplicaUtilizador() {
    aplicaCorFundo(this, estado_.gUtilizador);
    findChild<QAction*>(QStringLiteral("mnuAlterarCaixa"))
        ->setEnabled(alteraCaixaPermitido(estado_));
}

void WMenu::actualizaBarraEstado() {
    const QStringList textos = paineisBarraEstado(estado_, QDate::currentDate());
    for (int i = 0; i < paineis_.size() && i < textos.size(); ++i)
        paineis_[i]->setText(textos[i]);
}

void WMenu::verificaVersao() {
    if (compararVersaoBD(estado_) != ComparacaoVersao::BaseMaisNova) return;
    // Stopped before the message, so it is shown once.
    versao_.stop();
    mensagens_.mensagem(
        QStringLiteral("Atenção que a base de dados foi actualizada por uma versão do "
                       "aplicativo superior à sua !"),
        Icone::Critico);
    ProcessaActualizacoes(estado_.config.pastaActualizacoes, mensagens_);
}

void WMenu::acercaDe() {
    QMessageBox::about(this, QStringLiteral("Acerca do Brasel"),
                       QStringLiteral("Brasel %1\nPonto de venda para restauração.\n\nEmpresa: %2")
                           .arg(versaoComPontos(), estado_.gNomeEmpresa));
}

void WMenu::configurarImpressora() {
    QPrinter impressora;
    QPrintDialog dialogo(&impressora, this);
    dialogo.exec();
}

void WMenu::closeEvent(QCloseEvent* evento) {
    area_->closeAllSubWindows();
    if (!area_->subWindowList().isEmpty()) {
        evento->ignore();
        return;
    }
    relogio_.stop();
    versao_.stop();
    pedidos_.stop();
    if (!terminado_) {
        terminado_ = true;
        devices::MostraEncerradoNoDisplay(estado_, linha_);
        fecharMenuPrincipal(estado_);
        Q_EMIT terminou();
    }
    evento->accept();
}

}  // namespace brasel::app
