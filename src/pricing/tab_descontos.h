#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "pricing/descontos_tabelas.h"

#include <QDateTime>
#include <QString>

#include <functional>
#include <optional>

namespace brasel::pricing {

// What an agreement of tabdescontos gives.
struct AcordoDescontos {
    bool encontrado = false;  // the found flag ("S")
    QString tipo;             // "P" price, "D" discounts, "T" both
    Currency preco;
    int escalao = 0;  // the tier the price came from; 0 for a typed price
    DescontosLinha descontos{};
    Currency descontoValor;
};

// The stock of a product in a warehouse; nullopt when it cannot be read.
using SaldoProduto =
    std::function<std::optional<Currency>(const QString& produto, const QString& armazem)>;

// The agreement of a customer and product for a warehouse and document type at `agora`. When
// ParamGeral TabDescontosMandaDataVazia is 1 an agreement without dates is taken first;
// otherwise (or without one) the newest agreement whose dates hold the day and whose hours hold
// the time ("00:00" or empty: no limit on that side) is taken. An agreement with ControloQuant
// holds only while the product has stock in the warehouse (`saldo` above 0); without a balance
// it is passed over. A price agreement takes its typed price when it is not 0, else the tier of
// PrecoPro; a discount agreement takes the customer's discounts (DescCli), else the product's
// (DescPro), else the typed ones.
AcordoDescontos TabDescontos_Procura(app::Estado& estado, const QString& Cliente,
                                     const QString& Produto, const QString& Armazem,
                                     const QString& TipoMovimento, const QDateTime& agora,
                                     const SaldoProduto& saldo, db::Connection* conn = nullptr);

}  // namespace brasel::pricing
