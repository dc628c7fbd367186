#pragma once

#include <QDateTime>
#include <QPageLayout>
#include <QString>
#include <QStringList>

#include <memory>

class QPainter;
class QPrinter;

namespace brasel::devices {

// One print job on a page printer ("LPT" tickets, the kitchen printer chosen by name, the
// drawer opened by the printer driver): text lines in "Courier New", one printed line each,
// a new page when one is full.
//
// The printer is chosen by name: an installed printer's name; "" the system's default printer;
// a folder, a PDF file inside it named after the job title and the time; a name ending in
// ".pdf", that file.
class TrabalhoImpressao {
  public:
    TrabalhoImpressao();
    ~TrabalhoImpressao();  // an unfinished job is aborted
    TrabalhoImpressao(const TrabalhoImpressao&) = delete;
    TrabalhoImpressao& operator=(const TrabalhoImpressao&) = delete;

    // False when no such printer is installed, the file cannot be written or the job cannot
    // start; the job is then not running.
    bool inicia(const QString& impressora, const QString& titulo,
                QPageLayout::Orientation orientacao = QPageLayout::Portrait);
    bool emCurso() const;
    // False when no job is running.
    bool imprimeLinha(const QString& texto);
    // Ends the job; true when it was running and the printer (or file) took it whole.
    bool termina();
    // Drops the job; a PDF file started for it is removed.
    void aborta();

    // The PDF file of the last job started ("" when it went to a printer or was aborted).
    QString ficheiroPdf() const { return ficheiroPdf_; }

    // The names of the printers installed on this workstation.
    static QStringList impressorasInstaladas();

  private:
    std::unique_ptr<QPrinter> impressora_;
    std::unique_ptr<QPainter> pintor_;
    QString ficheiroPdf_;
    int y_ = 0;
};

// The PDF file a job titled `titulo` writes into `pasta` when it starts at `quando`: the title
// (characters a file name cannot hold replaced by "_") and the time, never an existing file.
QString ficheiroPdfNaPasta(const QString& pasta, const QString& titulo, const QDateTime& quando);

}  // namespace brasel::devices
