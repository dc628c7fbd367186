#include "db/server_address.h"

#include <QUrl>

namespace brasel::db {

std::optional<ServerAddress> ServerAddress::parse(const QString& servidor) {
    const QString text = servidor.trimmed();
    if (text.isEmpty()) return std::nullopt;
    ServerAddress address;
    const QString lower = text.toLower();
    if (lower.startsWith(QStringLiteral("postgresql://")) ||
        lower.startsWith(QStringLiteral("postgres://"))) {
        const QUrl url(text);
        if (!url.isValid() || url.host().isEmpty()) return std::nullopt;
        address.engine = Engine::Postgres;
        address.host = url.host();
        address.port = url.port(5432);
        return address;
    }
    if (lower.startsWith(QStringLiteral("mssql://"))) {
        const QUrl url(text);
        address.engine = Engine::SqlServer;
        address.host = url.host();
        address.port = url.port(1433);
        return address;
    }
    address.engine = Engine::Sqlite;
    address.folder = lower.startsWith(QStringLiteral("sqlite:")) ? text.mid(7) : text;
    if (address.folder.isEmpty()) return std::nullopt;
    return address;
}

}  // namespace brasel::db
