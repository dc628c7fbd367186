#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "common/message_port.h"

#include <QString>

#include <cstdint>

namespace brasel::documents {

// The sale line a production is made for. Its key may be provisional (the line is posted after
// its production): Producao_ActualizaDestino then moves the links to the line's own key.
struct DestinoProducao {
    QString Tipo;        // the sale's movement type
    QString Numero;      // "" while the line is on an open tab
    QString Data;        // "yyyy-mm-dd"
    QString Identifica;  // the sale line's key (never empty)
};

// Production at sale: when `Produto` is a finished product (it has Nomenclatura rows), posts,
// in warehouse order, the exit ("S+") of each raw material, quantity times its bill-of-materials
// quantity, under ConfigProd.TipoSaida to the production customer, and the entry ("E+") of the
// finished product under ConfigProd.TipoEnt from the production supplier, each valued at its
// product's costs; each production line is linked to the sale line in MovProduto_Ligacoes (the
// entry too, so that undoing the sale undoes the whole production). Each of the two documents
// takes the next number of its type, whose UltNumero is raised and never lowered.
// True when there is nothing to produce or everything was posted; false, with nothing left
// behind and after "As Configurações para produção, estão Incompletas!" or "Não foi possível
// Produzir do Produto [ code ] [ description ]", otherwise. Runs on `conn` (gConn when none),
// inside the caller's transaction when one is open.
bool Producao_Lanca(app::Estado& estado, const QString& Produto, Currency Quantidade,
                    const DestinoProducao& destino, const QString& Armazem, MessagePort& mensagens,
                    db::Connection* conn = nullptr);

// Undoes the production of a sale line: deletes the lines linked to its Identifica and their
// links. A line without a key has nothing to undo. False when the database refused.
bool Producao_Anula(app::Estado& estado, std::int64_t NumRegisto, db::Connection* conn = nullptr);
// The same for a sale key, also before its line exists (a refused press).
bool Producao_AnulaIdentifica(app::Estado& estado, const QString& Identifica,
                              db::Connection* conn = nullptr);

// Moves the links filed under a provisional key to the sale line's own key.
bool Producao_ActualizaDestino(app::Estado& estado, const QString& provisoria,
                               const QString& definitiva, db::Connection* conn = nullptr);

}  // namespace brasel::documents
