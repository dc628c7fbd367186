// The supervisor's password before protected actions, and the confirmation of who is at the
// workstation by the company accepting their login.
#include "app/definicoes_posto.h"
#include "app/passwords.h"
#include "common/ediv.h"
#include "db/master_logins.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

using testing::EmpresaTeste;
using testing::MensagensGravadas;

TEST(Passwords, SupervisorPassword) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    struct Caso {
        const char* escrita;
        bool aceite;
    } casos[] = {
        {"teste-brasel", true}, {"teste-brasel ", false}, {"Teste-brasel", false}, {"", false}};
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.escrita);
        MensagensGravadas m;
        EXPECT_EQ(confirmaPasswordSupervisor(e, QString::fromUtf8(c.escrita), m), c.aceite);
        if (c.aceite) {
            EXPECT_TRUE(m.mensagens().isEmpty());
        } else {
            ASSERT_EQ(m.mensagens().size(), 1);
            EXPECT_EQ(m.mensagens()[0].texto, QStringLiteral("Password Inválida !"));
            EXPECT_EQ(m.mensagens()[0].titulo, QStringLiteral("Tente de Novo"));
        }
    }
    // A supervisor without password takes the empty text; a company without a supervisor row
    // takes nothing, not even the empty text its missing password would decrypt to.
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("update Utilizador set Password=? where Codigo='01'"),
                             {QString()}));
    EXPECT_TRUE(passwordSupervisorValida(e, QString()));
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("delete from Utilizador where Codigo='01'")));
    EXPECT_FALSE(passwordSupervisorValida(e, QString()));
}

TEST(Passwords, SupervisorPasswordAskedUnlessTheWorkstationSwitchedItOff) {
    testing::DefinicoesTemporarias definicoes;
    EXPECT_TRUE(precisaPasswordSupervisor());
    ASSERT_TRUE(posto::ConfigRest_DesactivaPassword.gravar(true));
    EXPECT_FALSE(precisaPasswordSupervisor());
}

TEST(Passwords, UserConfirmedByTheCompanyAcceptingTheirLogin) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    ASSERT_TRUE(db::MasterLogins(empresa.pasta())
                    .criar(QStringLiteral("ZE"), EmpresaTeste::password(), false));
    // Created by the login window as "Supervisor": logins compare without regard to case.
    ASSERT_TRUE(
        e.gConn.exec(QStringLiteral("update Utilizador set Login='Supervisor' where Codigo='01'")));
    const QString ok = EmpresaTeste::password();
    const QString recusa = kLoginRecusado;
    const QString semCodigo = QStringLiteral("Código de Utilizador não encontrado!");
    struct Caso {
        const char* login;
        QString password;
        const char* codigo;  // nullptr: refused
        QString mensagem;
    } casos[] = {
        {"RUI", ok, "03", {}},          {" ana ", ok, "02", {}},
        {"SUPERVISOR", ok, "01", {}},   {"RUI", QStringLiteral("errada"), nullptr, recusa},
        {"", ok, nullptr, recusa},      {"X' or '1'='1", ok, nullptr, recusa},
        {"ZE", ok, nullptr, semCodigo},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.login);
        MensagensGravadas m;
        const auto codigo = confirmaUtilizador(e, QString::fromUtf8(c.login), c.password, m);
        if (c.codigo) {
            EXPECT_EQ(codigo, std::optional<QString>(QString::fromUtf8(c.codigo)));
            EXPECT_TRUE(m.mensagens().isEmpty());
        } else {
            EXPECT_FALSE(codigo);
            ASSERT_EQ(m.mensagens().size(), 1);
            EXPECT_EQ(m.mensagens()[0].texto, c.mensagem);
            EXPECT_EQ(m.mensagens()[0].titulo, QStringLiteral("Tente novamente"));
        }
        // The workstation's own connection is never touched.
        EXPECT_EQ(e.gConn.params().login, EmpresaTeste::login());
        EXPECT_TRUE(e.gConn.isOpen());
    }
}

}  // namespace
}  // namespace brasel::app
