#include "pos/adicionar_produto.h"

#include "app/arranque.h"
#include "common/number_text.h"
#include "db/procedimentos/mete_no_mov_pro.h"
#include "devices/mostra_no_display.h"
#include "documents/lanca_mov_produto.h"
#include "documents/producao.h"
#include "documents/saldo_produto.h"
#include "pos/adicionar_produto_localizacao.h"
#include "pos/adicionar_produto_lote.h"
#include "pos/alteracao_linhas.h"
#include "pos/cozinha/envio_pedido.h"
#include "pricing/arredonda.h"
#include "pricing/descontos_tabelas.h"
#include "pricing/impostos.h"
#include "pricing/iva.h"
#include "pricing/leitura.h"
#include "pricing/linha.h"

#include <QDate>
#include <QSqlRecord>

namespace brasel::pos {

namespace {

const QString kFalhaLancamento =
    QStringLiteral("Não foi possível efectuar o Lançamento do produto ");

// Clears the busy flag however the press ends.
class Ocupado {
  public:
    explicit Ocupado(Tab& tab) : tab_(tab) { tab_.ocupado = true; }
    ~Ocupado() { tab_.ocupado = false; }
    Ocupado(const Ocupado&) = delete;
    Ocupado& operator=(const Ocupado&) = delete;

  private:
    Tab& tab_;
};

// The product's row as the adding reads it.
struct Produto {
    QString codigo;
    QString descricao;
    QString situacao;
    QString ivaTabVenda;
    double ivaTaxaVenda = 0.0;
    bool referencia = false;
    bool ctrlExistencia = false;
    bool lote = false;
    bool pesagem = false;
    bool impCopa = false;
    QString vendedorHabitual;
    QString unidadeVenda;
    std::array<Currency, 7> precos;
};

std::optional<Produto> lerProduto(db::Connection& conn, const QString& codigo) {
    const auto r = conn.firstRow(QStringLiteral("select * from Produtos where Codigo=?"),
                                 {pricing::textoSql(codigo)});
    if (!r || codigo.isEmpty()) return std::nullopt;
    auto texto = [&](const char* c) { return r->value(QString::fromLatin1(c)).toString(); };
    Produto p;
    p.codigo = texto("Codigo");
    p.descricao = texto("Descricao");
    p.situacao = texto("Situacao").trimmed();
    p.ivaTabVenda = texto("IvaTabVenda");
    p.ivaTaxaVenda = pricing::percentagem(r->value(QStringLiteral("IvaTaxaVenda")));
    p.referencia = pricing::ligado(r->value(QStringLiteral("Referencia")));
    p.ctrlExistencia = pricing::ligado(r->value(QStringLiteral("ctrlexistencia")));
    p.lote = pricing::ligado(r->value(QStringLiteral("Lote")));
    p.pesagem = pricing::ligado(r->value(QStringLiteral("Pesagem")));
    p.impCopa = pricing::ligado(r->value(QStringLiteral("ImpCopa")));
    p.vendedorHabitual = texto("vendedorhabitual");
    p.unidadeVenda = texto("UnidadeVenda");
    for (int i = 0; i < 7; ++i)
        p.precos[static_cast<std::size_t>(i)] =
            Currency::fromVariant(r->value(QStringLiteral("PrecoVenda%1").arg(i + 1)));
    return p;
}

// Whether the product's situation lets it move: no situation does; a situation does when its
// TabSituacao row says Movimenta 1.
bool Situacao_bln(db::Connection& conn, const Produto& p) {
    if (p.situacao.isEmpty()) return true;
    const auto r = conn.firstRow(QStringLiteral("select Movimenta from TabSituacao where Codigo=?"),
                                 {p.situacao});
    return r && r->value(0).toInt() == 1;
}

// The customer's equivalent of a VAT table (ClientesTabIVA), "" when it has none.
QString ClientesTabIva_str(db::Connection& conn, const QString& cliente, const QString& tabIva) {
    const auto r = conn.firstRow(
        QStringLiteral("select TabIvaEquivalente from ClientesTabIVA where Cliente=? and TabIva=?"),
        {cliente, tabIva});
    return r ? r->value(0).toString().trimmed() : QString();
}

// One add: the questions first, then the writes in one transaction.
class Adicao {
  public:
    Adicao(Tab& tab, PerguntasTab& perguntas)
        : tab_(tab), perguntas_(perguntas), estado_(tab.estado()), conn_(estado_.gConn) {}

