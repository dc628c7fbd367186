#pragma once

#include "db/connection.h"
#include "devices/linha_serie.h"

#include <QByteArray>
#include <QString>

namespace brasel::devices {

// The pulse a cash drawer device gets when it has no printer definition of its own: ESC p 0
// with 25 and 250 (the on and off times of the kick, in 2 ms units).
inline const QByteArray kPulsoGaveta("\x1bp\x00\x19\xfa", 5);

// What a workstation reaches its cash drawer through.
struct MeiosGaveta {
    LinhaSerie& linha;         // the main window's serial control (drawer on the ticket printer)
    QString dispositivoOPOS;   // ConfigRest_CaixaDinheiro: the drawer's own device, "" none
    QString impressoraPagina;  // the page printer whose driver kicks the drawer ("" default)
};

// Opens the drawer for a document of type `tipoDocumento` ("" = unconditional, as from the menu
// or the print-choice dialog), for `utilizador`:
// - a type whose TabTipoMov row says abrecaixa is not "1" never opens it;
// - a user whose drawer hangs on the page printer (CaixaDinheiroPorDrive = 1) gets a driver job
//   only for an unconditional opening with `drivePermitido` (a printed document's own job kicks
//   the drawer otherwise);
// - otherwise the OPOS device gets its pulse and the ticket printer of the user's TipoImpTalao
//   its drawer code.
// True when the drawer was told to open by at least one way.
bool AbreGaveta(db::Connection& conn, const QString& utilizador, const MeiosGaveta& meios,
                const QString& tipoDocumento, bool drivePermitido);

// Writes kPulsoGaveta to the drawer device `dispositivo` (a device path). Nothing is done for an
// empty or missing path, and no file is ever created; false then or when the write fails.
bool AbreGavetaOPOS(const QString& dispositivo);

// A one-line job "---" titled "Abretura do Caixa - Por Drive" on the page printer `impressora`
// (see TrabalhoImpressao for the names); the driver kicks the drawer with every job. False when
// the job could not start or did not end well.
bool AbreGavetaPorDrive(const QString& impressora);

}  // namespace brasel::devices
