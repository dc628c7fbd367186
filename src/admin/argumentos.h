#pragma once

#include <QHash>
#include <QString>
#include <QStringList>

#include <optional>

namespace brasel::admin {

// What was asked on the command line: a command and its options ("--server S" or
// "--server=S"; switches such as "--sysadmin" hold "1").
struct Pedido {
    QString comando;
    QHash<QString, QString> opcoes;

    QString opcao(const QString& nome) const { return opcoes.value(nome); }
    bool tem(const QString& nome) const { return opcoes.contains(nome); }
};

// The text of --help.
QString textoAjuda();

// Reads the arguments that follow the program's name. nullopt, with the reason in `erro`, when
// the command is unknown, an option does not belong to it, a value is missing or a required
// option is absent, or when there is no argument at all. "--help" (or "help") gives the command
// "help".
std::optional<Pedido> lerPedido(const QStringList& argumentos, QString* erro);

}  // namespace brasel::admin
