#pragma once

#include "common/currency.h"
#include "db/connection.h"

#include <QString>

#include <optional>

namespace brasel::db {

// How a line's stock effect (MovProduto.AfectaStk) moves the stock of its warehouse: +1 for what
// comes in ("E+", "S-" the return of an exit, "AC+", "TL+"), -1 for what goes out ("S+", "E-" the
// reversal of an entry, "AC-", "TL-"), 0 for "NA", "TRA" and anything else. A "TRA" line moves
// its quantity from Armazem to ArmazemDest and so leaves the product's total unchanged.
int SinalStock(const QString& afectaStk);

// The keys a stock balance can be asked for. In SaldoProduto every key left "%" (or empty) takes
// any value; the other procedures use only the keys they name.
struct ChavesSaldo {
    QString Produto;
    QString Armazem;
    QString Localizacao;
    QString Lote;
    QString Estacao;
    QString Sexo;
    QString Referencia;
    QString Modelo;
    QString Cor;
    QString Tamanho;
    QString Comprimento;
    QString Fornece;
    QString DataFabrico;
    QString DataValidade;
};

// The company's stock-balance procedures: the balance (@Existencia) of a product from every
// MovProduto line with a stock effect, open tab lines included; nullopt when the database
// cannot be read. Each runs on the caller's connection.
std::optional<Currency> SaldoProduto(Connection& conn, const ChavesSaldo& chaves);
std::optional<Currency> SaldoProduto_Pro(Connection& conn, const QString& Produto);
std::optional<Currency> SaldoProduto_ProLote(Connection& conn, const QString& Produto,
                                             const QString& Lote);
std::optional<Currency> SaldoProduto_ProArm(Connection& conn, const QString& Produto,
                                            const QString& Armazem);
std::optional<Currency> SaldoProduto_ProArmLoc(Connection& conn, const QString& Produto,
                                               const QString& Armazem, const QString& Localizacao);
std::optional<Currency> SaldoProduto_ProArmLocLote(Connection& conn, const QString& Produto,
                                                   const QString& Armazem,
                                                   const QString& Localizacao, const QString& Lote);
std::optional<Currency> SaldoProduto_ProArmLocLote_DtFabricoValidade(
    Connection& conn, const QString& Produto, const QString& Armazem, const QString& Localizacao,
    const QString& Lote, const QString& DataFabrico, const QString& DataValidade);

}  // namespace brasel::db
