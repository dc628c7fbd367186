#pragma once

#include "common/currency.h"

#include <QString>

namespace brasel::cash {

// What the payment screen hands back to the closing when the cashier confirms.
struct Pagamento {
    QString pagaComo;
    Currency totalDoc;    // the document total after any discount given on the screen
    Currency valorPagar;  // the amount charged
    double descontoPer = 0.0;
    Currency desconto;  // totalDoc - valorPagar
    Currency entregou;  // amount tendered, in the company's currency
    Currency troco;
    QString cambio;             // currency the customer paid in (the company's when "")
    Currency entregouNoCambio;  // amount tendered as counted, in `cambio`
    QString observa;
};

}  // namespace brasel::cash
