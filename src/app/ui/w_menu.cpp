#include "app/ui/w_menu.h"

#include "app/actualizador.h"
#include "app/definicoes_posto.h"
#include "app/menu_principal.h"
#include "app/ui/acessos_janela.h"
#include "app/verifica_versao.h"
#include "common/ui/estilo_tactil.h"
#include "common/versao.h"

#include <QCloseEvent>
#include <QMdiSubWindow>
#include <QMenuBar>
#include <QMessageBox>
#include <QPixmap>
#include <QPrintDialog>
#include <QPrinter>
#include <QStatusBar>

namespace brasel::app {

namespace {

// How often the main window looks whether a newer program updated the database.
constexpr int kIntervaloVersaoMs = 60 * 1000;

}  // namespace

CatalogoJanelas catalogoPrograma(Estado& estado) {
    CatalogoJanelas catalogo;
    (void)estado;
    return catalogo;
}

WMenu::WMenu(Estado& estado, QWidget* pai)
    : QMainWindow(pai),
      estado_(estado),
      mensagens_(this),
      catalogo_(catalogoPrograma(estado)),
      area_(new QMdiArea(this)) {
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
    criarMenu();
    aplicaFonteTactil(this);
    connect(&relogio_, &QTimer::timeout, this, &WMenu::actualizaBarraEstado);
    connect(&versao_, &QTimer::timeout, this, &WMenu::verificaVersao);
}

void WMenu::criarMenu() {
    auto accao = [this](QMenu* menu, const char* nome, const QString& texto, auto&& fazer) {
        QAction* a = menu->addAction(texto);
        a->setObjectName(QLatin1String(nome));
        connect(a, &QAction::triggered, this, fazer);
        return a;
    };
    QMenu* utilitarios = menuBar()->addMenu(QStringLiteral("&Utilitários"));
    utilitarios->setObjectName(QStringLiteral("mnuUtilitarios"));
    accao(utilitarios, "mnuDefImpressorass", QStringLiteral("Definir &Impressora..."),
          [this] { configurarImpressora(); });
    QMenu* utilizador = menuBar()->addMenu(QStringLiteral("U&tilizador"));
    utilizador->setObjectName(QStringLiteral("mnuUtilizador"));
    accao(utilizador, "LogOff", QStringLiteral("&Terminar Sessão"), [this] { close(); });
    QMenu* ajuda = menuBar()->addMenu(QStringLiteral("A&juda"));
    ajuda->setObjectName(QStringLiteral("mnuAjuda"));
    accao(ajuda, "Informa", QStringLiteral("&Acerca do Brasel"), [this] { acercaDe(); });
}

bool WMenu::carregar() {
    if (!carregarMenuPrincipal(estado_, mensagens_)) return false;
    aplicaCorFundo(this, estado_.gUtilizador);
    aplicaFundo();
    actualizaBarraEstado();
    relogio_.start(1000);
    versao_.start(kIntervaloVersaoMs);
    return true;
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
    if (!terminado_) {
        terminado_ = true;
        fecharMenuPrincipal(estado_);
        Q_EMIT terminou();
    }
    evento->accept();
}

}  // namespace brasel::app
