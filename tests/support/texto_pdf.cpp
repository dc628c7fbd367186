#include "support/texto_pdf.h"

#include <QProcess>
#include <QStandardPaths>

namespace brasel::testing {

std::optional<QString> textoPdf(const QString& ficheiro) {
    const QString programa = QStandardPaths::findExecutable(QStringLiteral("pdftotext"));
    if (programa.isEmpty()) return std::nullopt;
    QProcess processo;
    processo.start(programa, {QStringLiteral("-layout"), QStringLiteral("-enc"),
                              QStringLiteral("UTF-8"), ficheiro, QStringLiteral("-")});
    if (!processo.waitForFinished(30000) || processo.exitCode() != 0) return std::nullopt;
    return QString::fromUtf8(processo.readAllStandardOutput());
}

}  // namespace brasel::testing
