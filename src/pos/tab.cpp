#include "pos/tab.h"

#include "app/definicoes_posto.h"
#include "pricing/arredonda_terceiro.h"
#include "pricing/desconto_financeiro.h"
#include "pricing/impostos.h"
#include "pricing/leitura.h"

#include <QDate>
#include <QSqlRecord>

namespace brasel::pos {

namespace {

QString texto(const QSqlRecord& r, const char* campo) {
    return r.value(QString::fromLatin1(campo)).toString();
}
Currency valor(const QSqlRecord& r, const char* campo) {
    return Currency::fromVariant(r.value(QString::fromLatin1(campo)));
}
double taxa(const QSqlRecord& r, const char* campo) {
    return pricing::percentagem(r.value(QString::fromLatin1(campo)));
}

// One stored line as the list shows it. "Qty * Preço" is the line's gross value and "Valor
// Linha" what the line costs after its discounts and with its VAT; the general discount is
// only spread over the lines when the tab is closed.
pricing::LinhaLista linhaDoRegisto(const QSqlRecord& r, pricing::Impostos& impostos,
                                   const QString& mesa) {
    pricing::LinhaLista l;
    l.seleccionada = r.value(QStringLiteral("SelecFecha")).toInt() == 1;
    l.numRegisto = r.value(QStringLiteral("NumRegisto")).toLongLong();
    l.produto = texto(r, "Codigo");
    l.quantidade = valor(r, "QuantNormal");
    l.descricao = texto(r, "Descricao");
    l.preco = valor(r, "Preco");
    l.ivaTaxa = taxa(r, "IvaTaxa");
    l.desc1 = taxa(r, "DescontoPer1");
    l.desc2 = taxa(r, "DescontoPer2");
    l.desc3 = taxa(r, "DescontoPer3");
    l.ivaTabela = texto(r, "IvaTabela");
    l.precoVP = Currency::parse(texto(r, "PVPAplicado")).value_or(Currency{});
    l.valorDesconto = valor(r, "TotalDesconto");
    l.valorIva = valor(r, "ValorIva");
    l.qtyPreco = valor(r, "ValorIliq");
    l.valorLinha = l.qtyPreco - l.valorDesconto + l.valorIva;
    l.vendedor = texto(r, "Vendedor");
    l.unidade = texto(r, "Unidade");
    l.obsLinha = texto(r, "ObsLinha");
    l.valDescGeral = valor(r, "ValDescontoGeral");
    l.atributos = {texto(r, "Estacao"), texto(r, "Sexo"), texto(r, "Referencia"),
                   texto(r, "Modelo"),  texto(r, "Cor"),  texto(r, "Tamanho")};
    l.fornecedor = texto(r, "Fornece");
    l.precoAplicado = valor(r, "PrecoAplicado");
    l.tipoGuia = texto(r, "TipoGuia");
    l.numGuia = texto(r, "NumGuia");
    l.dataGuia = texto(r, "DataGuia");
    l.numEncomenda = texto(r, "NumEncomenda");
    l.regiEncomenda = texto(r, "RegiEncomenda");
    l.lote = texto(r, "Lote");
    l.dataFabrico = texto(r, "DataFabrico");
    l.dataValidade = texto(r, "DataValidade");
    l.taxaIRS = taxa(r, "TaxaIRS");
    l.incidIRS = valor(r, "IncidIRS");
    l.valorIRS = valor(r, "ValorIRS");
    const QString identifica = texto(r, "Identifica");
    if (!identifica.isEmpty()) {
        const pricing::ChaveLinhaImposto chave{
            texto(r, "Tipo"), texto(r, "Numero"), texto(r, "Ano"), QStringLiteral("C"), mesa,
            l.produto,        identifica};
        l.outImpostosSujeitos =
            impostos.Get_Imposto_ImpostosMovProduto(chave, pricing::FiltroIva::ComIva);
        l.ivaOutImpostos = impostos.Get_IVA_ImpostosMovProduto(chave);
        l.outImpostosNaoSujeitos =
            impostos.Get_Imposto_ImpostosMovProduto(chave, pricing::FiltroIva::SemIva);
    }
    return l;
}

}  // namespace

Tab::Tab(app::Estado& estado, MessagePort& mensagens, devices::LinhaSerie& linha)
    : estado_(estado), mensagens_(mensagens), linha_(linha) {
    definicoes_.casadec = estado_.param.casadec;
    definicoes_.precoAplicado = app::posto::ConfigRest_PrecoIncBrowse.ler();
}

QString Tab::utilizador() const {
    return estado_.gLogin;
}

QString Tab::escalao() const {
    if (configuracao_ && !configuracao_->escalao.isEmpty()) return configuracao_->escalao;
    return QStringLiteral("1");
}

bool Tab::lerMesa(const QString& codigo) {
    mesa_ = MesaTab{};
    const auto r = estado_.gConn.firstRow(
        QStringLiteral("select Codigo,Descricao,JaImprimiuTalao,Diversos,TipoCli from Clientes "
                       "where Codigo=?"),
        {pricing::textoSql(codigo)});
    if (!r || codigo.isEmpty()) return false;
    mesa_.codigo = texto(*r, "Codigo");
    mesa_.descricao = texto(*r, "Descricao");
    mesa_.jaImprimiuTalao = r->value(QStringLiteral("JaImprimiuTalao")).toInt() == 1;
    mesa_.diversos = pricing::ligado(r->value(QStringLiteral("Diversos")));
    mesa_.tipoCli = texto(*r, "TipoCli").trimmed();
    definicoes_.arredondamentos = pricing::LerArredondamentos(estado_, QStringLiteral("C"), codigo);
    definicoes_.formulaIVA = pricing::FormulaIVA_int(estado_, QStringLiteral("C"), codigo);
    return true;
}

void Tab::limparMesa() {
    mesa_ = MesaTab{};
    configuracao_.reset();
    lista_ = pricing::ListaLinhas{};
}

bool Tab::definirTipo(const QString& codigo) {
    tipo_ = TipoTab{};
    const auto r = estado_.gConn.firstRow(
        QStringLiteral("select codigo,Descricao,AfectaCli,AfectaSTK,AfectaCaixa from TabTipoMov "
                       "where codigo=?"),
        {pricing::textoSql(codigo)});
    if (!r || codigo.isEmpty()) {
        lista_ = pricing::ListaLinhas{};
        return false;
    }
    tipo_ = TipoTab{texto(*r, "codigo"), texto(*r, "Descricao"), texto(*r, "AfectaCli"),
                    texto(*r, "AfectaSTK"), texto(*r, "AfectaCaixa")};
    return CarregarDoc(0);
}

void Tab::ConfigUtil() {
    configuracao_ = pricing::ConfigUtil(estado_, mesa_.codigo);
}

bool Tab::CarregarDoc(std::int64_t NumRegisto) {
    if (!temMesaETipo()) {
        lista_ = pricing::ListaLinhas{};
        return true;
    }
    QString sql =
        QStringLiteral("select * from MovProduto where ") + QString::fromLatin1(kCondicaoTab);
    QVariantList valores{mesa_.codigo, tipo_.codigo, pricing::textoSql(utilizador())};
    if (NumRegisto != 0) {
        sql += QStringLiteral(" and NumRegisto=?");
        valores << QVariant::fromValue(NumRegisto);
    }
    sql += QStringLiteral(" order by NumRegisto");
    auto q = estado_.gConn.exec(sql, valores);
    if (!q) return false;
    // Every row is read before the taxes of any line are asked: a server that streams rows
    // drops the rest of a result when the connection runs another statement.
    std::vector<QSqlRecord> registos;
    while (q->next())
        registos.push_back(q->record());
    q->finish();
    std::vector<pricing::LinhaLista> lidas;
    pricing::Impostos impostos(estado_);
    for (const QSqlRecord& r : registos)
        lidas.push_back(linhaDoRegisto(r, impostos, mesa_.codigo));
    if (NumRegisto == 0) lista_.linhas.clear();
    lista_.linhas.insert(lista_.linhas.end(), lidas.begin(), lidas.end());
    return CalculosGerais();
}

bool Tab::CalculosGerais() {
    const QString mesa = mesa_.codigo;
    const QString tipo = tipo_.codigo;
    const QString ano = QString::number(QDate::currentDate().year());
    return pricing::CalculosGerais(
        lista_, definicoes_,
        [this, mesa, tipo, ano](Currency base) -> std::optional<pricing::DescontoFinanceiro> {
            return pricing::DescontoFinanceiro_Calcular(estado_, mesa, tipo, ano, QString(), base);
        });
}

int Tab::indiceLinha(std::int64_t NumRegisto) const {
    for (std::size_t i = 0; i < lista_.linhas.size(); ++i)
        if (lista_.linhas[i].numRegisto == NumRegisto) return static_cast<int>(i);
    return -1;
}

bool Tab::marcarLinha(std::int64_t NumRegisto, bool marcada) {
    const int i = indiceLinha(NumRegisto);
    if (i < 0) return false;
    const QString sql =
        QStringLiteral("update MovProduto set SelecFecha=? where NumRegisto=? and ") +
        QString::fromLatin1(kCondicaoTab);
    if (!estado_.gConn.exec(sql, {marcada ? 1 : 0, QVariant::fromValue(NumRegisto), mesa_.codigo,
                                  tipo_.codigo, pricing::textoSql(utilizador())}))
        return false;
    lista_.linhas[static_cast<std::size_t>(i)].seleccionada = marcada;
    return CalculosGerais();
}

void Tab::retirarLinha(std::int64_t NumRegisto) {
    const int i = indiceLinha(NumRegisto);
    if (i >= 0) lista_.linhas.erase(lista_.linhas.begin() + i);
    CalculosGerais();
}

}  // namespace brasel::pos
