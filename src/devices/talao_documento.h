#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "devices/linha_serie.h"

#include <QString>

namespace brasel::devices {

// A closed document to print as a receipt, and how.
struct TalaoDocumento {
    QString tipo;
    QString numero;
    QString ano;
    bool talaoCompra = false;  // ">>>>>>>>>>  TALAO DE COMPRA  <<<<<<<<<<<" on top
    int vias = 1;              // copies; 0 prints nothing but still opens the drawer
    bool observacao = false;   // the document's observation instead of its lines
};

// The receipt of a closed document on the serial ticket printer (the main window's `linha`).
bool ImprimeTalaoSerie(app::Estado& estado, MessagePort& mensagens, LinhaSerie& linha,
                       const TalaoDocumento& documento);
// The same receipt on the user's page printer (UtilConfGeral.Impressora) in "Courier New".
bool ImprimeTalaoWindows(app::Estado& estado, MessagePort& mensagens, LinhaSerie& linha,
                         const TalaoDocumento& documento);
// One of the two, as the user's PortaTalao says ("COM" serial, "LPT" page printer).
bool ImprimeTalao(app::Estado& estado, MessagePort& mensagens, LinhaSerie& linha,
                  const TalaoDocumento& documento);

}  // namespace brasel::devices
