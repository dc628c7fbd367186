#pragma once

#include "app/parametros.h"
#include "pricing/lista_linhas.h"

#include <QString>
#include <QStringList>

#include <vector>

namespace brasel::pos {

// One column of the order screen's line list: title, width in twips, right-aligned (numbers).
struct ColunaTab {
    QString titulo;
    int twips = 0;
    bool direita = false;
};

// Positions of the columns whose widths the workstation keeps.
inline constexpr int kColunaQty = 2;
inline constexpr int kColunaDescricao = 3;
inline constexpr int kColunaPreco = 4;

// The 42 columns of the line list, in order: the widths of "Qty.", "Descrição" and "Preço"
// as given (the workstation's JanProTam... keys), the six reference-attribute columns titled by
// the company's dimension captions.
std::vector<ColunaTab> ColunasTab(const app::Parametros& param, int larguraQty,
                                  int larguraDescricao, int larguraPreco);

// What each column shows for a line: amounts and percentages with the company's decimals
// (prices with the price decimals, quantities with the quantity decimals); the price column
// shows the applied price when `precoAplicado` (ConfigRest_PrecoIncBrowse).
QStringList TextosLinha(const pricing::LinhaLista& linha, const app::Parametros& param,
                        bool precoAplicado);

}  // namespace brasel::pos
