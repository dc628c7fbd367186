#pragma once

#include "common/currency.h"
#include "db/procedimentos/mete_no_mov_pro.h"
#include "db/sessao.h"

#include <QString>

#include <optional>

namespace brasel::documents {

// The company's costing settings (ParamGeral).
struct ParamCustos {
    int FormulaPrecoMedioCusto = 0;  // 2 = moving average; anything else = totals
    bool PMCArmazem = false;         // the average cost is kept per warehouse
    QString PrecoTranfAcertos;       // "PRECOMEDIOCUSTO" = internal movements at the average cost
};
// nullopt when ParamGeral cannot be read.
std::optional<ParamCustos> LerParamCustos(db::Connection& conn);

// The costs of a product as its row holds them.
struct CustosProduto {
    Currency precomediocusto;
    Currency ultprecocompra;
    Currency ultprecocusto;
};

// How a movement is valued.
enum class ClasseCusto {
    Entrada,  // "E+"/"E-": valued at its own price
    Interno,  // adjustments and transfers ("TRA", "AC+", "AC-", "TL+", "TL-")
    Outro,    // sales, returns, lines without stock effect: the product's costs at posting time
};

// An adjustment or transfer, by its document type or its stock effect.
bool MovimentoInterno(const QString& tipo, const QString& afectaStk);
ClasseCusto ClassificaCusto(const QString& tipo, const QString& afectaStk);

// The opening-balance entries of a year, recognised by their description: they carry the average
// cost forward as their price and do not enter a new average.
bool EntradaSaldosIniciais(const QString& descricao);

// Fills the cost columns of a line for its kind of movement: PMCusto, UPCompra, UPCusto, the
// per-warehouse costs when PMCArmazem is on, and for entries the VAT on cost (TaxaCustos of the
// line's VAT code). An internal movement is valued (Preco, ValorIliq) at the average cost when
// PrecoTranfAcertos is "PRECOMEDIOCUSTO", else at the last cost. False when a reading failed or
// an amount is out of range; the line is then left as it was.
bool PreencheCustosLinha(db::Sessao& sessao, db::Connection& conn, const ParamCustos& param,
                         const CustosProduto& produto, db::ValoresMovPro& linha);

}  // namespace brasel::documents
