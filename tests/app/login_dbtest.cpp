// Login OK on embedded companies: what each outcome leaves open, set and said, the supervisor's
// first login on a server without its login, and the support user's row.
#include "app/definicoes_posto.h"
#include "app/login.h"
#include "common/ediv.h"
#include "db/master_logins.h"
#include "db/query_helpers.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <QDir>
#include <QSqlDatabase>
#include <QSqlQuery>

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

using testing::DefinicoesTemporarias;
using testing::EmpresaTeste;
using testing::MensagensGravadas;

QString campo(Estado& e, const char* sql, const QVariantList& valores = {}) {
    // A connection of the test's own: the login may have closed the session's.
    db::Connection conn;
    db::ConnectionParams p;
    p.server = *db::ServerAddress::parse(e.gServidor);
    p.baseDados = db::nomeBaseDados(e.gEmpresa);
    p.login = EmpresaTeste::login();
    p.password = EmpresaTeste::password();
    p.autenticacao = QStringLiteral("SQL");
    p.semPooling = true;
    if (!conn.open(p)) return QStringLiteral("<sem ligação>");
    const auto linha = conn.firstRow(QString::fromUtf8(sql), valores);
    return linha ? linha->value(0).toString() : QString();
}

bool algumaLigacaoAberta(const Estado& e) {
    return e.gConn.isOpen() || e.gConnAux.isOpen() || e.gConnLocks.isOpen() ||
           e.gConnContab.isOpen();
}

// Takes a login out of the folder, as on a server where it was never created.
void apagaLogin(const QString& pasta, const QString& login) {
    const QString nome = QStringLiteral("apaga-login");
    {
        QSqlDatabase db = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), nome);
        db.setDatabaseName(db::MasterLogins(pasta).filePath());
        ASSERT_TRUE(db.open());
        QSqlQuery q(db);
        q.prepare(QStringLiteral("delete from Logins where Nome=?"));
        q.addBindValue(login);
        ASSERT_TRUE(q.exec());
        db.close();
    }
    QSqlDatabase::removeDatabase(nome);
}

// What closing the main window does: the user is no longer in use, the connections close.
void terminaSessao(Estado& e) {
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("update Utilizador set UsoPOS=0 where Codigo=?"),
                             {e.gUtilizador}));
    fecharLigacoes(e);
}

class Login : public ::testing::Test {
  protected:
    DefinicoesTemporarias definicoes;
    MensagensGravadas m;
};

TEST_F(Login, EachOutcomeLeavesTheSessionAsTheNextStepNeedsIt) {
    struct Caso {
        const char* nome;
        QString password;
        ResultadoLogin resultado;
        const char* codigo;
    };
    const Caso casos[] = {
        {"supervisor", EmpresaTeste::password(), ResultadoLogin::Entrou, "01"},
        {"  ana ", EmpresaTeste::password(), ResultadoLogin::Entrou, "02"},
        {"RUI", QStringLiteral("errada"), ResultadoLogin::PasswordErrada, ""},
        {"", EmpresaTeste::password(), ResultadoLogin::PasswordErrada, ""},
    };
    for (const Caso& caso : casos) {
        EmpresaTeste empresa(true);
        Estado& e = empresa.estado();
        posto::NomeUtilizador.gravar(QStringLiteral("anterior"));
        const auto r = validarLogin(e, QString::fromUtf8(caso.nome), caso.password, {}, m);
        EXPECT_EQ(r, caso.resultado) << caso.nome;
        EXPECT_EQ(e.gUtilizador, QString::fromUtf8(caso.codigo)) << caso.nome;
        // A refused password is never explained: the box is simply cleared.
        EXPECT_TRUE(m.mensagens().isEmpty()) << m.textos().join(QLatin1Char('|')).toStdString();
        if (r == ResultadoLogin::Entrou) {
            EXPECT_TRUE(e.gConn.isOpen() && e.gConnAux.isOpen() && e.gConnLocks.isOpen());
            EXPECT_EQ(e.gConn.params().login, QString::fromUtf8(caso.nome).trimmed().toUpper());
            EXPECT_EQ(e.gConn.params().tempoComando, 0);
            EXPECT_EQ(campo(e, "select UsoPOS from Utilizador where Codigo=?", {e.gUtilizador}),
                      QStringLiteral("1"));
            EXPECT_EQ(posto::NomeUtilizador.ler(),
                      QString::fromUtf8(caso.nome).trimmed().toUpper());
            EXPECT_FALSE(e.gCaixa.isEmpty());  // the user's parameters were loaded
        } else {
            EXPECT_FALSE(algumaLigacaoAberta(e)) << caso.nome;
            EXPECT_EQ(posto::NomeUtilizador.ler(), QStringLiteral("anterior"));
        }
        m.limpar();
    }
}

