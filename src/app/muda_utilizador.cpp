#include "app/muda_utilizador.h"

#include "app/acessos.h"
#include "app/carrega_parametros.h"
#include "app/passwords.h"
#include "common/ediv.h"
#include "db/query_helpers.h"

namespace brasel::app {

namespace {

// The in-use flag goes with the workstation: the user who leaves is no longer in use here and
// the one who arrives is. Nothing moves when the previous user's flag was not set.
void passaFlagEmUso(db::Connection& conn, const QString& anterior, const QString& novo) {
    if (anterior == novo) return;
    const auto linha = db::primeiraLinha(
        conn, QStringLiteral("select UsoPOS from Utilizador where Codigo=?"), {anterior});
    if (!linha || linha->value(0).toInt() != 1) return;
    db::WriteTransaction tx(conn);
    if (conn.exec(QStringLiteral("update Utilizador set UsoPOS=0 where Codigo=?"), {anterior}) &&
        conn.exec(QStringLiteral("update Utilizador set UsoPOS=1 where Codigo=?"), {novo})) {
        tx.commit();
    }
}

}  // namespace

QString UtilizadorMudanca::password() const {
    return EDiv::Decrypt(passwordCifrada);
}

QList<UtilizadorMudanca> utilizadoresMudanca(Estado& estado) {
    QList<UtilizadorMudanca> lista;
    auto q = estado.gConn.exec(
        QStringLiteral("select u.Codigo, u.Login, u.Password from Utilizador u where u.Codigo>? "
                       "and (u.Codigo=? or exists (select 1 from Acessos a where "
                       "a.utilizador=u.Codigo and a.chave=? and a.value=?)) order by u.Login"),
        {QStringLiteral("00"), QStringLiteral("01"), kPrograma, 1});
    while (q && q->next()) {
        lista.append({q->value(0).toString().trimmed(), q->value(1).toString().trimmed(),
                      q->value(2).toString()});
    }
    return lista;
}

bool confirmaPasswordUtilizador(const UtilizadorMudanca& utilizador, const QString& escrita,
                                MessagePort& mensagens) {
    if (escrita == utilizador.password()) return true;
    mensagens.mensagem(QStringLiteral("Password Inválida!"), Icone::Critico);
    return false;
}

bool mudaUtilizador(Estado& estado, const UtilizadorMudanca* escolhido, MessagePort& mensagens,
                    const QString& caixaPosto) {
    if (escolhido == nullptr) {
        mensagens.mensagem(QStringLiteral("Não Definiu o Utilizador!"), Icone::Critico);
        return false;
    }
    db::Connection nova;
    if (!abreEmpresaComo(estado, nova, escolhido->login, escolhido->password())) {
        mensagens.mensagem(kLoginRecusado, Icone::Critico);
        return false;
    }
    // Closing the proven connection parks its session, and gConn takes that same session back,
    // so the hand-over does not depend on the server accepting the login a second time.
    const db::ConnectionParams params = nova.params();
    nova.close();
    const db::ConnectionParams anteriores = estado.gConn.params();
    if (!estado.gConn.open(params)) {
        estado.gConn.open(anteriores);
        mensagens.mensagem(kLoginRecusado, Icone::Critico);
        return false;
    }
    passaFlagEmUso(estado.gConn, estado.gUtilizador, escolhido->codigo);
    estado.gUtilizador = escolhido->codigo;
    estado.gNomeUtilizador = escolhido->login;
    CarregaParametros(estado, mensagens, caixaPosto);
    return true;
}

}  // namespace brasel::app
