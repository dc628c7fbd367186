// A product press on the order screen, from the handler to the line shown in the tab's list,
// against the bare insert of one MovProduto row on the same connection; on an embedded company
// holding 1,000,000 history lines and 5,000 more products, and on PostgreSQL when BRASEL_TEST_PG
// names a server. Each press is timed on its own: the median and the 99th percentile are
// reported as counters (microseconds).
#include "apoio_bench.h"
#include "db/procedimentos/mete_no_mov_pro.h"
#include "pos/abertura_mesa.h"
#include "pos/adicionar_produto.h"
#include "support/mensagens_gravadas.h"

#include <QDate>

#include <memory>

namespace {

using namespace brasel;
using bench::cronometra;
using bench::Medidas;

constexpr int kProdutos = 5000;
constexpr int kHistorico = 1000000;
// The tab is emptied every so many presses, as a table is closed: a tab of thousands of lines
// would measure the totals of an impossible table.
constexpr int kLinhasPorMesa = 40;

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

// The open tab of table M01 under the cash-sale type, on a company already filled.
struct Cenario {
    app::Estado* estado = nullptr;
    testing::MensagensGravadas mensagens;
    devices::LinhaSerie linha;
    bench::SemPerguntas perguntas;
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

// The embedded demo company, and a PostgreSQL one of its own when a server is named, each
// filled with the history.
bench::Empresas<Cenario> gEmpresas(
    [](app::Estado& e, Cenario& c) { return preencheHistorico(e.gConn) && c.abre(e); },
    QLatin1Char('B'));

void BM_PressaoProdutoEmbutida(benchmark::State& state) {
    if (auto* c = gEmpresas.embutida(state)) pressoes(state, *c);
}
BENCHMARK(BM_PressaoProdutoEmbutida)->Unit(benchmark::kMicrosecond)->Iterations(2000);

void BM_InsercaoNuaEmbutida(benchmark::State& state) {
    if (auto* c = gEmpresas.embutida(state)) insercoes(state, *c->estado);
}
BENCHMARK(BM_InsercaoNuaEmbutida)->Unit(benchmark::kMicrosecond)->Iterations(2000);

void BM_PressaoProdutoPostgres(benchmark::State& state) {
    if (auto* c = gEmpresas.postgres(state)) pressoes(state, *c);
}
BENCHMARK(BM_PressaoProdutoPostgres)->Unit(benchmark::kMicrosecond)->Iterations(500);

void BM_InsercaoNuaPostgres(benchmark::State& state) {
    if (auto* c = gEmpresas.postgres(state)) insercoes(state, *c->estado);
}
BENCHMARK(BM_InsercaoNuaPostgres)->Unit(benchmark::kMicrosecond)->Iterations(500);

}  // namespace

int main(int argc, char** argv) {
    return bench::correBenchmarks(argc, argv, gEmpresas);
}
