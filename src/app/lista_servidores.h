#pragma once

#include "app/definicoes_posto.h"

#include <QString>

namespace brasel::app {

// The server list as the server maintenance window edits it before saving: a new entry takes
// the first entry not in use, and deleting an entry moves the following ones up, so the
// entries in use stay numbered from 1 without gaps.

// The entry that names `servidor` (trimmed, without regard to case), other than `excepto`;
// -1 when there is none.
int indiceServidor(const ListaServidores& lista, const QString& servidor, int excepto = -1);

enum class EdicaoServidor { Feita, SemServidor, Repetido, Cheia };

EdicaoServidor acrescentarServidor(ListaServidores& lista, const EntradaServidor& entrada);
EdicaoServidor alterarServidor(ListaServidores& lista, int indice, const EntradaServidor& entrada);
// False when `indice` is not an entry of the list.
bool apagarServidor(ListaServidores& lista, int indice);

// What the person is told when an edit is refused ("" for an edit that was made).
QString mensagemEdicao(EdicaoServidor resultado);

}  // namespace brasel::app
