#include "devices/documento_impresso.h"

#include "pricing/leitura.h"

#include <QSqlQuery>
#include <QSqlRecord>

namespace brasel::devices {

namespace {

constexpr int kPedaco = 40;
constexpr int kPedacosPorLinha = 5;

QString texto(const QSqlRecord& r, const char* campo) {
    return r.value(QString::fromLatin1(campo)).toString();
}

Currency valor(const QSqlRecord& r, const char* campo) {
    return Currency::fromVariant(r.value(QString::fromLatin1(campo)));
}

void lerTipo(db::Connection& conn, DocumentoImpresso& d) {
    const auto r = conn.firstRow(
        QStringLiteral("select Descricao,AfectaCli,abrecaixa,Vias from TabTipoMov where codigo=?"),
        {d.tipo});
    if (!r) return;
    d.descricaoTipo = texto(*r, "Descricao").left(29);
    d.afectaCli = texto(*r, "AfectaCli").trimmed();
    d.tipoAbreCaixa = pricing::ligado(r->value(QStringLiteral("abrecaixa")));
    d.viasTipo = r->value(QStringLiteral("Vias")).toInt();
}

void lerCabecalho(db::Connection& conn, const QSqlRecord& r, DocumentoImpresso& d) {
    d.data = texto(r, "Data");
    d.dataSys = texto(r, "DataSys");
    d.cliente = texto(r, "Codigo");
    d.nome = texto(r, "Descricao");
    d.morada = texto(r, "Morada");
    d.local = texto(r, "Local");
    d.codPostal = texto(r, "CodPostal");
    d.contribuinte = texto(r, "Contribuinte");
    d.observa = texto(r, "Observa");
    d.notaCertificacao = texto(r, "NotaCertificacao");
    d.armazem = texto(r, "Armazem");
    d.valor = valor(r, "Valor");
    d.desconto = valor(r, "Desconto");
    d.iva = valor(r, "IVA");
    d.descontoFinanceiro = valor(r, "DescontoFinanceiro");
    d.totalDoc = valor(r, "TotalDoc");
    d.entregou = valor(r, "Entregou");
    d.login = LoginUtilizador(conn, texto(r, "Utilizador"));
    d.descricaoPostal = DescricaoPostal(conn, d.codPostal);
}

void lerImpostosEPagamentos(db::Connection& conn, DocumentoImpresso& d, const QVariantList& chave) {
    if (auto q = conn.exec(QStringLiteral("select CodigoImposto,Imposto from ImpostosMovTerceiro "
                                          "where CliFor='C' and Tipo=? and Numero=? and Ano=? "
                                          "order by CodigoImposto"),
                           chave)) {
        while (q->next())
            d.impostos.push_back({q->value(0).toString(), Currency::fromVariant(q->value(1))});
    }
    if (auto q =
            conn.exec(QStringLiteral(
                          "select c.PagaComo,COALESCE(p.Descricao,''),c.ValorTotal from MovCaixa c "
                          "left join PagaComo p on p.codigo=c.PagaComo "
                          "where c.Tipo=? and c.Numero=? and c.Ano=? order by c.NumRegisto"),
                      chave)) {
        while (q->next()) {
            d.pagamentos.push_back({q->value(0).toString(), q->value(1).toString(),
                                    Currency::fromVariant(q->value(2))});
        }
    }
}

}  // namespace

QStringList DocumentoImpresso::blocoCliente() const {
    return BlocoCliente(nome, morada, local, codPostal, descricaoPostal, contribuinte);
}

QString DocumentoImpresso::dataImpressa(const QString& data) {
    const QString d = data.left(10);
    if (d.size() != 10 || d.at(4) != u'-') return d;
    return d.mid(8, 2) + QLatin1Char('-') + d.mid(5, 2) + QLatin1Char('-') + d.left(4);
}

QString DocumentoImpresso::horaImpressa(const QString& dataSys) {
    return dataSys.size() >= 16 ? dataSys.mid(11, 5) : QString();
}

std::optional<DocumentoImpresso> LerDocumentoImpresso(db::Connection& conn, MessagePort& mensagens,
                                                      const QString& tipo, const QString& numero,
                                                      const QString& ano) {
    const QVariantList chave{pricing::textoSql(tipo), pricing::textoSql(numero),
                             pricing::textoSql(ano)};
    const auto cabecalho = conn.firstRow(
        QStringLiteral("select * from MovCliente where Tipo=? and Numero=? and Ano=?"), chave);
    if (!cabecalho) {
        mensagens.mensagem(QStringLiteral("Documento Inexistente"), Icone::Critico);
        return std::nullopt;
    }
    DocumentoImpresso d;
    d.tipo = tipo;
    d.numero = numero;
    d.ano = ano;
    lerTipo(conn, d);
    lerCabecalho(conn, *cabecalho, d);
    d.cabecalho = CabecalhoLoja(conn, d.armazem);
    const auto primeira = conn.firstRow(
        QStringLiteral("select DataSys from MovProduto where Tipo=? and Numero=? and Ano=? "
                       "order by DataSys limit 1"),
        chave);
    if (primeira) d.horaAbertura = primeira->value(0).toString();

    auto linhas = LerLinhasImpressas(conn, QStringLiteral("Tipo=? and Numero=? and Ano=?"), chave);
    if (!linhas || linhas->empty()) {
        mensagens.mensagem(QStringLiteral("Documento Inexistente em movimentos de produtos"),
                           Icone::Critico);
        return std::nullopt;
    }
    d.linhas = std::move(*linhas);
    d.ivas = AgrupaIva(d.linhas);
    lerImpostosEPagamentos(conn, d, chave);
    return d;
}

QStringList PedacosNota(const QString& nota) {
    QStringList pedacos;
    for (qsizetype i = 0; i < nota.size(); i += kPedaco)
        pedacos << nota.mid(i, kPedaco);
    return pedacos;
}

QStringList PedacosObservacao(const QString& observa) {
    QStringList pedacos;
    for (const QString& linha : observa.split(QStringLiteral("\r\n"))) {
        for (int k = 0; k < kPedacosPorLinha; ++k) {
            const QString p = linha.mid(k * kPedaco, kPedaco);
            if (k > 0 && p.isEmpty()) break;
            pedacos << p;
        }
    }
    return pedacos;
}

std::vector<DocumentoListado> ListaDocumentosCliente(db::Connection& conn, const QString& filtro,
                                                     int limite) {
    const QString f = pricing::textoSql(filtro.trimmed());
    // Both sides go through the engine's UPPER, so accented letters compare alike.
    const QString padrao = QLatin1Char('%') + f + QLatin1Char('%');
    auto q = conn.exec(
        QStringLiteral("select Tipo,Numero,Ano,Data,Descricao,TotalDoc from MovCliente "
                       "where ?='' or UPPER(Tipo) like UPPER(?) or UPPER(Numero) like UPPER(?) "
                       "or UPPER(Codigo) like UPPER(?) or UPPER(Descricao) like UPPER(?) "
                       "order by Data desc, DataSys desc, NumRegisto desc limit ?"),
        {f, padrao, padrao, padrao, padrao, limite});
    std::vector<DocumentoListado> lista;
    if (!q) return lista;
    while (q->next()) {
        lista.push_back({q->value(0).toString(), q->value(1).toString(), q->value(2).toString(),
                         q->value(3).toString(), q->value(4).toString(),
                         Currency::fromVariant(q->value(5))});
    }
    return lista;
}

}  // namespace brasel::devices
