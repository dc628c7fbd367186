#pragma once

#include "common/message_port.h"
#include "db/connection.h"
#include "pos/perguntas_fecho.h"

#include <QString>

#include <optional>

namespace brasel::pos {

// The walk-in customer data last used with a tax number, from the newest document that carries
// it; nullopt when none has it (or the number is empty).
std::optional<DadosClienteDiverso> DadosUltimoDocumento(db::Connection& conn,
                                                        const QString& contribuinte);

// The two rules of confirming the walk-in customer's data of a document dated `data`
// ("yyyy-MM-dd"): from 2010-12-31 on a tax number is required unless the user may post without
// one; an incomplete address is pointed out and the person chooses to go back and fill it.
// True when the data may be taken.
bool ConfirmaDadosCliDiv(MessagePort& mensagens, const DadosClienteDiverso& dados,
                         const QString& data, bool lancaSemContribuinte);

// The message of a document that needs a tax number and has none.
QString textoFaltaContribuinte();

}  // namespace brasel::pos
