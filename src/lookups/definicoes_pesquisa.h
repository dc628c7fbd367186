#pragma once

#include "lookups/pesquisa.h"

#include <QString>

#include <vector>

namespace brasel::lookups {

// How the code fields of one master table are validated and searched. The first searchable
// field is the code, the second the description: "/" and "\" open the search on them.
struct DefinicaoPesquisa {
    QString tabela;
    QString codigo;     // qualified code column
    QString descricao;  // qualified description column
    std::vector<CampoPesquisa> campos;
    QString colunas;   // column layout of the search list
    QString seleccao;  // select list and from clause of the search
    QString ordem;
    QString mensagem;  // when a typed code is refused; empty: refused silently
    QString titulo;    // caption of the search window
};

// The master tables the lookups validate and search.
enum class Mestre {
    Documentos,
    Cambios,
    Produtos,
    Clientes,
    Fornecedores,
    ClientesMoradas,
    FornecedoresMoradas,
    TipoMov,
    PagaComo,
    Vendedores,
    TabPostal,
    OutUnidades,
    Observacoes,
    Armazens,
    Localizacoes,
    LotesTabela,
    Utilizadores,
    Estacao,
    Sexo,
    Referencia,
    Modelo,
    Cor,
    Tamanho,
    Comprimento,
    Caixas,
    ImpressorasTaloes,
    Delegados,
    ProdutosFacturaREST,
};

const DefinicaoPesquisa& definicao(Mestre mestre);

}  // namespace brasel::lookups
