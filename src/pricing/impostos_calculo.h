#pragma once

#include "common/currency.h"
#include "pricing/arredonda.h"

#include <QSqlRecord>
#include <QString>
#include <QStringList>

#include <array>
#include <optional>
#include <vector>

namespace brasel::pricing {

// A row of ProdutosImpostos: one other tax of a product.
struct DefinicaoImposto {
    QString codigo;
    Currency valorUnitario;      // an amount per unit; when set the factors are not used
    bool incidIliquido = false;  // the base is the line's gross value ...
    bool incidDesconto = false;  // ... less the line's discount
    std::array<double, 3> factores{};
    bool sujeitoIva = false;           // the tax itself bears the line's VAT
    bool calculaPrecoZero = false;     // computed even on a line of price 0
    QString processa;                  // "S": into the document totals
    QString actUpc;                    // "S": into the last purchase cost
    std::array<bool, 7> convertePV{};  // sale price n is shown with the tax on top

    static DefinicaoImposto deRegisto(const QSqlRecord& linha);
};

// What the tax engine reads of a document line.
struct DadosLinhaImposto {
    Currency quantidade;
    Currency preco;
    Currency valorIliq;
    Currency totalDesconto;
    QString ivaTabela;
    double ivaTaxa = 0.0;
};

// One tax of one line, as ImpostosMovProduto keeps it.
struct ImpostoLinha {
    QString codigoImposto;
    Currency incidencia;  // the money base, or the quantity for a tax per unit
    Currency imposto;
    Currency valorIva;
    double taxaIva = 0.0;
    QString tabIva;  // "" for a tax that bears no VAT
    QString ivaTabela;
    QString processa;
    QString actUpc;
};

// The tax of one line, rounded with the party's line VAT pair; nullopt when the price is 0 and
// the tax is not computed on free lines. A per-unit tax is quantity x amount. Otherwise the
// filled factors (non-zero) are applied one after the other, each as a percentage of what the
// one before gave, starting from the base, and each taken to four decimals: 10 and 50 give
// 5 % of the base; with no factor filled the tax is 0. Raises CurrencyOverflow out of range.
std::optional<ImpostoLinha> CalculaUmImposto(const DefinicaoImposto& d,
                                             const DadosLinhaImposto& linha,
                                             RegraArredondamento regra);

// The tax of one unit sold at `preco`, unrounded.
Currency ImpostoUnitario(const DefinicaoImposto& d, Currency preco);

// The order screen's three tax columns of a line: taxes that enter the totals (Processa "S"),
// split into those bearing VAT and those that do not, and the VAT they bear.
struct ColunasImpostos {
    Currency sujeitos;     // "Out. Impostos (Sujeito a IVA)"
    Currency iva;          // "IVA Out.Impostos"
    Currency naoSujeitos;  // "Out. Impostos (Não Sujeito a IVA)"
};
ColunasImpostos ColunasDaLinha(const std::vector<ImpostoLinha>& impostos);

// The tax codes of a party's list: each code is followed by "§"; blanks are dropped.
QStringList CodigosImpostos(const QString& lista);

}  // namespace brasel::pricing
