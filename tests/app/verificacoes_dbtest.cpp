// The start-up checks: configuration pieces in their order, and the database version check.
#include "app/carrega_parametros.h"
#include "app/verifica_configuracao.h"
#include "app/verifica_versao.h"
#include "common/versao.h"
#include "db/master_logins.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

#include <functional>

namespace brasel::app {
namespace {

using testing::EmpresaTeste;
using testing::MensagensGravadas;

TEST(VerificaConfiguracaoInicial, DemoPassesAndEachMissingPieceStopsWithItsMessage) {
    struct Caso {
        const char* mensagem;
        std::function<void(Estado&)> estraga;
    };
    auto sql = [](const char* texto) {
        return [texto](Estado& e) { ASSERT_TRUE(e.gConn.exec(QString::fromUtf8(texto))); };
    };
    const Caso casos[] = {
        {"Não tem Localizações definidas!", sql("delete from localizacao")},
        {"Não tem Câmbio de Moeda Nacional Definido!",
         [](Estado& e) { e.param.cambiodef.clear(); }},
        {"Não tem Câmbio de Moeda Europeia Definido!",
         [](Estado& e) { e.param.cambioeuro = QStringLiteral(" "); }},
        {"Não tem o Ano Definido!", [](Estado& e) { e.param.ano.clear(); }},
        {"Não tem o Mês Definido!", [](Estado& e) { e.param.mes.clear(); }},
        {"Não tem o Simbolo Definido!", [](Estado& e) { e.gSimbolo.clear(); }},
        {"Não tem o Armazém Definido!", [](Estado& e) { e.gArmazem.clear(); }},
        {"Não tem o Caixa Definido!", [](Estado& e) { e.gCaixa.clear(); }},
        {"Tem que definir os Armazens!", sql("delete from armazens")},
        {"Tem que Configurar os Utilizadores!", sql("delete from utilconfgeral")},
        {"Tem que Configurar o Utilizador -> 01 !",
         sql("delete from utilconfgeral where utilizador='01'")},
    };
    {
        EmpresaTeste empresa(true);
        MensagensGravadas m;
        EXPECT_TRUE(VerificaConfiguracaoInicial(empresa.estado(), m))
            << m.textos().join(QLatin1Char('|')).toStdString();
        EXPECT_TRUE(m.mensagens().isEmpty());
    }
    for (const Caso& caso : casos) {
        EmpresaTeste empresa(true);
        caso.estraga(empresa.estado());
        MensagensGravadas m;
        EXPECT_FALSE(VerificaConfiguracaoInicial(empresa.estado(), m));
        ASSERT_EQ(m.mensagens().size(), 1) << caso.mensagem;
        EXPECT_EQ(m.mensagens()[0].texto, QString::fromUtf8(caso.mensagem));
    }
}

TEST(VerificaConfiguracaoInicial, SupervisorIsToldOfEveryUnconfiguredUserButSupport) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    ASSERT_TRUE(e.gConn.exec(
        QStringLiteral("insert into Utilizador (Codigo, Login) values ('00','QUORIL')")));
    ASSERT_TRUE(e.gConn.exec(
        QStringLiteral("insert into Utilizador (Codigo, Login) values ('09','NOVO')")));
    MensagensGravadas m;
    e.gUtilizador = QStringLiteral("01");
    EXPECT_FALSE(VerificaConfiguracaoInicial(e, m));
    EXPECT_EQ(m.textos(), QStringList{QStringLiteral("Tem que Configurar o Utilizador -> 09 !")});
    // Another user is not told about the others.
    m.limpar();
    const auto outro = e.gConn.firstRow(
        QStringLiteral("select utilizador from utilconfgeral where utilizador<>'01'"));
    ASSERT_TRUE(outro);
    e.gUtilizador = outro->value(0).toString();
    EXPECT_TRUE(VerificaConfiguracaoInicial(e, m));
}

class VersaoBD : public ::testing::Test {
  protected:
    void defineVersao(const QString& versao) {
        ASSERT_TRUE(
            empresa.estado().gConn.exec(QStringLiteral("update Actualiza set Versao=?"), {versao}));
    }
    EmpresaTeste empresa;
    MensagensGravadas m;
};

TEST_F(VersaoBD, EqualPassesSilently) {
    EXPECT_EQ(compararVersaoBD(empresa.estado()), ComparacaoVersao::Igual);
    EXPECT_TRUE(VerificaVersaoBD(empresa.estado(), m));
    EXPECT_TRUE(m.mensagens().isEmpty());
}

TEST_F(VersaoBD, EmptyVersionCannotBeEntered) {
    defineVersao(QString());
    EXPECT_FALSE(VerificaVersaoBD(empresa.estado(), m));
    EXPECT_EQ(
        m.textos(),
        QStringList{QStringLiteral(
            "A Versão do Aplicativo Requer que seja efectuada a Actualização de Base de Dados!")});
}

TEST_F(VersaoBD, NewerDatabaseTellsTheProgramVersion) {
    defineVersao(versaoTexto12(versaoMaior() + 1, 0, 0));
    EXPECT_EQ(compararVersaoBD(empresa.estado()), ComparacaoVersao::BaseMaisNova);
    EXPECT_FALSE(VerificaVersaoBD(empresa.estado(), m));
    ASSERT_EQ(m.mensagens().size(), 2);
    EXPECT_EQ(m.mensagens()[0].texto,
              QStringLiteral("A Versão do Aplicativo Encontra-se Desactualizada!"));
    EXPECT_TRUE(m.mensagens()[1].texto.startsWith(QStringLiteral("A Versão deste Aplicativo é [") +
                                                  versaoComPontos() + QStringLiteral("].\r\n")));
}

TEST_F(VersaoBD, OlderDatabaseAdviceDependsOnTheLogin) {
    defineVersao(QStringLiteral("000000090000"));
    // The fixture's login administers the folder.
    db::MasterLogins(empresa.pasta()).criar(EmpresaTeste::login(), EmpresaTeste::password(), true);
    EXPECT_FALSE(VerificaVersaoBD(empresa.estado(), m));
    ASSERT_EQ(m.mensagens().size(), 2);
    EXPECT_TRUE(m.mensagens()[1].texto.contains(QStringLiteral("Actualizar Todas as Empresas")));
    m.limpar();
    db::MasterLogins(empresa.pasta()).criar(EmpresaTeste::login(), EmpresaTeste::password(), false);
    EXPECT_FALSE(VerificaVersaoBD(empresa.estado(), m));
    ASSERT_EQ(m.mensagens().size(), 2);
    EXPECT_EQ(m.mensagens()[1].texto,
              QStringLiteral("Contacte o Administrador do Sistema antes de Operar."));
}

TEST_F(VersaoBD, UnreachableCompanyIsRefusedWithoutMessage) {
    empresa.estado().gEmpresa = QStringLiteral("9999");
    EXPECT_EQ(compararVersaoBD(empresa.estado()), ComparacaoVersao::SemLigacao);
    EXPECT_FALSE(VerificaVersaoBD(empresa.estado(), m));
    EXPECT_TRUE(m.mensagens().isEmpty());
}

}  // namespace
}  // namespace brasel::app
