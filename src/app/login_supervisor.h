#pragma once

#include "common/message_port.h"
#include "db/sessao.h"

#include <QString>

#include <optional>

namespace brasel::app {

// The supervisor's own login on the server: the first time the supervisor logs in to a server
// that has none, it is created with the password typed, as an administrator of the server, by
// the login the company was selected with.

inline const QString kLoginSupervisor = QStringLiteral("SUPERVISOR");

// Whether the server of the selected company has the login; nullopt when the server cannot be
// asked.
std::optional<bool> Ver_se_Existe_Login(db::Sessao& sessao, const QString& login);

// Creates the supervisor's login with `password` and says so. A refusal (an empty password, or
// a company-selection login that may not create logins) is shown and gives false.
bool criarLoginSupervisor(db::Sessao& sessao, const QString& password, MessagePort& mensagens);

}  // namespace brasel::app
