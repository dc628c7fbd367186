#include "devices/documento_pagina.h"

#include "app/definicoes_posto.h"
#include "common/settings_store.h"
#include "devices/formata_colunas.h"
#include "devices/impressora_windows.h"
#include "documents/assinatura.h"

#include <QDateTime>
#include <QDir>
#include <QFileInfo>
#include <QFont>
#include <QGuiApplication>
#include <QPageLayout>
#include <QPageSize>
#include <QPrinter>
#include <QPrinterInfo>
#include <QTextDocument>

#include <memory>

namespace brasel::devices {

namespace {

QString h(const QString& texto) {
    return texto.toHtmlEscaped();
}

// A table row of cells; a cell starting with ">" is right-aligned.
QString linhaTabela(const QStringList& celulas, const QString& tag = QStringLiteral("td")) {
    QString r = QStringLiteral("<tr>");
    for (const QString& c : celulas) {
        const bool direita = c.startsWith(QLatin1Char('>'));
        r += QStringLiteral("<%1%2>%3</%1>")
                 .arg(tag, direita ? QStringLiteral(" align=\"right\"") : QString(),
                      h(direita ? c.mid(1) : c));
    }
    return r + QStringLiteral("</tr>");
}

QString cabecalho(const DocumentoImpresso& d) {
    QString loja;
    for (qsizetype i = 0; i < d.cabecalho.size(); ++i) {
        if (d.cabecalho.at(i).trimmed().isEmpty()) continue;
        loja += i == 0 ? QStringLiteral(
                             "<span style=\"font-size:15pt; font-weight:bold\">%1</span>"
                             "<br/>")
                             .arg(h(d.cabecalho.at(i)))
                       : h(d.cabecalho.at(i)) + QStringLiteral("<br/>");
    }
    QString cliente;
    for (const QString& c : d.blocoCliente()) {
        if (!c.trimmed().isEmpty()) cliente += h(c) + QStringLiteral("<br/>");
    }
    const QString documento =
        QStringLiteral(
            "<span style=\"font-size:14pt; font-weight:bold\">%1</span><br/>"
            "<b>Nº %2</b><br/>Data: %3 %4<br/>Empr.: %5<br/>Cliente: %6")
            .arg(h(d.descricaoTipo), h(d.numero), h(DocumentoImpresso::dataImpressa(d.data)),
                 h(DocumentoImpresso::horaImpressa(d.dataSys)), h(d.login), h(d.cliente));
    return QStringLiteral(
               "<table width=\"100%\" cellspacing=\"0\" cellpadding=\"4\"><tr>"
               "<td width=\"55%\" valign=\"top\">%1</td>"
               "<td width=\"45%\" valign=\"top\" style=\"border: 1px solid #444\">%2</td></tr>"
               "<tr><td></td><td valign=\"top\"><br/>Exmo.(s) Sr.(s)<br/><b>%3</b></td></tr>"
               "</table>")
        .arg(loja, documento, cliente);
}

QString tabelaLinhas(const DocumentoImpresso& d, int decimais, int decimaisQuant) {
    QString t = QStringLiteral(
        "<table width=\"100%\" cellspacing=\"0\" cellpadding=\"3\" border=\"1\" "
        "style=\"border-collapse: collapse; border-color: #888\">");
    t += linhaTabela(
        {QStringLiteral("Descrição"), QStringLiteral(">Quant."), QStringLiteral(">Preço"),
         QStringLiteral(">Desconto"), QStringLiteral(">IVA %"), QStringLiteral(">Total")},
        QStringLiteral("th"));
    for (const LinhaImpressa& l : d.linhas) {
        QString descricao = l.descricao;
        if (!l.outUnidade.isEmpty()) {
            descricao += QStringLiteral(" (") + ValorTalao(l.outQuant, decimaisQuant) +
                         QLatin1Char(' ') + l.outUnidade + QLatin1Char(')');
        }
        t += linhaTabela({descricao, QLatin1Char('>') + ValorTalao(l.quantidade, decimaisQuant),
                          QLatin1Char('>') + ValorTalao(l.preco, decimais),
                          QLatin1Char('>') + ValorTalao(l.desconto, decimais),
                          QLatin1Char('>') + TaxaTalao(l.ivaTaxa),
                          QLatin1Char('>') + ValorTalao(l.total(), decimais)});
    }
    return t + QStringLiteral("</table>");
}

QString resumos(const DocumentoImpresso& d, int decimais) {
    QString iva = QStringLiteral(
        "<table cellspacing=\"0\" cellpadding=\"3\" border=\"1\" "
        "style=\"border-collapse: collapse; border-color: #888\">");
    iva +=
        linhaTabela({QStringLiteral("IVA"), QStringLiteral(">Taxa"), QStringLiteral(">Incidência"),
                     QStringLiteral(">Valor IVA"), QStringLiteral(">Valor Inc.")},
                    QStringLiteral("th"));
    for (const GrupoIva& g : d.ivas) {
        iva += linhaTabela({g.tabela, QLatin1Char('>') + TaxaTalao(g.taxa) + QLatin1Char('%'),
                            QLatin1Char('>') + ValorTalao(g.incidencia, decimais),
                            QLatin1Char('>') + ValorTalao(g.iva, decimais),
                            QLatin1Char('>') + ValorTalao(g.comIva(), decimais)});
    }
    iva += QStringLiteral("</table>");
    for (const auto& imposto : d.impostos) {
        iva += QStringLiteral("<p>Total %1: %2 (imposto não contemplado nas linhas)</p>")
                   .arg(h(imposto.codigo), h(ValorTalao(imposto.valor, decimais)));
    }

    const auto total = [&](const QString& rotulo, Currency v) {
        return linhaTabela({rotulo, QLatin1Char('>') + ValorTalao(v, decimais)});
    };
    QString totais = QStringLiteral("<table width=\"100%\" cellspacing=\"0\" cellpadding=\"3\">");
    totais += total(QStringLiteral("Total Ilíquido"), d.valor);
    totais += total(QStringLiteral("Total Descontos"), d.desconto);
    totais += total(QStringLiteral("Desconto Financeiro"), d.descontoFinanceiro);
    totais += total(QStringLiteral("Total IVA"), d.iva);
    totais += QStringLiteral(
                  "<tr><td style=\"font-size:13pt\"><b>Total Geral</b></td>"
                  "<td align=\"right\" style=\"font-size:13pt\"><b>%1</b></td></tr>")
                  .arg(h(ValorTalao(d.totalDoc, decimais)));
    for (const auto& p : d.pagamentos) {
        totais += total(
            QStringLiteral("Pago por: (") + p.codigo + QStringLiteral(") ") + p.descricao, p.valor);
    }
    if (d.afectaCli == u"S+") {
        totais += total(QStringLiteral("Entregou"), d.entregouImpresso());
        totais += total(QStringLiteral("Troco"), d.troco());
    }
    totais += QStringLiteral("</table>");
    return QStringLiteral(
               "<table width=\"100%\" cellspacing=\"0\" cellpadding=\"0\"><tr>"
               "<td width=\"55%\" valign=\"top\">%1</td><td width=\"5%\"></td>"
               "<td width=\"40%\" valign=\"top\">%2</td></tr></table>")
        .arg(iva, totais);
}

// The printer a page goes to; the PDF file in `pdf` when it goes to one. Nothing when the
// named printer is not installed.
std::unique_ptr<QPrinter> impressoraPagina(const QString& impressora, const QString& titulo,
                                           QString& pdf) {
    const QString nome = impressora.trimmed();
    const QDateTime agora = QDateTime::currentDateTime();
    if (nome.isEmpty()) {
        const QString pasta = PastaDocumentosPdf();
        if (!QDir().mkpath(pasta)) return nullptr;
        pdf = ficheiroPdfNaPasta(pasta, titulo, agora);
    } else if (QFileInfo(nome).isDir()) {
        pdf = ficheiroPdfNaPasta(nome, titulo, agora);
    } else if (nome.endsWith(QStringLiteral(".pdf"), Qt::CaseInsensitive)) {
        pdf = nome;
    }
    std::unique_ptr<QPrinter> p;
    if (pdf.isEmpty()) {
        const QPrinterInfo info = QPrinterInfo::printerInfo(nome);
        if (info.isNull()) return nullptr;
        p = std::make_unique<QPrinter>(info, QPrinter::HighResolution);
    } else {
        p = std::make_unique<QPrinter>(QPrinter::HighResolution);
        p->setOutputFormat(QPrinter::PdfFormat);
        p->setOutputFileName(pdf);
    }
    p->setDocName(titulo);
    p->setPageSize(QPageSize(QPageSize::A4));
    p->setPageOrientation(QPageLayout::Portrait);
    p->setPageMargins(QMarginsF(15, 15, 15, 15), QPageLayout::Millimeter);
    return p;
}

}  // namespace

QString PastaDocumentosPdf() {
    return QDir(pastaDefinicoes()).filePath(QStringLiteral("Documentos"));
}

QString HtmlDocumentoPagina(const DocumentoImpresso& d, int decimais, int decimaisQuant,
                            bool naoServeDeFactura) {
    QString html = QStringLiteral("<html><body style=\"font-size:10pt\">");
    html += cabecalho(d);
    html += QStringLiteral("<br/>");
    html += tabelaLinhas(d, decimais, decimaisQuant);
    html += QStringLiteral("<br/>");
    html += resumos(d, decimais);
    if (!d.observa.trimmed().isEmpty()) {
        html += QStringLiteral("<p><b>Observações:</b><br/>%1</p>")
                    .arg(h(d.observa).replace(QStringLiteral("\r\n"), QStringLiteral("<br/>")));
    }
    if (naoServeDeFactura)
        html += QStringLiteral("<p><b>Este documento não serve de Factura</b></p>");
    html += QStringLiteral("<hr/><p style=\"font-size:9pt\">%1</p>").arg(h(d.notaCertificacao));
    return html + QStringLiteral("</body></html>");
}

bool ImprimeDocumentoPagina(app::Estado& estado, MessagePort& mensagens, const QString& tipo,
                            const QString& numero, const QString& ano, const QString& impressora,
                            QString* ficheiroPdf) {
    if (!documents::ValidaAssinatura(estado, mensagens, true, tipo, numero, ano)) return false;
    const auto d = LerDocumentoImpresso(estado.gConn, mensagens, tipo, numero, ano);
    if (!d) return false;
    // Pages need the fonts of the graphical application.
    if (qobject_cast<QGuiApplication*>(QCoreApplication::instance()) == nullptr) return false;

    const auto config = LerConfigImpressao(estado.gConn, estado.gUtilizador);
    const int decimais = DecimaisTalao(config ? config->decimais : 0, estado.param.casadec);
    const bool naoServe = app::posto::TipoImprimeMesa.ler() == tipo;
    QString pdf;
    const QString titulo = d->descricaoTipo + QLatin1Char(' ') + numero + QLatin1Char('-') + ano;
    auto printer = impressoraPagina(impressora, titulo, pdf);
    if (!printer) {
        mensagens.mensagem(QStringLiteral("Não foi possível imprimir o documento na impressora ") +
                               impressora + QLatin1Char('.'),
                           Icone::Critico);
        return false;
    }
    QTextDocument pagina;
    QFont letra(QStringLiteral("Arial"), 10);
    letra.setStyleHint(QFont::SansSerif);
    pagina.setDefaultFont(letra);
    pagina.setHtml(HtmlDocumentoPagina(*d, decimais, estado.param.casadecquant, naoServe));
    pagina.print(printer.get());
    printer.reset();
    const bool ok = pdf.isEmpty() || QFileInfo(pdf).size() > 0;
    if (!ok) {
        mensagens.mensagem(QStringLiteral("Não foi possível gravar o documento em ") + pdf,
                           Icone::Critico);
        return false;
    }
    if (ficheiroPdf) *ficheiroPdf = pdf;
    return true;
}

}  // namespace brasel::devices
