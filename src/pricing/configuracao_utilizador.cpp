#include "pricing/configuracao_utilizador.h"

#include "db/query_helpers.h"

namespace brasel::pricing {

std::optional<ConfigUtilizador> LerConfigUtilizador(app::Estado& estado, db::Connection* conn) {
    const auto linha = db::primeiraLinha(
        estado.ligacao(conn),
        QStringLiteral("select Precario,PVP,Descontos,Desconto1,Desconto2,Desconto3,DescFFpro,"
                       "VendDef,vendedorUtil,DescGERAL,AltTipoMov,PortaTalao,Impressora,"
                       "TipoImpTalao from UtilConfGeral where utilizador=?"),
        {estado.gUtilizador});
    if (!linha) return std::nullopt;
    const auto texto = [&](int i) { return linha->value(i).toString().trimmed(); };
    ConfigUtilizador c;
    c.precario = texto(0).toUpper();
    c.pvp = linha->value(1).toInt();
    c.descontos = texto(2).toUpper();
    c.posicoes = {linha->value(3).toInt(), linha->value(4).toInt(), linha->value(5).toInt()};
    c.descFFpro = texto(6).toUpper();
    c.vendDef = texto(7).toUpper();
    c.vendedorUtil = texto(8);
    c.descGeral = texto(9).toUpper();
    c.altTipoMov = texto(10);
    c.portaTalao = texto(11);
    c.impressora = texto(12);
    c.tipoImpTalao = texto(13);
    return c;
}

}  // namespace brasel::pricing
