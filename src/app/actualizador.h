#pragma once

#include "common/message_port.h"

#include <QString>

#include <compare>
#include <optional>

namespace brasel::app {

// The updater: new releases are dropped into the update folder of Config.cfg (line 5) by
// whoever installs the program. A release is a file or folder named after its version, either
// "000100020003" or "1.2.3" (anything after a further "." is ignored: "1.2.3.tar.gz"), or a
// file "versao.txt" whose first non-blank line is a version in either form. The program only
// tells where a newer release is; it never replaces its own files.

struct Versao {
    int maior = 0;
    int menor = 0;
    int revisao = 0;

    auto operator<=>(const Versao&) const = default;
    QString texto() const;  // "1.2.3"
    static Versao actual();
    // "000100020003" or "1.2.3"; nullopt for anything else.
    static std::optional<Versao> ler(const QString& texto);
};

struct VersaoDisponivel {
    Versao versao;
    QString caminho;  // the release's file or folder (the folder, for versao.txt)
};

// The newest release in the folder, whatever its version; nullopt when the folder is missing
// or holds none.
std::optional<VersaoDisponivel> VerificaNovasVersoes(const QString& pastaActualizacoes);

// The caption of the company selection. With no release known, the newest is the one running.
QString legendaVersoes(const std::optional<VersaoDisponivel>& nova);

// When the folder holds a release newer than the program, says where it is and returns true;
// otherwise does nothing.
bool ProcessaActualizacoes(const QString& pastaActualizacoes, MessagePort& mensagens);

}  // namespace brasel::app
