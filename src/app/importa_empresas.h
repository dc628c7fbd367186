#pragma once

#include "app/definicoes_posto.h"

#include <QList>
#include <QString>
#include <QStringList>

#include <optional>

namespace brasel::app {

// The server list of an older installation, exported to "Empresas.csv": one server a row with
// the columns Server, UID and PWD (the password under the character cipher). A first row naming
// the columns is optional; without it the columns are taken in that order.

inline const QString kFicheiroEmpresasAntigo = QStringLiteral("Empresas.csv");

// The rows of a CSV text. Fields are separated by ","; a field in double quotes may hold commas,
// line breaks and quotes written twice. Blank lines give no row.
QList<QStringList> lerLinhasCsv(const QString& texto);

// The servers of the file in server order, each password taken out of the character cipher and
// stored under the company-list cipher, authentication "SQL". The file is read as UTF-8, or as
// Windows-1252 when it is not valid UTF-8. nullopt (and `erro`) when it cannot be read or lacks
// one of the columns.
std::optional<QList<EntradaServidor>> lerEmpresasCsv(const QString& ficheiro,
                                                     QString* erro = nullptr);

struct ResultadoImportacao {
    int importados = 0;
    int repetidos = 0;  // a server already in the list (or twice in the file)
    int semLugar = 0;   // the list already had its 20 entries
};

// Adds the servers to the free entries of the list.
ResultadoImportacao juntarServidores(ListaServidores& lista, const QList<EntradaServidor>& novos);

// The folder a command line names: its first word, or the text between the double quotes it
// starts with. "" for an empty line and for the updater's protocol ("<@>...").
QString pastaDaLinhaComando(const QString& linhaComando);

// The first start of a workstation whose list is empty: when the program was started with a
// folder on its command line, the servers of "Empresas.csv" there are imported and the list is
// saved. True when a server was imported.
bool importarEmpresasIniciais(const QString& linhaComando);

}  // namespace brasel::app
