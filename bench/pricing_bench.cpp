// The rounding primitive, and the line computation of a product press against the bare reads it
// makes on an embedded company (the party's rounding row and the VAT code).
#include "app/estado.h"
#include "db/master_logins.h"
#include "db/query_helpers.h"
#include "db/schema/esquema.h"
#include "pricing/arredonda.h"
#include "pricing/arredonda_terceiro.h"
#include "pricing/iva.h"
#include "pricing/linha.h"

#include <QCoreApplication>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

#include <cstdlib>
#include <memory>

namespace {

using brasel::Currency;

void BM_ArredondaValor(benchmark::State& state) {
    std::int64_t raw = 123456789;
    int k = 0;
    for (auto _ : state) {
        const Currency r =
            brasel::pricing::ArredondaValor(Currency::fromRaw(raw), k % 4, k % 4 + 1);
        benchmark::DoNotOptimize(r);
        raw += 7919;
        ++k;
    }
}
BENCHMARK(BM_ArredondaValor);

// An embedded company with one table (customer) and one VAT code, built once.
struct Empresa {
    QTemporaryDir pasta;
    brasel::app::Estado estado;

    Empresa() {
        const QString login = QStringLiteral("BENCH");
        const QString password = QStringLiteral("bench-brasel");
        if (!brasel::db::MasterLogins(pasta.path()).criar(login, password, true)) std::abort();
        brasel::db::ConnectionParams p;
        p.server = *brasel::db::ServerAddress::parse(pasta.path());
        p.baseDados = brasel::db::nomeBaseDados(QStringLiteral("0001"));
        p.login = login;
        p.password = password;
        p.autenticacao = QStringLiteral("SQL");
        p.criar = true;
        if (!estado.gConn.open(p)) std::abort();
        if (!brasel::db::schema::actualizarEsquema(estado.gConn, nullptr, nullptr)) std::abort();
        estado.param.casadec = 2;
        estado.gConn.exec(QStringLiteral("insert into Clientes (Codigo,decmerlin,arremerlin,"
                                         "decdesclin,arredesclin,decivalin,arreivalin) values "
                                         "(?,2,1,2,1,2,1)"),
                          {QStringLiteral("M1")});
        estado.gConn.exec(
            QStringLiteral("insert into TabIva (codigo,Taxa,Incluido) values (?,?,0)"),
            {QStringLiteral("N"), QStringLiteral("23")});
    }
};

Empresa& empresa() {
    static auto e = std::make_unique<Empresa>();
    return *e;
}

void BM_Linha_Calcular_cur(benchmark::State& state) {
    brasel::app::Estado& e = empresa().estado;
    const Currency preco = *Currency::parse(QStringLiteral("12.35"));
    const Currency quantidade = *Currency::parse(QStringLiteral("3"));
    for (auto _ : state) {
        benchmark::DoNotOptimize(
            brasel::pricing::Linha_Calcular_cur(e, QStringLiteral("C"), QStringLiteral("M1"), preco,
                                                quantidade, 10, 5, 0, QStringLiteral("N")));
    }
}
BENCHMARK(BM_Linha_Calcular_cur);

// The two reads of BM_Linha_Calcular_cur and nothing else.
void BM_LeiturasDaLinha(benchmark::State& state) {
    brasel::app::Estado& e = empresa().estado;
    for (auto _ : state) {
        benchmark::DoNotOptimize(
            brasel::pricing::LerArredondamentos(e, QStringLiteral("C"), QStringLiteral("M1")));
        benchmark::DoNotOptimize(brasel::pricing::LerTaxaIva(e, QStringLiteral("N")));
    }
}
BENCHMARK(BM_LeiturasDaLinha);

// The arithmetic of the line alone, on settings already read.
void BM_CalculaLinha(benchmark::State& state) {
    const auto arr = brasel::pricing::ArredondamentosTerceiro::todos(2, 1);
    const brasel::pricing::TaxaIva iva{false, 23.0, 0.0};
    const Currency preco = *Currency::parse(QStringLiteral("12.35"));
    const Currency quantidade = *Currency::parse(QStringLiteral("3"));
    for (auto _ : state) {
        benchmark::DoNotOptimize(
            brasel::pricing::CalculaLinha(arr, iva, preco, quantidade, 10, 5, 0, 2));
    }
}
BENCHMARK(BM_CalculaLinha);

}  // namespace

int main(int argc, char** argv) {
    QCoreApplication app(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
