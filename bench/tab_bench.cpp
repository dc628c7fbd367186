// A product press on the order screen, from the handler to the line shown in the tab's list,
// against the bare insert of one MovProduto row on the same connection; on an embedded company
// holding 1,000,000 history lines and 5,000 more products, and on PostgreSQL when BRASEL_TEST_PG
// names a server. Each press is timed on its own: the median and the 99th percentile are
// reported as counters (microseconds).
#include "app/carrega_parametros.h"
#include "db/connections.h"
#include "db/demo/restaurante_demo.h"
#include "db/procedimentos/mete_no_mov_pro.h"
#include "db/schema/servidor.h"
#include "pos/abertura_mesa.h"
#include "pos/adicionar_produto.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/mensagens_gravadas.h"
#include "support/servidor_pg.h"

#include <QCoreApplication>
#include <QDate>

#include <benchmark/benchmark.h>

#include <algorithm>
#include <chrono>
#include <memory>
#include <optional>
#include <vector>

namespace {

using namespace brasel;

constexpr int kProdutos = 5000;
constexpr int kHistorico = 1000000;
// The tab is emptied every so many presses, as a table is closed: a tab of thousands of lines
// would measure the totals of an impossible table.
constexpr int kLinhasPorMesa = 40;

// The tab's questions are never asked for the product pressed here.
class SemPerguntas : public pos::PerguntasTab {
  public:
    std::optional<Currency> pedirValor(const QString&) override { return std::nullopt; }
    std::optional<QString> pedirTexto(const QString&, const QString&, bool) override {
        return std::nullopt;
    }
    pos::PrecoQuant pedir(const QString&, const pos::PropostaPrecoQuant&) override { return {}; }
    Currency pesa(Currency) override { return {}; }
    bool passwordSupervisor() override { return false; }
    std::optional<QString> mesa() override { return std::nullopt; }
    std::optional<QString> tipoMovimento() override { return std::nullopt; }
    std::optional<pos::LoteEscolhido> lote(const QString&, Currency) override {
        return std::nullopt;
    }
    std::optional<pos::ReferenciaEscolhida> referencia(const QString&) override {
        return std::nullopt;
    }
};

// The company's history: products and closed lines, one transaction, prepared inserts.
bool preencheHistorico(db::Connection& c) {
    db::WriteTransaction tx(c);
    for (int i = 0; i < kProdutos; ++i) {
        if (!c.exec(QStringLiteral("insert into Produtos (Codigo,Descricao,Grupo,IvaTabVenda,"
                                   "IvaTaxaVenda,PrecoVenda1) values (?,?,'01','IT','13','2.50')"),
                    {QStringLiteral("H%1").arg(i, 5, 10, QLatin1Char('0')),
                     QStringLiteral("Produto %1").arg(i)}))
            return false;
    }
    const QDate inicio = QDate::currentDate().addYears(-3);
    for (int i = 0; i < kHistorico; ++i) {
        const QString data = inicio.addDays(i % 1000).toString(QStringLiteral("yyyy-MM-dd"));
        if (!c.exec(QStringLiteral("insert into MovProduto (Codigo,Descricao,Tipo,Numero,Ano,Data,"
                                   "Preco,QuantNormal,ValorIliq,IvaTabela,CliFor,Terceiro,"
                                   "Utilizador,Fechado,AfectaStk,Identifica) values "
                                   "(?,'Histórico','VD',?,?,?,'2.5','1','2.5','IT','C','M05',"
                                   "'ANA','S','S+',?)"),
                    {QStringLiteral("H%1").arg(i % kProdutos, 5, 10, QLatin1Char('0')),
                     QStringLiteral("%1").arg(i / 10, 8, 10, QLatin1Char('0')), data.left(4), data,
                     QStringLiteral("H%1").arg(i)}))
            return false;
    }
    return tx.commit();
}

struct Medidas {
    std::vector<double> us;

    void relata(benchmark::State& state) {
        if (us.empty()) return;
        std::sort(us.begin(), us.end());
        state.counters["mediana_us"] = us[us.size() / 2];
        state.counters["p99_us"] = us[std::min(us.size() - 1, us.size() * 99 / 100)];
    }
};

template <class F>
double cronometra(F&& f) {
    const auto t0 = std::chrono::steady_clock::now();
    f();
    return std::chrono::duration<double, std::micro>(std::chrono::steady_clock::now() - t0).count();
}

// The open tab of table M01 under the cash-sale type, on a company already filled.
struct Cenario {
    app::Estado* estado = nullptr;
    testing::MensagensGravadas mensagens;
    devices::LinhaSerie linha;
    SemPerguntas perguntas;
    std::unique_ptr<pos::Tab> tab;

