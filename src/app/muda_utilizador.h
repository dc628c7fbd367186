#pragma once

#include "app/estado.h"
#include "common/message_port.h"

#include <QList>
#include <QString>

namespace brasel::app {

// A user that may be chosen when changing user without leaving the program.
struct UtilizadorMudanca {
    QString codigo;
    QString login;
    QString passwordCifrada;  // as stored, under the character cipher

    QString password() const;
    bool semPassword() const { return passwordCifrada.isEmpty(); }
};

// How a user without a stored password is shown.
inline const QString kSemPassword = QStringLiteral("(Sem Password)");

// The users that may take over this workstation, by login: every user but the support user,
// among them the supervisor and those whose program right is granted.
QList<UtilizadorMudanca> utilizadoresMudanca(Estado& estado);

// Whether `escrita` is the user's password; otherwise "Password Inválida!" and false.
bool confirmaPasswordUtilizador(const UtilizadorMudanca& utilizador, const QString& escrita,
                                MessagePort& mensagens);

// Makes `escolhido` the user of the program: the company is opened with its login and password
// on a connection of its own and, only once that worked, gConn takes it over, so a refused user
// leaves the previous one working. Then gUtilizador, the user's name and the in-use flag follow,
// and the parameters are loaded again (`caixaPosto`: the workstation's cash register).
// False, after its message, when no user was chosen or the company refused the login.
bool mudaUtilizador(Estado& estado, const UtilizadorMudanca* escolhido, MessagePort& mensagens,
                    const QString& caixaPosto);

}  // namespace brasel::app
