// The way into the program against the connections it opens: start-up to the company window with
// its list, and login to the main window, each beside opening the same connections alone.
#include "app/definicoes_posto.h"
#include "app/login.h"
#include "app/seleccao_empresa.h"
#include "app/ui/frm_sel_empresa.h"
#include "app/ui/w_menu.h"
#include "db/connections.h"
#include "support/empresa_teste.h"
#include "support/mensagens_gravadas.h"

#include <QApplication>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

#include <memory>

namespace {

using namespace brasel;

struct Demo {
    QTemporaryDir definicoes;
    std::unique_ptr<testing::EmpresaTeste> empresa;
    app::LinhaEmpresa linha;
};

Demo& demo() {
    static Demo d;
    static const bool feito = [] {
        qputenv("BRASEL_SETTINGS_DIR", d.definicoes.path().toUtf8());
        d.empresa = std::make_unique<testing::EmpresaTeste>(true);
        app::ListaServidores lista = app::lerServidores();
        lista[0].servidor = d.empresa->pasta();
        lista[0].login = testing::EmpresaTeste::login();
        lista[0].definirPassword(testing::EmpresaTeste::password());
        lista[0].tipoAutenticacao = QStringLiteral("SQL");
        app::gravarServidores(lista);
        d.linha = app::listarEmpresas({}, {}, {}).value(0);
        return true;
    }();
    (void)feito;
    return d;
}

// Opening the company database as the company window does; without the pool, a new session of
// the engine each time.
void abreEmpresa(db::Connection& conn, bool semPooling = false) {
    QString password = testing::EmpresaTeste::password();
    db::Abre_Connexao(conn, demo().empresa->pasta(), QStringLiteral("Vendrola0001"),
                      testing::EmpresaTeste::login(), password, {}, QStringLiteral("SQL"), 120, 60,
                      semPooling);
}

void ArranqueAteJanelaEmpresas(benchmark::State& state) {
    Demo& d = demo();
    app::Estado estado;
    testing::MensagensGravadas mensagens;
    for (auto _ : state) {
        auto* janela = new app::frmSelEmpresa(estado, mensagens, QString());
        janela->show();
        QApplication::processEvents();
        if (janela->linhas().isEmpty()) state.SkipWithError("a lista de empresas veio vazia");
        delete janela;
    }
    (void)d;
}

// The company list reads each company over a connection of its own.
void ArranqueSoLigacoes(benchmark::State& state) {
    demo();
    for (auto _ : state) {
        db::Connection master;
        QString password = testing::EmpresaTeste::password();
        db::Abre_Connexao(master, demo().empresa->pasta(), QStringLiteral("Master"),
                          testing::EmpresaTeste::login(), password, {}, QStringLiteral("SQL"), 30,
                          10);
        db::Connection empresa;
        abreEmpresa(empresa);
    }
}

void LoginAteMenuPrincipal(benchmark::State& state) {
    Demo& d = demo();
    testing::MensagensGravadas mensagens;
    for (auto _ : state) {
        app::Estado estado;
        if (app::entrarEmpresa(estado, d.linha, mensagens) != app::ResultadoEmpresa::Login ||
            app::validarLogin(estado, testing::EmpresaTeste::login(),
                              testing::EmpresaTeste::password(), {},
                              mensagens) != app::ResultadoLogin::Entrou) {
            state.SkipWithError("a entrada falhou");
            break;
        }
        auto* menu = new app::WMenu(estado);
        menu->carregar();
        menu->show();
        QApplication::processEvents();
        menu->close();
        delete menu;
    }
}

// Company OK opens gConn; the login opens gConn, gConnAux and gConnLocks again. Argument 1:
// every connection a new session of the engine, as the first login of a workstation finds them.
void LoginSoLigacoes(benchmark::State& state) {
    demo();
    const bool semPooling = state.range(0) == 1;
    for (auto _ : state) {
        db::Connection empresa;
        abreEmpresa(empresa, semPooling);
        db::Connection principal;
        db::Connection aux;
        db::Connection locks;
        for (db::Connection* c : {&principal, &aux, &locks})
            abreEmpresa(*c, semPooling);
    }
}

BENCHMARK(ArranqueAteJanelaEmpresas)
    ->Unit(benchmark::kMillisecond)
    ->Repetitions(7)
    ->ReportAggregatesOnly(true);
BENCHMARK(ArranqueSoLigacoes)
    ->Unit(benchmark::kMillisecond)
    ->Repetitions(7)
    ->ReportAggregatesOnly(true);
BENCHMARK(LoginAteMenuPrincipal)
    ->Unit(benchmark::kMillisecond)
    ->Repetitions(7)
    ->ReportAggregatesOnly(true);
BENCHMARK(LoginSoLigacoes)
    ->Arg(0)
    ->Arg(1)
    ->Unit(benchmark::kMillisecond)
    ->Repetitions(7)
    ->ReportAggregatesOnly(true);

}  // namespace

int main(int argc, char** argv) {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
