#include "documents/numeracao.h"

namespace brasel::documents {

QString NumeroDocumento(qint64 numero) {
    return QStringLiteral("%1").arg(numero, 8, 10, QLatin1Char('0'));
}

QString tabelaCabecalho(QChar TipoTerceiro) {
    return TipoTerceiro.toUpper() == u'F' ? QStringLiteral("MovFornece")
                                          : QStringLiteral("MovCliente");
}

namespace {

// The counter as stored and as a number; nullopt when the type is missing or the text is not a
// number.
struct Contador {
    QString texto;
    qint64 valor = 0;
};

std::optional<Contador> lerContador(db::Connection& conn, const QString& Tipo) {
    const auto linha = conn.firstRow(
        QStringLiteral("select COALESCE(UltNumero,'') from TabTipoMov where codigo=?"), {Tipo});
    if (!linha) return std::nullopt;
    Contador c{linha->value(0).toString(), 0};
    const QString limpo = c.texto.trimmed();
    if (limpo.isEmpty()) return c;
    bool ok = false;
    c.valor = limpo.toLongLong(&ok);
    if (!ok || c.valor < 0) return std::nullopt;
    return c;
}

}  // namespace

std::optional<qint64> UltNumero_lng(db::Connection& conn, const QString& Tipo) {
    const auto c = lerContador(conn, Tipo);
    if (!c) return std::nullopt;
    return c->valor;
}

std::optional<QString> ProximoNumTabTipoMov(db::Connection& conn, const QString& Tipo) {
    // The update only takes when the counter still holds what was read: a workstation that
    // raised it in between makes us read again and take the number after its one. Comparing
    // with the text read, not by text order, also serves a counter stored without its zeros.
    for (int tentativa = 0; tentativa < 20; ++tentativa) {
        const auto actual = lerContador(conn, Tipo);
        if (!actual) return std::nullopt;
        const QString numero = NumeroDocumento(actual->valor + 1);
        auto rs = conn.exec(QStringLiteral("update TabTipoMov set UltNumero=? where codigo=? and "
                                           "COALESCE(UltNumero,'')=?"),
                            {numero, Tipo, actual->texto});
        if (!rs) return std::nullopt;
        if (rs->numRowsAffected() > 0) return numero;
    }
    return std::nullopt;
}

std::optional<QString> NumeroLivre(db::Connection& conn, const QString& tabelaCabecalho,
                                   const QString& Tipo, const QString& Ano, const QString& Minimo) {
    const auto ultimo = UltNumero_lng(conn, Tipo);
    if (!ultimo) return std::nullopt;
    qint64 candidato = *ultimo + 1;
    bool ok = false;
    const qint64 minimo = Minimo.trimmed().toLongLong(&ok);
    if (ok && minimo > candidato) candidato = minimo;
    // The table name comes from tabelaCabecalho(), never from input.
    const QString sql = QStringLiteral("select 1 from ") + tabelaCabecalho +
                        QStringLiteral(" where Tipo=? and Numero=? and Ano=?");
    for (;; ++candidato) {
        const QString numero = NumeroDocumento(candidato);
        auto q = conn.exec(sql, {Tipo, numero, Ano});
        if (!q) return std::nullopt;
        const bool ocupado = q->next();
        q->finish();
        if (!ocupado) return numero;
    }
}

bool GravaUltNumero(db::Connection& conn, const QString& Tipo, const QString& Numero) {
    const auto ultimo = UltNumero_lng(conn, Tipo);
    if (!ultimo) return false;
    bool ok = false;
    const qint64 numero = Numero.toLongLong(&ok);
    if (!ok) return false;
    if (numero <= *ultimo) return true;
    auto q = conn.exec(QStringLiteral("update TabTipoMov set UltNumero=? where codigo=?"),
                       {NumeroDocumento(numero), Tipo});
    return q && q->numRowsAffected() > 0;
}

}  // namespace brasel::documents
