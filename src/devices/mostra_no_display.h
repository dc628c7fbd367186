#pragma once

#include "app/estado.h"
#include "devices/linha_serie.h"

#include <QByteArray>
#include <QString>

#include <optional>

namespace brasel::devices {

// The display of the user's workstation: its TabDisplay row with the codes already as bytes.
struct DefinicaoDisplay {
    int porta = 0;
    int numLetras = 0;
    QByteArray limpa;
    QByteArray inicializa;
    QByteArray linha1Inicio;
    QByteArray linha1Fim;
    QByteArray linha2Inicio;
    QByteArray linha2Fim;
    int alinha1 = 0;
    int alinha2 = 0;
};

// The display the user works with: nothing when UtilConfGeral.UsaDisplay is not 1, or when its
// CodigoDisplay names no TabDisplay row (or the database cannot be read).
std::optional<DefinicaoDisplay> displayDoUtilizador(db::Connection& conn,
                                                    const QString& utilizador);

// An amount handed to the display ("12.50", "12,5", "1,234.50") as its shortest decimal text
// ("12.5"); "" for an empty or unreadable text, which is then left off the line. A lone "." or
// "," is the decimal separator; a separator that occurs twice, or before the other kind, groups
// thousands.
QString valorDisplay(const QString& texto);

// Line 2: the quantity and "x", the price, then blanks so that the total ends at column
// `numLetras` (none when there is no room: nothing is cut). Price and total are followed by a
// blank and the currency text. Empty arguments are left off.
QString linha2Display(const QString& quantidade, const QString& preco, const QString& total,
                      const QString& moeda, int numLetras);

// Shows two lines on the user's display through the shared serial control: clears it, then
// line 1 (the text cut to the line's length) and line 2 (the amounts). Returns whether every
// output went out; a user without a display, or a port held by a printout, shows nothing.
bool MostraNoDisplay(app::Estado& estado, LinhaSerie& linha, const QString& primeiraLinha,
                     const QString& total = {}, const QString& preco = {},
                     const QString& quantidade = {}, const QString& moeda = {});

// What the main window shows when it opens and when it closes.
inline constexpr const char* kDisplayAguarde = "Aguarde Por Favor";
inline constexpr const char* kDisplayEncerrado = "< ENCERRADO >";
bool MostraAguardeNoDisplay(app::Estado& estado, LinhaSerie& linha);
bool MostraEncerradoNoDisplay(app::Estado& estado, LinhaSerie& linha);

}  // namespace brasel::devices
