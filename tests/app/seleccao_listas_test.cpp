// The lists of the company selection: editing the server list before it is saved, and searching
// the company list.
#include "app/lista_servidores.h"
#include "app/seleccao_empresa.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

EntradaServidor entrada(const char* servidor, const char* autenticacao = "sql") {
    return {
        QString::fromUtf8(servidor), QStringLiteral(" sa "), {}, QString::fromUtf8(autenticacao)};
}

QStringList servidores(const ListaServidores& lista) {
    QStringList nomes;
    for (const EntradaServidor& e : lista) {
        if (e.emUso()) nomes << e.servidor;
    }
    return nomes;
}

TEST(EdicaoServidores, AddChangeAndDeleteKeepTheEntriesInUseTogether) {
    ListaServidores lista;
    EXPECT_EQ(acrescentarServidor(lista, entrada(" /dados ")), EdicaoServidor::Feita);
    EXPECT_EQ(lista[0].servidor, QStringLiteral("/dados"));
    EXPECT_EQ(lista[0].login, QStringLiteral("sa"));
    EXPECT_EQ(lista[0].tipoAutenticacao, QStringLiteral("SQL"));
    EXPECT_EQ(acrescentarServidor(lista, entrada("postgresql://caixa", "Win")),
              EdicaoServidor::Feita);
    EXPECT_EQ(lista[1].tipoAutenticacao, QStringLiteral("WIN"));
    EXPECT_EQ(acrescentarServidor(lista, entrada("   ")), EdicaoServidor::SemServidor);
    EXPECT_EQ(acrescentarServidor(lista, entrada("POSTGRESQL://CAIXA")), EdicaoServidor::Repetido);

    // A change may keep its own name but not take another entry's.
    EXPECT_EQ(alterarServidor(lista, 0, entrada("/dados", "WIN")), EdicaoServidor::Feita);
    EXPECT_EQ(alterarServidor(lista, 0, entrada("postgresql://caixa")), EdicaoServidor::Repetido);
    EXPECT_EQ(alterarServidor(lista, 0, entrada("")), EdicaoServidor::SemServidor);
    EXPECT_EQ(alterarServidor(lista, 20, entrada("/x")), EdicaoServidor::SemServidor);
    EXPECT_EQ(lista[0].tipoAutenticacao, QStringLiteral("WIN"));

    // A gap left by the settings of another program is filled first.
    lista[3].servidor = QStringLiteral("/quarto");
    EXPECT_EQ(acrescentarServidor(lista, entrada("/terceiro")), EdicaoServidor::Feita);
    EXPECT_EQ(servidores(lista),
              (QStringList{QStringLiteral("/dados"), QStringLiteral("postgresql://caixa"),
                           QStringLiteral("/terceiro"), QStringLiteral("/quarto")}));
    EXPECT_TRUE(apagarServidor(lista, 1));
    EXPECT_FALSE(apagarServidor(lista, -1));
    EXPECT_EQ(servidores(lista), (QStringList{QStringLiteral("/dados"), QStringLiteral("/terceiro"),
                                              QStringLiteral("/quarto")}));
    EXPECT_EQ(lista[2].servidor, QStringLiteral("/quarto"));
    EXPECT_FALSE(lista[19].emUso());
}

TEST(EdicaoServidores, TwentyEntriesAtMostAndEachRefusalHasItsMessage) {
    ListaServidores lista;
    for (int i = 0; i < kEntradasServidor; ++i) {
        ASSERT_EQ(acrescentarServidor(lista, {QStringLiteral("s%1").arg(i), {}, {}, {}}),
                  EdicaoServidor::Feita);
    }
    EXPECT_EQ(acrescentarServidor(lista, entrada("s20")), EdicaoServidor::Cheia);
    EXPECT_EQ(mensagemEdicao(EdicaoServidor::Repetido), QStringLiteral("Servidor já Existente!"));
    EXPECT_EQ(mensagemEdicao(EdicaoServidor::Cheia),
              QStringLiteral("Não pode definir mais de 20 Servidores!"));
    EXPECT_FALSE(mensagemEdicao(EdicaoServidor::SemServidor).isEmpty());
    EXPECT_TRUE(mensagemEdicao(EdicaoServidor::Feita).isEmpty());
}

TEST(ProcurarEmpresas, CodeOrNameWithoutRegardToCase) {
    QList<LinhaEmpresa> linhas(3);
    linhas[0].codigo = QStringLiteral("0001");
    linhas[0].nome = QStringLiteral("Tasca do Largo");
    linhas[1].codigo = QStringLiteral("0002");
    linhas[1].nome = QStringLiteral("Pastelaria Central");
    linhas[2].codigo = QStringLiteral("TASC");
    linhas[2].nome = QStringLiteral("Desligada");
    const std::pair<const char*, QList<int>> casos[] = {
        {"", {0, 1, 2}},    {"  ", {0, 1, 2}}, {"tasc", {0, 2}}, {"0002", {1}},
        {" central ", {1}}, {"000", {0, 1}},   {"nada", {}},
    };
    for (const auto& [texto, esperado] : casos)
        EXPECT_EQ(procurarEmpresas(linhas, QString::fromUtf8(texto)), esperado) << texto;
}

}  // namespace
}  // namespace brasel::app
