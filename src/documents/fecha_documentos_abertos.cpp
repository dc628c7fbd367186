#include "documents/fecha_documentos_abertos.h"

#include "app/bloqueios.h"
#include "cash/lanca_mov_caixa.h"
#include "documents/cabecalho_movimento.h"
#include "documents/numeracao.h"
#include "pricing/arredonda_terceiro.h"
#include "pricing/desconto_financeiro.h"
#include "pricing/documento.h"
#include "pricing/leitura.h"
#include "pricing/terceiro_taxas.h"

#include <QDate>
#include <QSet>
#include <QSqlRecord>

#include <vector>

namespace brasel::documents {

namespace {

// An open line as it is closed: its key rows and what the VAT slots need.
struct LinhaAberta {
    qint64 numRegisto = 0;
    QString identifica;
    pricing::LinhaLista valores;
};

struct TipoDocumento {
    QString afectaCli;
    QString afectaFor;
    QString afectaCaixa;
};

std::optional<TipoDocumento> lerTipo(db::Connection& conn, const QString& tipo) {
    const auto r = conn.firstRow(
        QStringLiteral("select AfectaCli,AfectaFor,AfectaCaixa from TabTipoMov where codigo=?"),
        {tipo});
    if (!r) return std::nullopt;
    return TipoDocumento{r->value(0).toString().trimmed(), r->value(1).toString().trimmed(),
                         r->value(2).toString().trimmed()};
}

std::optional<std::vector<LinhaAberta>> lerLinhas(app::Estado& estado, db::Connection& conn,
                                                  const DocumentosAbertos& p) {
    QString sql = QStringLiteral(
        "select NumRegisto,Identifica,IvaTabela,IvaTaxa,ValorIliq,TotalDesconto,ValorIva,"
        "ValDescontoGeral,TaxaIRS,IncidIRS,ValorIRS from MovProduto where Terceiro=? and "
        "CliFor=? and Tipo=? and Fechado='N'");
    QVariantList valores{p.terceiro, QString(p.tipoTerceiro), p.tipo};
    if (!p.utilizador.isEmpty()) {
        sql += QStringLiteral(" and Utilizador=?");
        valores << p.utilizador;
    }
    auto q = conn.exec(sql + QStringLiteral(" order by NumRegisto"), valores);
    if (!q) return std::nullopt;
    std::vector<QSqlRecord> registos;
    while (q->next())
        registos.push_back(q->record());
    q->finish();
    const QString cliFor(p.tipoTerceiro);
    auto arredonda = [&](const QVariant& v, int tipoValor) {
        return pricing::Arredonda_Valores_cur(estado, cliFor, p.terceiro, Currency::fromVariant(v),
                                              tipoValor, &conn);
    };
    std::vector<LinhaAberta> linhas;
    for (const QSqlRecord& r : registos) {
        LinhaAberta l;
        l.numRegisto = r.value(0).toLongLong();
        l.identifica = r.value(1).toString();
        pricing::LinhaLista& v = l.valores;
        v.seleccionada = true;
        v.numRegisto = l.numRegisto;
        v.ivaTabela = r.value(2).toString();
        v.ivaTaxa = pricing::percentagem(r.value(3));
        v.qtyPreco = arredonda(r.value(4), pricing::MercadoriaLinha);
        v.valorDesconto = arredonda(r.value(5), pricing::DescontoLinha);
        v.valorIva = arredonda(r.value(6), pricing::IvaLinha);
        v.valDescGeral = Currency::fromVariant(r.value(7));
        v.taxaIRS = pricing::percentagem(r.value(8));
        v.incidIRS = Currency::fromVariant(r.value(9));
        v.valorIRS = Currency::fromVariant(r.value(10));
        v.valorLinha = v.qtyPreco - v.valorDesconto + v.valorIva;
        linhas.push_back(l);
    }
    return linhas;
}

bool maisDeQuatroIvas(const std::vector<LinhaAberta>& linhas) {
    QSet<QString> codigos;
    for (const LinhaAberta& l : linhas)
        codigos.insert(l.valores.ivaTabela);
    return codigos.size() > 4;
}

struct Terceiro {
    TerceiroCabecalho dados;
    QString pagaComo;
    QString vendedor;
    int condPag = 0;
    QString cobrador;
};

std::optional<Terceiro> lerTerceiro(db::Connection& conn, QChar tipoTerceiro,
                                    const QString& codigo) {
    // Suppliers have no seller nor collector.
    const bool cliente = tipoTerceiro != u'F';
    const QString sql =
        cliente ? QStringLiteral(
                      "select Codigo,Descricao,Morada,Local,codpost,Pais,Deferencia,"
                      "Contribuinte,PagaComo,condpag,Vendedor,Cobrador from Clientes "
                      "where Codigo=?")
                : QStringLiteral(
                      "select codigo,Descricao,Morada,Local,codpost,Pais,Deferencia,"
                      "Contribuinte,PagaComo,condpag,'','' from Fornece where codigo=?");
    const auto r = conn.firstRow(sql, {codigo});
    if (!r) return std::nullopt;
    Terceiro t;
    t.dados = {r->value(0).toString(), r->value(1).toString(), r->value(2).toString(),
               r->value(3).toString(), r->value(4).toString(), r->value(5).toString(),
               r->value(6).toString(), r->value(7).toString()};
    t.pagaComo = r->value(8).toString();
    t.condPag = r->value(9).toInt();
    t.vendedor = r->value(10).toString();
    t.cobrador = r->value(11).toString();
    return t;
}

// Numbers the lines and the rows that hang from them.
bool numeraLinhas(db::Connection& conn, const std::vector<LinhaAberta>& linhas,
                  const Cabecalho& c) {
    for (const LinhaAberta& l : linhas) {
        auto q = conn.exec(QStringLiteral("update MovProduto set Numero=?,Ano=?,Data=?,Fechado='S' "
                                          "where NumRegisto=? and Fechado='N'"),
                           {c.numero, c.ano, c.data, QVariant::fromValue<qlonglong>(l.numRegisto)});
        if (!q || q->numRowsAffected() != 1) return false;
        if (l.identifica.isEmpty()) continue;
        const QVariantList chave{c.numero, c.ano, l.identifica};
        if (!conn.exec(
                QStringLiteral("update HistoricoGuias set Numero=?,Ano=? where Identifica=?"),
                chave) ||
            !conn.exec(QStringLiteral("update ImpostosMovProduto set Numero=?,Ano=? where "
                                      "Identifica=? and Numero=''"),
                       chave) ||
            !conn.exec(QStringLiteral("update ProdutosPacksHistorico set numero=?,Ano=? where "
                                      "Identifica=?"),
                       chave))
            return false;
    }
    return true;
}

QString fecha(app::Estado& estado, MessagePort& mensagens, db::Connection& conn,
              const DocumentosAbertos& p) {
    const auto tipo = lerTipo(conn, p.tipo);
    const auto linhas = lerLinhas(estado, conn, p);
    if (!tipo || !linhas || linhas->empty()) return {};
    if (maisDeQuatroIvas(*linhas)) {
        mensagens.mensagem(QStringLiteral("Existem mais do que 4 IVAS diferentes.\r\n"
                                          "Não pode Encerrar este Documento!"),
                           Icone::Exclamacao);
        return {};
    }
    const QString cliFor(p.tipoTerceiro);
    const auto terceiro = lerTerceiro(conn, p.tipoTerceiro, p.terceiro);
    if (!terceiro) return {};

    Cabecalho c;
    c.tipoTerceiro = p.tipoTerceiro;
    c.terceiro = terceiro->dados;
    c.data =
        p.data.isEmpty() ? QDate::currentDate().toString(QStringLiteral("yyyy-MM-dd")) : p.data;
    c.ano = c.data.left(4);
    c.tipo = p.tipo;
    const auto numero = NumeroLivre(conn, tabelaCabecalho(p.tipoTerceiro), p.tipo, c.ano);
    if (!numero) return {};
    c.numero = *numero;
    if (!numeraLinhas(conn, *linhas, c)) return {};

    pricing::DefinicoesDocumento definicoes;
    definicoes.arredondamentos = pricing::LerArredondamentos(estado, cliFor, p.terceiro, &conn);
    definicoes.formulaIVA = pricing::FormulaIVA_int(estado, cliFor, p.terceiro, &conn);
    definicoes.casadec = estado.param.casadec;
    pricing::ListaLinhas lista;
    for (const LinhaAberta& l : *linhas)
        lista.linhas.push_back(l.valores);
    const bool cliente = p.tipoTerceiro != u'F';
    // The financial discount reads the lines of the numbered document.
    const pricing::CalculoDescontoFinanceiro descontoFinanceiro =
        [&](Currency base) -> std::optional<pricing::DescontoFinanceiro> {
        if (!cliente) return pricing::DescontoFinanceiro{};
        return pricing::DescontoFinanceiro_Calcular(estado, p.terceiro, p.tipo, c.ano, c.numero,
                                                    base, &conn);
    };
    if (!pricing::CalculosGerais(lista, definicoes, descontoFinanceiro)) return {};
    const auto venda = pricing::CabecalhoDocumento(lista, definicoes);
    if (!venda) return {};

    c.afecta = cliente ? tipo->afectaCli : tipo->afectaFor;
    c.modulo = cliente ? QStringLiteral("FC") : QStringLiteral("FF");
    c.vendedor = terceiro->vendedor;
    c.pagaComo = terceiro->pagaComo;
    c.condPag = terceiro->condPag;
    c.dataVenc = DataVencimento(c.data, c.condPag);
    c.valores = *venda;
    c.saldoDoc = c.afecta == u"S+" || c.afecta == u"S-" ? Currency{} : venda->totaldoc;
    c.observa = QStringLiteral("Processamento automático.");
    c.armazem = estado.gArmazem;
    c.cambio = estado.param.cambiodef;
    c.entregou = venda->totaldoc;
    c.caixa = estado.gCaixa;
    c.utilizador = estado.gUtilizador;
    c.cobrador = terceiro->cobrador;
    c.descontoPP = pricing::DescontoPP_Percentagem_cur(estado, cliFor, p.terceiro, venda->totaldoc,
                                                       p.tipo, &conn)
                       .value_or(0.0);
    const auto gravado = GravaCabecalho(estado, conn, c);
    if (!gravado) return {};
    if (!conn.exec(
            QStringLiteral("update MovProduto set Hora=? where Tipo=? and Numero=? and Ano=?"),
            {gravado->dataSys.mid(11, 8), c.tipo, c.numero, c.ano}))
        return {};
    if (tipo->afectaCaixa != u"NA" && !tipo->afectaCaixa.isEmpty()) {
        cash::MovimentoCaixa m;
        m.tipo = c.tipo;
        m.numero = c.numero;
        m.data = c.data;
        m.afecta = tipo->afectaCaixa;
        m.pagaComo = c.pagaComo;
        m.valorTotal = venda->totaldoc;
        m.valor = venda->valor;
        m.desconto = venda->desconto;
        m.valiva = venda->valiva;
        m.tabiva = venda->tabiva;
        m.taxiva = venda->taxiva;
        m.observa = c.observa;
        m.nomeEntidade = c.terceiro.descricao;
        if (!cash::LancaMovCaixa(estado, conn, m)) return {};
    }
    if (!GravaUltNumero(conn, c.tipo, c.numero)) return {};
    return c.numero;
}

}  // namespace

QString FechaDocumentosAbertos(app::Estado& estado, MessagePort& mensagens, db::Connection& conn,
                               const DocumentosAbertos& pedido) {
    try {
        if (conn.inTransaction()) return fecha(estado, mensagens, conn, pedido);
        db::WriteTransaction transaccao(conn);
        if (!transaccao.active() || !app::BloqueiaDocumentos(conn)) return {};
        const QString numero = fecha(estado, mensagens, conn, pedido);
        if (numero.isEmpty() || !transaccao.commit()) return {};
        return numero;
    } catch (const CurrencyOverflow&) {
        return {};
    }
}

}  // namespace brasel::documents
