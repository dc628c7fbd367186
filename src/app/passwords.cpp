#include "app/passwords.h"

#include "app/definicoes_posto.h"
#include "common/ediv.h"
#include "db/connections.h"
#include "db/query_helpers.h"

namespace brasel::app {

namespace {

const QString kTenteNovamente = QStringLiteral("Tente novamente");

}  // namespace

bool precisaPasswordSupervisor() {
    return !posto::ConfigRest_DesactivaPassword.ler();
}

bool abreEmpresaComo(Estado& estado, db::Connection& conn, const QString& login,
                     const QString& password) {
    // A user's own password is always a server login's password, whatever authentication the
    // company list uses to reach the server.
    QString plain = password;
    return db::Abre_Connexao(conn, estado.gServidor, db::nomeBaseDados(estado.gEmpresa),
                             login.trimmed(), plain, QString(), QStringLiteral("SQL"), 0, 60);
}

bool passwordSupervisorValida(Estado& estado, const QString& escrita) {
    const auto linha = db::primeiraLinha(
        estado.gConn, QStringLiteral("select Login, Password from Utilizador where Codigo=?"),
        {QStringLiteral("01")});
    if (!linha) return false;
    return escrita == EDiv::Decrypt(linha->value(1).toString());
}

bool confirmaPasswordSupervisor(Estado& estado, const QString& escrita, MessagePort& mensagens) {
    if (passwordSupervisorValida(estado, escrita)) return true;
    mensagens.mensagem(QStringLiteral("Password Inválida !"), Icone::Critico,
                       QStringLiteral("Tente de Novo"));
    return false;
}

std::optional<QString> confirmaUtilizador(Estado& estado, const QString& login,
                                          const QString& password, MessagePort& mensagens) {
    db::Connection conn;
    if (!abreEmpresaComo(estado, conn, login, password)) {
        mensagens.mensagem(kLoginRecusado, Icone::Critico, kTenteNovamente);
        return std::nullopt;
    }
    // Logins are kept as they were created ("Supervisor", "ANA"); the server compares them
    // without regard to case, and so does this.
    const auto linha = db::primeiraLinha(
        conn, QStringLiteral("select Codigo from Utilizador where upper(Login)=? order by Codigo"),
        {login.trimmed().toUpper()});
    const QString codigo = linha ? linha->value(0).toString().trimmed() : QString();
    if (codigo.isEmpty()) {
        mensagens.mensagem(QStringLiteral("Código de Utilizador não encontrado!"), Icone::Critico,
                           kTenteNovamente);
        return std::nullopt;
    }
    return codigo;
}

}  // namespace brasel::app
