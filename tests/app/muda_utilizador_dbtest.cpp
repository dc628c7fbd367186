// Changing user without leaving the program: who may be chosen, the password asked, and a
// refused user never costing the workstation its connection.
#include "app/muda_utilizador.h"
#include "app/passwords.h"
#include "common/ediv.h"
#include "db/master_logins.h"
#include "db/query_helpers.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

#include <optional>

namespace brasel::app {
namespace {

using testing::EmpresaTeste;
using testing::MensagensGravadas;

QStringList logins(const QList<UtilizadorMudanca>& lista) {
    QStringList nomes;
    for (const UtilizadorMudanca& u : lista)
        nomes << u.login;
    return nomes;
}

void executa(Estado& e, const char* sql, const QVariantList& valores = {}) {
    ASSERT_TRUE(e.gConn.exec(QString::fromUtf8(sql), valores)) << e.gConn.lastError().toStdString();
}

UtilizadorMudanca escolhe(Estado& e, const QString& login) {
    for (const UtilizadorMudanca& u : utilizadoresMudanca(e)) {
        if (u.login == login) return u;
    }
    ADD_FAILURE() << "sem " << login.toStdString();
    return {};
}

int usoPOS(Estado& e, const QString& codigo) {
    return e.gConn
        .firstRow(QStringLiteral("select UsoPOS from Utilizador where Codigo=?"), {codigo})
        ->value(0)
        .toInt();
}

TEST(MudaUtilizador, ListsTheSupervisorAndUsersWithTheProgramRight) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    EXPECT_EQ(
        logins(utilizadoresMudanca(e)),
        (QStringList{QStringLiteral("ANA"), QStringLiteral("RUI"), QStringLiteral("SUPERVISOR")}));

    // The support user never; a refused program right, or none at all, keeps a user out.
    executa(e, "insert into Utilizador (Codigo, Login, Password) values ('00', 'QUORIL', '')");
    executa(e, "insert into Utilizador (Codigo, Login, Password) values ('04', 'ZE', '')");
    executa(e, "update Acessos set value=0 where utilizador='03' and chave='Brasel'");
    const QList<UtilizadorMudanca> lista = utilizadoresMudanca(e);
    EXPECT_EQ(logins(lista), (QStringList{QStringLiteral("ANA"), QStringLiteral("SUPERVISOR")}));
    EXPECT_EQ(lista[0].codigo, QStringLiteral("02"));
    EXPECT_EQ(lista[0].password(), EmpresaTeste::password());
}

TEST(MudaUtilizador, PasswordMustMatchTheStoredOneDecrypted) {
    struct Caso {
        const char* guardada;  // plain, stored under the cipher
        const char* escrita;
        bool aceite;
    } casos[] = {
        {"teste-brasel", "teste-brasel", true},
        {"teste-brasel", "TESTE-BRASEL", false},
        {"teste-brasel", "", false},
        {"çã€", "çã€", true},
        {"", "", true},
        {"", "x", false},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.escrita);
        const UtilizadorMudanca u{QStringLiteral("02"), QStringLiteral("ANA"),
                                  EDiv::Encrypt(QString::fromUtf8(c.guardada))};
        EXPECT_EQ(u.semPassword(), QString::fromUtf8(c.guardada).isEmpty());
        MensagensGravadas m;
        EXPECT_EQ(confirmaPasswordUtilizador(u, QString::fromUtf8(c.escrita), m), c.aceite);
        EXPECT_EQ(m.textos(),
                  c.aceite ? QStringList{} : QStringList{QStringLiteral("Password Inválida!")});
    }
}

TEST(MudaUtilizador, RefusalsKeepThePreviousUserAndAWorkingConnection) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    db::MasterLogins(empresa.pasta()).criar(QStringLiteral("ZE"), QStringLiteral("outra"), false);
    executa(e, "insert into Utilizador (Codigo, Login, Password) values (?, ?, ?)",
            {QStringLiteral("04"), QStringLiteral("ZE"), EDiv::Encrypt(QStringLiteral("errada"))});
    executa(e, "insert into Utilizador (Codigo, Login, Password) values (?, ?, ?)",
            {QStringLiteral("05"), QStringLiteral("SEMLOGIN"), EDiv::Encrypt(QStringLiteral("x"))});

    struct Caso {
        const char* nome;
        std::optional<UtilizadorMudanca> escolhido;
        const QString mensagem;
    } casos[] = {
        {"nenhum", std::nullopt, QStringLiteral("Não Definiu o Utilizador!")},
        {"password do servidor diferente",
         UtilizadorMudanca{QStringLiteral("04"), QStringLiteral("ZE"),
                           EDiv::Encrypt(QStringLiteral("errada"))},
         kLoginRecusado},
        {"sem login no servidor",
         UtilizadorMudanca{QStringLiteral("05"), QStringLiteral("SEMLOGIN"),
                           EDiv::Encrypt(QStringLiteral("x"))},
         kLoginRecusado},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        MensagensGravadas m;
        EXPECT_FALSE(mudaUtilizador(e, c.escolhido ? &*c.escolhido : nullptr, m, {}));
        EXPECT_EQ(m.textos(), QStringList{c.mensagem});
        EXPECT_EQ(e.gUtilizador, QStringLiteral("01"));
        EXPECT_EQ(e.gConn.params().login, EmpresaTeste::login());
        ASSERT_TRUE(e.gConn.isOpen());
        EXPECT_TRUE(e.gConn.firstRow(QStringLiteral("select count(*) from Utilizador")));
    }
}

TEST(MudaUtilizador, AWaiterTakesOverWithTheirParametersAndTheInUseFlag) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    executa(e, "update Utilizador set UsoPOS=1 where Codigo='01'");
    executa(e, "update UtilConfGeral set caixa='02', armazem='009' where utilizador='02'");
    MensagensGravadas m;
    const UtilizadorMudanca ana = escolhe(e, QStringLiteral("ANA"));
    ASSERT_TRUE(mudaUtilizador(e, &ana, m, QStringLiteral("  ")));
    EXPECT_TRUE(m.textos().isEmpty()) << m.textos().join(QLatin1Char('|')).toStdString();
    EXPECT_EQ(e.gUtilizador, QStringLiteral("02"));
    EXPECT_EQ(e.gNomeUtilizador, QStringLiteral("ANA"));
    EXPECT_EQ(e.gConn.params().login, QStringLiteral("ANA"));
    EXPECT_EQ(e.gCaixa, QStringLiteral("02"));
    EXPECT_EQ(e.gArmazem, QStringLiteral("009"));
    EXPECT_EQ(usoPOS(e, QStringLiteral("01")), 0);
    EXPECT_EQ(usoPOS(e, QStringLiteral("02")), 1);

    // The workstation's own cash register wins; a user who was not flagged moves no flag.
    executa(e, "update Utilizador set UsoPOS=0 where Codigo='02'");
    const UtilizadorMudanca rui = escolhe(e, QStringLiteral("RUI"));
    ASSERT_TRUE(mudaUtilizador(e, &rui, m, QStringLiteral("07")));
    EXPECT_EQ(e.gUtilizador, QStringLiteral("03"));
    EXPECT_EQ(e.gCaixa, QStringLiteral("07"));
    EXPECT_EQ(usoPOS(e, QStringLiteral("03")), 0);
    // The connection taken over is a working one, writes included.
    EXPECT_TRUE(e.gConn.exec(QStringLiteral("update Utilizador set DataSys=? where Codigo=?"),
                             {QStringLiteral("2024-01-01 00:00:00"), QStringLiteral("03")}));
}

}  // namespace
}  // namespace brasel::app