TEST_F(Login, UnknownUserIsRefusedAndTheConnectionClosed) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    ASSERT_TRUE(db::MasterLogins(empresa.pasta())
                    .criar(QStringLiteral("ZE"), EmpresaTeste::password(), false));
    EXPECT_EQ(validarLogin(e, QStringLiteral("ze"), EmpresaTeste::password(), {}, m),
              ResultadoLogin::Recusado);
    ASSERT_EQ(m.mensagens().size(), 1);
    EXPECT_EQ(m.mensagens()[0].texto,
              QStringLiteral("O Utilizador ZE Não está Criado Nesta Empresa!"));
    EXPECT_EQ(m.mensagens()[0].icone, Icone::Critico);
    EXPECT_FALSE(algumaLigacaoAberta(e));
    EXPECT_TRUE(e.gUtilizador.isEmpty());
}

TEST_F(Login, UserAlreadyInUseIsWarnedAndStillLogsIn) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("update Utilizador set UsoPOS=1 where Codigo='02'")));
    EXPECT_EQ(validarLogin(e, QStringLiteral("ANA"), EmpresaTeste::password(), {}, m),
              ResultadoLogin::Entrou);
    ASSERT_EQ(m.mensagens().size(), 1);
    EXPECT_EQ(m.mensagens()[0].titulo, QStringLiteral("<< UTILIZADOR JÁ EM USO >>"));
    EXPECT_TRUE(m.mensagens()[0].texto.startsWith(
        QStringLiteral("Se este código não é o seu, deve sair do aplicativo")));
    EXPECT_TRUE(m.mensagens()[0].texto.contains(
        QStringLiteral("\r\ndesbloquear na ficha de utilizadores!\r\n")));
    EXPECT_EQ(e.gUtilizador, QStringLiteral("02"));
}

TEST_F(Login, ProgramRightDecidesAndIsCreatedForANewUser) {
    {
        EmpresaTeste empresa(true);
        Estado& e = empresa.estado();
        ASSERT_TRUE(e.gConn.exec(
            QStringLiteral("update acessos set value=0 where utilizador='02' and chave='Brasel'")));
        EXPECT_EQ(validarLogin(e, QStringLiteral("ana"), EmpresaTeste::password(), {}, m),
                  ResultadoLogin::Recusado);
        EXPECT_EQ(m.textos(), QStringList{QStringLiteral("Acesso Negado ao Programa Brasel")});
        EXPECT_FALSE(algumaLigacaoAberta(e));
        EXPECT_TRUE(e.gUtilizador.isEmpty());
        EXPECT_EQ(campo(e, "select UsoPOS from Utilizador where Codigo='02'"), QStringLiteral("0"));
    }
    m.limpar();
    {
        // A user without rights gets the program and every window granted.
        EmpresaTeste empresa(true);
        Estado& e = empresa.estado();
        ASSERT_TRUE(e.gConn.exec(QStringLiteral("delete from acessos where utilizador='03'")));
        const JanelaAcesso janela{QStringLiteral("frmFacturacao"),
                                  QStringLiteral("Facturação"),
                                  {{QStringLiteral("cmdGravarDoc"), QStringLiteral("&Gravar")}}};
        EXPECT_EQ(validarLogin(
                      e, QStringLiteral("rui"), EmpresaTeste::password(),
                      [&janela] { return QList<JanelaAcesso>{janela}; }, m),
                  ResultadoLogin::Entrou);
        EXPECT_EQ(campo(e, "select value from acessos where utilizador='03' and chave='Brasel'"),
                  QStringLiteral("1"));
        EXPECT_EQ(campo(e,
                        "select value from acessos where utilizador='03' and "
                        "chave='BraselfrmFacturacao.cmdGravarDoc'"),
                  QStringLiteral("1"));
    }
}

