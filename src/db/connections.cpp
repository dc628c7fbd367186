#include "db/connections.h"

#include "common/cls_encripta.h"
#include "db/query_helpers.h"

namespace brasel::db {

namespace {

// "SQL" (also when empty) or "WIN", compared without regard to case; "" for anything else.
QString autenticacaoNormal(const QString& autenticacao) {
    const QString a = autenticacao.trimmed().toUpper();
    if (a.isEmpty() || a == QStringLiteral("SQL")) return QStringLiteral("SQL");
    if (a == QStringLiteral("WIN")) return QStringLiteral("WIN");
    return {};
}

}  // namespace

bool Abre_Connexao(Connection& conn, const QString& servidor, const QString& baseDados,
                   const QString& login, QString& password, const QString& passwordCifrada,
                   const QString& autenticacao, int tempoComando, int tempoLigacao,
                   bool semPooling) {
    const auto endereco = ServerAddress::parse(servidor);
    if (!endereco) return false;
    if (!passwordCifrada.trimmed().isEmpty()) {
        password = clsEncripta::Desencripta(0, clsEncripta::chaveEmpresas(), passwordCifrada);
    }
    const QString modo = autenticacaoNormal(autenticacao);
    if (modo.isEmpty()) return false;
    ConnectionParams params;
    params.server = *endereco;
    params.baseDados = baseDados;
    params.login = login;
    params.password = password;
    params.autenticacao = modo;
    params.tempoComando = tempoComando;
    params.tempoLigacao = tempoLigacao;
    params.semPooling = semPooling;
    return conn.open(params);
}

bool Abre_Connexao_Local(Sessao& sessao, Connection& conn, int tempoComando, int tempoLigacao,
                         bool semPooling) {
    QString password = sessao.gPassword;
    return Abre_Connexao(conn, sessao.gServidor, nomeBaseDados(sessao.gEmpresa), sessao.gLogin,
                         password, QString(), sessao.gAutenticacao, tempoComando, tempoLigacao,
                         semPooling);
}

bool Fecha_Conneccao(Connection& conn) {
    conn.close();
    return true;
}

bool Testa_Connection(Sessao& sessao, Connection* conn) {
    Connection& c = sessao.ligacao(conn);
    return c.exec(QStringLiteral("select 1")).has_value();
}

bool Abre_Connexao_Contabilidade(Sessao& sessao, SetupContabilidade setup, bool configuracao,
                                 MessagePort* mensagens, Connection* conn) {
    const bool snc = setup == SetupContabilidade::SNC;
    const QString sufixo = snc ? QStringLiteral("SNC") : QString();
    const QString marca = snc ? QStringLiteral("(SNC)") : QStringLiteral("(POC)");
    const auto linha =
        primeiraLinha(sessao.gConn, QStringLiteral("select * from ParamGeral limit 1"));
    if (!linha) return false;
    auto coluna = [&](const QString& nome) {
        const int i = linha->indexOf(nome + sufixo);
        return i < 0 ? QString() : linha->value(i).toString().trimmed();
    };
    const QString servidor = coluna(QStringLiteral("Server"));
    const QString empresa = coluna(QStringLiteral("empresa"));
    const QString login = coluna(QStringLiteral("Login"));
    const QString cifrada = coluna(QStringLiteral("Password"));
    const QString recusa =
        servidor.isEmpty()
            ? QStringLiteral("Não tem definido o Servidor da Contabilidade %1 [Parâmetros Gerais]")
        : empresa.isEmpty()
            ? QStringLiteral("Não tem definida a Empresa da Contabilidade %1 [Parâmetros Gerais]")
        : login.isEmpty()
            ? QStringLiteral(
                  "Não tem definido o Utilizador da Contabilidade %1 [Parâmetros Gerais]")
            : QString();
    if (!recusa.isEmpty()) {
        if (mensagens) mensagens->mensagem(recusa.arg(marca), Icone::Critico);
        return false;
    }
    // The authentication column holds 1 for a server login and 0 for the workstation's user;
    // a text "SQL"/"WIN" is taken as it is.
    const QString autenticaTexto = coluna(QStringLiteral("ContabAutenticaSQL")).toUpper();
    const QString autenticacao =
        autenticaTexto == QStringLiteral("WIN") || autenticaTexto == QStringLiteral("0")
            ? QStringLiteral("WIN")
            : QStringLiteral("SQL");
    QString password;
    Connection& destino = conn != nullptr ? *conn : sessao.gConnContab;
    return Abre_Connexao(destino, servidor, configuracao ? QStringLiteral("LedraConfig") : empresa,
                         login, password, cifrada, autenticacao, 0, 60);
}

bool Abre_Conn_QuorilComNet_bln(Sessao& sessao, Connection& conn, MessagePort& mensagens) {
    const auto linha = primeiraLinha(
        sessao.gConn,
        QStringLiteral("select Servidor, Login, Password from QuorilComNet_Config limit 1"));
    bool aberta = false;
    if (linha) {
        QString password;
        aberta = Abre_Connexao(conn, linha->value(0).toString(), QStringLiteral("QuorilComNet"),
                               linha->value(1).toString(), password, linha->value(2).toString(),
                               QStringLiteral("SQL"), 0, 60);
    }
    if (!aberta) {
        mensagens.mensagem(
            QStringLiteral("Não foi possível a ligação à base de dados QuorilComNet!"),
            Icone::Critico);
    }
    return aberta;
}

}  // namespace brasel::db
