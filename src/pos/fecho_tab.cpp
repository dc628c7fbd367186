#include "pos/fecho_tab.h"

#include "app/bloqueios.h"
#include "app/registo_log.h"
#include "cash/lanca_mov_caixa.h"
#include "devices/documento_pagina.h"
#include "devices/mostra_no_display.h"
#include "devices/talao_documento.h"
#include "documents/cabecalho_movimento.h"
#include "documents/controlo_credito.h"
#include "documents/numeracao.h"
#include "pos/abertura_mesa.h"
#include "pricing/arredonda.h"
#include "pricing/impostos.h"
#include "pricing/leitura.h"
#include "pricing/terceiro_taxas.h"

#include <QDate>
#include <QSqlRecord>

namespace brasel::pos {

namespace {

constexpr const char* kTextoCaixa = "Facuração Rest";
constexpr const char* kTextoLog = "Facturação de Clientes";

QString hoje() {
    return QDate::currentDate().toString(QStringLiteral("yyyy-MM-dd"));
}

bool temEfeito(const QString& codigo) {
    return codigo.trimmed() != u"NA";
}

void mostraTotal(Tab& tab) {
    devices::MostraNoDisplay(tab.estado(), tab.linhaSerie(), QStringLiteral("Total a Pagar"),
                             tab.lista().totais.total.toText(tab.estado().param.casadec));
}

// The header amounts of the tab's selected lines, each rounded with the customer's pairs.
pricing::CabecalhoVenda valoresCabecalho(const Tab& tab, const pricing::CabecalhoVenda& v) {
    const pricing::DefinicoesDocumento& d = tab.definicoes();
    auto arredonda = [&d](int tipoValor, Currency valor) {
        return pricing::Arredonda(d.arredondamentos, tipoValor, valor, 4);
    };
    pricing::CabecalhoVenda r = v;
    for (std::size_t i = 0; i < 4; ++i) {
        r.valor[i] = arredonda(pricing::ValorSlot, v.valor[i]);
        r.desconto[i] = arredonda(pricing::DescontoSlot, v.desconto[i]);
        r.valiva[i] = arredonda(pricing::IvaSlot, v.valiva[i]);
    }
    r.valorTotal = arredonda(pricing::MercadoriaGeral, v.valorTotal);
    r.descontoTotal = arredonda(pricing::DescontoGeral, v.descontoTotal);
    r.iva = arredonda(pricing::IvaGeral, v.iva);
    r.totaldoc = arredonda(pricing::TotalGeral, v.totaldoc);
    return r;
}

// The customer's record as the header and the cash movement need it.
struct Cliente {
    documents::TerceiroCabecalho terceiro;
    QString pagaComo;
    int condPag = 0;
    QString cobrador;
};

std::optional<Cliente> lerCliente(db::Connection& conn, const QString& codigo) {
    const auto r = conn.firstRow(
        QStringLiteral("select Codigo,Descricao,Morada,Local,codpost,Pais,Deferencia,Contribuinte,"
                       "PagaComo,condpag,Cobrador from Clientes where Codigo=?"),
        {codigo});
    if (!r) return std::nullopt;
    Cliente c;
    c.terceiro = {r->value(0).toString(), r->value(1).toString(), r->value(2).toString(),
                  r->value(3).toString(), r->value(4).toString(), r->value(5).toString(),
                  r->value(6).toString(), r->value(7).toString()};
    c.pagaComo = r->value(8).toString();
    c.condPag = r->value(9).toInt();
    c.cobrador = r->value(10).toString();
    return c;
}

documents::TerceiroCabecalho terceiroDiverso(const QString& codigo, const DadosClienteDiverso& d) {
    return {codigo, d.nome, d.morada, d.local, d.codPostal, d.pais, d.deferencia, d.contribuinte};
}

// Numbers and closes one selected line with the values the screen computed for it; adds its
// carriage to `portes`. False when the line is no longer an open line of the tab.
bool fechaLinha(Tab& tab, db::Connection& conn, const pricing::LinhaLista& l,
                const documents::Cabecalho& c, Currency& portes) {
    const QString condicao = QStringLiteral(" and ") + QString::fromLatin1(kCondicaoTab);
    const QVariantList chave{QVariant::fromValue<qlonglong>(l.numRegisto), tab.mesa().codigo,
                             tab.tipo().codigo, pricing::textoSql(tab.utilizador())};
    const auto r = conn.firstRow(
        QStringLiteral("select Codigo,Identifica,Portes,DataDevolucao from MovProduto where "
                       "NumRegisto=? and Numero=''") +
            condicao,
        chave);
    if (!r) return false;
    const QString produto = r->value(0).toString();
    const QString identifica = r->value(1).toString();
    portes += Currency::fromVariant(r->value(2));
    QString devolucao = r->value(3).toString();
    const auto p = conn.firstRow(
        QStringLiteral("select COALESCE(DiasDevolucao,0) from Produtos where Codigo=?"), {produto});
    if (p && p->value(0).toInt() > 0)
        devolucao = documents::DataVencimento(c.data, p->value(0).toInt());
    if (!identifica.isEmpty() &&
        !conn.exec(QStringLiteral("update ImpostosMovProduto set Numero=?,Ano=? where Produto=? "
                                  "and Identifica=? and Tipo=? and Numero='' and CliFor='C' "
                                  "and Terceiro=?"),
                   {c.numero, c.ano, produto, identifica, c.tipo, tab.mesa().codigo}))
        return false;
    QVariantList valores{c.numero,
                         c.data,
                         c.ano,
                         l.valorIva.toText(),
                         l.descGeral,
                         l.valDescGeral.toText(),
                         l.valorDesconto.toText(),
                         l.quantidade.toText(),
                         pricing::textoSql(devolucao),
                         l.qtyPreco.toText()};
    valores.append(chave);
    auto q = conn.exec(
        QStringLiteral("update MovProduto set Numero=?,Data=?,Ano=?,Fechado='S',ValorIva=?,"
                       "DescontoPerGeral=?,ValDescontoGeral=?,TotalDesconto=?,QuantNormal=?,"
                       "TipoGuia='',DataDevolucao=?,ValorIliq=? where NumRegisto=? and Numero=''") +
            condicao,
        valores);
    return q && q->numRowsAffected() == 1;
}

cash::MovimentoCaixa movimentoCaixa(const Tab& tab, const documents::Cabecalho& c,
                                    const DadosFecho& dados) {
    cash::MovimentoCaixa m;
    m.tipo = c.tipo;
    m.numero = c.numero;
    m.data = c.data;
    m.afecta = tab.tipo().afectaCaixa;
    m.pagaComo = c.pagaComo;
    m.valorTotal = c.valores.totaldoc;
    m.valor = c.valores.valor;
    m.desconto = c.valores.desconto;
    m.valiva = c.valores.valiva;
    m.tabiva = c.valores.tabiva;
    m.taxiva = c.valores.taxiva;
    m.cambio = dados.pagamento ? dados.pagamento->cambio : QString();
    m.observa = QString::fromUtf8(kTextoCaixa);
    m.nomeEntidade = c.terceiro.descricao;
    return m;
}

// The header of the tab's document, as the closing writes it.
std::optional<documents::Cabecalho> cabecalho(Tab& tab, db::Connection& conn,
                                              const DadosFecho& dados, const QString& numero) {
    app::Estado& estado = tab.estado();
    const auto cliente = lerCliente(conn, tab.mesa().codigo);
    const auto venda = pricing::CabecalhoDocumento(tab.lista(), tab.definicoes());
    if (!cliente || !venda) return std::nullopt;
    documents::Cabecalho c;
    c.tipoTerceiro = u'C';
    c.terceiro =
        dados.diverso ? terceiroDiverso(tab.mesa().codigo, *dados.diverso) : cliente->terceiro;
    c.data = dados.data;
    c.afecta = tab.tipo().afectaCli;
    c.modulo = QStringLiteral("FC");
    c.tipo = tab.tipo().codigo;
    c.numero = numero;
    c.ano = dados.data.left(4);
    c.vendedor = tab.configuracao() ? tab.configuracao()->vendedor : QString();
    c.pagaComo = dados.pagamento ? dados.pagamento->pagaComo : cliente->pagaComo;
    c.condPag = cliente->condPag;
    c.dataVenc = documents::DataVencimento(c.data, c.condPag);
    c.valores = valoresCabecalho(tab, *venda);
    c.descFinPer = dados.pagamento ? dados.pagamento->descontoPer : 0.0;
    const QString afecta = c.afecta.trimmed();
    c.saldoDoc = afecta == u"S+" || afecta == u"S-" ? Currency{} : c.valores.totaldoc;
    c.observa = dados.pagamento ? dados.pagamento->observa : QString();
    c.armazem = estado.gArmazem;
    c.cambio = estado.param.cambiodef;
    c.entregou = dados.pagamento && !dados.pagamento->entregou.isZero() ? dados.pagamento->entregou
                                                                        : c.valores.totaldoc;
    c.caixa = estado.gCaixa;
    c.utilizador = estado.gUtilizador;
    c.cobrador = cliente->cobrador;
    c.descontoPP =
        pricing::DescontoPP_Percentagem_cur(estado, QStringLiteral("C"), tab.mesa().codigo,
                                            c.valores.totaldoc, c.tipo, &conn)
            .value_or(0.0);
    return c;
}

std::optional<DocumentoFechado> grava(Tab& tab, const DadosFecho& dados, FalhaGravacao& falha) {
    app::Estado& estado = tab.estado();
    db::Connection& conn = estado.gConn;
    const QString ano = dados.data.left(4);
    falha = FalhaGravacao::BaseDados;
    db::WriteTransaction transaccao(conn);
    if (!transaccao.active() || !app::BloqueiaDocumentos(conn)) return std::nullopt;
    // The number proposed before the lock may have gone to another workstation meanwhile.
    const auto numero = documents::NumeroLivre(conn, QStringLiteral("MovCliente"),
                                               tab.tipo().codigo, ano, dados.numero);
    if (!numero) return std::nullopt;
    const auto c = cabecalho(tab, conn, dados, *numero);
    if (!c) return std::nullopt;
    documents::FalhaCabecalho falhaCabecalho = documents::FalhaCabecalho::Nenhuma;
    const auto gravado = documents::GravaCabecalho(estado, conn, *c, &falhaCabecalho);
    if (!gravado) {
        if (falhaCabecalho == documents::FalhaCabecalho::Assinatura)
            falha = FalhaGravacao::Assinatura;
        return std::nullopt;
    }
    Currency portes;
    for (const pricing::LinhaLista& l : tab.lista().linhas) {
        if (!l.seleccionada) continue;
        if (!fechaLinha(tab, conn, l, *c, portes)) {
            falha = FalhaGravacao::LinhaAlterada;
            return std::nullopt;
        }
    }
    pricing::Impostos impostos(estado, &conn);
    if (!impostos.Calcula_Impostos_MovTerceiro(
            {c->tipo, c->numero, c->ano, QStringLiteral("C"), tab.mesa().codigo}))
        return std::nullopt;
    const QVariantList documento{c->tipo, c->numero, c->ano};
    if (!conn.exec(
            QStringLiteral("update MovProduto set Hora=? where Tipo=? and Numero=? and Ano=?"),
            QVariantList{gravado->dataSys.mid(11, 8)} + documento) ||
        !conn.exec(
            QStringLiteral("update MovCliente set Portes=? where Tipo=? and Numero=? and Ano=?"),
            QVariantList{portes.toText()} + documento))
        return std::nullopt;
    if (temEfeito(tab.tipo().afectaCaixa)) {
        const cash::MovimentoCaixa movimento = movimentoCaixa(tab, *c, dados);
        if (!cash::LancaMovCaixa(estado, conn, movimento,
                                 dados.divisao ? &*dados.divisao : nullptr))
            return std::nullopt;
    }
    db::EntradaLog entrada;
    entrada.modulo = QStringLiteral("FC");
    entrada.accao = QStringLiteral("N");
    entrada.observa = QString::fromUtf8(kTextoLog);
    entrada.descricao = c->terceiro.descricao;
    entrada.valor = c->valores.totaldoc;
    entrada.tipo = c->tipo;
    entrada.numero = c->numero;
    entrada.ano = c->ano;
    entrada.terceiro = tab.mesa().codigo;
    app::RegistaLogGeral(estado, entrada, &conn);
    if (!conn.exec(QStringLiteral("update Clientes set JaImprimiuTalao=0 where Codigo=?"),
                   {tab.mesa().codigo}) ||
        !documents::GravaUltNumero(conn, c->tipo, c->numero) || !transaccao.commit())
        return std::nullopt;
    falha = FalhaGravacao::Nenhuma;
    return DocumentoFechado{c->tipo, c->numero, c->ano, c->valores.totaldoc};
}

void imprime(Tab& tab, PerguntasFecho& perguntas, const ConfigFecho& config,
             const DocumentoFechado& doc) {
    const devices::EscolhaImpressao escolha = perguntas.escolhaImpressao(doc.tipo);
    if (escolha.escolha == devices::EscolhaImpressao::Nenhum) return;
    if (config.impressoraTalao) {
        devices::ImprimeTalao(tab.estado(), tab.mensagens(), tab.linhaSerie(),
                              {doc.tipo, doc.numero, doc.ano,
                               escolha.escolha == devices::EscolhaImpressao::TalaoCompra,
                               escolha.vias, escolha.observacao});
        return;
    }
    for (int via = 0; via < escolha.vias; ++via)
        if (!devices::ImprimeDocumentoPagina(tab.estado(), tab.mensagens(), doc.tipo, doc.numero,
                                             doc.ano, QString()))
            return;
}

}  // namespace

ConfigFecho LerConfigFecho(app::Estado& estado) {
    ConfigFecho c;
    const auto r = estado.gConn.firstRow(
        QStringLiteral("select MostrarFormFechaDoc,MostrarFormCliDiversos,LancaSemContribuinte,"
                       "ConfirmacaoEncerramento,MostraCliDiverso,Impressora from UtilConfGeral "
                       "where utilizador=?"),
        {estado.gUtilizador});
    if (!r) return c;
    c.mostrarFormFechaDoc = r->value(0).toInt() == 1;
    c.mostrarFormCliDiversos = r->value(1).toInt() == 1;
    c.lancaSemContribuinte = r->value(2).toInt() == 1;
    c.confirmaUtilizador = r->value(3).toString().toUpper().contains(QLatin1String("FC"));
    c.mostraCliDiverso = r->value(4).toInt() == 1;
    c.impressoraTalao = r->value(5).toString().trimmed().toUpper() == u"T";
    return c;
}

std::optional<DocumentoFechado> GravaDocumento(Tab& tab, const DadosFecho& dados,
                                               FalhaGravacao* falha) {
    FalhaGravacao f = FalhaGravacao::BaseDados;
    std::optional<DocumentoFechado> doc;
    try {
        doc = grava(tab, dados, f);
    } catch (const CurrencyOverflow&) {
        // The transaction guard has rolled everything back on the way out.
        doc.reset();
    }
    if (falha) *falha = doc ? FalhaGravacao::Nenhuma : f;
    return doc;
}

void PreparaProximoCliente(Tab& tab, const ConfigFecho& config) {
    app::Estado& estado = tab.estado();
    tab.edicaoLivre = true;
    estado.gConn.exec(QStringLiteral("update MovProduto set SelecFecha=1 where ") +
                          QString::fromLatin1(kCondicaoTab),
                      {tab.mesa().codigo, tab.tipo().codigo, pricing::textoSql(tab.utilizador())});
    tab.CarregarDoc(0);
    if (!tab.lista().linhas.empty()) return;
    if (config.mostraCliDiverso && !estado.param.clidiversos.isEmpty()) {
        AbrirMesa(tab, estado.param.clidiversos);
        return;
    }
    tab.limparMesa();
    devices::MostraNoDisplay(estado, tab.linhaSerie(), QString::fromLatin1(kDisplayProximoCliente));
}

Fecho FecharTab(Tab& tab, PerguntasFecho& perguntas) {
    app::Estado& estado = tab.estado();
    MessagePort& m = tab.mensagens();
    Fecho fecho;
    const auto& linhas = tab.lista().linhas;
    const auto seleccionadas =
        std::count_if(linhas.begin(), linhas.end(), [](const auto& l) { return l.seleccionada; });
    if (!tab.temMesaETipo() || seleccionadas == 0) {
        m.mensagem(QStringLiteral("NÃO SELECCIONOU QUALQUER PRODUTO!"), Icone::Critico);
        return fecho;
    }
    if (const auto recusa = documents::VerificaCreditoCliente(
            estado.gConn, tab.mesa().codigo, tab.lista().totais.total, tab.tipo().codigo,
            QDate::currentDate(), estado.param.casadec)) {
        m.mensagem(recusa->texto, Icone::Exclamacao);
        if (!recusa->autorizavel || !perguntas.autorizaSupervisor()) return fecho;
    }
    if (static_cast<std::size_t>(seleccionadas) < linhas.size())
        m.mensagem(QStringLiteral("NÃO TEM OS PRODUTOS TODOS SELECCIONADOS!"), Icone::Informacao,
                   QStringLiteral("A V I S O"));
    fecho.resultado = ResultadoFecho::Cancelado;
    if (!m.confirmar(QStringLiteral("Confirma o Encerramento?"))) return fecho;
    const ConfigFecho config = LerConfigFecho(estado);
    if (config.confirmaUtilizador && perguntas.confirmaUtilizador().isEmpty()) return fecho;

    DadosFecho dados;
    dados.data = hoje();
    const auto numero = documents::NumeroLivre(estado.gConn, QStringLiteral("MovCliente"),
                                               tab.tipo().codigo, dados.data.left(4));
    if (!numero) {
        m.mensagem(QStringLiteral("Não foi possível obter o Número do Documento!"), Icone::Critico);
        fecho.resultado = ResultadoFecho::Falhou;
        return fecho;
    }
    dados.numero = *numero;
    mostraTotal(tab);

    const QString afecta = tab.tipo().afectaCli.trimmed();
    if ((afecta == u"NA" || afecta == u"S+") && config.mostrarFormFechaDoc) {
        const AplicaDesconto aplica = [&tab](double percentagem) -> std::optional<Currency> {
            if (!pricing::CalcularDescontos(tab.lista(), Currency{}, percentagem,
                                            tab.definicoes()) ||
                !tab.CalculosGerais())
                return std::nullopt;
            return tab.lista().totais.total;
        };
        dados.pagamento =
            perguntas.pagamento(tab.mesa().descricao, tab.lista().totais.total, aplica);
        if (!dados.pagamento) {
            pricing::CalcularDescontos(tab.lista(), Currency{}, 0.0, tab.definicoes());
            tab.CalculosGerais();
            return fecho;
        }
        perguntas.mostraTroco(QStringLiteral("Nº ") + dados.numero, tab.lista().totais.total,
                              dados.pagamento->entregou, dados.pagamento->troco);
        mostraTotal(tab);
    }

    if (tab.mesa().diversos) {
        const auto cliente = lerCliente(estado.gConn, tab.mesa().codigo);
        DadosClienteDiverso conhecidos;
        if (cliente)
            conhecidos = {cliente->terceiro.contribuinte, cliente->terceiro.descricao,
                          cliente->terceiro.deferencia,   cliente->terceiro.morada,
                          cliente->terceiro.local,        cliente->terceiro.codPostal,
                          cliente->terceiro.pais};
        if (config.mostrarFormCliDiversos) {
            dados.diverso = perguntas.clienteDiverso(conhecidos, dados.data);
            if (!dados.diverso) return fecho;
            conhecidos = *dados.diverso;
        }
        if (!config.lancaSemContribuinte && conhecidos.contribuinte.trimmed().isEmpty()) {
            m.mensagem(QStringLiteral("     Não Definiu o Número de Contribuinte!     \r\n\r\n"
                                      "(Campo de Preenchimento Obrigatório)"),
                       Icone::Informacao, QStringLiteral("ATENÇÃO"));
            fecho.resultado = ResultadoFecho::Recusado;
            return fecho;
        }
    }

    if (estado.gVariosPagaComo && temEfeito(tab.tipo().afectaCaixa)) {
        dados.divisao = perguntas.divisaoCaixa(
            tab.lista().totais.total, dados.pagamento ? dados.pagamento->pagaComo : QString());
        if (!dados.divisao) return fecho;
    }

    FalhaGravacao falha = FalhaGravacao::Nenhuma;
    fecho.documento = GravaDocumento(tab, dados, &falha);
    if (!fecho.documento) {
        m.mensagem(falha == FalhaGravacao::Assinatura
                       ? QStringLiteral("\r\nNão foi possível Gerar a Assinatura.")
                       : QStringLiteral("Não foi possível Gravar o Documento."),
                   Icone::Critico);
        fecho.resultado = ResultadoFecho::Falhou;
        return fecho;
    }
    fecho.resultado = ResultadoFecho::Fechado;
    const QString mesa = tab.mesa().codigo;
    imprime(tab, perguntas, config, *fecho.documento);
    app::ApagaLockMesa(estado, mesa);
    PreparaProximoCliente(tab, config);
    return fecho;
}

Fecho FecharComTalao(Tab& tab, PerguntasFecho& perguntas) {
    tab.CarregarDoc(0);
    mostraTotal(tab);
    if (!tab.mensagens().confirmar(QStringLiteral("Fecha Documento ?")))
        return {ResultadoFecho::Cancelado, std::nullopt};
    return FecharTab(tab, perguntas);
}

}  // namespace brasel::pos
