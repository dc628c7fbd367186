// What the login window starts with: the last name typed, or under Windows authentication in a
// remote session the session's user, locked, logging in at once when asked to.
#include "app/login.h"
#include "app/definicoes_posto.h"
#include "support/apoio_arranque.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

using testing::DefinicoesTemporarias;
using testing::VariavelAmbiente;

TEST(AbrirLogin, NameLockAndAutomaticLoginFollowAuthenticationAndSession) {
    struct Caso {
        const char* autenticacao;
        const char* clienteRemoto;  // nullptr: a local session
        bool automatico;
        const char* nome;
        bool bloqueado;
        bool entrarJa;
    };
    const Caso casos[] = {
        {"SQL", nullptr, true, "ULTIMO", false, false},
        {"", "10.0.0.7 50000 22", true, "ULTIMO", false, false},
        {"SQL", "10.0.0.7 50000 22", true, "ULTIMO", false, false},
        {"WIN", nullptr, true, "ULTIMO", false, false},
        {"win", "10.0.0.7 50000 22", true, "maria", true, true},
        {"WIN", "10.0.0.7 50000 22", false, "maria", true, false},
    };
    DefinicoesTemporarias definicoes;
    ASSERT_TRUE(posto::NomeUtilizador.gravar(QStringLiteral("ULTIMO")));
    const VariavelAmbiente utilizador("USER", "maria");
    const VariavelAmbiente semConexao("SSH_CONNECTION", QByteArray());
    for (const Caso& caso : casos) {
        const VariavelAmbiente cliente(
            "SSH_CLIENT", caso.clienteRemoto ? QByteArray(caso.clienteRemoto) : QByteArray());
        Estado estado;
        estado.gAutenticacao = QString::fromUtf8(caso.autenticacao);
        const AberturaLogin a = prepararLogin(estado, caso.automatico);
        const std::string onde =
            std::string(caso.autenticacao) + (caso.clienteRemoto ? " remoto" : " local");
        EXPECT_EQ(a.nome, QString::fromUtf8(caso.nome)) << onde;
        EXPECT_EQ(a.nomeBloqueado, caso.bloqueado) << onde;
        EXPECT_EQ(a.entrarJa, caso.entrarJa) << onde;
    }
}

}  // namespace
}  // namespace brasel::app
