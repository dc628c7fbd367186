#include "app/registo_log.h"

#include "db/query_helpers.h"

namespace brasel::app {

bool RegistaLogGeral(Estado& estado, db::EntradaLog entrada, db::Connection* conn) {
    db::Connection& c = estado.ligacao(conn);
    const auto linha = db::primeiraLinha(
        c, QStringLiteral("select ActivaLogGeral from UtilConfGeral where Utilizador=?"),
        {estado.gUtilizador});
    if (linha && !linha->value(0).isNull() &&
        linha->value(0).toString().trimmed() == QStringLiteral("0")) {
        return false;
    }
    if (entrada.utilizador.isEmpty()) entrada.utilizador = estado.gUtilizador;
    if (entrada.dataSys.isEmpty())
        entrada.dataSys = db::Get_DataSysServer_InsertIntoSQL(estado, &c);
    return db::MeteNoLogGeral(c, entrada);
}

}  // namespace brasel::app
