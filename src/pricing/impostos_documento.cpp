// Taxes of a document: its ImpostosMovTerceiro rows, one per tax code over four VAT slots.
#include "db/query_helpers.h"
#include "pricing/arredonda_terceiro.h"
#include "pricing/impostos.h"
#include "pricing/leitura.h"

#include <algorithm>
#include <array>
#include <map>

namespace brasel::pricing {

namespace {

struct SlotImposto {
    QString tabIva;
    double taxa = 0.0;
    Currency incidencia;
    Currency iva;
};

struct TotalImposto {
    Currency incidencia;
    Currency imposto;
    Currency valorIva;
    std::array<SlotImposto, 4> slots;
};

QVariantList valoresChave(const ChaveDocumentoImposto& d) {
    return {textoSql(d.tipo), textoSql(d.numero), textoSql(d.ano), d.cliFor.trimmed().toUpper(),
            textoSql(d.terceiro)};
}

const QString kCondicaoDocumento =
    QStringLiteral(" Tipo=? and Numero=? and Ano=? and CliFor=? and Terceiro=?");

}  // namespace

bool Impostos::Calcula_Impostos_MovTerceiro(const ChaveDocumentoImposto& documento) {
    db::Connection& c = ligacao();
    auto q = c.exec(QStringLiteral("select CodigoImposto,Incidencia,Imposto,ValorIVA,TabIVA,"
                                   "TaxaIVA from ImpostosMovProduto where Processa='S' and") +
                        kCondicaoDocumento + QStringLiteral(" order by CodigoImposto,NumRegisto"),
                    valoresChave(documento));
    if (!q) return false;
    std::map<QString, TotalImposto> porCodigo;
    std::vector<QString> codigosIva;  // the document's VAT codes in order of appearance
    const RegraArredondamento regra =
        LerArredondamentos(estado_, documento.cliFor, documento.terceiro, &c).regra(IvaGeral);
    try {
        while (q->next()) {
            TotalImposto& t = porCodigo[q->value(0).toString()];
            const Currency incidencia = Currency::fromVariant(q->value(1));
            const Currency imposto = Currency::fromVariant(q->value(2));
            const Currency iva = Currency::fromVariant(q->value(3));
            t.incidencia += incidencia;
            t.imposto += imposto;
            t.valorIva += iva;
            const QString tabIva = q->value(4).toString().trimmed();
            if (tabIva.isEmpty()) continue;
            auto pos = std::find(codigosIva.begin(), codigosIva.end(), tabIva);
            if (pos == codigosIva.end()) {
                if (codigosIva.size() == 4) return false;
                pos = codigosIva.insert(codigosIva.end(), tabIva);
            }
            SlotImposto& s = t.slots[static_cast<std::size_t>(pos - codigosIva.begin())];
            s.tabIva = tabIva;
            s.taxa = percentagem(q->value(5));
            s.incidencia += imposto;
            s.iva += iva;
        }
        const auto arredonda = [&](Currency v) {
            return ArredondaValor(v, regra.decimais, regra.modo);
        };
        const QString quando = db::Get_DataSysServer_InsertIntoSQL(estado_, &c);
        TransacaoSeNecessaria t(c);
        if (!t.active()) return false;
        if (!c.exec(QStringLiteral("delete from ImpostosMovTerceiro where") + kCondicaoDocumento,
                    valoresChave(documento))) {
            return false;
        }
        for (const auto& [codigo, total] : porCodigo) {
            QVariantList v = valoresChave(documento);
            v << codigo << arredonda(total.incidencia).toText() << arredonda(total.imposto).toText()
              << arredonda(total.valorIva).toText();
            for (const SlotImposto& s : total.slots)
                v << textoSql(s.tabIva);
            for (const SlotImposto& s : total.slots)
                v << CCur(s.taxa).toText();
            for (const SlotImposto& s : total.slots)
                v << arredonda(s.incidencia).toText();
            for (const SlotImposto& s : total.slots)
                v << arredonda(s.iva).toText();
            v << textoSql(estado_.gUtilizador) << quando;
            if (!c.exec(
                    QStringLiteral(
                        "insert into ImpostosMovTerceiro (Tipo,Numero,Ano,CliFor,Terceiro,"
                        "CodigoImposto,Incidencia,Imposto,ValorIVA,TabIVA1,TabIVA2,TabIVA3,"
                        "TabIVA4,TaxaIVA1,TaxaIVA2,TaxaIVA3,TaxaIVA4,IncidIVA1,IncidIVA2,"
                        "IncidIVA3,IncidIVA4,ValIVA1,ValIVA2,ValIVA3,ValIVA4,Utilizador,"
                        "DataSys) values (?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?)"),
                    v)) {
                return false;
            }
        }
        return t.commit();
    } catch (const CurrencyOverflow&) {
        return false;
    }
}

Currency Impostos::Get_Imposto_ImpostosMovTerceiro(const ChaveDocumentoImposto& documento,
                                                   int slot) {
    if (slot < 0 || slot > 4) return Currency();
    const QString coluna =
        slot == 0 ? QStringLiteral("Imposto") : QStringLiteral("IncidIVA%1").arg(slot);
    return soma(
        QStringLiteral("select COALESCE(sum(%1),0) from ImpostosMovTerceiro where").arg(coluna) +
            kCondicaoDocumento,
        valoresChave(documento));
}

Currency Impostos::Get_IVA_ImpostosMovTerceiro(const ChaveDocumentoImposto& documento, int slot) {
    if (slot < 0 || slot > 4) return Currency();
    const QString coluna =
        slot == 0 ? QStringLiteral("ValorIVA") : QStringLiteral("ValIVA%1").arg(slot);
    return soma(
        QStringLiteral("select COALESCE(sum(%1),0) from ImpostosMovTerceiro where").arg(coluna) +
            kCondicaoDocumento,
        valoresChave(documento));
}

bool Impostos::Delete_Produto_ImpostosMovTerceiro(const ChaveDocumentoImposto& documento) {
    return ligacao()
        .exec(QStringLiteral("delete from ImpostosMovTerceiro where") + kCondicaoDocumento,
              valoresChave(documento))
        .has_value();
}

}  // namespace brasel::pricing
