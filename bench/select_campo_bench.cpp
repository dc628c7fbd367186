// Select_Campo_str against a bare prepared query on the same connection, on the embedded engine
// and (when BRASEL_TEST_PG names a server) on PostgreSQL.
#include "db/connections.h"
#include "db/master_logins.h"
#include "db/query_helpers.h"
#include "support/servidor_pg.h"

#include <QCoreApplication>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

#include <memory>

namespace {

using namespace brasel;

constexpr int kProdutos = 5000;

struct Base {
    std::unique_ptr<QTemporaryDir> pasta;
    db::Sessao sessao;
    db::Connection master;
    bool pronta = false;

    void preenche() {
        db::Connection& c = sessao.gConn;
        c.exec(
            QStringLiteral("create table Produtos (NumRegisto INTEGER, Codigo TEXT PRIMARY KEY, "
                           "Descricao TEXT, PrecoVenda1 NUMERIC(19,4))"));
        db::WriteTransaction tx(c);
        for (int i = 0; i < kProdutos; ++i) {
            c.exec(QStringLiteral("insert into Produtos values (?,?,?,?)"),
                   {i, QStringLiteral("P%1").arg(i), QStringLiteral("Produto %1").arg(i),
                    QStringLiteral("1.50")});
        }
        tx.commit();
        pronta = true;
    }
};

void preparaEmbutida(Base& b) {
    b.pasta = std::make_unique<QTemporaryDir>();
    db::MasterLogins(b.pasta->path()).criar(QStringLiteral("bench"), QStringLiteral("pw"), true);
    db::ConnectionParams p;
    p.server = *db::ServerAddress::parse(b.pasta->path());
    p.baseDados = QStringLiteral("Vendrola0001");
    p.criar = true;
    db::Connection criar;
    criar.open(p);
    criar.close();
    b.sessao.gServidor = b.pasta->path();
    b.sessao.gEmpresa = QStringLiteral("0001");
    b.sessao.gLogin = QStringLiteral("bench");
    b.sessao.gPassword = QStringLiteral("pw");
    b.sessao.gAutenticacao = QStringLiteral("SQL");
    if (db::Abre_Connexao_Local(b.sessao, b.sessao.gConn, 0, 60)) b.preenche();
}

Base& embutida() {
    static Base base;
    static const bool feito = (preparaEmbutida(base), true);
    (void)feito;
    return base;
}

void preparaPostgres(Base& b) {
    const auto pg = testing::servidorPg();
    if (!pg) return;
    QString password = pg->password;
    if (!db::Abre_Connexao(b.master, pg->servidor, QStringLiteral("Master"), pg->login, password,
                           {}, QStringLiteral("SQL"), 0, 10, true)) {
        return;
    }
    b.master.exec(QStringLiteral("drop database if exists vendrolab001"));
    b.master.exec(QStringLiteral("create database vendrolab001"));
    b.sessao.gServidor = pg->servidor;
    b.sessao.gEmpresa = QStringLiteral("B001");
    b.sessao.gLogin = pg->login;
    b.sessao.gPassword = pg->password;
    b.sessao.gAutenticacao = QStringLiteral("SQL");
    if (db::Abre_Connexao_Local(b.sessao, b.sessao.gConn, 0, 60, true)) b.preenche();
}

Base& postgres() {
    static Base base;
    static const bool feito = (preparaPostgres(base), true);
    (void)feito;
    return base;
}

Base& escolhe(const benchmark::State& state) {
    return state.range(0) == 0 ? embutida() : postgres();
}

void SelectCampoStr(benchmark::State& state) {
    Base& base = escolhe(state);
    if (!base.pronta) {
        state.SkipWithError("motor indisponível");
        return;
    }
    int i = 0;
    for (auto _ : state) {
        const QString descricao = db::Select_Campo_str(
            base.sessao, QStringLiteral("Produtos"), QStringLiteral("Descricao"),
            QStringLiteral("Codigo"), QStringLiteral("P%1").arg(i++ % kProdutos));
        benchmark::DoNotOptimize(descricao);
    }
}

void PreparedQuery(benchmark::State& state) {
    Base& base = escolhe(state);
    if (!base.pronta) {
        state.SkipWithError("motor indisponível");
        return;
    }
    QSqlQuery query(base.sessao.gConn.database());
    query.setForwardOnly(true);
    query.prepare(QStringLiteral("select Descricao from Produtos where Codigo=?"));
    int i = 0;
    for (auto _ : state) {
        query.bindValue(0, QStringLiteral("P%1").arg(i++ % kProdutos));
        query.exec();
        QString descricao;
        if (query.next()) descricao = query.value(0).toString();
        query.finish();
        benchmark::DoNotOptimize(descricao);
    }
}

BENCHMARK(SelectCampoStr)->Arg(0)->Arg(1)->ArgName("pg");
BENCHMARK(PreparedQuery)->Arg(0)->Arg(1)->ArgName("pg");

}  // namespace

int main(int argc, char** argv) {
    QCoreApplication app(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    if (postgres().pronta) {
        postgres().sessao.gConn.close();
        postgres().master.exec(QStringLiteral("drop database if exists vendrolab001"));
    }
    return 0;
}
