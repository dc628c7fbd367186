#pragma once

#include "common/currency.h"

#include <QChar>
#include <QString>

#include <optional>

namespace brasel::pos {

// The text being typed on the touch keyboard: Caps Lock and a pending dead key ("´", "`" or "~")
// decide what a key adds.
class Teclado {
  public:
    explicit Teclado(bool capsLock = true) : capsLock_(capsLock) {}

    // Appends one key, upper-cased with Caps Lock and lower-cased without; a pending dead key
    // followed by a vowel that takes it gives the accented vowel. The dead key is then spent.
    void CarregaLetra(const QString& letra);
    // A dead key: adds nothing until the next key.
    void acento(QChar acento) { acento_ = acento; }
    // Backspace: the last character, when there is one.
    void apaga();
    // A predefined text, added as it is written.
    void acrescenta(const QString& texto);

    void setCapsLock(bool ligado) { capsLock_ = ligado; }
    bool capsLock() const { return capsLock_; }
    QChar acentoPendente() const { return acento_; }
    const QString& resultado() const { return resultado_; }
    void setResultado(const QString& texto) { resultado_ = texto; }

  private:
    QString resultado_;
    bool capsLock_;
    QChar acento_;
};

// A keypad entry read as an amount: digits with at most one decimal separator ("." or ","),
// optionally signed. nullopt when empty; `valido` false when it is not such a number.
struct ValorTeclado {
    std::optional<Currency> valor;
    bool valido = true;
};
ValorTeclado lerValorTeclado(const QString& texto);

// Asks a number on the touch keypad: nullopt when the person left it empty or gave up. Only
// numbers come back; the keypad refuses anything else.
class PedeValor {
  public:
    virtual ~PedeValor() = default;
    virtual std::optional<Currency> pedirValor(const QString& titulo) = 0;
};

// Asks a text on the touch keyboard, starting from `inicial`: nullopt when the person gave up.
// With `mascara` the text is shown as "*" (passwords).
class PedeTexto {
  public:
    virtual ~PedeTexto() = default;
    virtual std::optional<QString> pedirTexto(const QString& titulo, const QString& inicial = {},
                                              bool mascara = false) = 0;
};

}  // namespace brasel::pos
