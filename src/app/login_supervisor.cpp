#include "app/login_supervisor.h"

#include "db/connections.h"
#include "db/master_logins.h"
#include "db/query_helpers.h"
#include "db/schema/servidor.h"

namespace brasel::app {

std::optional<bool> Ver_se_Existe_Login(db::Sessao& sessao, const QString& login) {
    const auto servidor = db::ServerAddress::parse(sessao.gServidor);
    if (!servidor) return std::nullopt;
    switch (servidor->engine) {
        case db::Engine::Sqlite:
            return db::MasterLogins(servidor->folder).existe(login);
        case db::Engine::Postgres: {
            db::Connection master;
            QString password = sessao.gPassword;
            if (!db::Abre_Connexao(master, sessao.gServidor, QStringLiteral("Master"),
                                   sessao.gLogin, password, {}, sessao.gAutenticacao, 30, 10,
                                   true)) {
                return std::nullopt;
            }
            return db::primeiraLinha(master,
                                     QStringLiteral("select 1 from pg_roles where rolname=?"),
                                     {master.dialect().physicalLoginName(login)})
                .has_value();
        }
        case db::Engine::SqlServer:
            return std::nullopt;
    }
    return std::nullopt;
}

bool criarLoginSupervisor(db::Sessao& sessao, const QString& password, MessagePort& mensagens) {
    // An administrator of the server without a password would open every company to anyone.
    if (password.isEmpty()) {
        mensagens.mensagem(
            QStringLiteral(
                "Tem que indicar uma Password para criar o Utilizador SUPERVISOR no SQL."),
            Icone::Critico);
        return false;
    }
    const auto servidor = db::ServerAddress::parse(sessao.gServidor);
    QString erro;
    if (!servidor || !db::schema::criarLogin(*servidor, {sessao.gLogin, sessao.gPassword},
                                             kLoginSupervisor, password, true, &erro)) {
        mensagens.mensagem(
            QStringLiteral("Não foi possível criar o Utilizador SUPERVISOR no SQL.\r\n") + erro,
            Icone::Critico);
        return false;
    }
    mensagens.mensagem(QStringLiteral("Foi criado o Utilizador SUPERVISOR no SQL."),
                       Icone::Informacao);
    return true;
}

}  // namespace brasel::app
