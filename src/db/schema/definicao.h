#pragma once

#include <QList>
#include <QString>
#include <QStringList>

namespace brasel::db::schema {

// The kinds of column of the company database. The engine types come from the dialect.
enum class Tipo {
    Texto,         // codes, texts, dates "yyyy-mm-dd", timestamps "yyyy-mm-dd HH:MM:SS"
    Inteiro,       // counts, decimals, modes and flags (1 on, 0 off)
    Inteiro64,     // the record number of a row of another table
    Montante,      // amounts, prices, quantities, percentages, points: four decimals
    Cambio,        // exchange rates: six decimals
    Quantidade10,  // converted quantities of a line: ten decimals
    Imagem,        // pictures of buttons
    Identidade,    // the row's own number (NumRegisto)
};

struct Coluna {
    QString nome;
    Tipo tipo = Tipo::Texto;
    // SQL literal of the default; empty = the kind's own ('' for text, 0 for numbers, none for
    // pictures and identities). Rows inserted with a few columns then compare as the program
    // expects (Impostos<>'', Diversos<>'1').
    QString defeito;
};

// An index of a table; a unique one may hold only for the rows that meet `condicao`.
struct Indice {
    QStringList colunas;
    bool unico = false;
    QString condicao;  // SQL condition written in code, never from input
};

struct Tabela {
    QString nome;
    QList<Coluna> colunas;
    QList<Indice> indices;
    bool umaLinha = false;  // holds exactly one row, created with the table
};

// The ten kinds of amount that carry their own decimals and rounding mode, in the order of the
// column suffixes (cliarre<valor>, Clientes.dec<valor>, ...): valor, iva, desc, merlin, desclin,
// ivalin, mergeral, descgeral, ivageral, totalgeral.
QStringList sufixosArredondamento();

// Every table and column of a company database, in creation order.
const QList<Tabela>& tabelasEmpresa();

}  // namespace brasel::db::schema
