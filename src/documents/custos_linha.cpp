#include "documents/custos_linha.h"

#include "documents/preco_medio_custo.h"
#include "documents/ultimos_precos.h"
#include "pricing/leitura.h"

#include <QStringList>

namespace brasel::documents {

namespace {

bool custosEntrada(db::Sessao& sessao, db::Connection& conn, const ParamCustos& param,
                   db::ValoresMovPro& l) {
    l.UPCompra = l.Preco;
    l.UPCusto = l.Preco;
    if (EntradaSaldosIniciais(l.Descricao)) {
        l.PMCusto = l.Preco;
        if (param.PMCArmazem) l.Armazem_PMCusto = l.Preco;
    } else {
        const MovimentoCusto mov{l.Codigo, l.AfectaStk, l.QuantNormal, l.Preco, l.Armazem, l.Data,
                                 0};
        const FormulaPMC formula =
            param.FormulaPrecoMedioCusto == 2 ? FormulaPMC::MediaMovel : FormulaPMC::Totais;
        const auto media = PrecoMedioCusto_Calcular(sessao, mov, formula, false, &conn);
        if (!media) return false;
        l.PMCusto = *media;
        if (param.PMCArmazem) {
            const auto mediaArmazem = PrecoMedioCusto_Calcular(sessao, mov, formula, true, &conn);
            if (!mediaArmazem) return false;
            l.Armazem_PMCusto = *mediaArmazem;
        }
    }
    if (param.PMCArmazem) {
        l.Armazem_UPCompra = l.Preco;
        l.Armazem_UPCusto = l.Preco;
    }
    // A VAT code without a row bears no VAT on cost.
    auto iva = conn.exec(QStringLiteral("select COALESCE(TaxaCustos,0) from TabIva where codigo=?"),
                         {l.IvaTabela});
    if (!iva) return false;
    const double taxa = iva->next() ? pricing::percentagem(iva->value(0)) : 0.0;
    l.IvaCustos_Taxa = CCur(taxa);
    l.IvaCustos_Valor = (l.ValorIliq - l.TotalDesconto).percentOf(taxa);
    return true;
}

}  // namespace

std::optional<ParamCustos> LerParamCustos(db::Connection& conn) {
    const auto linha = conn.firstRow(
        QStringLiteral("select COALESCE(FormulaPrecoMedioCusto,0), COALESCE(PMCArmazem,0), "
                       "COALESCE(PrecoTranfAcertos,'') from ParamGeral limit 1"));
    if (!linha) return std::nullopt;
    return ParamCustos{linha->value(0).toInt(), linha->value(1).toInt() != 0,
                       linha->value(2).toString().trimmed()};
}

bool MovimentoInterno(const QString& tipo, const QString& afectaStk) {
    static const QStringList internos{QStringLiteral("TRA"), QStringLiteral("AC+"),
                                      QStringLiteral("AC-"), QStringLiteral("TL+"),
                                      QStringLiteral("TL-")};
    return internos.contains(tipo.trimmed().toUpper()) ||
           internos.contains(afectaStk.trimmed().toUpper());
}

ClasseCusto ClassificaCusto(const QString& tipo, const QString& afectaStk) {
    if (MovimentoInterno(tipo, afectaStk)) return ClasseCusto::Interno;
    if (afectaStk.trimmed().startsWith(QLatin1Char('E'), Qt::CaseInsensitive))
        return ClasseCusto::Entrada;
    return ClasseCusto::Outro;
}

bool EntradaSaldosIniciais(const QString& descricao) {
    const QString d = descricao.trimmed().toUpper();
    return d == u"SALDOS INICIAIS(FECHO ANO)" || d == u"ENTRADA DE SALDOS INICIAIS";
}

bool PreencheCustosLinha(db::Sessao& sessao, db::Connection& conn, const ParamCustos& param,
                         const CustosProduto& produto, db::ValoresMovPro& linha) {
    db::ValoresMovPro l = linha;
    try {
        switch (ClassificaCusto(l.Tipo, l.AfectaStk)) {
            case ClasseCusto::Entrada:
                if (!custosEntrada(sessao, conn, param, l)) return false;
                break;
            case ClasseCusto::Interno: {
                const bool media =
                    param.PrecoTranfAcertos.compare(u"PRECOMEDIOCUSTO", Qt::CaseInsensitive) == 0;
                l.Preco = media ? produto.precomediocusto : produto.ultprecocusto;
                l.ValorIliq = l.Preco * l.QuantNormal;
                [[fallthrough]];
            }
            case ClasseCusto::Outro:
                l.PMCusto = produto.precomediocusto;
                l.UPCompra = produto.ultprecocompra;
                l.UPCusto = produto.ultprecocusto;
                if (param.PMCArmazem) {
                    const auto armazem =
                        UltimosPrecosArmazem(sessao, l.Codigo, l.Armazem, l.Data, &conn);
                    if (!armazem) return false;
                    l.Armazem_PMCusto = armazem->Armazem_PMCusto;
                    l.Armazem_UPCompra = armazem->Armazem_UPCompra;
                    l.Armazem_UPCusto = armazem->Armazem_UPCusto;
                }
                break;
        }
    } catch (const CurrencyOverflow&) {
        return false;
    }
    linha = l;
    return true;
}

}  // namespace brasel::documents
