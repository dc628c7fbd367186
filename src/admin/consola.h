#pragma once

#include "common/message_port.h"

#include <QTextStream>

namespace brasel::admin {

// The admin tool's two streams. Results go to the standard output; failures and the messages
// the program's routines would show in a box go to the error output.
struct Consola {
    QTextStream saida{stdout};
    QTextStream erros{stderr};
};

// A message port for routines run from the command line: every message is a line on the error
// output, every question is answered "no".
class MensagensConsola : public MessagePort {
  public:
    explicit MensagensConsola(QTextStream& erros) : erros_(erros) {}

    void mensagem(const QString& texto, Icone icone, const QString& titulo = {}) override;
    bool confirmar(const QString& texto, const QString& titulo = {}) override;
    int quantas() const { return quantas_; }

  private:
    QTextStream& erros_;
    int quantas_ = 0;
};

}  // namespace brasel::admin
