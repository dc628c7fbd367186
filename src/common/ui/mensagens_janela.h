#pragma once

#include "common/message_port.h"

#include <QPointer>
#include <QWidget>

namespace brasel {

// The message port of the windows: modal message boxes over `pai`, and the program's own
// large-button question with "&Sim" and "&Não" (buttons cmdSim and cmdNao).
class MensagensJanela : public MessagePort {
  public:
    explicit MensagensJanela(QWidget* pai = nullptr) : pai_(pai) {}

    void mensagem(const QString& texto, Icone icone, const QString& titulo = {}) override;
    bool confirmar(const QString& texto, const QString& titulo = {}) override;

  private:
    QPointer<QWidget> pai_;
};

}  // namespace brasel
