#include "support/servidor_pg.h"

namespace brasel::testing {

std::optional<ServidorPg> servidorPg() {
    const QString servidor = qEnvironmentVariable("BRASEL_TEST_PG");
    if (servidor.isEmpty()) return std::nullopt;
    ServidorPg pg;
    pg.servidor = servidor;
    pg.login = qEnvironmentVariable("BRASEL_TEST_PG_USER", QStringLiteral("postgres"));
    pg.password = qEnvironmentVariable("BRASEL_TEST_PG_PASSWORD");
    return pg;
}

}  // namespace brasel::testing
