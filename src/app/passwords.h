#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "db/connection.h"

#include <QString>

#include <optional>

namespace brasel::app {

// Whether protected actions (a line already sent to the kitchen deleted or changed) ask for the
// supervisor's password on this workstation.
bool precisaPasswordSupervisor();

// Opens the selected company on `conn` as `login` with `password`: a user proves who they are by
// the company accepting their own login (server logins, or the embedded server's logins).
bool abreEmpresaComo(Estado& estado, db::Connection& conn, const QString& login,
                     const QString& password);
// What a person is told when the company refuses a user's login.
inline const QString kLoginRecusado =
    QStringLiteral("Utilizador Inexistente no SQL ou Password inválida (Tabela de Utilizadores).");

// Whether `escrita` is the supervisor's (user "01") password. A company without a supervisor
// row accepts nothing.
bool passwordSupervisorValida(Estado& estado, const QString& escrita);
// The same, with "Password Inválida !" (title "Tente de Novo") when it is not.
bool confirmaPasswordSupervisor(Estado& estado, const QString& escrita, MessagePort& mensagens);

// The code of the user who proves to be `login` by opening the company with `password` on a
// connection of its own (gConn stays as it is). Nothing, after its message (title "Tente
// novamente"), when the company refuses the login or no user has it.
std::optional<QString> confirmaUtilizador(Estado& estado, const QString& login,
                                          const QString& password, MessagePort& mensagens);

}  // namespace brasel::app
