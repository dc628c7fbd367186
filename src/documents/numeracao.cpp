#include "documents/numeracao.h"

namespace brasel::documents {

QString NumeroDocumento(qint64 numero) {
    return QStringLiteral("%1").arg(numero, 8, 10, QLatin1Char('0'));
}

std::optional<QString> ProximoNumTabTipoMov(db::Connection& conn, const QString& Tipo) {
    // A workstation that raised the counter between our reading and our update leaves our
    // update without effect: read again and take the number after its one.
    for (int tentativa = 0; tentativa < 20; ++tentativa) {
        const auto linha = conn.firstRow(
            QStringLiteral("select COALESCE(UltNumero,'') from TabTipoMov where codigo=?"), {Tipo});
        if (!linha) return std::nullopt;
        bool ok = false;
        const QString actual = linha->value(0).toString().trimmed();
        const qint64 ultimo = actual.isEmpty() ? 0 : actual.toLongLong(&ok);
        if (!actual.isEmpty() && !ok) return std::nullopt;
        const QString numero = NumeroDocumento(ultimo + 1);
        auto rs = conn.exec(
            QStringLiteral("update TabTipoMov set UltNumero=? where codigo=? and UltNumero<?"),
            {numero, Tipo, numero});
        if (!rs) return std::nullopt;
        if (rs->numRowsAffected() > 0) return numero;
    }
    return std::nullopt;
}

}  // namespace brasel::documents
