#pragma once

// The keypad of the cash window tests: the scripted answers in order (nothing once they run
// out), and the titles it was asked with.
#include "common/currency.h"
#include "pos/teclado.h"

#include <QString>
#include <QStringList>

#include <deque>
#include <optional>

namespace brasel::cash::teste {

class TecladoGravado : public pos::PedeValor {
  public:
    std::optional<Currency> pedirValor(const QString& titulo) override {
        titulos << titulo;
        if (respostas.empty()) return std::nullopt;
        const auto r = respostas.front();
        respostas.pop_front();
        return r;
    }
    std::deque<std::optional<Currency>> respostas;
    QStringList titulos;
};

}  // namespace brasel::cash::teste
