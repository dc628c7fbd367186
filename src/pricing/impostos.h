#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "pricing/impostos_calculo.h"

#include <QString>

#include <cstdint>
#include <optional>
#include <vector>

namespace brasel::pricing {

// A document line whose taxes are computed: by its NumRegisto when given, else by Identifica.
struct LinhaAlvo {
    QString tipo;
    QString numero;
    QString ano;
    std::int64_t numRegisto = 0;
    QString identifica;
    QString produto;
    bool historicoGuias = false;  // a line of the guide history instead of MovProduto
};

// The tax rows of one line.
struct ChaveLinhaImposto {
    QString tipo;
    QString numero;
    QString ano;
    QString cliFor;
    QString terceiro;
    QString produto;
    QString identifica;
};

// The tax rows of one document.
struct ChaveDocumentoImposto {
    QString tipo;
    QString numero;
    QString ano;
    QString cliFor;
    QString terceiro;
};

enum class FiltroIva { Todos, SemIva, ComIva };

// The other taxes (besides VAT) of document lines and documents. Every routine works on the
// connection given at construction (gConn when none or closed); writes run in a transaction of
// their own unless the connection already holds one. Failures give false or 0.
class Impostos {
  public:
    explicit Impostos(app::Estado& estado, db::Connection* conn = nullptr);

    // Computes the taxes of a stored line for the party's tax list and replaces the line's rows
    // in ImpostosMovProduto with them (a line computed twice is not taxed twice). A party with an
    // empty list gets none. False when a read or a write fails.
    bool CalculaImposto(const QString& CliFor, const QString& Terceiro, const LinhaAlvo& linha);
    // The same computation for a line not yet stored; nothing is written.
    std::optional<std::vector<ImpostoLinha>> CalculaImposto_Virtual(const QString& CliFor,
                                                                    const QString& Terceiro,
                                                                    const QString& Produto,
                                                                    const DadosLinhaImposto& linha);
    // A supplier's withholding rate for the accounting integration; 0 when it has none.
    double CalculaImposto_IRS_Integracao(const QString& Fornecedor);

    // Rebuilds the document's ImpostosMovTerceiro rows from its line taxes that enter the
    // totals: one row per tax code, split over up to four VAT slots (in order of appearance;
    // a slot's incidence is the tax that bears that VAT), rounded with the party's document
    // VAT pair. A fifth VAT code writes nothing and gives false.
    bool Calcula_Impostos_MovTerceiro(const ChaveDocumentoImposto& documento);

    Currency Get_Imposto_ImpostosMovProduto(const ChaveLinhaImposto& linha,
                                            FiltroIva filtro = FiltroIva::Todos,
                                            bool apenasProcessa = false);
    // Taxes that enter the purchase cost, for entry documents (type's AfectaSTK "E+") only.
    Currency Get_Imposto_ImpostosMovProduto_Como_Despesa(const ChaveLinhaImposto& linha);
    // The document's tax total (slot 0) or the incidence of VAT slot 1 to 4.
    Currency Get_Imposto_ImpostosMovTerceiro(const ChaveDocumentoImposto& documento, int slot = 0);
    Currency Get_IVA_ImpostosMovProduto(const ChaveLinhaImposto& linha);
    // The VAT of the document's taxes (slot 0) or of VAT slot 1 to 4.
    Currency Get_IVA_ImpostosMovTerceiro(const ChaveDocumentoImposto& documento, int slot = 0);

    // Deletes the tax rows of the MovProduto line with this NumRegisto.
    bool Delete_Produto_ImpostosMovProduto(std::int64_t NumRegisto);
    bool Delete_Produto_ImpostosMovTerceiro(const ChaveDocumentoImposto& documento);
    // Deletes the tax rows of the guide-history line with this NumRegisto.
    bool Actualiza_Produto_ImpostosMovProduto_HistoricoGuias(std::int64_t NumRegisto);

    // Sale price `Escalao` (1..7) with the taxes whose ConvertePV of that tier is set added,
    // rounded to the price decimals; 0 for a tier outside 1..7 or an unknown product.
    Currency PrecoVenda_ComImposto_cur(const QString& Produto, int Escalao);
    // The price a shelf label shows: every tax of the product added, whatever the tier's
    // ConvertePV says.
    Currency PrecoVenda_ComImposto_Apenas_Para_Etiquetas_cur(const QString& Produto, int Escalao);
    // The taxes of one unit sold at `Preco` (all the product's taxes, unrounded).
    Currency Produto_Valor_Imposto_cur(const QString& Produto, Currency Preco);
    // The product's tax codes, "/" between them.
    QString Produto_Descricoes_Impostos_str(const QString& Produto);
    bool Ver_Se_Tem_Impostos_Lancados(const ChaveLinhaImposto& linha);

  private:
    db::Connection& ligacao();
    // The product's taxes among `codigos` (all of them when empty and `todos`).
    std::optional<std::vector<DefinicaoImposto>> definicoes(const QString& produto,
                                                            const QStringList& codigos,
                                                            bool todos = false);
    // The party's tax codes and line VAT pair; nullopt when it pays no other taxes.
    std::optional<std::pair<QStringList, RegraArredondamento>> listaTerceiro(
        const QString& cliFor, const QString& terceiro);
    Currency soma(const QString& sql, const QVariantList& valores);
    Currency precoComImpostos(const QString& produto, int escalao, bool todos);
    bool apagaImpostosDaLinha(const QString& tabela, std::int64_t numRegisto);

    app::Estado& estado_;
    db::Connection* conn_;
};

}  // namespace brasel::pricing
