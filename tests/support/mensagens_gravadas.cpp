#include "support/mensagens_gravadas.h"

namespace brasel::testing {

void MensagensGravadas::mensagem(const QString& texto, Icone icone, const QString& titulo) {
    mensagens_.append({texto, icone, titulo});
}

bool MensagensGravadas::confirmar(const QString& texto, const QString& /*titulo*/) {
    perguntas_.append(texto);
    return respostas_.isEmpty() ? respostaFinal : respostas_.takeFirst();
}

void MensagensGravadas::responder(std::initializer_list<bool> respostas) {
    for (bool resposta : respostas)
        respostas_.append(resposta);
}

QStringList MensagensGravadas::textos() const {
    QStringList lista;
    for (const Mensagem& m : mensagens_)
        lista << m.texto;
    return lista;
}

bool MensagensGravadas::contem(const QString& parte) const {
    for (const Mensagem& m : mensagens_) {
        if (m.texto.contains(parte)) return true;
    }
    for (const QString& p : perguntas_) {
        if (p.contains(parte)) return true;
    }
    return false;
}

void MensagensGravadas::limpar() {
    mensagens_.clear();
    perguntas_.clear();
    respostas_.clear();
}

}  // namespace brasel::testing
