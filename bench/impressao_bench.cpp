// A 40-line ticket through the serial path (the port, a pseudo-terminal and the simulated
// printer on the other side) against the time its bytes need on a 9600-baud line, which is
// what a real printer imposes.
#include "devices/codigo_impressora.h"
#include "devices/impressao_serie.h"
#include "impressora.h"
#include "support/devsim_teste.h"

#include <QCoreApplication>
#include <QElapsedTimer>

#include <benchmark/benchmark.h>

namespace {

using namespace brasel;
using namespace brasel::devices;

constexpr int kLinhas = 40;

DefinicaoImpressora definicao() {
    DefinicaoImpressora d;
    d.porta = 1;
    d.codigos.feedNLines = ConstroiCodigo(QStringLiteral("27+100"));
    d.codigos.smallOn = ConstroiCodigo(QStringLiteral("27+33+1"));
    d.codigos.mediumOn = ConstroiCodigo(QStringLiteral("27+33+16"));
    d.codigos.corte = ConstroiCodigo(QStringLiteral("29+86+66+0"));
    d.codigos.cor0 = ConstroiCodigo(QStringLiteral("27+114+0"));
    d.codigos.reset = ConstroiCodigo(QStringLiteral("27+64"));
    d.codigos.internacional = ConstroiCodigo(QStringLiteral("27+116+3"));
    return d;
}

// Forty lines of forty characters, accents included, as the receipts print them.
void talao(CImpressoraTalao& impressora, int) {
    for (int i = 1; i <= kLinhas; ++i) {
        const QString linha = QStringLiteral("Açúcar e pão %1").arg(i).leftJustified(31) +
                              QStringLiteral("%1,50").arg(i).rightJustified(9);
        impressora.ImprimeLinha(linha, true, 1, false);
    }
}

void TalaoSerie(benchmark::State& state) {
    const DefinicaoImpressora d = definicao();
    testing::DevsimTeste devsim;
    auto& impressora = devsim.liga(1, std::make_shared<devsim::ImpressoraTalao>(d.codigos));
    LinhaSerie linha(devsim.mapa());
    OpcoesImpressaoSerie opcoes;
    opcoes.saltaLinhas = 5;

    // One ticket first, to know how many bytes a ticket is: it ends with the cut and a reset.
    const QByteArray fim = d.codigos.corte + "\r" + d.codigos.reset + "\r";
    if (!ImprimeNaSerie(linha, d, opcoes, talao) ||
        !impressora.espera([&](const QByteArray& r) { return r.endsWith(fim); }, 10000)) {
        state.SkipWithError("o talão não saiu");
        return;
    }
    const qsizetype bytesPorTalao = impressora.recebidos().size();

    double segundos = 0;
    for (auto _ : state) {
        const qsizetype antes = impressora.recebidos().size();
        QElapsedTimer relogio;
        relogio.start();
        // The ticket is printed once the printer has every byte of it.
        if (!ImprimeNaSerie(linha, d, opcoes, talao) ||
            !impressora.esperaBytes(antes + bytesPorTalao, 10000)) {
            state.SkipWithError("o talão não saiu");
            return;
        }
        segundos += relogio.nsecsElapsed() / 1e9;
    }
    const double limite = bytesPorTalao *
                          DefinicoesSerie::ler(kDefinicoesTalao)->bitsPorCaracter() /
                          DefinicoesSerie::ler(kDefinicoesTalao)->baud;
    state.counters["bytes_talao"] = static_cast<double>(bytesPorTalao);
    state.counters["limite_9600_ms"] = limite * 1000;
    state.counters["razao_tempo_limite"] = segundos / state.iterations() / limite;
}

BENCHMARK(TalaoSerie)->Unit(benchmark::kMillisecond);

}  // namespace

int main(int argc, char** argv) {
    QCoreApplication app(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
