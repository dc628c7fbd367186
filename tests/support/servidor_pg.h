#pragma once

#include <QString>

#include <optional>

namespace brasel::testing {

// The PostgreSQL server the pg tests run on, from BRASEL_TEST_PG ("postgresql://host:port"),
// BRASEL_TEST_PG_USER and BRASEL_TEST_PG_PASSWORD (a login that may create databases and roles).
struct ServidorPg {
    QString servidor;
    QString login;
    QString password;
};

// nullopt when no server is configured: the test then skips.
std::optional<ServidorPg> servidorPg();

}  // namespace brasel::testing
