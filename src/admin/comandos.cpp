#include "admin/comandos.h"

#include "admin/assinaturas.h"
#include "admin/verificacao.h"
#include "app/definicoes_posto.h"
#include "common/settings_store.h"
#include "db/demo/restaurante_demo.h"
#include "db/master_logins.h"
#include "db/schema/esquema.h"
#include "db/schema/servidor.h"

#include <algorithm>

namespace brasel::admin {

namespace {

using db::schema::Credenciais;

struct Contexto {
    db::ServerAddress servidor;
    Credenciais credenciais;
    QString empresa;
};

int falhou(Consola& consola, const QString& texto) {
    consola.erros << texto << Qt::endl;
    return kFalha;
}

// A folder without any login takes the caller's as its first administrator.
bool primeiroLogin(const Contexto& c, Consola& consola) {
    if (c.servidor.engine != db::Engine::Sqlite ||
        !db::MasterLogins(c.servidor.folder).logins().isEmpty()) {
        return true;
    }
    QString erro;
    if (!db::schema::criarLogin(c.servidor, {}, c.credenciais.login, c.credenciais.password, true,
                                &erro)) {
        consola.erros << erro << Qt::endl;
        return false;
    }
    consola.saida
        << QStringLiteral("Foi criado o login %1 (administrador).").arg(c.credenciais.login)
        << Qt::endl;
    return true;
}

int criarLogin(const Pedido& p, const Contexto& c, Consola& consola) {
    const Credenciais admin{p.opcao(QStringLiteral("admin-login")),
                            p.opcao(QStringLiteral("admin-password"))};
    const bool semLogins = c.servidor.engine == db::Engine::Sqlite &&
                           db::MasterLogins(c.servidor.folder).logins().isEmpty();
    if (admin.login.isEmpty() && !semLogins) {
        consola.erros << QStringLiteral(
                             "Indique --admin-login e --admin-password de um "
                             "administrador do servidor.")
                      << Qt::endl;
        return kUtilizacao;
    }
    QString erro;
    if (!db::schema::criarLogin(c.servidor, admin, c.credenciais.login, c.credenciais.password,
                                p.tem(QStringLiteral("sysadmin")) || semLogins, &erro)) {
        return falhou(consola, erro);
    }
    consola.saida << QStringLiteral("Login %1 pronto%2.")
                         .arg(c.credenciais.login, p.tem(QStringLiteral("sysadmin")) || semLogins
                                                       ? QStringLiteral(" (administrador)")
                                                       : QString())
                  << Qt::endl;
    return kSucesso;
}

int criarEmpresa(const Pedido& p, const Contexto& c, Consola& consola) {
    if (!primeiroLogin(c, consola)) return kFalha;
    QString erro;
    if (!db::schema::criarEmpresa(c.servidor, c.credenciais, c.empresa,
                                  p.opcao(QStringLiteral("name")), &erro)) {
        return falhou(consola, erro);
    }
    consola.saida << QStringLiteral("Empresa %1 criada.").arg(c.empresa) << Qt::endl;
    return kSucesso;
}

int actualizarEmpresa(const Contexto& c, Consola& consola) {
    db::Connection conn;
    QString erro;
    QStringList alteracoes;
    if (!db::schema::abrirEmpresa(conn, c.servidor, c.credenciais, c.empresa, &erro) ||
        !db::schema::actualizarEsquema(conn, &alteracoes, &erro)) {
        return falhou(consola, erro);
    }
    for (const QString& a : alteracoes)
        consola.saida << "  " << a << Qt::endl;
    consola.saida << (alteracoes.isEmpty()
                          ? QStringLiteral("A empresa %1 já estava actualizada.").arg(c.empresa)
                          : QStringLiteral("Empresa %1 actualizada.").arg(c.empresa))
                  << Qt::endl;
    return kSucesso;
}

int carregarDemo(const Pedido& p, const Contexto& c, Consola& consola) {
    const QString nome = p.opcao(QStringLiteral("name"));
    const QString passwordDemo = p.tem(QStringLiteral("demo-password"))
                                     ? p.opcao(QStringLiteral("demo-password"))
                                     : c.credenciais.password;
    if (!primeiroLogin(c, consola)) return kFalha;
    QString erro;
    const auto existe = db::schema::existeEmpresa(c.servidor, c.credenciais, c.empresa, &erro);
    if (!existe) return falhou(consola, erro);
    if (!*existe) {
        const QString nomeEmpresa = nome.isEmpty() ? db::demo::nomeRestauranteDemo() : nome;
        if (!db::schema::criarEmpresa(c.servidor, c.credenciais, c.empresa, nomeEmpresa, &erro)) {
            return falhou(consola, erro);
        }
        consola.saida << QStringLiteral("Empresa %1 criada.").arg(c.empresa) << Qt::endl;
    }
    db::Connection conn;
    if (!db::schema::abrirEmpresa(conn, c.servidor, c.credenciais, c.empresa, &erro)) {
        return falhou(consola, erro);
    }
    // Refused before any login is touched.
    if (db::demo::empresaComDados(conn)) {
        return falhou(consola, QStringLiteral("A empresa %1 já tem dados: o restaurante de "
                                              "demonstração só se carrega numa empresa vazia.")
                                   .arg(c.empresa));
    }
    for (const db::demo::UtilizadorDemo& u : db::demo::utilizadoresDemo()) {
        if (!db::schema::criarLogin(c.servidor, c.credenciais, u.login, passwordDemo, u.supervisor,
                                    &erro)) {
            return falhou(consola, erro);
        }
    }
    if (!db::demo::carregarRestauranteDemo(conn, passwordDemo, nome, &erro)) {
        return falhou(consola, erro);
    }
    consola.saida
        << QStringLiteral("Restaurante de demonstração carregado na empresa %1.").arg(c.empresa)
        << Qt::endl;
    for (const db::demo::UtilizadorDemo& u : db::demo::utilizadoresDemo()) {
        consola.saida << QStringLiteral("  Utilizador %1: login %2%3")
                             .arg(u.codigo, u.login,
                                  u.supervisor ? QStringLiteral(" (supervisor)") : QString())
                      << Qt::endl;
    }
    return kSucesso;
}

// Keeps the server in this workstation's company list: the entry of the same server is updated,
// otherwise the first free one of the twenty is taken.
int acrescentarServidor(const Pedido& p, Consola& consola) {
    const QString autenticacao = p.tem(QStringLiteral("auth"))
                                     ? p.opcao(QStringLiteral("auth")).trimmed().toUpper()
                                     : QStringLiteral("SQL");
    if (autenticacao != QStringLiteral("SQL") && autenticacao != QStringLiteral("WIN")) {
        consola.erros
            << QStringLiteral("Autenticação inválida: \"%1\" (SQL ou WIN).").arg(autenticacao)
            << Qt::endl;
        return kUtilizacao;
    }
    app::ListaServidores lista = app::lerServidores();
    const QString servidor = p.opcao(QStringLiteral("server")).trimmed();
    auto entrada = std::find_if(lista.begin(), lista.end(), [&](const app::EntradaServidor& e) {
        return e.servidor.trimmed() == servidor;
    });
    if (entrada == lista.end()) {
        entrada = std::find_if(lista.begin(), lista.end(),
                               [](const app::EntradaServidor& e) { return !e.emUso(); });
    }
    if (entrada == lista.end()) {
        return falhou(consola,
                      QStringLiteral("A lista de servidores deste posto já tem vinte entradas."));
    }
    entrada->servidor = servidor;
    entrada->login = p.opcao(QStringLiteral("login"));
    entrada->definirPassword(p.opcao(QStringLiteral("password")));
    entrada->tipoAutenticacao = autenticacao;
    if (!app::gravarServidores(lista)) {
        return falhou(consola, QStringLiteral("Não foi possível gravar a lista de servidores em ") +
                                   pastaDefinicoes());
    }
    consola.saida << QStringLiteral("Servidor %1 na lista de empresas deste posto.").arg(servidor)
                  << Qt::endl;
    return kSucesso;
}

}  // namespace

int executar(const Pedido& p, Consola& consola) {
    if (p.comando == QStringLiteral("help")) {
        consola.saida << textoAjuda();
        return kSucesso;
    }
    if (p.comando == QStringLiteral("generate-key")) return gerarChave(p, consola);
    Contexto c;
    const auto servidor = db::ServerAddress::parse(p.opcao(QStringLiteral("server")));
    if (!servidor) {
        consola.erros
            << QStringLiteral("Servidor inválido: \"%1\"").arg(p.opcao(QStringLiteral("server")))
            << Qt::endl;
        return kUtilizacao;
    }
    c.servidor = *servidor;
    c.credenciais = {p.opcao(QStringLiteral("login")), p.opcao(QStringLiteral("password"))};
    if (p.comando == QStringLiteral("create-login")) return criarLogin(p, c, consola);
    if (p.comando == QStringLiteral("add-server")) return acrescentarServidor(p, consola);
    c.empresa = p.opcao(QStringLiteral("company"));
    if (!db::schema::codigoEmpresaValido(c.empresa)) {
        consola.erros << QStringLiteral(
                             "Código de empresa inválido: \"%1\" (quatro letras ou "
                             "algarismos).")
                             .arg(c.empresa)
                      << Qt::endl;
        return kUtilizacao;
    }
    if (p.comando == QStringLiteral("create")) return criarEmpresa(p, c, consola);
    if (p.comando == QStringLiteral("upgrade")) return actualizarEmpresa(c, consola);
    if (p.comando == QStringLiteral("demo")) return carregarDemo(p, c, consola);
    if (p.comando == QStringLiteral("verify-signatures")) {
        return verificarAssinaturas(p, c.servidor, c.credenciais, c.empresa, consola);
    }
    return verificarEmpresa(c.servidor, c.credenciais, c.empresa, consola) ? kSucesso : kFalha;
}

}  // namespace brasel::admin
