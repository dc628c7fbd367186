#pragma once

#include <QString>

#include <optional>

namespace brasel::testing {

// The text of a PDF file as pdftotext reads it (pages separated by form feeds); nothing when
// the tool is missing or cannot read the file.
std::optional<QString> textoPdf(const QString& ficheiro);

}  // namespace brasel::testing
