#pragma once

#include "app/estado.h"
#include "db/procedimentos/mete_no_mov_pro.h"

#include <QString>

#include <cstdint>

namespace brasel::documents {

// What the posting needs beside the row itself.
struct ExtrasLancamento {
    // The activity-log text of the posting ("Facturação Clientes (Rest)"); "" writes no entry.
    QString textoLog;
    // A barcode generated for the line, stored on it after the insert; "" stores none.
    QString codigoBarras;
};

enum class RecusaLancamento {
    Nenhuma,
    ProdutoInexistente,  // no Produtos row for the code
    SemExistencia,       // stock control: the balance is not above zero or below the quantity
    SemLote,             // a lot-controlled product moved in stock without a lot
    Falhou,              // the database refused or could not be read
};

struct ResultadoLancamento {
    std::int64_t NumRegisto = 0;  // the new row; 0 when nothing was written
    RecusaLancamento recusa = RecusaLancamento::Falhou;
    explicit operator bool() const { return NumRegisto > 0; }
};

// Posts one line (a MovProduto row) on `conn` (gConn when none), inside the caller's transaction
// when one is open and in one of its own otherwise, so that a refusal or failure leaves no row.
// `linha` is read and, once posted, completed in place: an empty seller takes the product's
// usual one, an empty unit the product's UnidadeVenda, the cost columns are filled for the kind of
// movement, the return date from the product's DiasDevolucao, DataSys from the server, Integrou "N"
// and an empty Identifica a new unique key. Stock control refuses an exit of a product whose
// ctrlexistencia is 1 when its balance (warehouse, lot, location and attributes of the line) is
// not above zero or is below the quantity; adjustments and transfers are never refused.
// The caller shows its own message for a refusal.
ResultadoLancamento LancaMovProduto(app::Estado& estado, db::ValoresMovPro& linha,
                                    const ExtrasLancamento& extras = {},
                                    db::Connection* conn = nullptr);

}  // namespace brasel::documents
