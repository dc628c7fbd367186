#pragma once

#include "app/acessos.h"

#include <QList>
#include <QString>

namespace brasel::app {

// What the rights editor needs beside the rights themselves.

// The parent of every right in the list, by index: the right whose key is its `chave1`, or -1
// for the roots (the program right, and rights whose parent is not in the list or is the right
// itself).
QList<int> paisDireitos(const QList<DireitoAcesso>& direitos);

// The text of a right in the tree: the button's caption for a button, the window's caption for a
// window, each followed by its name; the key when there is no caption.
QString textoDireito(const DireitoAcesso& direito);

struct UtilizadorEditavel {
    QString codigo;
    QString login;
};
// The users whose rights can be restricted ("00" and "01" never are), by code.
QList<UtilizadorEditavel> utilizadoresEditaveis(Estado& estado);

}  // namespace brasel::app
