#include "db/procedimentos/mete_no_log_geral.h"

namespace brasel::db {

bool MeteNoLogGeral(Connection& conn, const EntradaLog& e) {
    return conn
        .exec(QStringLiteral("insert into LogGeral (Utilizador, Modulo, Accao, Observa, Descricao, "
                             "Valor, Tipo, Numero, Ano, Produto, Terceiro, DataSys) values "
                             "(?,?,?,?,?,?,?,?,?,?,?,?)"),
              {e.utilizador.left(2), e.modulo.left(2), e.accao.left(1), e.observa,
               e.descricao.left(100), e.valor.toText(), e.tipo.left(3), e.numero.left(8),
               e.ano.left(4), e.produto.left(15), e.terceiro.left(10), e.dataSys.left(50)})
        .has_value();
}

}  // namespace brasel::db
