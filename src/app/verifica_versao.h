#pragma once

#include "common/message_port.h"
#include "db/sessao.h"

namespace brasel::app {

enum class ComparacaoVersao {
    Igual,             // the database was made for this program
    SemVersao,         // Actualiza holds no version: the database must be updated first
    BaseMaisNova,      // a newer program updated the database
    ProgramaMaisNovo,  // the database must be updated to this program's version
    SemLigacao,        // the company database could not be read
};

// Reads Actualiza.Versao over a connection of its own and compares it, as text, with the
// program's 12-character version. Shows nothing.
ComparacaoVersao compararVersaoBD(db::Sessao& sessao);

// The version check of a company: true when the program may enter. Each refusal shows its
// messages; a database that cannot be reached is refused without a message (the connection
// that follows reports it).
bool VerificaVersaoBD(db::Sessao& sessao, MessagePort& mensagens);

}  // namespace brasel::app
