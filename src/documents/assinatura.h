#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "common/message_port.h"
#include "db/connection.h"

#include <QChar>
#include <QString>

#include <optional>

namespace brasel::documents {

// What signing a new document gives its header: Hash, HashControl and NotaCertificacao.
struct Assinatura {
    QString hash;
    int assinou = 0;  // HashControl: 1 when a signature was produced
    QString notaCertificacao;
};

// The text a document's signature is made over: Data, DataSys as "yyyy-MM-ddTHH:mm:ss",
// "Tipo Ano/Numero" (the year being the first four characters of Data), the total with two
// decimals and "." (no thousands separator) and the signature of the previous document of the
// type and year, each but the last followed by ";". nullopt when DataSys is not a date and time.
std::optional<QString> TextoAssinatura(const QString& Data, const QString& DataSys,
                                       const QString& Tipo, const QString& Numero,
                                       Currency TotalDoc, const QString& HashAnterior);

// Signs a new document of type `Tipo` (customer "C" documents in MovCliente, supplier "F" in
// MovFornece) dated `Data` ("yyyy-MM-dd"), chaining it to the previous document of its type and
// year. `DataSys` comes back as "yyyy-MM-ddTHH:mm:ss". False when no signature could be made
// (no key, a later document of a sequence-checked type, ...): the caller then writes nothing.
// Runs on the caller's connection, inside its closing transaction.
bool AssinaDocumento(app::Estado& estado, db::Connection& conn, Assinatura& resultado,
                     QString& DataSys, const QString& Tipo, const QString& Numero,
                     const QString& Data, Currency TotalDoc, QChar TipoTerceiro = u'C');

// No document of the type and year is dated later or numbered higher.
bool VerificaSequencia(db::Connection& conn, const QString& Tipo, const QString& Numero,
                       const QString& Data);

// Signs the stored document again from its stored values and compares with its Hash.
bool VerificaAssinatura(app::Estado& estado, db::Connection& conn, const QString& Tipo,
                        const QString& Numero, const QString& Ano, QChar TipoTerceiro = u'C');

// The check before a document is printed: false (and, with `mostrar`, the message) only for a
// signed customer document whose signature no longer matches.
bool ValidaAssinatura(app::Estado& estado, MessagePort& mensagens, bool Mostrar,
                      const QString& Tipo, const QString& Numero, const QString& Ano);

// The signature over the whole header; stored in Hash_Quoril when `Gravar`. nullopt when the
// header cannot be read or signed.
std::optional<QString> AssinaConteudo(app::Estado& estado, db::Connection& conn, bool Gravar,
                                      const QString& Tipo, const QString& Numero,
                                      const QString& Ano, QChar TipoTerceiro = u'C');

}  // namespace brasel::documents
