#pragma once

#include "common/message_port.h"
#include "db/sessao.h"

#include <QByteArray>
#include <QList>
#include <QString>
#include <QStringList>

#include <optional>

namespace brasel::pos {

// The product grouping level of the menu (NivelEmenta, any case): the column of Produtos and the
// table that describes it. Anything unknown is the group level.
struct NivelProdutos {
    QString coluna;  // "Grupo", "Familia" or "Subfamilia"
    QString tabela;  // "TabGrupoPro", "TabFamPro" or "TabSubFamPro"
};
NivelProdutos nivelProdutos(const QString& nivelEmenta);

// Per-user product blocks live in the free per-user store under this window name, one row per
// blocked product code (Chave).
inline constexpr const char* kNomeBloqueioProdutos = "BloqueioProdutos";

// Whether `produto` is blocked for `utilizador`; a store that cannot be read blocks nothing.
bool VerBloqueioUtilproduto(db::Connection& conn, const QString& utilizador,
                            const QString& produto);

// Whether some product set holding `produto` is valid on `dia` ("yyyy-mm-dd").
bool ProdutoNumConjuntoValido(db::Connection& conn, const QString& produto, const QString& dia);

// One product button of the order screen.
struct BotaoProduto {
    QString codigo;
    QString descricao;
    QByteArray foto;
};

// The buttons of one group (family, sub-family: `nivelEmenta`) for `utilizador` on `dia`, by
// description: products blocked for the user are left out and, with `soConjuntosValidos` (the
// workstation's ConfigRest_ActivaProdutosFacturaREST), so are products of no set valid that day.
// nullopt when the database cannot be read.
std::optional<QList<BotaoProduto>> ProdutosDosBotoes(db::Connection& conn,
                                                     const QString& nivelEmenta,
                                                     const QString& codigoNivel,
                                                     const QString& utilizador, const QString& dia,
                                                     bool soConjuntosValidos);

// The heading of a product set; dates are "yyyy-mm-dd".
struct ConjuntoProdutos {
    QString codigo;
    QString descricao;
    QString dataInicial;
    QString dataFinal;
};

// One product in the set window's list: ticked with the set's dates when it belongs to the set.
struct LinhaConjunto {
    QString produto;
    QString descricao;
    QString nivel;  // description of the product's group (family, sub-family)
    bool marcado = false;
    QString dataInicial;
    QString dataFinal;
};

// Every product, by grouping column, description and code, marked for the set `conjunto`
// (an empty code marks none). nullopt when the database cannot be read.
std::optional<QList<LinhaConjunto>> CarregarProdutosConjunto(db::Connection& conn,
                                                             const QString& nivelEmenta,
                                                             const QString& conjunto);

// The heading stored with the set's rows; nullopt when the set has no row.
std::optional<ConjuntoProdutos> LerConjunto(db::Connection& conn, const QString& codigo);

// The next free set code.
QString ProximoConjunto(db::Sessao& sessao);

// Stores the set: every ticked product gets (or keeps) its row with the heading, the user and
// the server time; the unticked products lose their row of this set only. All or nothing.
// Refused, with a message, unless code, description and both dates are filled and the period
// does not end before it starts.
bool GravarConjunto(db::Sessao& sessao, MessagePort& mensagens, const QString& utilizador,
                    const ConjuntoProdutos& conjunto, const QStringList& marcados,
                    const QStringList& desmarcados);

}  // namespace brasel::pos
