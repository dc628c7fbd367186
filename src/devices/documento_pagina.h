#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "devices/documento_impresso.h"

#include <QString>

namespace brasel::devices {

// Where full-page documents go when no printer is named: the folder "Documentos" inside the
// workstation's settings folder (BRASEL_SETTINGS_DIR when set), one PDF per document.
QString PastaDocumentosPdf();

// The A4 page of a closed document as rich text: the shop heading, the document's type, number
// and date, the customer with the taxpayer number, the lines, the other taxes, the VAT summary,
// the totals, the payments and the certification note.
QString HtmlDocumentoPagina(const DocumentoImpresso& documento, int decimais, int decimaisQuant,
                            bool naoServeDeFactura);

// Prints a closed document on an A4 page, after its signature is checked (ValidaAssinatura:
// a document whose signature no longer matches is refused with its message). `impressora` as
// the page printers name it: an installed printer, a folder (a PDF inside it) or a ".pdf" file;
// "" is a PDF in PastaDocumentosPdf(). `ficheiroPdf`, when given, receives the PDF written.
// False when the document is refused, missing, or could not be printed.
bool ImprimeDocumentoPagina(app::Estado& estado, MessagePort& mensagens, const QString& tipo,
                            const QString& numero, const QString& ano, const QString& impressora,
                            QString* ficheiroPdf = nullptr);

}  // namespace brasel::devices