TEST_F(Login, SupervisorFirstLoginCreatesItsServerLoginWithThePasswordTyped) {
    EmpresaTeste empresa(false);
    Estado& e = empresa.estado();
    db::MasterLogins logins(empresa.pasta());
    apagaLogin(empresa.pasta(), QStringLiteral("SUPERVISOR"));
    ASSERT_TRUE(logins.criar(QStringLiteral("ADMIN"), QStringLiteral("admin-pw"), true));
    ASSERT_TRUE(logins.criar(QStringLiteral("CAIXA"), QStringLiteral("caixa-pw"), false));
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("delete from Utilizador")));
    const QString nova = QStringLiteral("nova'pw\"x");

    // The company was selected with a login that may not create others: nothing is created.
    e.gLogin = QStringLiteral("CAIXA");
    e.gPassword = QStringLiteral("caixa-pw");
    EXPECT_EQ(validarLogin(e, QStringLiteral("supervisor"), nova, {}, m), ResultadoLogin::Recusado);
    ASSERT_EQ(m.mensagens().size(), 1);
    EXPECT_TRUE(m.mensagens()[0].texto.startsWith(
        QStringLiteral("Não foi possível criar o Utilizador SUPERVISOR no SQL.")));
    EXPECT_FALSE(logins.existe(QStringLiteral("SUPERVISOR")));

    // An administrator without a password is never made.
    m.limpar();
    e.gLogin = QStringLiteral("ADMIN");
    e.gPassword = QStringLiteral("admin-pw");
    EXPECT_EQ(validarLogin(e, QStringLiteral("SUPERVISOR"), {}, {}, m), ResultadoLogin::Recusado);
    EXPECT_EQ(m.mensagens().size(), 1);
    EXPECT_FALSE(logins.existe(QStringLiteral("SUPERVISOR")));

    m.limpar();
    EXPECT_EQ(validarLogin(e, QStringLiteral(" Supervisor "), nova, {}, m), ResultadoLogin::Entrou);
    EXPECT_EQ(m.textos(),
              QStringList{QStringLiteral("Foi criado o Utilizador SUPERVISOR no SQL.")});
    EXPECT_TRUE(logins.verificar(QStringLiteral("SUPERVISOR"), nova, QStringLiteral("SQL")));
    EXPECT_TRUE(logins.sysAdmin(QStringLiteral("SUPERVISOR")));
    EXPECT_EQ(e.gUtilizador, QStringLiteral("01"));
    const auto linha = e.gConn.firstRow(
        QStringLiteral("select Login, Password, DataSys from Utilizador where Codigo='01'"));
    ASSERT_TRUE(linha);
    EXPECT_EQ(linha->value(0).toString(), QStringLiteral("Supervisor"));
    EXPECT_EQ(linha->value(1).toString(), EDiv::Encrypt(nova));
    EXPECT_EQ(linha->value(2).toString().size(), 19);

    // The next login finds both and creates nothing.
    m.limpar();
    terminaSessao(e);
    EXPECT_EQ(validarLogin(e, QStringLiteral("supervisor"), nova, {}, m), ResultadoLogin::Entrou);
    EXPECT_TRUE(m.mensagens().isEmpty());
    const auto contagem = e.gConn.firstRow(QStringLiteral("select count(*) from Utilizador"));
    ASSERT_TRUE(contagem);
    EXPECT_EQ(contagem->value(0).toInt(), 1);
}

TEST_F(Login, SupportLoginGetsItsRowEveryTimeWithoutComplaint) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    ASSERT_TRUE(db::MasterLogins(empresa.pasta())
                    .criar(QStringLiteral("QUORIL"), EmpresaTeste::password(), false));
    for (int vez = 0; vez < 2; ++vez) {
        EXPECT_EQ(validarLogin(e, QStringLiteral("quoril"), EmpresaTeste::password(), {}, m),
                  ResultadoLogin::Entrou);
        EXPECT_EQ(e.gUtilizador, QStringLiteral("00"));
        terminaSessao(e);
    }
    EXPECT_TRUE(m.mensagens().isEmpty());
    EXPECT_EQ(campo(e, "select count(*) from Utilizador where Codigo='00'"), QStringLiteral("1"));
    EXPECT_EQ(campo(e, "select coalesce(Password,'nula') from Utilizador where Codigo='00'"),
              QString());
}

}  // namespace
}  // namespace brasel::app
