// Questions about the tax rows of a line, and their removal with the line.
#include "db/query_helpers.h"
#include "pricing/impostos.h"
#include "pricing/leitura.h"

namespace brasel::pricing {

namespace {

QVariantList valoresChave(const ChaveLinhaImposto& l) {
    return {textoSql(l.tipo),      textoSql(l.numero),
            textoSql(l.ano),       l.cliFor.trimmed().toUpper(),
            textoSql(l.terceiro),  textoSql(l.produto),
            textoSql(l.identifica)};
}

const QString kCondicaoLinha = QStringLiteral(
    " where Tipo=? and Numero=? and Ano=? and CliFor=? and Terceiro=? and Produto=? and "
    "Identifica=?");

}  // namespace

Currency Impostos::soma(const QString& sql, const QVariantList& valores) {
    const auto linha = db::primeiraLinha(ligacao(), sql, valores);
    return linha ? Currency::fromVariant(linha->value(0)) : Currency();
}

Currency Impostos::Get_Imposto_ImpostosMovProduto(const ChaveLinhaImposto& linha, FiltroIva filtro,
                                                  bool apenasProcessa) {
    QString sql =
        QStringLiteral("select COALESCE(sum(Imposto),0) from ImpostosMovProduto") + kCondicaoLinha;
    if (filtro == FiltroIva::SemIva) sql += QStringLiteral(" and TabIVA=''");
    if (filtro == FiltroIva::ComIva) sql += QStringLiteral(" and TabIVA<>''");
    if (apenasProcessa) sql += QStringLiteral(" and Processa='S'");
    return soma(sql, valoresChave(linha));
}

Currency Impostos::Get_Imposto_ImpostosMovProduto_Como_Despesa(const ChaveLinhaImposto& linha) {
    const QString stock =
        db::Select_Campo_str(estado_, QStringLiteral("TabTipoMov"), QStringLiteral("AfectaSTK"),
                             QStringLiteral("codigo"), linha.tipo, {}, conn_);
    if (stock.trimmed().toUpper() != u"E+") return Currency();
    return soma(QStringLiteral("select COALESCE(sum(Imposto),0) from ImpostosMovProduto") +
                    kCondicaoLinha + QStringLiteral(" and Act_UPC='S'"),
                valoresChave(linha));
}

Currency Impostos::Get_IVA_ImpostosMovProduto(const ChaveLinhaImposto& linha) {
    return soma(
        QStringLiteral("select COALESCE(sum(ValorIVA),0) from ImpostosMovProduto") + kCondicaoLinha,
        valoresChave(linha));
}

bool Impostos::Ver_Se_Tem_Impostos_Lancados(const ChaveLinhaImposto& linha) {
    const auto r = db::primeiraLinha(
        ligacao(), QStringLiteral("select count(*) from ImpostosMovProduto") + kCondicaoLinha,
        valoresChave(linha));
    return r && r->value(0).toInt() > 0;
}

bool Impostos::apagaImpostosDaLinha(const QString& tabela, std::int64_t numRegisto) {
    const auto l = db::primeiraLinha(
        ligacao(),
        QStringLiteral("select Tipo,Numero,Ano,CliFor,Terceiro,Codigo,Identifica from %1 where "
                       "NumRegisto=?")
            .arg(tabela),
        {QVariant::fromValue(static_cast<qlonglong>(numRegisto))});
    if (!l) return false;
    QVariantList chave;
    for (int i = 0; i < 7; ++i)
        chave << textoSql(l->value(i).toString());
    return ligacao()
        .exec(QStringLiteral("delete from ImpostosMovProduto") + kCondicaoLinha, chave)
        .has_value();
}

bool Impostos::Delete_Produto_ImpostosMovProduto(std::int64_t NumRegisto) {
    return apagaImpostosDaLinha(QStringLiteral("MovProduto"), NumRegisto);
}

bool Impostos::Actualiza_Produto_ImpostosMovProduto_HistoricoGuias(std::int64_t NumRegisto) {
    return apagaImpostosDaLinha(QStringLiteral("HistoricoGuias"), NumRegisto);
}

}  // namespace brasel::pricing
