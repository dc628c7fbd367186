// The brasel program: start-up, then the company selection; from there the windows lead.
#include "app/arranque.h"
#include "app/config_cfg.h"
#include "app/estado.h"
#include "app/instancia_unica.h"
#include "app/ui/fluxo_entrada.h"
#include "app/ui/w_menu.h"
#include "common/ui/mensagens_janela.h"
#include "devices/linha_serie.h"

#include <QApplication>
#include <QFileInfo>
#include <QTimer>

#include <cstdio>

namespace {

QString pastaPrograma() {
    return QFileInfo(QFileInfo(QStringLiteral("/proc/self/exe")).canonicalFilePath())
        .absolutePath();
}

bool temEcra() {
    return !qEnvironmentVariableIsEmpty("DISPLAY") ||
           !qEnvironmentVariableIsEmpty("WAYLAND_DISPLAY") ||
           !qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM");
}

}  // namespace

int main(int argc, char** argv) {
    using namespace brasel;
    QStringList argumentos;
    for (int i = 0; i < argc; ++i)
        argumentos << QString::fromLocal8Bit(argv[i]);
    const app::ArgumentosPrograma args = app::lerArgumentos(argumentos);

    app::Estado estado;
    // The updater's check runs before any window, and without a screen.
    if (app::LeLinhaComando(args.linhaComando, estado, pastaPrograma()) ==
        app::AccaoLinhaComando::Terminar) {
        return 0;
    }
    if (!temEcra()) {
        std::fprintf(
            stderr,
            "Brasel precisa de um ecrã gráfico e esta sessão não tem nenhum (DISPLAY vazio): "
            "corra-o numa sessão gráfica, ou num ecrã virtual com: xvfb-run -a %s\n",
            argv[0]);
        return 1;
    }
    QApplication aplicacao(argc, argv);
    QApplication::setApplicationName(QStringLiteral("Brasel"));
    MensagensJanela mensagens;

    app::InstanciaUnica instancia;
    if (!instancia.adquirir(mensagens)) return 1;
    app::forcarFormatoNumeros();
    app::preencheEstadoInicial(estado);
    if (app::LeConfigCfg(estado.config, mensagens, args.config) == app::LeituraConfig::Terminar)
        return 1;

    // The windows built to describe their buttons for a new user's rights never open a port.
    devices::LinhaSerie linhaDescricoes;
    app::FluxoEntrada fluxo(
        estado, mensagens, args.linhaComando,
        [&estado, &mensagens, &linhaDescricoes] {
            return app::catalogoPrograma(estado, mensagens, linhaDescricoes).descricoes();
        },
        [](app::Estado& e) -> QWidget* {
            auto* menu = new app::WMenu(e);
            // A company without its parameters row cannot be worked in: the
            // program ends.
            if (!menu->carregar()) QTimer::singleShot(0, qApp, [] { QCoreApplication::exit(1); });
            return menu;
        });
    QObject::connect(&fluxo, &app::FluxoEntrada::terminado, &aplicacao, &QCoreApplication::quit);
    fluxo.iniciar();
    return aplicacao.exec();
}
