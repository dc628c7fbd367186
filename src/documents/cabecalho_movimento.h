#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "db/connection.h"
#include "documents/assinatura.h"
#include "pricing/documento.h"

#include <QChar>
#include <QString>

#include <optional>

namespace brasel::documents {

// The party block of a header: the customer's (or supplier's) record, or what was typed for the
// walk-in customer.
struct TerceiroCabecalho {
    QString codigo;
    QString descricao;
    QString morada;
    QString local;
    QString codPostal;
    QString pais;
    QString deferencia;
    QString contribuinte;
};

// Every value of a new document header (MovCliente for customers, MovFornece for suppliers)
// besides those the writer fills itself (server time, signature, application version).
struct Cabecalho {
    QChar tipoTerceiro = u'C';
    TerceiroCabecalho terceiro;
    QString data;  // "yyyy-MM-dd"
    QString afecta;
    QString modulo;  // "FC" customers, "FF" suppliers
    QString tipo;
    QString numero;
    QString ano;
    QString vendedor;
    QString pagaComo;
    int condPag = 0;
    QString dataVenc;
    pricing::CabecalhoVenda valores;
    double descFinPer = 0.0;
    Currency saldoDoc;
    QString observa;
    QString armazem;
    QString cambio;
    Currency entregou;
    QString caixa;
    QString utilizador;
    QString cobrador;
    double descontoPP = 0.0;
};

// What the writer adds: the server time stored in DataSys and the signature.
struct CabecalhoGravado {
    QString dataSys;  // "yyyy-MM-dd HH:mm:ss"
    Assinatura assinatura;
};

enum class FalhaCabecalho { Nenhuma, Assinatura, BaseDados };

// Signs and inserts the header on `conn`, inside the caller's closing transaction (which holds
// the closing lock, so the chain reads the last committed document of the type), then stores its
// whole-content signature. On failure nothing is kept by the caller's rollback; `falha` says
// whether the signature could not be made or the database refused.
std::optional<CabecalhoGravado> GravaCabecalho(app::Estado& estado, db::Connection& conn,
                                               const Cabecalho& cabecalho,
                                               FalhaCabecalho* falha = nullptr);

// "yyyy-MM-dd" of `data` plus `dias` days: the due date of a document.
QString DataVencimento(const QString& data, int dias);

}  // namespace brasel::documents
