#pragma once

#include "db/schema/definicao.h"

#include <initializer_list>

namespace brasel::db::schema {

// Writes a table of the definition in a few lines: every table starts with its identity
// column, then the columns in the order they are added.
class Def {
  public:
    explicit Def(const char* nome, const char* identidade = "NumRegisto");

    Def& texto(std::initializer_list<const char*> nomes);
    Def& inteiro(std::initializer_list<const char*> nomes);
    Def& montante(std::initializer_list<const char*> nomes);
    Def& imagem(std::initializer_list<const char*> nomes);
    Def& coluna(const QString& nome, Tipo tipo, const char* defeito = "");
    Def& colunas(const QList<Coluna>& grupo);
    // Numbered columns: prefixo + 1 .. prefixo + n.
    Def& numeradas(const char* prefixo, int n, Tipo tipo);

    Def& unico(std::initializer_list<const char*> colunas, const char* condicao = "");
    Def& indice(std::initializer_list<const char*> colunas);
    Def& umaLinha();

    // A finished description reads as the table it describes.
    operator Tabela() const { return tabela_; }

  private:
    Def& juntar(std::initializer_list<const char*> nomes, Tipo tipo);
    Tabela tabela_;
};

// Code and description with the identity: the master tables that only a lookup reads.
Tabela tabelaCodigoDescricao(const char* nome);

void acrescentaConfiguracao(QList<Tabela>& tabelas);
void acrescentaMestres(QList<Tabela>& tabelas);
void acrescentaMovimentos(QList<Tabela>& tabelas);
void acrescentaPontos(QList<Tabela>& tabelas);

}  // namespace brasel::db::schema
