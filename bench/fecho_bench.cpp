// Closing a ten-line tab end to end (checks, number, signed header, lines, cash movement, log,
// commit, the receipt printed on the simulated ticket printer and the tab read again) against the
// bare transaction of the same inserts and updates on the same connection; on the embedded demo
// company, and on PostgreSQL when BRASEL_TEST_PG names a server. Each closing is timed on its own:
// the median and the 99th percentile are reported as counters (microseconds).
#include "apoio_bench.h"
#include "devices/definicao_impressora.h"
#include "impressora.h"
#include "pos/abertura_mesa.h"
#include "pos/adicionar_produto.h"
#include "pos/fecho_tab.h"
#include "support/chave_teste.h"
#include "support/devsim_teste.h"
#include "support/mensagens_gravadas.h"

#include <QDate>

#include <memory>
#include <optional>
#include <vector>

namespace {

using namespace brasel;
using bench::cronometra;
using bench::Medidas;

constexpr int kLinhas = 10;
const char* const kProdutos[] = {"B001", "B003", "B006", "B010", "B015",
                                 "P002", "P005", "P011", "S001", "S003"};

// The cashier: paid in cash with the exact amount, one purchase ticket.
class Caixa : public pos::PerguntasFecho {
  public:
    QString confirmaUtilizador() override { return QStringLiteral("01"); }
    std::optional<cash::Pagamento> pagamento(const QString&, Currency totalDoc,
                                             const pos::AplicaDesconto&) override {
        cash::Pagamento p;
        p.pagaComo = QStringLiteral("NU");
        p.totalDoc = p.valorPagar = p.entregou = totalDoc;
        return p;
    }
    void mostraTroco(const QString&, Currency, Currency, Currency) override {}
    std::optional<pos::DadosClienteDiverso> clienteDiverso(const pos::DadosClienteDiverso& d,
                                                           const QString&) override {
        return d;
    }
    std::optional<std::vector<cash::ParcialPagamento>> divisaoCaixa(Currency total,
                                                                    const QString&) override {
        return std::vector<cash::ParcialPagamento>{{QStringLiteral("NU"), total}};
    }
    devices::EscolhaImpressao escolhaImpressao(const QString&) override {
        return {devices::EscolhaImpressao::TalaoCompra, 1, false};
    }
    bool autorizaSupervisor() override { return false; }
};

// Table M01's tab under the cash-sale type, its receipts going to a simulated ticket printer.
struct Cenario {
    app::Estado* estado = nullptr;
    testing::MensagensGravadas mensagens;
    testing::DevsimTeste devsim;
    std::unique_ptr<devices::LinhaSerie> linha;
    bench::SemPerguntas perguntas;
    Caixa caixa;
    std::unique_ptr<pos::Tab> tab;

    bool abre(app::Estado& e) {
        estado = &e;
        testing::usaChaveTeste(e);
        // No pole display answers here; the receipt goes out without pauses.
        e.gConn.exec(QStringLiteral("update UtilConfGeral set UsaDisplay=0, PausaImpressao=0"));
        const auto definicao = devices::LerDefinicaoImpressora(e.gConn, QStringLiteral("EP1"));
        if (!definicao) return false;
        devsim.liga(1, std::make_shared<devsim::ImpressoraTalao>(definicao->codigos));
        devsim.aplica(e);
        linha = std::make_unique<devices::LinhaSerie>(devsim.mapa());
        mensagens.respostaFinal = true;
        tab = std::make_unique<pos::Tab>(e, mensagens, *linha);
        return tab->definirTipo(QStringLiteral("VD")) &&
               pos::AbrirMesa(*tab, QStringLiteral("M01"));
    }

