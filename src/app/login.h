#pragma once

#include "app/acessos.h"
#include "app/estado.h"
#include "common/message_port.h"

#include <QList>
#include <QString>

namespace brasel::app {

// The login of a user into the selected company: the password is checked by opening the company
// database with the user's own login and password.

enum class ResultadoLogin {
    Entrou,          // connections open, user and parameters loaded: the main window follows
    PasswordErrada,  // the server refused the login or password: the password is typed again
    Recusado,        // refused with a message (unknown user, program right, supervisor login)
};

// Login OK. `janelas` are the program's windows, whose rights are created for a user who has
// none yet. On success the user is marked in use (UsoPOS) and the name typed is kept for the
// next login; on failure no connection is left open.
ResultadoLogin validarLogin(Estado& estado, const QString& nomeEscrito, const QString& password,
                            const FornecedorJanelas& janelas, MessagePort& mensagens);

// What the login window starts with.
struct AberturaLogin {
    QString nome;                // the login box
    bool nomeBloqueado = false;  // the box may not be changed
    bool entrarJa = false;       // the login runs at once, as if OK were pressed
};

// Windows authentication in a remote session: the session's user, locked, logging in at once
// when `automatico`. Otherwise the last name typed, and the password is asked.
AberturaLogin prepararLogin(const Estado& estado, bool automatico);

// Closes every connection of the session (the main connection, the accounting one, and the two
// the login opened).
void fecharLigacoes(Estado& estado);

}  // namespace brasel::app
