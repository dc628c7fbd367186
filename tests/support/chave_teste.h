#pragma once

#include "app/estado.h"

#include <QString>

#include <optional>

namespace brasel::testing {

// A signing key made once per test process in a temporary folder: the key file and its public
// half (PEM).
QString ficheiroChaveTeste();
QString ficheiroChavePublicaTeste();

// Points the state at the test key: Config.cfg's key file and certificate number "0000".
void usaChaveTeste(app::Estado& estado);

// Checks a signature with the openssl command line and the public half of the test key, outside
// the program: `openssl dgst -sha1 -verify`. nullopt when no openssl program is installed (the
// test then skips).
std::optional<bool> confereComOpenssl(const QString& texto, const QString& assinatura);

}  // namespace brasel::testing