    // Ten lines on the table, read back as the screen holds them.
    bool enche() {
        for (const char* produto : kProdutos)
            if (pos::PremirProduto(*tab, perguntas, QString::fromLatin1(produto)) <= 0)
                return false;
        return tab->CarregarDoc(0) && tab->lista().linhas.size() == std::size_t(kLinhas);
    }
};

void fechos(benchmark::State& state, Cenario& c) {
    Medidas m;
    for (auto _ : state) {
        state.PauseTiming();
        const bool cheia = c.enche();
        state.ResumeTiming();
        if (!cheia) {
            state.SkipWithError("a mesa não ficou com as dez linhas");
            break;
        }
        pos::Fecho f;
        m.us.push_back(cronometra([&] { f = pos::FecharTab(*c.tab, c.caixa); }));
        if (f.resultado != pos::ResultadoFecho::Fechado) {
            state.SkipWithError(qPrintable(
                QStringLiteral("o fecho falhou (%1): ").arg(int(f.resultado)) +
                c.mensagens.textos().join(u'|') + u'|' + c.mensagens.perguntas().join(u'|')));
            break;
        }
    }
    m.relata(state);
}

// The writes a closing makes, bare: the lock, the header, ten lines closed, the cash row, the
// log row, the table's flag and the counter, in one transaction.
void transaccoesNuas(benchmark::State& state, Cenario& c) {
    Medidas m;
    db::Connection& conn = c.estado->gConn;
    const QString hoje = QDate::currentDate().toString(QStringLiteral("yyyy-MM-dd"));
    qint64 numero = 90000000;
    for (auto _ : state) {
        state.PauseTiming();
        const bool cheia = c.enche();
        std::vector<std::int64_t> linhas;
        for (const auto& l : c.tab->lista().linhas)
            linhas.push_back(l.numRegisto);
        const QString n = QString::number(++numero);
        state.ResumeTiming();
        if (!cheia) {
            state.SkipWithError("a mesa não ficou com as dez linhas");
            break;
        }
        bool ok = true;
        m.us.push_back(cronometra([&] {
            db::WriteTransaction tx(conn);
            ok = conn.exec(QStringLiteral("update LockFacCli set tmp=1")).has_value() &&
                 conn.exec(QStringLiteral("insert into MovCliente (Tipo,Numero,Ano,Codigo,Data,"
                                          "TotalDoc,Hash) values ('VD',?,?,'M01',?,'25.5','x')"),
                           {n, hoje.left(4), hoje})
                     .has_value();
            for (std::int64_t r : linhas)
                ok = ok && conn.exec(QStringLiteral("update MovProduto set Numero=?,Ano=?,Data=?,"
                                                    "Fechado='S' where NumRegisto=?"),
                                     {n, hoje.left(4), hoje, qint64(r)})
                               .has_value();
            ok =
                ok &&
                conn.exec(QStringLiteral("insert into MovCaixa (Tipo,Numero,Ano,PagaComo,Data,"
                                         "ValorTotal,Afecta) values ('VD',?,?,'NU',?,'25.5','R+')"),
                          {n, hoje.left(4), hoje})
                    .has_value() &&
                conn.exec(QStringLiteral("insert into LogGeral (Modulo,Accao,Utilizador) values "
                                         "('FC','N','01')"))
                    .has_value() &&
                conn.exec(
                        QStringLiteral("update Clientes set JaImprimiuTalao=0 where Codigo='M01'"))
                    .has_value() &&
                conn.exec(QStringLiteral("update TabTipoMov set UltNumero=? where Codigo='VD'"),
                          {n})
                    .has_value() &&
                tx.commit();
        }));
        if (!ok) {
            state.SkipWithError("a transacção nua falhou");
            break;
        }
        state.PauseTiming();
        c.tab->CarregarDoc(0);
        state.ResumeTiming();
    }
    m.relata(state);
}

// The embedded demo company, and a PostgreSQL one of its own when a server is named.
bench::Empresas<Cenario> gEmpresas([](app::Estado& e, Cenario& c) { return c.abre(e); },
                                   QLatin1Char('F'));

void BM_FechoMesaEmbutida(benchmark::State& state) {
    if (auto* c = gEmpresas.embutida(state)) fechos(state, *c);
}
BENCHMARK(BM_FechoMesaEmbutida)->Unit(benchmark::kMicrosecond)->Iterations(300);

void BM_TransaccaoNuaEmbutida(benchmark::State& state) {
    if (auto* c = gEmpresas.embutida(state)) transaccoesNuas(state, *c);
}
BENCHMARK(BM_TransaccaoNuaEmbutida)->Unit(benchmark::kMicrosecond)->Iterations(300);

void BM_FechoMesaPostgres(benchmark::State& state) {
    if (auto* c = gEmpresas.postgres(state)) fechos(state, *c);
}
BENCHMARK(BM_FechoMesaPostgres)->Unit(benchmark::kMicrosecond)->Iterations(200);

void BM_TransaccaoNuaPostgres(benchmark::State& state) {
    if (auto* c = gEmpresas.postgres(state)) transaccoesNuas(state, *c);
}
BENCHMARK(BM_TransaccaoNuaPostgres)->Unit(benchmark::kMicrosecond)->Iterations(200);

}  // namespace

int main(int argc, char** argv) {
    return bench::correBenchmarks(argc, argv, gEmpresas);
}
