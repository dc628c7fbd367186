#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "common/message_port.h"

#include <QHash>
#include <QString>

#include <optional>
#include <vector>

namespace brasel::cash {

// A payment method as the cash windows list it.
struct FormaPagamento {
    qlonglong numRegisto = 0;
    QString codigo;
    QString descricao;
};

// Every payment method by description; nullopt when they cannot be read.
std::optional<std::vector<FormaPagamento>> FormasPagamento(db::Connection& conn);

// The amount counted in the till for one payment method.
struct ContagemCaixa {
    QString pagaComo;
    Currency valor;
};

// Records the count of register `caixa` on `data` ("yyyy-MM-dd"), replacing the count that
// register and date had, in one transaction: either the whole new count is kept or the old one
// stays. Without a register or a date it says so and writes nothing. False when nothing was
// written.
bool GravaRegistoCaixa(app::Estado& estado, MessagePort& mensagens, const QString& caixa,
                       const QString& data, const std::vector<ContagemCaixa>& contagem);

// The counted amounts of a register and date by payment method; nullopt when they cannot be
// read.
std::optional<QHash<QString, Currency>> CarregaRegistoCaixa(db::Connection& conn,
                                                            const QString& caixa,
                                                            const QString& data);

// One payment method of the register report. Receipts are R+ less R-, payments P+ less P-;
// the till balance is receipts less payments, and the difference is the count less that
// balance (above zero: more in the till than the movements say).
struct LinhaRelatorioCaixa {
    QString pagaComo;
    QString descricao;
    Currency recebimentos;
    Currency pagamentos;
    Currency saldo;
    Currency registo;
    Currency diferenca;
};

// The register report of one register and date: a line per payment method (the listed methods,
// then any method the movements name that is no longer listed), and the balance of the register
// before the date, on the date and after it. "NA" movements count nowhere.
struct RelatorioCaixa {
    QString titulo;  // "Diário do Caixa - " + description + " (" + register + ")"
    QString data;    // "Data: " + dd-MM-yyyy
    std::vector<LinhaRelatorioCaixa> linhas;
    Currency saldoAnterior;
    Currency saldoDia;
    Currency saldoActual;
};

// nullopt when the movements, the count or the methods cannot be read.
std::optional<RelatorioCaixa> CalculaRelatorioCaixa(app::Estado& estado, const QString& caixa,
                                                    const QString& data);

}  // namespace brasel::cash
