#include "admin/verificacao.h"

#include "app/carrega_parametros.h"
#include "app/estado.h"
#include "app/verifica_configuracao.h"
#include "common/versao.h"
#include "db/master_logins.h"
#include "db/schema/definicao.h"
#include "db/schema/esquema.h"

namespace brasel::admin {

namespace {

QString problemaVersao(const QString& versaoBase) {
    const QString programa = versaoTexto12();
    const QString detalhe =
        QStringLiteral(" (base de dados: %1, aplicativo: %2)")
            .arg(versaoBase.isEmpty() ? QStringLiteral("sem versão") : versaoBase, programa);
    if (versaoBase.isEmpty() || versaoBase < programa) {
        return QStringLiteral(
                   "A Versão do Aplicativo Requer que seja efectuada a Actualização de Base de "
                   "Dados!") +
               detalhe;
    }
    if (versaoBase > programa) {
        return QStringLiteral("A Versão do Aplicativo Encontra-se Desactualizada!") + detalhe;
    }
    return {};
}

// Users whose login the server does not know could never log in.
QStringList loginsEmFalta(db::Connection& conn, const db::ServerAddress& servidor) {
    auto q = conn.exec(QStringLiteral(
        "select Codigo, Login from Utilizador where COALESCE(Login,'')<>'' order by Codigo"));
    if (!q) return {QStringLiteral("Não foi possível ler os utilizadores: ") + conn.lastError()};
    QList<std::pair<QString, QString>> utilizadores;
    while (q->next())
        utilizadores.append({q->value(0).toString(), q->value(1).toString().trimmed()});
    QStringList problemas;
    const db::MasterLogins logins(servidor.folder);
    for (const auto& [codigo, login] : utilizadores) {
        const bool existe =
            servidor.engine == db::Engine::Postgres
                ? conn.firstRow(QStringLiteral("select 1 from pg_roles where rolname=?"),
                                {conn.dialect().physicalLoginName(login)})
                      .has_value()
                : logins.existe(login);
        if (!existe) {
            problemas << QStringLiteral("O utilizador %1 (%2) não tem login no servidor.")
                             .arg(codigo, login);
        }
    }
    return problemas;
}

}  // namespace

bool verificarEmpresa(const db::ServerAddress& servidor, const db::schema::Credenciais& credenciais,
                      const QString& codigo, Consola& consola) {
    app::Estado estado;
    estado.gEmpresa = codigo;
    estado.gLogin = credenciais.login;
    estado.gPassword = credenciais.password;
    estado.gAutenticacao = QStringLiteral("SQL");
    estado.gUtilizador = QStringLiteral("01");
    QString erro;
    if (!db::schema::abrirEmpresa(estado.gConn, servidor, credenciais, codigo, &erro)) {
        consola.erros << erro << Qt::endl;
        return false;
    }
    db::Connection& conn = estado.gConn;
    QStringList problemas;
    const QString versao = db::schema::versaoBaseDados(conn);
    if (const QString p = problemaVersao(versao); !p.isEmpty()) problemas << p;
    const QStringList esquema = db::schema::verificarEsquema(conn);
    problemas << esquema;
    if (esquema.isEmpty()) problemas << loginsEmFalta(conn, servidor);
    for (const QString& p : problemas)
        consola.erros << "  - " << p << Qt::endl;

    bool configuracao = esquema.isEmpty();
    if (configuracao) {
        MensagensConsola mensagens(consola.erros);
        app::CarregaParametros(estado, mensagens, {});
        configuracao =
            app::VerificaConfiguracaoInicial(estado, mensagens) && mensagens.quantas() == 0;
    }
    if (!problemas.isEmpty() || !configuracao) {
        consola.erros << QStringLiteral("A empresa %1 não está completa.").arg(codigo) << Qt::endl;
        return false;
    }
    consola.saida << QStringLiteral("Empresa %1 completa: versão %2, %3 tabelas.")
                         .arg(codigo, versao)
                         .arg(db::schema::tabelasEmpresa().size())
                  << Qt::endl;
    return true;
}

}  // namespace brasel::admin
