#pragma once

#include "db/sessao.h"

#include <QDateTime>
#include <QSqlQuery>
#include <QSqlRecord>
#include <QString>
#include <QVariant>
#include <QVariantList>

#include <optional>

namespace brasel::db {

// An extra condition of a query: SQL text with "?" marks and the values they bind, in order.
// Values are never pasted into the text: a code or a note may hold a quote.
struct Condicao {
    QString sql;
    QVariantList valores;
};

// The first field `campo` of `tabela` where `campoChave` = `valorChave` (plus `extra`), as text;
// with an empty key field and value, the first row of the whole table. "" when there is no row
// or the query fails.
QString Select_Campo_str(Sessao& sessao, const QString& tabela, const QString& campo,
                         const QString& campoChave, const QString& valorChave,
                         const Condicao& extra = {}, Connection* conn = nullptr);

// The field `campo` of the first row of `sql`; with no row, 0 when `numerico`, else "".
QVariant Select_Retorna_Campo_var(Sessao& sessao, const QString& sql, const QVariantList& valores,
                                  const QString& campo, Connection* conn = nullptr,
                                  bool numerico = false);

// The first row of a statement, or nullopt when it has none or fails.
std::optional<QSqlRecord> primeiraLinha(Connection& conn, const QString& sql,
                                        const QVariantList& valores = {});

bool Ver_Se_Existe_Tabela_bln(Sessao& sessao, Connection* conn, const QString& tabela);
bool Existe_Coluna_bln(Sessao& sessao, Connection* conn, const QString& tabela,
                       const QString& coluna);
// Adds a column; `definicao` is the column name and type ("Obs TEXT"), never a value.
bool Adiciona_Coluna(Sessao& sessao, Connection* conn, const QString& tabela,
                     const QString& definicao);

// True when the query has no row (or is not active); otherwise the query stands on its first row.
bool RecordsetVazio_bln(QSqlQuery& rs);

// The largest numeric value of `campo` plus one, as text ("1" when none is numeric).
QString ProximoCodigoNumerico(Sessao& sessao, const QString& tabela, const QString& campo,
                              const Condicao& extra = {}, Connection* conn = nullptr);
// The numeric value of the largest `campo` (compared as stored) plus one, as text.
QString GetProximoCodigo(Sessao& sessao, Connection* conn, const QString& tabela,
                         const QString& campo);

// The server's date and time; the workstation's clock when the server cannot be asked.
QDateTime Get_DataSysServer(Sessao& sessao, Connection* conn = nullptr);
// The same date as "dd-mm-yyyy".
QString Get_DataServer(Sessao& sessao, Connection* conn = nullptr);
// The server time as the timestamp text stored in DataSys columns ("yyyy-mm-dd HH:MM:SS"),
// ready to be bound to an insert or update.
QString Get_DataSysServer_InsertIntoSQL(Sessao& sessao, Connection* conn = nullptr);
// A select-list expression turning a stored "yyyy-mm-dd" column into "dd-mm-yyyy" under `alias`
// (campo + "M" when the alias is empty).
QString Select_Retorna_GData(const QString& campo, const QString& alias = {});

// The text of a stored timestamp.
QString textoDataSys(const QDateTime& when);

}  // namespace brasel::db
