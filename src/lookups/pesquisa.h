#pragma once

#include "db/query_helpers.h"
#include "db/sessao.h"

#include <QString>
#include <QStringList>
#include <QVariantList>

#include <optional>
#include <vector>

namespace brasel::lookups {

// A field the search window can filter on: the qualified column ("Produtos.Codigo") and the
// caption offered in its field selector ("Código").
struct CampoPesquisa {
    QString coluna;
    QString titulo;
};

// What the search window is asked to show. Table, columns and clauses come from code; only the
// filter's values, the key and the row limit come from a person, and they are bound.
struct PedidoPesquisa {
    QString titulo;  // caption of the window
    QString tabela;  // whose NumRegisto>0 (PDocumentos: Record>0) every row must have
    // Select list and from clause, " Produtos.Codigo,Produtos.Descricao from Produtos "; a list
    // beginning with "Distinct" asks for distinct rows.
    QString seleccao;
    std::vector<CampoPesquisa> campos;
    QString colunas;      // column layout of the result list
    db::Condicao filtro;  // " and ..." conditions, or nothing
    QString ordem;        // " Order by ..."
    int campo = 0;        // the field selected when the window opens
    QString chave;        // the key the window opens with
    QString limite;       // the row-limit box's text
};

// A statement and the values it binds, in order.
struct Consulta {
    QString sql;
    QVariantList valores;
};

// The identity column a listed or validated row must have a positive value in: NumRegisto,
// Record for the document layouts (PDocumentos).
QString colunaIdentidade(const QString& tabela);

inline constexpr int kLimiteSemNumero = 999999999;

// The number of rows the row-limit text asks for; text that is not a positive whole number
// asks for every row (999999999).
int limiteLinhas(const QString& texto);

// The like pattern of a key: every "*" becomes "%" and a "%" is appended (rows that begin with
// the key).
QString padraoChave(const QString& chave);

// The search statement for field `campo` of the request and `chave`, `limite` as typed: the
// request's rows, the filter, the key compared without regard to case, the order, the limit.
Consulta construirConsulta(const PedidoPesquisa& pedido, int campo, const QString& chave,
                           const QString& limite);

// The rows of the search as texts (nulls empty), or nullopt when the statement fails; `erro`
// then holds the engine's text.
std::optional<std::vector<QStringList>> executarPesquisa(db::Connection& conn,
                                                         const PedidoPesquisa& pedido, int campo,
                                                         const QString& chave,
                                                         const QString& limite, QString* erro);

// " and (<tabela>.Situacao=? or ...) " with the situations the user may see in searches
// (UtilConfig_Div rows NomeForm 'SituacoesPesquisa'); nothing when the table has no Situacao
// column or the user has no such row.
db::Condicao filtroSituacoes(db::Sessao& sessao, const QString& utilizador, const QString& tabela);

// One message of database trouble from the engine's error text: a missing column
// ("Campo Inexistente na Tabela " and the table), a missing table ("Tabela Inexistente ou Base
// de Dados") or, for anything else, the connection's ("Falha na Ligação ao Servidor ...").
QString mensagemErroBaseDados(const QString& erro, const QString& tabela);

// The first and second column of the row a person chose: code and description.
struct LinhaEscolhida {
    QString codigo;
    QString descricao;
};

// The search window as the lookups see it: the windows show WPesquisaNOVA, the tests answer
// from a script.
class JanelaPesquisa {
  public:
    virtual ~JanelaPesquisa() = default;
    // Shows the request modally; the chosen row, or nothing when the person cancelled.
    virtual std::optional<LinhaEscolhida> Pesquisa(const PedidoPesquisa& pedido) = 0;
};

}  // namespace brasel::lookups
