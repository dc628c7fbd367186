#include "admin/consola.h"

namespace brasel::admin {

void MensagensConsola::mensagem(const QString& texto, Icone /*icone*/, const QString& titulo) {
    ++quantas_;
    erros_ << "  - " << (titulo.isEmpty() ? QString() : titulo + QStringLiteral(": ")) << texto
           << Qt::endl;
}

bool MensagensConsola::confirmar(const QString& texto, const QString& /*titulo*/) {
    ++quantas_;
    erros_ << "  - " << texto << QStringLiteral(" (respondido: Não)") << Qt::endl;
    return false;
}

}  // namespace brasel::admin
