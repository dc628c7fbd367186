#include "app/acessos.h"

#include "db/query_helpers.h"

namespace brasel::app {

namespace {

QString semE(const QString& caption) {
    QString t = caption;
    t.remove(QLatin1Char('&'));
    return t;
}

bool insereSeFalta(db::Connection& conn, const QString& utilizador, const QString& chave, int valor,
                   const QString& chave1, const QString& form, const QString& ctrl,
                   const QString& caption, const QString& ctrlcap) {
    if (db::primeiraLinha(
            conn, QStringLiteral("select chave from acessos where chave=? and utilizador=?"),
            {chave, utilizador})) {
        return true;
    }
    return conn
        .exec(QStringLiteral("insert into acessos (utilizador, chave, value, chave1, form, ctrl, "
                             "caption, ctrlcap) values (?,?,?,?,?,?,?,?)"),
              {utilizador, chave, valor, chave1, form, ctrl, semE(caption), semE(ctrlcap)})
        .has_value();
}

}  // namespace

QString chaveJanela(const QString& janela, const QString& sufixo) {
    return kPrograma + janela + sufixo;
}

QString chaveBotao(const QString& chaveDaJanela, const QString& botao) {
    return chaveDaJanela + QLatin1Char('.') + botao;
}

bool utilizadorSemRestricoes(const QString& utilizador) {
    return utilizador == QStringLiteral("00") || utilizador == QStringLiteral("01");
}

bool botaoRestringivel(const BotaoJanela& botao) {
    if (!botao.nome.toLower().startsWith(QStringLiteral("cmd"))) return false;
    if (botao.nome == QStringLiteral("cmdSim") || botao.nome == QStringLiteral("cmdNao"))
        return false;
    const QString caption = semE(botao.caption).toUpper();
    for (const char* saida : {"FECHA", "CANCEL", "VOLTA", "SAI"}) {
        if (caption.contains(QLatin1String(saida))) return false;
    }
    return true;
}

void GetBotoes(Estado& estado, const JanelaAcesso& janela, const QString& utilizador, int valor,
               const QString& sufixo) {
    db::Connection& conn = estado.gConn;
    const QString chave = chaveJanela(janela.nome, sufixo);
    insereSeFalta(conn, utilizador, chave, valor, kPrograma, janela.nome, QString(), janela.caption,
                  QString());
    for (const BotaoJanela& botao : janela.botoes) {
        if (!botaoRestringivel(botao)) continue;
        insereSeFalta(conn, utilizador, chaveBotao(chave, botao.nome), valor, chave, janela.nome,
                      botao.nome, janela.caption, botao.caption);
    }
}

std::optional<int> CheckUtilizApp(Estado& estado, const QString& chave, const QString& utilizador) {
    const auto linha = db::primeiraLinha(
        estado.gConn,
        QStringLiteral("select chave, value from acessos where chave=? and utilizador=?"),
        {chave, utilizador});
    if (!linha) return std::nullopt;
    return linha->value(1).toString().trimmed().toInt();
}

ResultadoAcesso FormAcessos(Estado& estado, const JanelaAcesso& janela, const QString& utilizador,
                            const QString& sufixo) {
    ResultadoAcesso resultado;
    if (utilizadorSemRestricoes(utilizador)) {
        resultado.permitido = true;
        return resultado;
    }
    const QString chave = chaveJanela(janela.nome, sufixo);
    if (!CheckUtilizApp(estado, chave, utilizador))
        GetBotoes(estado, janela, utilizador, 1, sufixo);
    resultado.permitido = CheckUtilizApp(estado, chave, utilizador) == 1;
    if (!resultado.permitido) return resultado;
    for (const BotaoJanela& botao : janela.botoes) {
        if (!botaoRestringivel(botao)) continue;
        // A button without a row (added to the window after its rights were created) is allowed.
        const auto valor = CheckUtilizApp(estado, chaveBotao(chave, botao.nome), utilizador);
        resultado.botoes.insert(botao.nome, !valor || *valor == 1);
    }
    return resultado;
}

void CriaTodososAcessos(Estado& estado, const QString& utilizador,
                        const QList<JanelaAcesso>& janelas) {
    if (utilizadorSemRestricoes(utilizador)) return;
    db::WriteTransaction tx(estado.gConn);
    insereSeFalta(estado.gConn, utilizador, kPrograma, 1, QString(), QString(), QString(),
                  kPrograma, QString());
    for (const JanelaAcesso& janela : janelas)
        GetBotoes(estado, janela, utilizador, 1);
    tx.commit();
}

void ApagaTodososAcessos(Estado& estado, const QString& utilizador) {
    if (utilizador == QStringLiteral("TODOS")) {
        estado.gConn.exec(QStringLiteral("delete from acessos"));
    } else {
        estado.gConn.exec(QStringLiteral("delete from acessos where utilizador=?"), {utilizador});
    }
}

QList<DireitoAcesso> lerDireitos(Estado& estado, const QString& utilizador) {
    QList<DireitoAcesso> direitos;
    auto q = estado.gConn.exec(
        QStringLiteral("select chave, chave1, form, ctrl, caption, ctrlcap, value from acessos "
                       "where utilizador=? order by chave"),
        {utilizador});
    while (q && q->next()) {
        direitos.append({q->value(0).toString(), q->value(1).toString(), q->value(2).toString(),
                         q->value(3).toString(), q->value(4).toString(), q->value(5).toString(),
                         q->value(6).toString().trimmed() == QStringLiteral("1")});
    }
    return direitos;
}

bool gravarDireitos(Estado& estado, const QString& utilizador,
                    const QList<DireitoAcesso>& direitos) {
    if (utilizador == QStringLiteral("00")) return false;
    db::WriteTransaction tx(estado.gConn);
    for (const DireitoAcesso& d : direitos) {
        if (!estado.gConn.exec(
                QStringLiteral("update acessos set value=? where chave=? and utilizador=?"),
                {d.valor ? 1 : 0, d.chave, utilizador})) {
            return false;
        }
    }
    return tx.commit();
}

bool acessoPrograma(Estado& estado, const QString& utilizador, const FornecedorJanelas& janelas) {
    if (utilizadorSemRestricoes(utilizador)) return true;
    if (!CheckUtilizApp(estado, kPrograma, utilizador)) {
        CriaTodososAcessos(estado, utilizador, janelas ? janelas() : QList<JanelaAcesso>{});
    }
    return CheckUtilizApp(estado, kPrograma, utilizador) == 1;
}

}  // namespace brasel::app
