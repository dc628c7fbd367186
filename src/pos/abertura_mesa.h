#pragma once

#include "pos/tab.h"

#include <QHash>
#include <QString>
#include <QStringList>

namespace brasel::pos {

// What the customer display shows while no table is open.
inline constexpr const char* kDisplayProximoCliente = "Proximo Cliente...";

// Opens table `codigo` on the tab under its current type: reads the table, offers to take over
// the lines another user holds on it (TransfereLinhasOutrosUtilizadores), reads the tab's lines
// and the user's set-up, and locks stored lines when the table's provisional bill was printed.
// A code without a Clientes row clears the table (the type stays for the next one), shows
// "Proximo Cliente..." on the display and gives false.
bool AbrirMesa(Tab& tab, const QString& codigo);

// Moves, after the person agrees, the open lines of the tab's table and type that other users
// hold to the tab's user, one by one, each logged. A line whose VAT table belongs to another
// tax region (TabIva.Zona) than those of the user's tab, or would be a fifth VAT table in it,
// stays where it is; the lines that stayed are listed in one warning. Returns those lines'
// texts ("(code) -> reason"), empty when everything moved or nothing was asked.
QStringList TransfereLinhasOutrosUtilizadores(Tab& tab);

// Whether a line of VAT table `iva` may join a tab holding the VAT tables `ivasDaTab`: a table
// already there, or a new one while the tab holds fewer than four. A line without VAT always
// may.
bool Ver_4_Ivas_MovProduto_bln(const QStringList& ivasDaTab, const QString& iva);
// Whether a line of VAT table `iva` keeps the tab in one tax region: its region (by `zonas`,
// code -> TabIva.Zona; "" for a code not there) is that of every table the tab holds. A line
// without VAT always does.
bool Ver_Zonas_IVA_MovProduto_bln(const QStringList& ivasDaTab, const QString& iva,
                                  const QHash<QString, QString>& zonas);

// What the order screen starts with: the user's cash-sale type (UtilConfGeral.VendaPronto) and,
// when the user's MostraCliDiverso is 1, the walk-in customer (ParamGeral.Clidiversos).
struct InicioFacturacao {
    QString tipo;
    QString mesa;
};
InicioFacturacao ValoresIniciais(app::Estado& estado);

}  // namespace brasel::pos
