#pragma once

#include "db/dialect.h"
#include "db/schema/definicao.h"

#include <QString>

namespace brasel::db::schema {

// The statements that make the definition real on one engine. Names come from the definition,
// never from input, and are written unquoted (PostgreSQL keeps them in lower case).
QString tipoSql(const Coluna& coluna, const Dialect& dialect);
QString colunaSql(const Coluna& coluna, const Dialect& dialect);
QString criarTabelaSql(const Tabela& tabela, const Dialect& dialect);
QString adicionarColunaSql(const Tabela& tabela, const Coluna& coluna, const Dialect& dialect);
QString nomeIndice(const Tabela& tabela, const Indice& indice);
QString criarIndiceSql(const Tabela& tabela, const Indice& indice);

}  // namespace brasel::db::schema
