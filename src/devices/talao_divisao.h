#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "common/message_port.h"
#include "devices/linha_serie.h"
#include "devices/talao_comum.h"

#include <QDate>
#include <QString>

namespace brasel::devices {

// One share of a tab divided among its people: what each pays and the note typed for it.
struct TalaoDivisao {
    Currency valorPessoa;  // "Total Pagar"
    Currency totalGeral;   // the whole tab (the page printer prints it as "Total Geral")
    QString nota;          // split into its lines at CR LF, the first ten printed
    QDate data;            // date of issue; today when not set
};

// The lines of the share's purchase ticket: the shop heading, the purchase-ticket line, the date
// of issue, the note, "Total Pagar" in medium size (and "Total Geral" on the page printer), the
// footer lines.
LinhasTalao LinhasTalaoDivisao(const QStringList& cabecalho, const ConfigImpressao& config,
                               const TalaoDivisao& talao, int decimais, bool paraPagina);

// Prints the share's ticket on the user's serial ticket printer or page printer (PortaTalao).
// False when the user has no configuration, the printer is missing or the ticket did not go out.
bool ImprimeTalaoDivisao(app::Estado& estado, MessagePort& mensagens, LinhaSerie& linha,
                         const TalaoDivisao& talao);

}  // namespace brasel::devices
