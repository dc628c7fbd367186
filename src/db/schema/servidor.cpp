#include "db/schema/servidor.h"

#include "db/master_logins.h"
#include "db/schema/esquema.h"
#include "db/sessao.h"

#include <QFile>
#include <QFileInfo>
#include <QRegularExpression>
#include <QSqlDriver>
#include <QSqlField>

namespace brasel::db::schema {

namespace {

bool falha(QString* erro, const QString& texto) {
    if (erro) *erro = texto;
    return false;
}

ConnectionParams parametros(const ServerAddress& servidor, const QString& baseDados,
                            const Credenciais& credenciais, bool criar = false) {
    ConnectionParams p;
    p.server = servidor;
    p.baseDados = baseDados;
    p.login = credenciais.login;
    p.password = credenciais.password;
    p.autenticacao = QStringLiteral("SQL");
    p.tempoLigacao = 15;
    p.semPooling = true;
    p.criar = criar;
    return p;
}

bool motorSuportado(const ServerAddress& servidor, QString* erro) {
    if (servidor.engine != Engine::SqlServer) return true;
    return falha(erro, QStringLiteral("O servidor SQL Server ainda não é suportado."));
}

// Role definitions take no bound values: the password goes in as a literal quoted by the driver.
QString literal(Connection& conn, const QString& texto) {
    QSqlField campo(QStringLiteral("valor"), QMetaType(QMetaType::QString));
    campo.setValue(texto);
    return conn.database().driver()->formatValue(campo);
}

bool abrirMaster(Connection& master, const ServerAddress& servidor, const Credenciais& admin,
                 QString* erro) {
    if (master.open(parametros(servidor, QStringLiteral("Master"), admin))) return true;
    return falha(erro, QStringLiteral("Não foi possível ligar ao servidor: ") + master.lastError());
}

bool administradorPasta(const ServerAddress& servidor, const Credenciais& admin, QString* erro) {
    const MasterLogins logins(servidor.folder);
    if (!logins.verificar(admin.login, admin.password, QStringLiteral("SQL"))) {
        return falha(erro, QStringLiteral("Login ou password inválidos: ") + admin.login);
    }
    if (!logins.sysAdmin(admin.login)) {
        return falha(
            erro, QStringLiteral("O login %1 não é administrador do servidor.").arg(admin.login));
    }
    return true;
}

bool garantirGrupo(Connection& master, QString* erro) {
    if (master.firstRow(QStringLiteral("select 1 from pg_roles where rolname=?"),
                        {kGrupoUtilizadores})) {
        return true;
    }
    if (master.exec(QStringLiteral("CREATE ROLE ") + kGrupoUtilizadores +
                    QStringLiteral(" NOLOGIN"))) {
        return true;
    }
    return falha(erro, QStringLiteral("Não foi possível criar o grupo %1: %2")
                           .arg(kGrupoUtilizadores, master.lastError()));
}

bool criarLoginPostgres(const ServerAddress& servidor, const Credenciais& admin,
                        const QString& login, const QString& password, bool sysAdmin,
                        QString* erro) {
    Connection master;
    if (!abrirMaster(master, servidor, admin, erro) || !garantirGrupo(master, erro)) return false;
    const QString papel = master.dialect().physicalLoginName(login);
    const bool existe =
        master.firstRow(QStringLiteral("select 1 from pg_roles where rolname=?"), {papel})
            .has_value();
    QString sql = (existe ? QStringLiteral("ALTER ROLE ") : QStringLiteral("CREATE ROLE ")) +
                  papel + QStringLiteral(" WITH LOGIN PASSWORD ") + literal(master, password);
    if (sysAdmin) sql += QStringLiteral(" CREATEDB CREATEROLE");
    if (!master.exec(sql)) {
        return falha(
            erro,
            QStringLiteral("Não foi possível criar o login %1: %2").arg(papel, master.lastError()));
    }
    // An administrator may bring further logins into the group.
    const QString membro = QStringLiteral("GRANT ") + kGrupoUtilizadores + QStringLiteral(" TO ") +
                           papel + (sysAdmin ? QStringLiteral(" WITH ADMIN OPTION") : QString());
    if (!master.exec(membro)) {
        return falha(erro, QStringLiteral("Não foi possível juntar o login %1 ao grupo %2: %3")
                               .arg(papel, kGrupoUtilizadores, master.lastError()));
    }
    return true;
}

void apagarFicheiroEmbutido(const QString& ficheiro) {
    for (const QString& sufixo : {QString(), QStringLiteral("-wal"), QStringLiteral("-shm")}) {
        QFile::remove(ficheiro + sufixo);
    }
}

// Schema and name on the new, empty database.
bool prepararEmpresa(Connection& conn, const QString& nomeEmpresa, QString* erro) {
    if (!actualizarEsquema(conn, nullptr, erro)) return false;
    if (nomeEmpresa.isEmpty()) return true;
    if (conn.exec(QStringLiteral("update ParamGeral set NomeEmpresa=?"), {nomeEmpresa}))
        return true;
    return falha(erro, conn.lastError());
}

bool criarEmpresaEmbutida(const ServerAddress& servidor, const Credenciais& admin,
                          const QString& codigo, const QString& nomeEmpresa, QString* erro) {
    if (!administradorPasta(servidor, admin, erro)) return false;
    const QString ficheiro = sqliteFilePath(servidor.folder, nomeBaseDados(codigo));
    if (QFileInfo::exists(ficheiro)) {
        return falha(erro, QStringLiteral("A empresa %1 já existe.").arg(codigo));
    }
    Connection conn;
    bool ok = conn.open(parametros(servidor, nomeBaseDados(codigo), admin, true));
    if (!ok) {
        falha(erro, conn.lastError());
    } else {
        ok = prepararEmpresa(conn, nomeEmpresa, erro);
    }
    conn.close();
    if (!ok) apagarFicheiroEmbutido(ficheiro);
    return ok;
}

bool criarEmpresaPostgres(const ServerAddress& servidor, const Credenciais& admin,
                          const QString& codigo, const QString& nomeEmpresa, QString* erro) {
    Connection master;
    if (!abrirMaster(master, servidor, admin, erro)) return false;
    const QString base = master.dialect().physicalDatabaseName(nomeBaseDados(codigo));
    if (master.firstRow(QStringLiteral("select 1 from pg_database where datname=?"), {base})) {
        return falha(erro, QStringLiteral("A empresa %1 já existe.").arg(codigo));
    }
    if (!garantirGrupo(master, erro)) return false;
    if (!master.exec(QStringLiteral("CREATE DATABASE ") + base + QStringLiteral(" OWNER ") +
                     kGrupoUtilizadores)) {
        return falha(erro, QStringLiteral("Não foi possível criar a base de dados %1: %2")
                               .arg(base, master.lastError()));
    }
    Connection conn;
    const bool ok = abrirEmpresa(conn, servidor, admin, codigo, erro) &&
                    prepararEmpresa(conn, nomeEmpresa, erro);
    conn.close();
    if (!ok) master.exec(QStringLiteral("DROP DATABASE IF EXISTS ") + base);
    return ok;
}

}  // namespace

bool codigoEmpresaValido(const QString& codigo) {
    static const QRegularExpression padrao(QStringLiteral("^[A-Za-z0-9]{4}$"));
    return padrao.match(codigo).hasMatch();
}

bool nomeLoginValido(const QString& login) {
    static const QRegularExpression padrao(QStringLiteral("^[A-Za-z_][A-Za-z0-9_]{0,62}$"));
    return padrao.match(login).hasMatch() &&
           login.compare(kGrupoUtilizadores, Qt::CaseInsensitive) != 0;
}

bool criarLogin(const ServerAddress& servidor, const Credenciais& admin, const QString& login,
                const QString& password, bool sysAdmin, QString* erro) {
    if (!nomeLoginValido(login)) {
        return falha(erro, QStringLiteral("Nome de login inválido: %1 (letras, algarismos e _, a "
                                          "começar por uma letra)")
                               .arg(login));
    }
    if (!motorSuportado(servidor, erro)) return false;
    if (servidor.engine == Engine::Postgres) {
        return criarLoginPostgres(servidor, admin, login, password, sysAdmin, erro);
    }
    MasterLogins logins(servidor.folder);
    const bool primeiro = logins.logins().isEmpty();
    if (!primeiro && !administradorPasta(servidor, admin, erro)) return false;
    return logins.criar(login, password, sysAdmin || primeiro, erro);
}

std::optional<bool> existeEmpresa(const ServerAddress& servidor, const Credenciais& admin,
                                  const QString& codigo, QString* erro) {
    if (!motorSuportado(servidor, erro)) return std::nullopt;
    if (servidor.engine == Engine::Sqlite) {
        return QFileInfo::exists(sqliteFilePath(servidor.folder, nomeBaseDados(codigo)));
    }
    Connection master;
    if (!abrirMaster(master, servidor, admin, erro)) return std::nullopt;
    return master
        .firstRow(QStringLiteral("select 1 from pg_database where datname=?"),
                  {master.dialect().physicalDatabaseName(nomeBaseDados(codigo))})
        .has_value();
}

bool criarEmpresa(const ServerAddress& servidor, const Credenciais& admin, const QString& codigo,
                  const QString& nomeEmpresa, QString* erro) {
    if (!codigoEmpresaValido(codigo)) {
        return falha(erro, QStringLiteral("Código de empresa inválido: %1 (quatro letras ou "
                                          "algarismos)")
                               .arg(codigo));
    }
    if (!motorSuportado(servidor, erro)) return false;
    return servidor.engine == Engine::Postgres
               ? criarEmpresaPostgres(servidor, admin, codigo, nomeEmpresa, erro)
               : criarEmpresaEmbutida(servidor, admin, codigo, nomeEmpresa, erro);
}

bool abrirEmpresa(Connection& conn, const ServerAddress& servidor, const Credenciais& credenciais,
                  const QString& codigo, QString* erro) {
    if (!motorSuportado(servidor, erro)) return false;
    if (!conn.open(parametros(servidor, nomeBaseDados(codigo), credenciais))) {
        return falha(erro, QStringLiteral("Não foi possível abrir a empresa %1: %2")
                               .arg(codigo, conn.lastError()));
    }
    if (servidor.engine == Engine::Postgres &&
        !conn.exec(QStringLiteral("SET ROLE ") + kGrupoUtilizadores)) {
        const QString motivo = conn.lastError();
        conn.close();
        return falha(erro, QStringLiteral("O login %1 não pertence ao grupo %2: %3")
                               .arg(credenciais.login, kGrupoUtilizadores, motivo));
    }
    return true;
}

}  // namespace brasel::db::schema