    std::int64_t executar(const QString& codigo, const QString& texto, std::int64_t substitui);

  private:
    bool recusa(const QString& mensagem) {
        tab_.mensagens().mensagem(mensagem, Icone::Critico);
        return false;
    }
    bool verificacoes(const QString& codigo);
    void precoEQuantidade(const QString& texto);
    void iva();
    bool pesagem();
    bool calculaLinha();
    std::int64_t grava(std::int64_t substitui);
    void mostra(std::int64_t numRegisto);

    Tab& tab_;
    PerguntasTab& perguntas_;
    app::Estado& estado_;
    db::Connection& conn_;
    Produto produto_;
    db::ValoresMovPro linha_;
    QString ivaTabela_;
    double ivaTaxa_ = 0.0;
    Currency preco_;        // without VAT
    Currency precoComIva_;  // what the customer pays a unit
    Currency quantidade_;
    pricing::ValoresLinha valores_;
};

bool Adicao::verificacoes(const QString& codigo) {
    const std::optional<Produto> p = lerProduto(conn_, codigo);
    if (!p || !Situacao_bln(conn_, *p))
        return recusa(QStringLiteral("O Registo Não pode ser Movimentado!"));
    produto_ = *p;
    if (tab_.Luzes) tab_.Luzes('R');

    const std::optional<LocalizacaoEncontrada> local =
        LocalizacaoProduto_Procura(conn_, produto_.codigo, linha_.Armazem);
    if (!local) return recusa(kFalhaLancamento + produto_.codigo);
    if (!local->registada) return recusa(QStringLiteral("Localização Inexistente"));
    linha_.Localizacao = local->codigo;

    // The VAT table the line will carry: the customer's equivalent when there is one.
    ivaTabela_ = produto_.ivaTabVenda;
    ivaTaxa_ = produto_.ivaTaxaVenda;
    const QString equivalente = ClientesTabIva_str(conn_, tab_.mesa().codigo, ivaTabela_);
    if (!equivalente.isEmpty()) {
        ivaTabela_ = equivalente;
        const std::optional<pricing::TaxaIva> t = pricing::LerTaxaIva(estado_, equivalente);
        ivaTaxa_ = t ? t->taxa : 0.0;
    }
    QStringList ivas;
    for (const pricing::LinhaLista& l : tab_.lista().linhas)
        if (!l.ivaTabela.isEmpty() && !ivas.contains(l.ivaTabela)) ivas << l.ivaTabela;
    if (!ivaTabela_.isEmpty() && ivas.size() >= 4 && !ivas.contains(ivaTabela_)) {
        return recusa(QStringLiteral("Não pode lançar mais produtos com IVAS diferentes.\r") +
                      QStringLiteral("Já ultrapassou os Quatro IVAS possiveis neste Documento."));
    }

    if (estado_.param.prontovestir == 1 && produto_.referencia) {
        const std::optional<ReferenciaEscolhida> ref = perguntas_.referencia(produto_.codigo);
        if (!ref || ref->fornecedor.trimmed().isEmpty())
            return recusa(QStringLiteral("Produto de Referências, mas sem o Fornecedor definido!"));
        linha_.Estacao = ref->atributos[0];
        linha_.Sexo = ref->atributos[1];
        linha_.Referencia = ref->atributos[2];
        linha_.Modelo = ref->atributos[3];
        linha_.Cor = ref->atributos[4];
        linha_.Tamanho = ref->atributos[5];
        linha_.Comprimento = ref->atributos[6];
        linha_.Fornece = ref->fornecedor;
    }

    if (produto_.ctrlExistencia) {
        db::ChavesSaldo chaves;
        chaves.Produto = produto_.codigo;
        chaves.Armazem = linha_.Armazem;
        chaves.Localizacao = linha_.Localizacao;
        chaves.Estacao = linha_.Estacao;
        chaves.Sexo = linha_.Sexo;
        chaves.Referencia = linha_.Referencia;
        chaves.Modelo = linha_.Modelo;
        chaves.Cor = linha_.Cor;
        chaves.Tamanho = linha_.Tamanho;
        chaves.Comprimento = linha_.Comprimento;
        chaves.Fornece = linha_.Fornece;
        const std::optional<Currency> saldo = documents::SaldoProduto_SP(estado_, chaves);
        if (!saldo || *saldo <= Currency{})
            return recusa(QStringLiteral("Não pode Lançar.\r\nProduto sem Existência!"));
    }

    if (produto_.lote && tab_.tipo().afectaStk != u"NA") {
        const auto r = conn_.firstRow(
            QStringLiteral("select sum(QuantNormal) from MovProduto where Codigo=? and Tipo=? and "
                           "Terceiro=? and CliFor='C' and Utilizador=? and Fechado<>'S'"),
            {produto_.codigo, tab_.tipo().codigo, tab_.mesa().codigo,
             pricing::textoSql(tab_.utilizador())});
        const Currency jaLancado = r ? Currency::fromVariant(r->value(0)) : Currency{};
        const std::optional<LoteEscolhido> lote = perguntas_.lote(produto_.codigo, jaLancado);
        if (!lote) return recusa(QStringLiteral("Não seleccionou qualquer Lote"));
        const QString invalido = ValidaLote(*lote);
        if (!invalido.isEmpty()) return recusa(invalido);
        linha_.Lote = lote->lote;
        linha_.DataFabrico = lote->dataFabrico;
        linha_.DataValidade = lote->dataValidade;
    }
    return true;
}

void Adicao::precoEQuantidade(const QString& texto) {
    const QString escalao = tab_.escalao();
    const int n = escalao.toInt();
    const std::size_t tier = n >= 1 && n <= 7 ? static_cast<std::size_t>(n - 1) : 0;
    linha_.PVPAplicado = QString::number(tier + 1);
    preco_ = produto_.precos[tier];
    Pendentes& pendentes = tab_.pendentes;
    if (pendentes.preco > Currency{} || pendentes.precoDefinido) {
        preco_ = pendentes.preco;
        pendentes.preco = Currency{};
        pendentes.precoDefinido = false;
    }
    quantidade_ = pendentes.quantidade.isZero() ? Currency(1) : pendentes.quantidade;

    const PrecoQuant dado =
        AbrirPrecoQuant(conn_, perguntas_, texto.isEmpty() ? produto_.codigo : texto);
    if (dado.preco) preco_ = *dado.preco;
    if (dado.quantidade) quantidade_ = dado.quantidade->isZero() ? Currency(1) : *dado.quantidade;
}

void Adicao::iva() {
    const std::optional<pricing::TaxaIva> codigo = pricing::LerTaxaIva(estado_, ivaTabela_);
    if (codigo && codigo->incluido) {
        precoComIva_ = preco_;
        preco_ = preco_.withoutPercent(ivaTaxa_);
    } else {
        precoComIva_ = preco_.withPercent(ivaTaxa_);
    }
}

bool Adicao::pesagem() {
    if (!produto_.pesagem) return true;
    const auto r =
        conn_.firstRow(QStringLiteral("select TemBalanca from UtilConfGeral where utilizador=?"),
                       {pricing::textoSql(estado_.gUtilizador)});
    if (!r || r->value(0).toInt() != 1) return true;
    const Currency peso =
        devices::Balanca_cur(conn_, perguntas_, preco_, ivaTabela_, precoComIva_, ivaTaxa_);
    if (peso <= Currency{}) return false;
    quantidade_ = peso;
    return true;
}

bool Adicao::calculaLinha() {
    preco_ = pricing::ArredondaValor(preco_, estado_.param.casadecpreco, pricing::ArredondaProximo);
    const pricing::DescontosLinha descontos =
        pricing::GET_DescontosProdutos(estado_, QStringLiteral("C"), tab_.mesa().codigo,
                                       produto_.codigo, preco_, tab_.tipo().codigo);
    // The price is already without VAT: the line's VAT is charged on top of it.
    const std::optional<pricing::TaxaIva> taxa =
        ivaTabela_.isEmpty()
            ? std::nullopt
            : std::optional<pricing::TaxaIva>(pricing::TaxaIva{false, ivaTaxa_, 0.0});
    const std::optional<pricing::ValoresLinha> v =
        pricing::CalculaLinha(tab_.definicoes().arredondamentos, taxa, preco_, quantidade_,
                              descontos[0], descontos[1], descontos[2], estado_.param.casadec);
    if (!v) return false;
    valores_ = *v;
    linha_.DescontoPer1 = CCur(descontos[0]);
    linha_.DescontoPer2 = CCur(descontos[1]);
    linha_.DescontoPer3 = CCur(descontos[2]);
    linha_.DescontoPerGeral = CCur(tab_.configuracao() ? tab_.configuracao()->descontoGeral : 0.0);
    return true;
}

std::int64_t Adicao::grava(std::int64_t substitui) {
    const QDate hoje = QDate::currentDate();
    linha_.Codigo = produto_.codigo;
    linha_.Descricao = produto_.descricao;
    linha_.Tipo = tab_.tipo().codigo;
    linha_.Numero = QString();
    linha_.Ano = QString::number(hoje.year());
    linha_.Data = hoje.toString(QStringLiteral("yyyy-MM-dd"));
    linha_.Preco = preco_;
    linha_.PrecoAplicado = precoComIva_;
    linha_.QuantNormal = quantidade_;
    linha_.IvaTabela = ivaTabela_;
    linha_.IvaTaxa = CCur(ivaTaxa_);
    linha_.ValorIva = valores_.iva;
    linha_.TotalDesconto = valores_.desconto;
    linha_.ValorIliq = valores_.bruto;
    linha_.Terceiro = tab_.mesa().codigo;
    linha_.CliFor = QStringLiteral("C");
    linha_.Unidade = produto_.unidadeVenda;
    const QString vendedor = tab_.configuracao() ? tab_.configuracao()->vendedor : QString();
    linha_.Vendedor = vendedor.isEmpty() ? produto_.vendedorHabitual : vendedor;
    linha_.AfectaCli = tab_.tipo().afectaCli;
    linha_.AfectaStk = tab_.tipo().afectaStk;
    linha_.Caixa = estado_.gCaixa;
    linha_.Aplic = QStringLiteral("FC");
    linha_.ObsLinha = tab_.pendentes.obs;
    linha_.Fechado = QStringLiteral("N");
    linha_.Utilizador = tab_.utilizador();
    // A new line counts in the tab's totals and goes with the next close until it is unticked.
    linha_.SelecFecha = 1;
    // The line's key is known before its production, which files its links under it.
    linha_.Identifica = app::GetUID();

    db::WriteTransaction transaccao(conn_);
    if (!transaccao.active()) return 0;
    if (substitui > 0 && !ApagaLinhaGravada(tab_, substitui, conn_)) return 0;
    const documents::DestinoProducao destino{linha_.Tipo, QString(), linha_.Data,
                                             linha_.Identifica};
    if (!documents::Producao_Lanca(estado_, produto_.codigo, quantidade_, destino, linha_.Armazem,
                                   tab_.mensagens(), &conn_))
        return 0;
    const documents::ResultadoLancamento r = documents::LancaMovProduto(
        estado_, linha_, {QString::fromUtf8(kTextoLogFacturacao), QString()}, &conn_);
    if (!r) {
        if (r.recusa == documents::RecusaLancamento::SemExistencia)
            recusa(QStringLiteral("Não pode Lançar.\r\nProduto sem Existência!"));
        else if (r.recusa == documents::RecusaLancamento::SemLote)
            recusa(QStringLiteral("Não seleccionou qualquer Lote"));
        else
            recusa(kFalhaLancamento + produto_.codigo);
        return 0;
    }
    pricing::Impostos impostos(estado_, &conn_);
    if (!impostos.CalculaImposto(QStringLiteral("C"), linha_.Terceiro,
                                 {linha_.Tipo, linha_.Numero, linha_.Ano, r.NumRegisto,
                                  linha_.Identifica, linha_.Codigo, false}))
        return 0;
    const cozinha::PedidoCozinha pedido{produto_.codigo, produto_.descricao, quantidade_,
                                        linha_.Terceiro, linha_.ObsLinha,    linha_.Utilizador};
    if (produto_.impCopa &&
        !cozinha::EnviaPedido(estado_, tab_.linhaSerie(), pedido, true, tab_.mensagens(), &conn_))
        return 0;
    if (!transaccao.commit()) return 0;
    // A bar ticket cannot be taken back: it prints only once the line is stored.
    if (!produto_.impCopa)
        cozinha::EnviaPedido(estado_, tab_.linhaSerie(), pedido, false, tab_.mensagens());
    return r.NumRegisto;
}

void Adicao::mostra(std::int64_t numRegisto) {
    if (tab_.Luzes) tab_.Luzes('G');
    const int casas = estado_.param.casadec;
    devices::MostraNoDisplay(
        estado_, tab_.linhaSerie(), produto_.descricao, NumeroParaTexto(valores_.total, casas),
        NumeroParaTexto(precoComIva_, casas), quantidade_.toPlainText(), estado_.param.cambiodef);
    tab_.CarregarDoc(numRegisto);
}

std::int64_t Adicao::executar(const QString& codigo, const QString& texto, std::int64_t substitui) {
    linha_.Armazem = ArmazemLinhasTab(estado_);
    std::int64_t numRegisto = 0;
    try {
        if (verificacoes(codigo)) {
            precoEQuantidade(texto);
            iva();
            if (pesagem() && calculaLinha()) numRegisto = grava(substitui);
        }
    } catch (const CurrencyOverflow&) {
        numRegisto = 0;
    }
    if (numRegisto <= 0) {
        if (tab_.Luzes) tab_.Luzes('G');
        return 0;
    }
    mostra(numRegisto);
    tab_.pendentes.limpar();
    return numRegisto;
}

}  // namespace

QString ArmazemLinhasTab(app::Estado& estado) {
    const auto r = estado.gConn.firstRow(QStringLiteral("select armazem from ParamGeral"));
    const QString armazem = r ? r->value(0).toString().trimmed() : QString();
    return armazem.isEmpty() ? estado.gArmazem : armazem;
}

std::int64_t AdicionarProduto(Tab& tab, PerguntasTab& perguntas, const QString& codigo,
                              const QString& texto, std::int64_t substitui) {
    return Adicao(tab, perguntas).executar(codigo, texto, substitui);
}

std::int64_t PremirProduto(Tab& tab, PerguntasTab& perguntas, const QString& codigo,
                           std::int64_t substitui) {
    if (tab.ocupado || !tab.temMesaETipo()) return 0;
    Ocupado ocupado(tab);
    const QString produto = tab.pendentes.produto.isEmpty() ? codigo : tab.pendentes.produto;
    if (tab.pendentes.quantidade <= Currency{}) tab.pendentes.quantidade = Currency(1);
    return AdicionarProduto(tab, perguntas, produto, produto, substitui);
}

}  // namespace brasel::pos
