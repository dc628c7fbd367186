#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "devices/linha_serie.h"
#include "devices/talao_comum.h"

#include <QString>

namespace brasel::devices {

// The open tab of table `mesa`, movement type `tipo` and login `login` as its provisional bill
// shows it.
struct ContaProvisoria {
    QStringList cabecalho;  // the shop heading
    QStringList cliente;    // the customer block of the table's Clientes row
    QString login;
    std::vector<LinhaImpressa> linhas;
};

// Reads the tab's open lines and the table's customer block; nothing when the lines cannot be
// read.
std::optional<ContaProvisoria> LerContaProvisoria(app::Estado& estado, const QString& mesa,
                                                  const QString& tipo, const QString& login);

// The bill: heading, customer, employee, the open lines, "Total Geral" in medium size, the VAT
// summary when the user prints it, the computer-processed note and the footer lines.
LinhasTalao LinhasContaProvisoria(const ContaProvisoria& conta, const ConfigImpressao& config,
                                  int decimais, int decimaisQuant);

// Prints the provisional bill on the user's serial ticket printer or page printer (PortaTalao).
bool ImprimeContaProvisoria(app::Estado& estado, MessagePort& mensagens, LinhaSerie& linha,
                            const QString& mesa, const QString& tipo, const QString& login);

}  // namespace brasel::devices
