#pragma once

#include <QString>
#include <QStringView>

#include <vector>

namespace brasel::lookups {

// Every list of the program describes its columns with one text: entries separated by "/", each
// "Caption,width[,align[,kind]]" ("Código,1800/Descrição,3600/Sit.,800,C/Data,1000,C,DATA/").
// The width is in twips and 0 hides the column (it still holds data, such as a password).

enum class Alinhamento { Esquerda, Direita, Centro };
enum class TipoColuna { Texto, Data, Valor };

struct ColunaLista {
    QString titulo;
    int larguraTwips = 0;
    Alinhamento alinhamento = Alinhamento::Esquerda;
    TipoColuna tipo = TipoColuna::Texto;

    bool oculta() const { return larguraTwips <= 0; }
};

inline constexpr int kMaxColunasLista = 40;
inline constexpr int kTwipsPorPolegada = 1440;

// The columns of a layout text, in order; entries past the 40th are dropped, the final "/" may
// be missing. Alignment letters "E", "D", "C" and kinds "DATA", "VALOR" are read in any case;
// anything else is left-aligned text. A width that is not a number hides the column.
std::vector<ColunaLista> lerColunasLista(const QString& formato);

// Twips on a screen of `dpi` logical dots per inch (96: 15 twips a pixel), rounded.
int twipsParaPixeis(int twips, double dpi = 96.0);

// A text that sorts, compared as plain text, in the order of the cells it stands for.
// Dates "dd-mm-yyyy" or "yyyy-mm-dd" (also with "/", optionally followed by a time) become
// "yyyy-mm-dd[ time]"; numbers with "," thousands and "." decimals, possibly negative, become a
// fixed-width key in numeric order. A cell that is neither sorts before every date or number.
QString chaveOrdenacaoData(QStringView texto);
QString chaveOrdenacaoValor(QStringView texto);
// The key of a cell in a column of `tipo` (text cells are their own key).
QString chaveOrdenacao(TipoColuna tipo, QStringView texto);

}  // namespace brasel::lookups
