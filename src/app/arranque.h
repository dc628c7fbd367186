#pragma once

#include "app/estado.h"

#include <QString>
#include <QStringList>

namespace brasel::app {

// What the program was started with: the "--config <path>" (or "--config=<path>") option, and
// every other argument joined by blanks into the line the updater's protocol is read from.
struct ArgumentosPrograma {
    QString linhaComando;
    QString config;  // "" for the Config.cfg beside the program
};
// `argumentos` as QCoreApplication::arguments() gives them (the program first).
ArgumentosPrograma lerArgumentos(const QStringList& argumentos);

enum class AccaoLinhaComando { Continuar, Terminar };

// The updater's protocol: "<@>COMMAND<@>server<@>n<@>login<@>password<@>text". Server, login
// and password preset the session; "ACT_CHK" leaves an empty file named after the program's
// version ("000100000000.txt") in `pastaPrograma` and asks the caller to end at once, before any
// window. A line that does not start with "<@>" changes nothing.
AccaoLinhaComando LeLinhaComando(const QString& linha, Estado& estado,
                                 const QString& pastaPrograma);

// The program formats and parses its own numbers with "." for decimals, whatever the OS locale.
// Call after the application object exists: constructing it adopts the user's locale.
void forcarFormatoNumeros();

// The month names (1..12) and the "like" wildcard.
void preencheEstadoInicial(Estado& estado);

// A new GUID in registry form: 38 characters, braces, upper case.
QString GetUID();

// The client of the remote session this program runs in (the address an SSH session came from),
// and the user of that session; both "" when the session is local.
QString WTS_NomeCliente();
QString WTS_NomeUtilizador();

}  // namespace brasel::app
