#pragma once

#include <QString>

#include <optional>

namespace brasel::db {

enum class Engine { Sqlite, Postgres, SqlServer };

// Where the company databases live, read from the server text of a company-list entry:
// a folder or "sqlite:<folder>" is the embedded engine, "postgresql://host[:port]" a server,
// "mssql://..." is reserved. Empty text is no server.
struct ServerAddress {
    Engine engine = Engine::Sqlite;
    QString folder;  // embedded engine
    QString host;    // server engines
    int port = 0;

    static std::optional<ServerAddress> parse(const QString& servidor);
};

}  // namespace brasel::db
