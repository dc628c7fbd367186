#pragma once

#include "common/currency.h"
#include "pricing/arredonda.h"
#include "pricing/lista_linhas.h"

#include <QString>

#include <array>
#include <functional>
#include <optional>

namespace brasel::pricing {

// What the document arithmetic needs besides the lines: the tab customer's rounding pairs and
// FormulaIVA (loaded when the table is opened), the general decimals and whether the screen
// works with applied prices (ConfigRest_PrecoIncBrowse).
struct DefinicoesDocumento {
    ArredondamentosTerceiro arredondamentos;
    int formulaIVA = 0;
    int casadec = 2;
    bool precoAplicado = false;
};

struct DescontoFinanceiro {
    double percentagem = 0.0;
    Currency valor;
};
// Computes the financial discount on a base (merchandise - discount); nullopt when it cannot.
using CalculoDescontoFinanceiro = std::function<std::optional<DescontoFinanceiro>(Currency base)>;

// Whether a product of VAT code `codigo` may join the tab: not when the four slots are taken by
// other codes.
bool PodeJuntarIva(const TotaisDocumento& totais, const QString& codigo);

// Spreads a document discount over the selected lines and recomputes their discount, VAT,
// withholding and value columns. With `PercDesconto` above 0 each line loses that percent of its
// value after its own discounts; otherwise `ValorDesconto` is shared in proportion to each
// line's value with VAT, so that the document total falls by `ValorDesconto`. Every step is
// taken to four decimals. False (the lines as they were) when an amount leaves the range.
bool CalcularDescontos(ListaLinhas& lista, Currency ValorDesconto, double PercDesconto,
                       const DefinicoesDocumento& definicoes);

// The totals and the four VAT slots of the selected lines, rounded with the customer's pairs;
// the financial discount, when one is given, comes off the total last. False (totals cleared)
// when the lines hold a fifth VAT code or an amount leaves the range.
bool CalculosGerais(ListaLinhas& lista, const DefinicoesDocumento& definicoes,
                    const CalculoDescontoFinanceiro& descontoFinanceiro = {});

// The amounts the closing writes on the sales document's header.
struct CabecalhoVenda {
    std::array<QString, 4> tabiva;
    std::array<double, 4> taxiva{};
    std::array<Currency, 4> valor;     // slot incidence + slot discount, kind 1
    std::array<Currency, 4> desconto;  // kind 2
    std::array<Currency, 4> valiva;    // kind 3
    std::array<Currency, 4> ivaIntra;  // always 0 here
    Currency valorTotal;               // `valor`, kind 7
    Currency descontoTotal;            // `desconto`, kind 8
    Currency iva;                      // kind 9
    Currency totaldoc;                 // kind 10
    Currency descfinval;               // sum of "Val.Desc.Geral"
    Currency incidIRS;
    Currency valorIRS;
    double descontoFinanceiroPerc = 0.0;
    Currency descontoFinanceiro;
};

// The header amounts from the totals last computed by CalculosGerais; nullopt out of range.
std::optional<CabecalhoVenda> CabecalhoDocumento(const ListaLinhas& lista,
                                                 const DefinicoesDocumento& definicoes);

}  // namespace brasel::pricing
