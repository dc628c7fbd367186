#include "documents/cabecalho_movimento.h"

#include "common/versao.h"
#include "db/query_helpers.h"
#include "documents/numeracao.h"

#include <QDate>
#include <QStringList>

namespace brasel::documents {

namespace {

QVariant texto(const QString& t) {
    // A null QString would bind NULL, which no "col=''" condition of the other programs matches.
    return t.isNull() ? QString(QLatin1String("")) : t;
}

QVariant montante(Currency c) {
    return c.toText();
}

// Column names and their values, in the order of the header table.
struct Colunas {
    QStringList nomes;
    QVariantList valores;

    void add(const char* nome, const QVariant& valor) {
        nomes << QString::fromLatin1(nome);
        valores << valor;
    }
    void add(const QString& nome, const QVariant& valor) {
        nomes << nome;
        valores << valor;
    }
};

Colunas colunas(const Cabecalho& c, const CabecalhoGravado& g) {
    const pricing::CabecalhoVenda& v = c.valores;
    Colunas k;
    k.add("Codigo", texto(c.terceiro.codigo));
    k.add("Descricao", texto(c.terceiro.descricao));
    k.add("Morada", texto(c.terceiro.morada));
    k.add("Local", texto(c.terceiro.local));
    k.add("CodPostal", texto(c.terceiro.codPostal));
    k.add("Pais", texto(c.terceiro.pais));
    k.add("Deferencia", texto(c.terceiro.deferencia));
    k.add("Contribuinte", texto(c.terceiro.contribuinte));
    k.add("Data", texto(c.data));
    k.add("Afecta", texto(c.afecta));
    k.add("Modulo", texto(c.modulo));
    k.add("Tipo", texto(c.tipo));
    k.add("Numero", texto(c.numero));
    k.add("Ano", texto(c.ano));
    k.add("Vendedor", texto(c.vendedor));
    k.add("comissaoper", montante(Currency{}));
    k.add("PagaComo", texto(c.pagaComo));
    k.add("condpag", c.condPag);
    k.add("datavenc", texto(c.dataVenc));
    for (int i = 0; i < 4; ++i) {
        const auto s = static_cast<std::size_t>(i);
        const QString n = QString::number(i + 1);
        k.add(QStringLiteral("Valor") + n, montante(v.valor[s]));
        k.add(QStringLiteral("Desconto") + n, montante(v.desconto[s]));
        k.add(QStringLiteral("ValIva") + n, montante(v.valiva[s]));
        k.add(QStringLiteral("TabIva") + n, texto(v.tabiva[s]));
        k.add(QStringLiteral("TaxIva") + n, v.taxiva[s]);
        k.add(QStringLiteral("IvaIntra") + n, montante(v.ivaIntra[s]));
    }
    k.add("Valor", montante(v.valorTotal));
    k.add("Desconto", montante(v.descontoTotal));
    k.add("IVA", montante(v.iva));
    k.add("DescFinVal", montante(v.descfinval));
    k.add("DescFinPer", c.descFinPer);
    k.add("DescontoFinanceiroPerc", v.descontoFinanceiroPerc);
    k.add("DescontoFinanceiro", montante(v.descontoFinanceiro));
    k.add("TotalDoc", montante(v.totaldoc));
    k.add("saldodoc", montante(c.saldoDoc));
    k.add("IncidIRS", montante(v.incidIRS));
    k.add("ValorIRS", montante(v.valorIRS));
    k.add("observaext", texto({}));
    k.add("Observa", texto(c.observa));
    k.add("Carga", texto({}));
    k.add("Descarga", texto({}));
    k.add("Armazem", texto(c.armazem));
    k.add("integrou", QStringLiteral("N"));
    k.add("Cambio", texto(c.cambio));
    k.add("ValCambio", montante(Currency(1)));
    k.add("Matricula", texto({}));
    k.add("Entregou", montante(c.entregou));
    k.add("Caixa", texto(c.caixa));
    k.add("Utilizador", texto(c.utilizador));
    k.add("Cobrador", texto(c.cobrador));
    k.add("CodigoMorada", QStringLiteral("000"));
    k.add("Juro", montante(Currency{}));
    k.add("ImpSelo", montante(Currency{}));
    k.add("DescontoPP", c.descontoPP);
    k.add("DataSys", g.dataSys);
    k.add("Hash", texto(g.assinatura.hash));
    k.add("HashControl", g.assinatura.assinou);
    k.add("NotaCertificacao", texto(g.assinatura.notaCertificacao));
    k.add("VersaoApp", versaoComPontos());
    k.add("Portes", montante(Currency{}));
    return k;
}

}  // namespace

QString DataVencimento(const QString& data, int dias) {
    return QDate::fromString(data, QStringLiteral("yyyy-MM-dd"))
        .addDays(dias)
        .toString(QStringLiteral("yyyy-MM-dd"));
}

std::optional<CabecalhoGravado> GravaCabecalho(app::Estado& estado, db::Connection& conn,
                                               const Cabecalho& cabecalho, FalhaCabecalho* falha) {
    auto falhou = [falha](FalhaCabecalho f) -> std::optional<CabecalhoGravado> {
        if (falha) *falha = f;
        return std::nullopt;
    };
    if (falha) *falha = FalhaCabecalho::Nenhuma;
    CabecalhoGravado gravado;
    gravado.dataSys = db::Get_DataSysServer_InsertIntoSQL(estado, &conn);
    // The signer hands the time back in its own form; the column keeps the stored one.
    QString dataSysAssinatura = gravado.dataSys;
    if (!AssinaDocumento(estado, conn, gravado.assinatura, dataSysAssinatura, cabecalho.tipo,
                         cabecalho.numero, cabecalho.data, cabecalho.valores.totaldoc,
                         cabecalho.tipoTerceiro))
        return falhou(FalhaCabecalho::Assinatura);

    const Colunas k = colunas(cabecalho, gravado);
    QStringList marcas;
    for (qsizetype i = 0; i < k.nomes.size(); ++i)
        marcas << QStringLiteral("?");
    const QString sql = QStringLiteral("insert into ") + tabelaCabecalho(cabecalho.tipoTerceiro) +
                        QStringLiteral(" (") + k.nomes.join(QLatin1Char(',')) +
                        QStringLiteral(") values (") + marcas.join(QLatin1Char(',')) +
                        QStringLiteral(")");
    if (!conn.exec(sql, k.valores)) return falhou(FalhaCabecalho::BaseDados);
    if (!AssinaConteudo(estado, conn, true, cabecalho.tipo, cabecalho.numero, cabecalho.ano,
                        cabecalho.tipoTerceiro))
        return falhou(FalhaCabecalho::Assinatura);
    return gravado;
}

}  // namespace brasel::documents
