#pragma once

#include <QString>

namespace brasel {

enum class Icone { Critico, Exclamacao, Informacao, Pergunta };

// Everything a routine tells or asks a person goes through this port: the windows answer it
// with message boxes, the tests with a recorder.
class MessagePort {
  public:
    virtual ~MessagePort() = default;
    virtual void mensagem(const QString& texto, Icone icone, const QString& titulo = {}) = 0;
    // The program's own large-button question with "&Sim" and "&Não"; true for "&Sim".
    virtual bool confirmar(const QString& texto, const QString& titulo = {}) = 0;
};

}  // namespace brasel
