#include "devices/talao_documento.h"

#include "app/definicoes_posto.h"
#include "devices/documento_impresso.h"
#include "devices/escolha_impressao.h"
#include "devices/formata_colunas.h"
#include "devices/talao_comum.h"

#include <QCursor>
#include <QGuiApplication>

namespace brasel::devices {

namespace {

const QString kTracos = QString(kLarguraTalao, QLatin1Char('-'));
const QString kIguais = QString(kLarguraTalao, QLatin1Char('='));

// The hourglass while a receipt is read and sent, where there is a screen to show it on.
class Ampulheta {
  public:
    Ampulheta() : activa_(qobject_cast<QGuiApplication*>(QCoreApplication::instance()) != nullptr) {
        if (activa_) QGuiApplication::setOverrideCursor(QCursor(Qt::WaitCursor));
    }
    ~Ampulheta() {
        if (activa_) QGuiApplication::restoreOverrideCursor();
    }
    Ampulheta(const Ampulheta&) = delete;
    Ampulheta& operator=(const Ampulheta&) = delete;

  private:
    bool activa_;
};

// Everything one receipt needs, read before the drawer opens or a byte is sent: a document
// whose lines are missing prints nothing at all rather than half a receipt.
struct Talao {
    ConfigImpressao config;
    DocumentoImpresso doc;
    int decimais = 2;
    int decimaisQuant = 3;
};

std::optional<Talao> preparaTalao(app::Estado& estado, MessagePort& mensagens,
                                  const TalaoDocumento& documento) {
    auto config = CarregaConfigImpressao(estado.gConn, estado.gUtilizador, mensagens);
    if (!config) return std::nullopt;
    auto doc = LerDocumentoImpresso(estado.gConn, mensagens, documento.tipo, documento.numero,
                                    documento.ano);
    if (!doc) return std::nullopt;
    Talao t{std::move(*config), std::move(*doc), 2, estado.param.casadecquant};
    t.decimais = DecimaisTalao(t.config.decimais, estado.param.casadec);
    return t;
}

QString valor(const Talao& t, Currency v) {
    return ValorTalao(v, t.decimais);
}

// The lines of the document, or its observation in observation mode.
void corpoSerie(const Talao& t, bool observacao, LinhasTalao& l) {
    if (observacao) {
        for (const QString& p : PedacosObservacao(t.doc.observa))
            l.push_back({p});
        return;
    }
    for (const LinhaImpressa& li : t.doc.linhas) {
        l.push_back({LinhaProduto(li, t.decimais, t.decimaisQuant), 1, true});
        if (!li.outUnidade.isEmpty()) {
            l.push_back({QStringLiteral("  ") + ValorTalao(li.outQuant, t.decimaisQuant) +
                         QStringLiteral("-> ") + li.outUnidade});
        }
    }
}

LinhasTalao linhasSerie(const Talao& t, bool talaoCompra, bool observacao) {
    const DocumentoImpresso& d = t.doc;
    LinhasTalao l;
    l.push_back({QString()});
    if (talaoCompra) l.push_back({QStringLiteral(">>>>>>>>>>  TALAO DE COMPRA  <<<<<<<<<<<")});
    for (const QString& c : d.cabecalho)
        l.push_back({c});
    l.push_back({kTracos});
    for (const QString& c : d.blocoCliente())
        l.push_back({c});
    l.push_back({QString()});
    l.push_back(
        {d.descricaoTipo.leftJustified(29, QLatin1Char(' ')) + QStringLiteral("Nº ") + d.numero});
    l.push_back({DocumentoImpresso::dataImpressa(d.data) + QLatin1Char(' ') +
                 DocumentoImpresso::horaImpressa(d.dataSys) + QStringLiteral("   Empr.: ") +
                 d.login});
    l.push_back({QStringLiteral("Data/Hora de Abertura ") +
                 DocumentoImpresso::horaImpressa(d.horaAbertura)});
    l.push_back({kIguais});
    corpoSerie(t, observacao, l);
    l.push_back({kIguais});
    if (t.config.impTotal) {
        for (const auto& imposto : d.impostos) {
            l.push_back(
                {FormataColunas(QStringLiteral("Total ") + imposto.codigo, 20, QStringLiteral("E"),
                                valor(t, imposto.valor), 12, QStringLiteral("D")),
                 2});
        }
        if (!d.impostos.empty())
            l.push_back({QStringLiteral("Imposto n/ contemplado nas linhas atras")});
        l.push_back({LinhaTotal(QStringLiteral("Total Iliq."), valor(t, d.valor)), 2});
        l.push_back({LinhaTotal(QStringLiteral("Total Desc."), valor(t, d.desconto)), 2});
        l.push_back({LinhaTotal(QStringLiteral("Total IVA"), valor(t, d.iva)), 2});
        l.push_back({LinhaTotal(QStringLiteral("Desc.Finac."), valor(t, d.descontoFinanceiro)), 2});
    }
    l.push_back({LinhaTotal(QStringLiteral("Total Geral"), valor(t, d.totalDoc)), 2});
    l.push_back({QString()});
    for (const auto& p : d.pagamentos) {
        l.push_back({FormataColunas(
            QStringLiteral("Pago por: (") + p.codigo + QStringLiteral(") ") + p.descricao, 28,
            QStringLiteral("E"), valor(t, p.valor), 12, QStringLiteral("D"))});
    }
    if (d.afectaCli == u"S+") {
        l.push_back({FormataColunas(QStringLiteral("Entregou"), 28, QStringLiteral("E"),
                                    valor(t, d.entregouImpresso()), 12, QStringLiteral("D"))});
        l.push_back({FormataColunas(QStringLiteral("Troco"), 28, QStringLiteral("E"),
                                    valor(t, d.troco()), 12, QStringLiteral("D"))});
    }
    if (t.config.impIvas) {
        l.push_back({QStringLiteral("IVA      Tx.     Valor Inc.    Valor IVA")});
        l.push_back({kTracos});
        for (const QString& r : ResumoIva(d.ivas, t.decimais))
            l.push_back({r});
    }
    for (const QString& p : PedacosNota(d.notaCertificacao))
        l.push_back({p});
    for (const QString& o : t.config.obs)
        l.push_back({o});
    return l;
}

// The page-printer twin: the same blocks with its own headings, the VAT rate on every line and
// full dates.
QStringList linhasPagina(const Talao& t, bool talaoCompra, bool observacao) {
    const DocumentoImpresso& d = t.doc;
    const auto total = [&](const QString& rotulo, Currency v) {
        return LinhaTotal(rotulo, valor(t, v), kLarguraTalao);
    };
    QStringList l;
    l << QString();
    if (talaoCompra) l << QStringLiteral(">>>>>>>>>>  TALAO DE COMPRA  <<<<<<<<<<<");
    l << d.cabecalho << kTracos << d.blocoCliente() << QString();
    l << d.descricaoTipo.leftJustified(29, QLatin1Char(' ')) + QStringLiteral("  No ") + d.numero;
    l << DocumentoImpresso::dataImpressa(d.data) + QLatin1Char(' ') +
             DocumentoImpresso::horaImpressa(d.dataSys) + QStringLiteral("   Empr.: ") + d.login;
    l << QStringLiteral("Data/Hora de Abertura ") +
             DocumentoImpresso::dataImpressa(d.horaAbertura) + QLatin1Char(' ') +
             DocumentoImpresso::horaImpressa(d.horaAbertura);
    l << kIguais;
    if (observacao) {
        l << PedacosObservacao(d.observa);
    } else {
        l << QStringLiteral("Produto           Quant.       Total IVA");
        for (const LinhaImpressa& li : d.linhas) {
            l << LinhaFixa(li.descricao, 15) +
                     ValorTalao(li.quantidade, t.decimaisQuant)
                         .rightJustified(9, QLatin1Char(' ')) +
                     valor(t, li.total()).rightJustified(12, QLatin1Char(' ')) +
                     (TaxaTalao(li.ivaTaxa) + QLatin1Char('%')).rightJustified(4, QLatin1Char(' '));
            if (!li.outUnidade.isEmpty()) {
                l << QStringLiteral("  ") + ValorTalao(li.outQuant, t.decimaisQuant) +
                         QStringLiteral("-> ") + li.outUnidade;
            }
        }
    }
    l << kIguais;
    if (t.config.impTotal) {
        for (const auto& imposto : d.impostos)
            l << total(QStringLiteral("Total ") + imposto.codigo, imposto.valor);
        if (!d.impostos.empty()) l << QStringLiteral("Imposto n/ contemplado nas linhas atras");
        l << total(QStringLiteral("Total Iliq. "), d.valor)
          << total(QStringLiteral("Total Desco."), d.desconto)
          << total(QStringLiteral("Total IVA   "), d.iva)
          << total(QStringLiteral("Desc.Financ."), d.descontoFinanceiro);
    }
    l << total(QStringLiteral("Total Geral "), d.totalDoc) << QString();
    for (const auto& p : d.pagamentos) {
        l << total(QStringLiteral("Pago por: (") + p.codigo + QStringLiteral(") ") + p.descricao,
                   p.valor);
    }
    if (d.afectaCli == u"S+") {
        l << total(QStringLiteral("Entregou"), d.entregouImpresso())
          << total(QStringLiteral("Troco"), d.troco());
    }
    if (t.config.impIvas) {
        l << QStringLiteral("IVA       Tx.     Valor Inc.   Valor IVA") << kTracos;
        for (const GrupoIva& g : d.ivas) {
            l << g.tabela.left(4).leftJustified(4, QLatin1Char(' ')) +
                     TaxaTalao(g.taxa).rightJustified(9, QLatin1Char(' ')) +
                     valor(t, g.comIva()).rightJustified(15, QLatin1Char(' ')) +
                     valor(t, g.iva).rightJustified(12, QLatin1Char(' '));
        }
    }
    l << PedacosNota(d.notaCertificacao);
    if (!d.tipo.isEmpty() && d.tipo == app::posto::TipoImprimeMesa.ler())
        l << QStringLiteral("Este documento não serve de Factura");
    l << t.config.obs;
    return l;
}

}  // namespace

bool ImprimeTalaoSerie(app::Estado& estado, MessagePort& mensagens, LinhaSerie& linha,
                       const TalaoDocumento& documento) {
    Ampulheta ampulheta;
    const auto t = preparaTalao(estado, mensagens, documento);
    if (!t) return false;
    // The printer definition is checked before the drawer opens: no printer, no receipt.
    const auto impressora =
        CarregaDefinicaoImpressora(estado.gConn, t->config.talao.tipoImpTalao, mensagens);
    if (!impressora) return false;
    AbreGavetaTalao(estado, linha, documento.tipo, false);
    return ImprimeLinhasSerie(linha, *impressora, t->config,
                              linhasSerie(*t, documento.talaoCompra, documento.observacao),
                              documento.vias);
}

bool ImprimeTalaoWindows(app::Estado& estado, MessagePort& mensagens, LinhaSerie& linha,
                         const TalaoDocumento& documento) {
    Ampulheta ampulheta;
    const auto t = preparaTalao(estado, mensagens, documento);
    if (!t) return false;
    AbreGavetaTalao(estado, linha, documento.tipo, false);
    return ImprimeLinhasPagina(
        t->config.impressoraPagina(), t->doc.descricaoTipo + QLatin1Char(' ') + documento.numero,
        linhasPagina(*t, documento.talaoCompra, documento.observacao), documento.vias);
}

bool ImprimeTalao(app::Estado& estado, MessagePort& mensagens, LinhaSerie& linha,
                  const TalaoDocumento& documento) {
    const auto config = CarregaConfigImpressao(estado.gConn, estado.gUtilizador, mensagens);
    if (!config) return false;
    return config->serie() ? ImprimeTalaoSerie(estado, mensagens, linha, documento)
                           : ImprimeTalaoWindows(estado, mensagens, linha, documento);
}

}  // namespace brasel::devices
