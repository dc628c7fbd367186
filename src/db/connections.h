#pragma once

#include "common/message_port.h"
#include "db/sessao.h"

#include <QString>

namespace brasel::db {

// Opens `conn` on `baseDados` of `servidor`. An encrypted password (company-list cipher) is
// decrypted into `password`. Authentication "SQL" (or empty) or "WIN", compared without regard
// to case; anything else opens nothing. On failure `conn` is left as it was before the call
// would have replaced it (closed) and false comes back.
bool Abre_Connexao(Connection& conn, const QString& servidor, const QString& baseDados,
                   const QString& login, QString& password, const QString& passwordCifrada,
                   const QString& autenticacao, int tempoComando, int tempoLigacao,
                   bool semPooling = false);

// Opens `conn` on the selected company with the credentials in use.
bool Abre_Connexao_Local(Sessao& sessao, Connection& conn, int tempoComando, int tempoLigacao,
                         bool semPooling = false);

// Closes `conn` when it is open.
bool Fecha_Conneccao(Connection& conn);

// True when the server answers a trivial query on the connection (gConn when none is given).
bool Testa_Connection(Sessao& sessao, Connection* conn = nullptr);

enum class SetupContabilidade { POC, SNC };

// Opens the accounting connection from the ParamGeral columns of the chosen set-up; with
// `configuracao` the accounting configuration database "LedraConfig" instead. The refusal
// messages are shown only when `mensagens` is given.
bool Abre_Connexao_Contabilidade(Sessao& sessao, SetupContabilidade setup, bool configuracao,
                                 MessagePort* mensagens, Connection* conn = nullptr);

// Opens the data-exchange database "QuorilComNet" from the company's QuorilComNet_Config row.
bool Abre_Conn_QuorilComNet_bln(Sessao& sessao, Connection& conn, MessagePort& mensagens);

}  // namespace brasel::db
