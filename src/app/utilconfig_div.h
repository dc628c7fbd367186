#pragma once

#include "common/currency.h"
#include "db/sessao.h"

#include <QString>

#include <cstdint>
#include <variant>

namespace brasel::app {

// A value of the free per-user store; the alternative held decides the stored TipoConteudo:
// Currency "Currency", int32 "Long", float "Single", int16 "Integer", double "Double",
// bool "Boolean", text "String".
using ValorDiv = std::variant<Currency, std::int32_t, float, std::int16_t, double, bool, QString>;

// Stores a value under (user, window, key): the row is added when missing, else rewritten.
bool UtilConfig_Div_Guarda_bln(db::Sessao& sessao, const QString& utilizador,
                               const QString& nomeForm, const QString& chave,
                               const ValorDiv& valor);

// The value stored under (user, window, key), converted back by its TipoConteudo; the text ""
// when there is no row.
ValorDiv UtilConfig_Div_Retorna_var(db::Sessao& sessao, const QString& utilizador,
                                    const QString& nomeForm, const QString& chave);

}  // namespace brasel::app
