#include "pricing/linha.h"

#include "pricing/arredonda_terceiro.h"
#include "pricing/desconto.h"

namespace brasel::pricing {

std::optional<ValoresLinha> CalculaLinha(const ArredondamentosTerceiro& terceiro,
                                         const std::optional<TaxaIva>& iva, Currency Preco,
                                         Currency Quantidade, double Desc1, double Desc2,
                                         double Desc3, int casadec) {
    try {
        ValoresLinha v;
        v.bruto = ArredondaValor(Arredonda(terceiro, MercadoriaLinha, Preco * Quantidade, casadec),
                                 casadec, ArredondaProximo);
        v.desconto = Arredonda(terceiro, DescontoLinha,
                               DescontoCascata(v.bruto, Desc1, Desc2, Desc3), casadec);
        v.incidencia = v.bruto - v.desconto;
        const Currency imposto = iva ? CalculaIva(*iva, v.incidencia) : Currency();
        v.iva = Arredonda(terceiro, IvaLinha, imposto, casadec);
        v.total = ArredondaValor(v.incidencia + v.iva, casadec, ArredondaProximo);
        return v;
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
}

Currency Linha_Calcular_cur(app::Estado& estado, const QString& TipoTerceiro,
                            const QString& Terceiro, Currency Preco, Currency Quantidade,
                            double Desc1, double Desc2, double Desc3, const QString& CodigoIva,
                            db::Connection* conn) {
    const auto valores = CalculaLinha(LerArredondamentos(estado, TipoTerceiro, Terceiro, conn),
                                      LerTaxaIva(estado, CodigoIva, conn), Preco, Quantidade, Desc1,
                                      Desc2, Desc3, estado.param.casadec);
    return valores ? valores->total : Currency();
}

}  // namespace brasel::pricing
