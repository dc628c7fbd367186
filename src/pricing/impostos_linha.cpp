// Taxes of one line: the party's list, the product's definitions and the rows of the line.
#include "db/query_helpers.h"
#include "pricing/impostos.h"
#include "pricing/leitura.h"

namespace brasel::pricing {

Impostos::Impostos(app::Estado& estado, db::Connection* conn) : estado_(estado), conn_(conn) {}

db::Connection& Impostos::ligacao() {
    return estado_.ligacao(conn_);
}

std::optional<std::vector<DefinicaoImposto>> Impostos::definicoes(const QString& produto,
                                                                  const QStringList& codigos,
                                                                  bool todos) {
    std::vector<DefinicaoImposto> d;
    if (codigos.isEmpty() && !todos) return d;
    QString sql = QStringLiteral("select * from ProdutosImpostos where Produto=?");
    QVariantList valores{produto};
    if (!codigos.isEmpty()) {
        QStringList marcas;
        for (const QString& c : codigos) {
            marcas << QStringLiteral("Codigo=?");
            valores << c;
        }
        sql += QStringLiteral(" and (") + marcas.join(QStringLiteral(" or ")) + u')';
    }
    auto q = ligacao().exec(sql + QStringLiteral(" order by Codigo"), valores);
    if (!q) return std::nullopt;
    while (q->next())
        d.push_back(DefinicaoImposto::deRegisto(q->record()));
    return d;
}

std::optional<std::pair<QStringList, RegraArredondamento>> Impostos::listaTerceiro(
    const QString& cliFor, const QString& terceiro) {
    const QString tabela = tabelaTerceiro(cliFor);
    if (tabela.isEmpty()) return std::nullopt;
    const auto linha = db::primeiraLinha(
        ligacao(),
        QStringLiteral("select ArreIvaLin,DecIvaLin,Impostos from %1 where Impostos<>'' and "
                       "codigo=?")
            .arg(tabela),
        {terceiro});
    if (!linha) return std::nullopt;
    const QStringList codigos = CodigosImpostos(linha->value(2).toString());
    if (codigos.isEmpty()) return std::nullopt;
    return std::make_pair(codigos,
                          RegraArredondamento{linha->value(1).toInt(), linha->value(0).toInt()});
}

std::optional<std::vector<ImpostoLinha>> Impostos::CalculaImposto_Virtual(
    const QString& CliFor, const QString& Terceiro, const QString& Produto,
    const DadosLinhaImposto& linha) {
    std::vector<ImpostoLinha> resultado;
    const auto lista = listaTerceiro(CliFor, Terceiro);
    if (!lista) return resultado;
    const auto defs = definicoes(Produto, lista->first);
    if (!defs) return std::nullopt;
    try {
        for (const DefinicaoImposto& d : *defs) {
            if (auto i = CalculaUmImposto(d, linha, lista->second)) resultado.push_back(*i);
        }
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
    return resultado;
}

bool Impostos::CalculaImposto(const QString& CliFor, const QString& Terceiro,
                              const LinhaAlvo& alvo) {
    db::Connection& c = ligacao();
    const QString tabela =
        alvo.historicoGuias ? QStringLiteral("HistoricoGuias") : QStringLiteral("MovProduto");
    const bool porNumero = alvo.numRegisto > 0;
    const auto linha = db::primeiraLinha(
        c,
        QStringLiteral("select Identifica,QuantNormal,Preco,ValorIliq,TotalDesconto,IvaTabela,"
                       "IvaTaxa from %1 where Tipo=? and Numero=? and Ano=? and %2=? and Codigo=?")
            .arg(tabela, porNumero ? QStringLiteral("NumRegisto") : QStringLiteral("Identifica")),
        {textoSql(alvo.tipo), textoSql(alvo.numero), textoSql(alvo.ano),
         porNumero ? QVariant::fromValue(static_cast<qlonglong>(alvo.numRegisto))
                   : QVariant(textoSql(alvo.identifica)),
         textoSql(alvo.produto)});
    if (!linha) return false;
    const DadosLinhaImposto dados{Currency::fromVariant(linha->value(1)),
                                  Currency::fromVariant(linha->value(2)),
                                  Currency::fromVariant(linha->value(3)),
                                  Currency::fromVariant(linha->value(4)),
                                  linha->value(5).toString(),
                                  percentagem(linha->value(6))};
    const auto impostos = CalculaImposto_Virtual(CliFor, Terceiro, alvo.produto, dados);
    if (!impostos) return false;
    const QString identifica = linha->value(0).toString();
    const QVariantList chave{textoSql(alvo.tipo), textoSql(alvo.numero),
                             textoSql(alvo.ano),  CliFor.trimmed().toUpper(),
                             textoSql(Terceiro),  textoSql(alvo.produto),
                             textoSql(identifica)};
    const QString quando = db::Get_DataSysServer_InsertIntoSQL(estado_, &c);
    TransacaoSeNecessaria t(c);
    if (!t.active()) return false;
    if (!c.exec(QStringLiteral("delete from ImpostosMovProduto where Tipo=? and Numero=? and "
                               "Ano=? and CliFor=? and Terceiro=? and Produto=? and Identifica=?"),
                chave)) {
        return false;
    }
    for (const ImpostoLinha& i : *impostos) {
        QVariantList valores = chave;
        valores << textoSql(i.codigoImposto) << i.incidencia.toText() << i.imposto.toText()
                << i.valorIva.toText() << CCur(i.taxaIva).toText() << textoSql(i.tabIva)
                << textoSql(i.ivaTabela) << textoSql(i.processa) << textoSql(i.actUpc)
                << textoSql(estado_.gUtilizador) << quando;
        if (!c.exec(QStringLiteral("insert into ImpostosMovProduto (Tipo,Numero,Ano,CliFor,"
                                   "Terceiro,Produto,Identifica,CodigoImposto,Incidencia,Imposto,"
                                   "ValorIVA,TaxaIVA,TabIVA,IvaTabela,Processa,Act_UPC,"
                                   "Utilizador,DataSys) values "
                                   "(?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?)"),
                    valores)) {
            return false;
        }
    }
    return t.commit();
}

double Impostos::CalculaImposto_IRS_Integracao(const QString& Fornecedor) {
    const auto linha = db::primeiraLinha(
        ligacao(),
        QStringLiteral("select TaxaIRS_Integra from Fornece where Codigo=? and FornecedorIRS=1 "
                       "and TaxaIRS_Integra>0"),
        {Fornecedor});
    return linha ? percentagem(linha->value(0)) : 0.0;
}

}  // namespace brasel::pricing
