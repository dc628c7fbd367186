#include "app/bloqueios.h"

#include "db/query_helpers.h"

namespace brasel::app {

namespace {

bool bloqueia(db::Connection& conn, const QString& tabela) {
    if (!conn.inTransaction()) return false;
    auto q = conn.exec(QStringLiteral("update ") + tabela + QStringLiteral(" set Tmp=1"));
    return q && q->numRowsAffected() > 0;
}

}  // namespace

bool BloqueiaDocumentos(db::Connection& conn) {
    return bloqueia(conn, QStringLiteral("LockFacCli"));
}

bool BloqueiaClientes(db::Connection& conn) {
    return bloqueia(conn, QStringLiteral("LockCli"));
}

QString nomeTabelaLockMesa(const QString& mesa) {
    // A table code may hold blanks or quotes: the name is a quoted identifier, quotes doubled.
    QString nome = QStringLiteral("LockLinRec") + mesa;
    nome.replace(QLatin1Char('"'), QStringLiteral("\"\""));
    return QLatin1Char('"') + nome + QLatin1Char('"');
}

void ApagaLockMesa(Estado& estado, const QString& mesa) {
    db::Connection& conn = estado.ligacao(&estado.gConnLocks);
    if (db::Ver_Se_Existe_Tabela_bln(estado, &conn, QStringLiteral("LockLinRec") + mesa)) {
        conn.exec(QStringLiteral("drop table ") + nomeTabelaLockMesa(mesa));
    }
}

}  // namespace brasel::app
