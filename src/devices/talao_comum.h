#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "common/message_port.h"
#include "db/connection.h"
#include "devices/definicao_impressora.h"
#include "devices/linha_serie.h"

#include <QString>
#include <QStringList>

#include <optional>
#include <vector>

// What every receipt shares: the user's printing settings, the shop heading, the document lines
// with their VAT groups, and the output of prepared lines on either kind of printer.
namespace brasel::devices {

// The receipt columns of a user's UtilConfGeral row.
struct ConfigImpressao {
    ConfigTalao talao;      // port, printer model, blank lines, pause, drawer flags
    QString impressora;     // "T" tickets; otherwise the page printer (a name, a folder, a ".pdf")
    bool impTotal = false;  // the block of partial totals
    bool impIvas = false;   // the VAT summary
    int decimais = 0;       // DecimaisImpTaloes (0: the company's)
    bool viasDoTipo = false;  // ImpTalaoViasTipoMov: copies from the document type
    QStringList obs;          // Obs1..Obs3 that are not blank

    bool serie() const { return talao.portaTalao != u"LPT"; }
    // Whether documents print as tickets ("T") rather than as full pages.
    bool talaoTermico() const;
    // The printer page-printer receipts go to: Impressora when it names one, else the system's
    // default printer ("").
    QString impressoraPagina() const;
};

// The row of `utilizador`; nothing when there is none or it cannot be read.
std::optional<ConfigImpressao> LerConfigImpressao(db::Connection& conn, const QString& utilizador);
// The same, telling the person "Não tem o POS configurado para o utilizador " + user.
std::optional<ConfigImpressao> CarregaConfigImpressao(db::Connection& conn,
                                                      const QString& utilizador,
                                                      MessagePort& mensagens);

// Linha1..Linha7 of the shop `armazem` (seven texts, blank when there is no such shop).
QStringList CabecalhoLoja(db::Connection& conn, const QString& armazem);
// The Login of a user, by its code (or the text itself when it is already a login).
QString LoginUtilizador(db::Connection& conn, const QString& utilizador);

// The customer block of a receipt: name, address, town, postal code with its description and
// "Contribuinte : " + the taxpayer number.
QStringList BlocoCliente(const QString& nome, const QString& morada, const QString& local,
                         const QString& codPostal, const QString& descricaoPostal,
                         const QString& contribuinte);
// The description of a postal code ("" when unknown).
QString DescricaoPostal(db::Connection& conn, const QString& codPostal);

// One document line as receipts print it.
struct LinhaImpressa {
    QString descricao;
    Currency quantidade;
    Currency preco;
    Currency valorIliq;  // quantity x price (VAT inside when the VAT table includes it)
    Currency desconto;   // TotalDesconto
    Currency iva;        // ValorIva
    QString ivaTabela;
    Currency ivaTaxa;
    bool ivaIncluido = false;
    Currency outQuant;   // quantity in the alternative unit
    QString outUnidade;  // its description ("" none)

    // What the customer pays for the line, VAT included.
    Currency total() const { return valorIliq - desconto + (ivaIncluido ? Currency() : iva); }
};

// The lines of one VAT table and rate.
struct GrupoIva {
    QString tabela;
    Currency taxa;
    Currency incidencia;  // without VAT, after discounts
    Currency desconto;
    Currency iva;

    Currency comIva() const { return incidencia + iva; }
};

// The VAT groups of `linhas`, in order of first appearance.
std::vector<GrupoIva> AgrupaIva(const std::vector<LinhaImpressa>& linhas);

// The MovProduto rows of a `where` condition on its own columns, unqualified (SQL with "?",
// bound to `valores`), in order,
// with the VAT table's "included" flag and the alternative unit's description.
std::optional<std::vector<LinhaImpressa>> LerLinhasImpressas(db::Connection& conn,
                                                             const QString& condicao,
                                                             const QVariantList& valores);

// A rate as receipts write it: "23", "6,5".
QString TaxaTalao(Currency taxa);
// The VAT summary lines of a 40-column receipt: table code, rate in 10, amount with VAT in 15,
// VAT in 13.
QStringList ResumoIva(const std::vector<GrupoIva>& grupos, int decimais);
// A 40-column line: description in 16, quantity right in 9, total right in 15.
QString LinhaProduto(const LinhaImpressa& linha, int decimais, int decimaisQuant);

// A prepared receipt line: its text and size (1 small, 2 medium, 3 large), and whether the
// printout pauses after it (PausaImpressao).
struct LinhaTalao {
    QString texto;
    int tamanho = 1;
    bool pausa = false;
};
using LinhasTalao = std::vector<LinhaTalao>;

// Serial printout of `linhas` on the ticket printer `impressora`, `vias` copies, each ending
// with the user's blank lines, the cut and a reset, with the user's pauses. False when the
// printout did not go out whole.
bool ImprimeLinhasSerie(LinhaSerie& linha, const DefinicaoImpressora& impressora,
                        const ConfigImpressao& config, const LinhasTalao& linhas, int vias);

// Page-printer printout of `linhas` in "Courier New" on `impressora` (see TrabalhoImpressao),
// one job per copy titled `titulo`. `pdf`, when given, receives the file of the last job.
bool ImprimeLinhasPagina(const QString& impressora, const QString& titulo,
                         const QStringList& linhas, int vias, QString* pdf = nullptr);

// `linhas` once, on the serial ticket printer or the page printer as the user's PortaTalao says
// (the page printer drops the sizes). A missing serial printer definition is told and false.
bool ImprimeLinhasTalao(db::Connection& conn, MessagePort& mensagens, LinhaSerie& linha,
                        const ConfigImpressao& config, const LinhasTalao& linhas,
                        const QString& titulo);

}  // namespace brasel::devices
