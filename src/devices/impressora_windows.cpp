#include "devices/impressora_windows.h"

#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QFont>
#include <QFontMetrics>
#include <QGuiApplication>
#include <QPainter>
#include <QPrinter>
#include <QPrinterInfo>
#include <QRegularExpression>

namespace brasel::devices {

namespace {

constexpr int kPontosLetra = 10;

QFont letraTalao() {
    QFont letra(QStringLiteral("Courier New"), kPontosLetra);
    letra.setStyleHint(QFont::TypeWriter);
    letra.setFixedPitch(true);
    return letra;
}

bool ePdf(const QString& nome) {
    return nome.endsWith(QStringLiteral(".pdf"), Qt::CaseInsensitive);
}

}  // namespace

QString ficheiroPdfNaPasta(const QString& pasta, const QString& titulo, const QDateTime& quando) {
    static const QRegularExpression proibidos(QStringLiteral("[\\\\/:*?\"<>|\\x00-\\x1F]"));
    QString base = QString(titulo).replace(proibidos, QStringLiteral("_")).trimmed();
    if (base.isEmpty()) base = QStringLiteral("Impressao");
    base += QLatin1Char(' ') + quando.toString(QStringLiteral("yyyy-MM-dd HH.mm.ss"));
    const QDir dir(pasta);
    QString caminho = dir.filePath(base + QStringLiteral(".pdf"));
    for (int n = 2; QFileInfo::exists(caminho); ++n)
        caminho = dir.filePath(base + QStringLiteral(" (%1).pdf").arg(n));
    return caminho;
}

TrabalhoImpressao::TrabalhoImpressao() = default;

TrabalhoImpressao::~TrabalhoImpressao() {
    aborta();
}

bool TrabalhoImpressao::inicia(const QString& impressora, const QString& titulo,
                               QPageLayout::Orientation orientacao) {
    aborta();
    // Text on a page needs the fonts of the graphical application.
    if (qobject_cast<QGuiApplication*>(QCoreApplication::instance()) == nullptr) return false;
    const QString nome = impressora.trimmed();
    QString pdf;
    if (!nome.isEmpty() && QFileInfo(nome).isDir()) {
        pdf = ficheiroPdfNaPasta(nome, titulo, QDateTime::currentDateTime());
    } else if (ePdf(nome)) {
        pdf = nome;
    }
    if (pdf.isEmpty()) {
        const QPrinterInfo info =
            nome.isEmpty() ? QPrinterInfo::defaultPrinter() : QPrinterInfo::printerInfo(nome);
        if (info.isNull()) return false;
        impressora_ = std::make_unique<QPrinter>(info, QPrinter::HighResolution);
    } else {
        // QPainter reports a file it cannot create only as a failed begin.
        impressora_ = std::make_unique<QPrinter>(QPrinter::HighResolution);
        impressora_->setOutputFormat(QPrinter::PdfFormat);
        impressora_->setOutputFileName(pdf);
    }
    impressora_->setDocName(titulo);
    impressora_->setPageOrientation(orientacao);
    pintor_ = std::make_unique<QPainter>();
    if (!pintor_->begin(impressora_.get())) {
        pintor_.reset();
        impressora_.reset();
        return false;
    }
    pintor_->setFont(letraTalao());
    ficheiroPdf_ = pdf;
    y_ = 0;
    return true;
}

bool TrabalhoImpressao::emCurso() const {
    return pintor_ != nullptr && pintor_->isActive();
}

bool TrabalhoImpressao::imprimeLinha(const QString& texto) {
    if (!emCurso()) return false;
    const QFontMetrics medida(pintor_->font(), impressora_.get());
    const int altura =
        impressora_->pageLayout().paintRectPixels(impressora_->resolution()).height();
    if (y_ > 0 && y_ + medida.height() > altura) {
        if (!impressora_->newPage()) return false;
        y_ = 0;
    }
    pintor_->drawText(0, y_ + medida.ascent(), texto);
    y_ += medida.lineSpacing();
    return true;
}

bool TrabalhoImpressao::termina() {
    if (!emCurso()) return false;
    const bool ok = pintor_->end();
    pintor_.reset();
    impressora_.reset();
    return ok;
}

void TrabalhoImpressao::aborta() {
    if (!emCurso()) return;
    impressora_->abort();
    pintor_->end();
    if (!ficheiroPdf_.isEmpty()) QFile::remove(ficheiroPdf_);
    pintor_.reset();
    impressora_.reset();
    ficheiroPdf_.clear();
}

QStringList TrabalhoImpressao::impressorasInstaladas() {
    return QPrinterInfo::availablePrinterNames();
}

}  // namespace brasel::devices
