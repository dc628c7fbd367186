#pragma once

// What the benchmarks of the order screen share: each call timed on its own, the tab's questions
// left unanswered, and the companies they run on (embedded, and on PostgreSQL when
// BRASEL_TEST_PG names a server), each with the demo restaurant.
#include "app/estado.h"
#include "pos/perguntas_tab.h"
#include "support/apoio_arranque.h"
#include "support/empresa_pg.h"
#include "support/empresa_teste.h"

#include <QCoreApplication>

#include <benchmark/benchmark.h>

#include <algorithm>
#include <chrono>
#include <functional>
#include <memory>
#include <optional>
#include <utility>
#include <vector>

namespace brasel::bench {

// The durations of a benchmark's calls: their median and 99th percentile become its counters
// (microseconds).
struct Medidas {
    std::vector<double> us;

    void relata(benchmark::State& state) {
        if (us.empty()) return;
        std::sort(us.begin(), us.end());
        state.counters["mediana_us"] = us[us.size() / 2];
        state.counters["p99_us"] = us[std::min(us.size() - 1, us.size() * 99 / 100)];
    }
};

// How long `f` took, in microseconds.
template <class F>
double cronometra(F&& f) {
    const auto t0 = std::chrono::steady_clock::now();
    f();
    return std::chrono::duration<double, std::micro>(std::chrono::steady_clock::now() - t0).count();
}

// The tab's questions: never asked for the products the benchmarks press.
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

// Whether the company was made (an embedded one that cannot be made stops the program).
inline bool criada(const testing::EmpresaTeste&) {
    return true;
}
inline bool criada(const testing::EmpresaPg& empresa) {
    return empresa.pronta();
}

// A company of type Empresa with the scene a benchmark measures on it; `pronta` false when
// either could not be made.
template <class Empresa, class Cenario>
struct Montagem {
    testing::DefinicoesTemporarias definicoes;
    Empresa empresa;
    Cenario cenario;
    bool pronta = false;

    template <class Prepara, class... Argumentos>
    explicit Montagem(const Prepara& prepara, Argumentos&&... argumentos)
        : empresa(std::forward<Argumentos>(argumentos)...) {
        pronta = criada(empresa) && prepara(empresa.estado(), cenario);
    }
};

// The two companies of a benchmark program, made on first use, the scene opened on each by
// `prepara`; the PostgreSQL one's code starts with `letraPg`. Both go in `larga`, while the
// application still stands.
template <class Cenario>
class Empresas {
  public:
    using Prepara = std::function<bool(app::Estado&, Cenario&)>;
    using Embutida = Montagem<testing::EmpresaTeste, Cenario>;
    using Postgres = Montagem<testing::EmpresaPg, Cenario>;

    Empresas(Prepara prepara, QChar letraPg) : prepara_(std::move(prepara)), letraPg_(letraPg) {}

    // The scene on the embedded company; nullptr, the benchmark skipped, when it is not ready.
    Cenario* embutida(benchmark::State& state) {
        if (!embutida_) embutida_ = std::make_unique<Embutida>(prepara_, true);
        return pronto(state, *embutida_, "empresa por preparar");
    }
    // The scene on the PostgreSQL company; nullptr, the benchmark skipped, without a server or
    // when the server refused it.
    Cenario* postgres(benchmark::State& state) {
        if (!postgres_) postgres_ = std::make_unique<Postgres>(prepara_, letraPg_, true);
        return pronto(state, *postgres_, "BRASEL_TEST_PG não definido ou servidor recusou");
    }
    void larga() {
        postgres_.reset();
        embutida_.reset();
    }

  private:
    template <class M>
    static Cenario* pronto(benchmark::State& state, M& montagem, const char* porque) {
        if (montagem.pronta) return &montagem.cenario;
        state.SkipWithError(porque);
        return nullptr;
    }

    Prepara prepara_;
    QChar letraPg_;
    std::unique_ptr<Embutida> embutida_;
    std::unique_ptr<Postgres> postgres_;
};

// The program's benchmarks under a Qt application; the companies go once they have run.
template <class Cenario>
int correBenchmarks(int argc, char** argv, Empresas<Cenario>& empresas) {
    QCoreApplication aplicacao(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    empresas.larga();
    return 0;
}

}  // namespace brasel::bench
