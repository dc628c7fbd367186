#include "pricing/arredonda_terceiro.h"

#include "db/query_helpers.h"
#include "pricing/leitura.h"

namespace brasel::pricing {

ArredondamentosTerceiro LerArredondamentos(app::Estado& estado, const QString& TipoTerceiro,
                                           const QString& Codigo, db::Connection* conn) {
    ArredondamentosTerceiro terceiro;
    const QString tabela = tabelaTerceiro(TipoTerceiro);
    if (tabela.isEmpty()) return terceiro;
    // Columns in TipoValor order: decimals then mode of kinds 1 to 10.
    const auto linha = db::primeiraLinha(
        estado.ligacao(conn),
        QStringLiteral("select decvalor,arrevalor,decdesc,arredesc,deciva,arreiva,decmerlin,"
                       "arremerlin,decdesclin,arredesclin,decivalin,arreivalin,decmergeral,"
                       "arremergeral,decdescgeral,arredescgeral,decivageral,arreivageral,"
                       "dectotalgeral,arretotalgeral from %1 where codigo=?")
            .arg(tabela),
        {Codigo});
    if (!linha) return terceiro;
    for (int k = 0; k < 10; ++k) {
        terceiro.regras[static_cast<std::size_t>(k)] = {linha->value(2 * k).toInt(),
                                                        linha->value(2 * k + 1).toInt()};
    }
    return terceiro;
}

Currency Arredonda_Valores_cur(app::Estado& estado, const QString& TipoTerceiro,
                               const QString& Codigo, Currency Valor, int TipoValor,
                               db::Connection* conn, int MaxDecimais) {
    if (MaxDecimais < 0) MaxDecimais = estado.param.casadec;
    try {
        return Arredonda(LerArredondamentos(estado, TipoTerceiro, Codigo, conn), TipoValor, Valor,
                         MaxDecimais);
    } catch (const CurrencyOverflow&) {
        return Currency();
    }
}

int FormulaIVA_int(app::Estado& estado, const QString& TipoTerceiro, const QString& Codigo,
                   db::Connection* conn) {
    const QString tabela = tabelaTerceiro(TipoTerceiro);
    if (tabela.isEmpty()) return 0;
    const auto linha = db::primeiraLinha(
        estado.ligacao(conn),
        QStringLiteral("select FormulaIVA from %1 where codigo=?").arg(tabela), {Codigo});
    return linha ? linha->value(0).toInt() : 0;
}

}  // namespace brasel::pricing
