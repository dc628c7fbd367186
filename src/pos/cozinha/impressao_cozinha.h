#pragma once

#include "db/connection.h"
#include "devices/definicao_impressora.h"
#include "devices/linha_serie.h"
#include "pos/cozinha/historico_copa.h"
#include "pos/cozinha/talao_cozinha.h"

#include <QList>
#include <QString>

namespace brasel::pos::cozinha {

// How a ticket went: only Impresso means that it really reached the printer.
enum class ResultadoTalao {
    Impresso,        // every byte went out on the line, or the page job ended
    PortaOcupada,    // another printout holds the serial line: nothing sent, try again later
    Falhou,          // the printer could not be reached or stopped taking the bytes
    NaoConfigurada,  // no printer is defined for it: nothing sent
};

// One kitchen row on the serial ticket printer `impressora` through the shared line: the
// character set and a reset, the row's lines, a reset. No cut: the rows of a ticket follow each
// other on the paper.
ResultadoTalao ImprimeTalaoCozinhaSerie(devices::LinhaSerie& linha,
                                        const devices::DefinicaoImpressora& impressora,
                                        const ItemTalaoCozinha& item);

// The rows of one kitchen ticket as one job on the page printer named `impressora` (the
// workstation's ConfigRest_ImpTalaoCozinhaNome: an installed printer, "" the default one, a
// folder or a ".pdf" name for a PDF file). Impresso once the job ended whole.
ResultadoTalao ImprimeTalaoCozinhaWindows(const QString& impressora,
                                          const QList<ItemTalaoCozinha>& itens);

// One bar ticket for a line of a tab on the bar's serial printer (the ImpTaloes row
// `codigoImpressora`, the workstation's ConfigRest_ImpTalaoBar): the table's line, eight lines
// of feed, the cut. NaoConfigurada when there is no such row.
ResultadoTalao ImprimeTalaoBar(db::Connection& conn, devices::LinhaSerie& linha,
                               const QString& codigoImpressora, const PedidoCozinha& pedido,
                               bool linhasExtra);

}  // namespace brasel::pos::cozinha
