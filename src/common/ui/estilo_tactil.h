#pragma once

#include "app/definicoes_posto.h"

#include <QString>
#include <QWidget>

namespace brasel {

// The look of the touch windows: the workstation's font (ConfigRest_Font, bold), large buttons,
// and the user's background colour (JanBackColor + user code) on windows that take it.
void aplicaFonteTactil(QWidget* janela);
void aplicaCorFundo(QWidget* janela, const QString& utilizador);

// Restores a window's geometry from its settings keys (its design geometry when none was saved)
// and saves it there when the window closes.
void guardaGeometria(QWidget* janela, const app::GeometriaJanela& chaves);

}  // namespace brasel
