#pragma once

#include "common/message_port.h"

#include <QList>
#include <QString>
#include <QStringList>

namespace brasel::testing {

// A message port that keeps what a routine told or asked a person, and answers its questions
// from a script: the answers given to responder() in order, then `respostaFinal`.
class MensagensGravadas : public MessagePort {
  public:
    struct Mensagem {
        QString texto;
        Icone icone;
        QString titulo;
    };

    void mensagem(const QString& texto, Icone icone, const QString& titulo = {}) override;
    bool confirmar(const QString& texto, const QString& titulo = {}) override;

    // Scripts the answers to the next questions, in order.
    void responder(std::initializer_list<bool> respostas);
    // The answer once the script has run out (false unless set).
    bool respostaFinal = false;

    const QList<Mensagem>& mensagens() const { return mensagens_; }
    QStringList textos() const;
    const QStringList& perguntas() const { return perguntas_; }
    // Whether some message or question contains `parte`.
    bool contem(const QString& parte) const;
    void limpar();

  private:
    QList<Mensagem> mensagens_;
    QStringList perguntas_;
    QList<bool> respostas_;
};

}  // namespace brasel::testing
