#pragma once

#include "admin/argumentos.h"
#include "admin/consola.h"
#include "db/connection.h"
#include "db/schema/servidor.h"
#include "documents/chave_assinatura.h"

#include <QString>
#include <QStringList>

namespace brasel::admin {

// generate-key --file F: a fresh signing key in F and its public half in F.pub.pem.
int gerarChave(const Pedido& pedido, Consola& consola);

// verify-signatures: every signature chain of the company checked with the public key, from
// --public (a PEM file) or --key (the key file). 0 when all verify, 1 when a chain breaks, 2 when
// the key or the company cannot be used.
int verificarAssinaturas(const Pedido& pedido, const db::ServerAddress& servidor,
                         const db::schema::Credenciais& credenciais, const QString& empresa,
                         Consola& consola);

// What the check of the chains found: one line per chain that breaks, at its first broken
// document ("Tipo VD 2026: documento 00000012 não confere").
struct ResultadoCadeias {
    int cadeias = 0;
    int documentos = 0;  // signed documents checked
    QStringList quebras;
};

// Walks each type and year of MovCliente and MovFornece in number order: every signed document
// must verify against its text built with the signature of the document before it. nullopt
// when the headers cannot be read.
std::optional<ResultadoCadeias> verificarCadeias(db::Connection& conn,
                                                 const documents::ChaveRsa& chave);

}  // namespace brasel::admin