    bool abre(app::Estado& e) {
        estado = &e;
        // No pole display answers here: the press is measured without one.
        e.gConn.exec(QStringLiteral("update UtilConfGeral set UsaDisplay=0"));
        tab = std::make_unique<pos::Tab>(e, mensagens, linha);
        return tab->definirTipo(QStringLiteral("VD")) &&
               pos::AbrirMesa(*tab, QStringLiteral("M01"));
    }
    void esvaziaMesa() {
        estado->gConn.exec(QStringLiteral("delete from MovProduto where Terceiro='M01'"));
        tab->CarregarDoc(0);
    }
};

void pressoes(benchmark::State& state, Cenario& c) {
    Medidas m;
    int n = 0;
    for (auto _ : state) {
        if (++n % kLinhasPorMesa == 0) {
            state.PauseTiming();
            c.esvaziaMesa();
            state.ResumeTiming();
        }
        std::int64_t linha = 0;
        m.us.push_back(cronometra(
            [&] { linha = pos::PremirProduto(*c.tab, c.perguntas, QStringLiteral("B015")); }));
        if (linha <= 0) {
            state.SkipWithError("a pressão não lançou a linha");
            break;
        }
    }
    m.relata(state);
    c.esvaziaMesa();
}

void insercoes(benchmark::State& state, app::Estado& estado) {
    Medidas m;
    db::ValoresMovPro v;
    v.Codigo = QStringLiteral("B015");
    v.Descricao = QStringLiteral("Café");
    v.Tipo = QStringLiteral("VD");
    v.CliFor = QStringLiteral("C");
    v.Terceiro = QStringLiteral("M02");
    v.QuantNormal = Currency(1);
    for (auto _ : state) {
        v.Identifica.clear();
        std::int64_t n = 0;
        m.us.push_back(cronometra([&] { n = db::MeteNoMovPro(estado.gConn, v); }));
        if (n <= 0) {
            state.SkipWithError("a inserção falhou");
            break;
        }
    }
    m.relata(state);
    estado.gConn.exec(QStringLiteral("delete from MovProduto where Terceiro='M02'"));
}

// The embedded company, built once.
struct Embutida {
    testing::DefinicoesTemporarias definicoes;
    testing::EmpresaTeste empresa{true};
    Cenario cenario;
    bool pronta = false;
};

Embutida& embutida() {
    static Embutida* e = [] {
        auto* nova = new Embutida;
        nova->pronta = preencheHistorico(nova->empresa.estado().gConn) &&
                       nova->cenario.abre(nova->empresa.estado());
        return nova;
    }();
    return *e;
}

void BM_PressaoProdutoEmbutida(benchmark::State& state) {
    Embutida& e = embutida();
    if (!e.pronta) return state.SkipWithError("empresa por preparar");
    pressoes(state, e.cenario);
}
BENCHMARK(BM_PressaoProdutoEmbutida)->Unit(benchmark::kMicrosecond)->Iterations(2000);

void BM_InsercaoNuaEmbutida(benchmark::State& state) {
    Embutida& e = embutida();
    if (!e.pronta) return state.SkipWithError("empresa por preparar");
    insercoes(state, e.empresa.estado());
}
BENCHMARK(BM_InsercaoNuaEmbutida)->Unit(benchmark::kMicrosecond)->Iterations(2000);

// The same on PostgreSQL: a company of its own with the demo restaurant and the history.
struct Postgres {
    testing::DefinicoesTemporarias definicoes;
    testing::MensagensGravadas mensagens;
    app::Estado estado;
    Cenario cenario;
    QString empresa;
    std::optional<testing::ServidorPg> pg = testing::servidorPg();
    bool criada = false;
    bool pronta = false;

    Postgres() {
        if (!pg) return;
        const auto servidor = db::ServerAddress::parse(pg->servidor);
        const db::schema::Credenciais admin{pg->login, pg->password};
        empresa = QStringLiteral("T%1").arg(QCoreApplication::applicationPid() % 1000, 3, 10,
                                            QLatin1Char('0'));
        QString erro;
        if (!servidor ||
            !(criada = db::schema::criarEmpresa(*servidor, admin, empresa, {}, &erro)) ||
            !db::schema::abrirEmpresa(estado.gConn, *servidor, admin, empresa, &erro) ||
            !db::demo::carregarRestauranteDemo(estado.gConn, pg->password, {}, &erro))
            return;
        estado.gServidor = pg->servidor;
        estado.gEmpresa = empresa;
        estado.gLogin = pg->login.toUpper();
        estado.gUtilizador = QStringLiteral("01");
        app::CarregaParametros(estado, mensagens, {});
        pronta = preencheHistorico(estado.gConn) && cenario.abre(estado);
    }

    // The benchmark's company goes when the program ends.
    void apagar() {
        estado.gConn.close();
        if (!criada) return;
        db::Connection master;
        QString password = pg->password;
        if (db::Abre_Connexao(master, pg->servidor, QStringLiteral("Master"), pg->login, password,
                              {}, QStringLiteral("SQL"), 30, 10, true))
            master.exec(QStringLiteral("DROP DATABASE IF EXISTS %1 WITH (FORCE)")
                            .arg(db::nomeBaseDados(empresa).toLower()));
    }
};

Postgres* gPostgres = nullptr;

Postgres& postgres() {
    if (!gPostgres) gPostgres = new Postgres;
    return *gPostgres;
}

void BM_PressaoProdutoPostgres(benchmark::State& state) {
    Postgres& p = postgres();
    if (!p.pronta) return state.SkipWithError("BRASEL_TEST_PG não definido ou servidor recusou");
    pressoes(state, p.cenario);
}
BENCHMARK(BM_PressaoProdutoPostgres)->Unit(benchmark::kMicrosecond)->Iterations(500);

void BM_InsercaoNuaPostgres(benchmark::State& state) {
    Postgres& p = postgres();
    if (!p.pronta) return state.SkipWithError("BRASEL_TEST_PG não definido ou servidor recusou");
    insercoes(state, p.estado);
}
BENCHMARK(BM_InsercaoNuaPostgres)->Unit(benchmark::kMicrosecond)->Iterations(500);

}  // namespace

int main(int argc, char** argv) {
    QCoreApplication aplicacao(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    if (gPostgres) gPostgres->apagar();
    return 0;
}
