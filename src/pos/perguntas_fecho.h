#pragma once

#include "cash/lanca_mov_caixa.h"
#include "cash/pagamento.h"
#include "common/currency.h"
#include "devices/escolha_impressao.h"

#include <QString>

#include <functional>
#include <optional>
#include <vector>

namespace brasel::pos {

// What is typed for the walk-in customer of a document.
struct DadosClienteDiverso {
    QString contribuinte;
    QString nome;
    QString deferencia;
    QString morada;
    QString local;
    QString codPostal;
    QString pais;
};

// Applies a discount percent to the open document and gives its new total; nullopt when it
// cannot.
using AplicaDesconto = std::function<std::optional<Currency>(double percentagem)>;

// Everything closing a tab asks a person beyond yes/no questions and messages (those go through
// the tab's message port): the order screen answers with its windows, the tests with scripts.
// nullopt is a question left without an answer (cancelled).
class PerguntasFecho {
  public:
    virtual ~PerguntasFecho() = default;

    // Who confirms the closing (login and password); the user's code, "" when not confirmed.
    virtual QString confirmaUtilizador() = 0;
    // The payment screen for the document total; nullopt when left without paying.
    virtual std::optional<cash::Pagamento> pagamento(const QString& cliente, Currency totalDoc,
                                                     const AplicaDesconto& aplicaDesconto) = 0;
    // Shows the change of a paid document (non-modal); `documento` is its title.
    virtual void mostraTroco(const QString& documento, Currency total, Currency entregou,
                             Currency troco) = 0;
    // The walk-in customer's data for a document dated `data`, starting from `propostos`.
    virtual std::optional<DadosClienteDiverso> clienteDiverso(const DadosClienteDiverso& propostos,
                                                              const QString& data) = 0;
    // The split of the total over several payment methods, starting with the whole total on
    // `pagaComo` (the method chosen at payment, "" none); nullopt when cancelled.
    virtual std::optional<std::vector<cash::ParcialPagamento>> divisaoCaixa(
        Currency totalDoc, const QString& pagaComo) = 0;
    // The print choice and copies for a document of type `tipo` (receipts, or the copies of a
    // full page for a user who does not print tickets).
    virtual devices::EscolhaImpressao escolhaImpressao(const QString& tipo) = 0;
    // The supervisor's password, letting a document through that exceeds the customer's credit
    // limit; false when it was not given.
    virtual bool autorizaSupervisor() = 0;
};

}  // namespace brasel::pos
