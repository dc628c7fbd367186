#pragma once

#include <QByteArray>
#include <QString>
#include <QTemporaryDir>

namespace brasel::testing {

// Sets an environment variable (or clears it, for a null value) for the life of the object.
class VariavelAmbiente {
  public:
    VariavelAmbiente(const char* nome, const QByteArray& valor)
        : nome_(nome), tinha_(qEnvironmentVariableIsSet(nome)), anterior_(qgetenv(nome)) {
        if (valor.isNull()) {
            qunsetenv(nome);
        } else {
            qputenv(nome, valor);
        }
    }
    ~VariavelAmbiente() {
        if (tinha_) {
            qputenv(nome_, anterior_);
        } else {
            qunsetenv(nome_);
        }
    }
    VariavelAmbiente(const VariavelAmbiente&) = delete;
    VariavelAmbiente& operator=(const VariavelAmbiente&) = delete;

  private:
    const char* nome_;
    bool tinha_;
    QByteArray anterior_;
};

// A settings folder of the test's own, so no test reads or writes the user's settings.
class DefinicoesTemporarias {
  public:
    DefinicoesTemporarias() : variavel_("BRASEL_SETTINGS_DIR", pasta_.path().toUtf8()) {}
    QString pasta() const { return pasta_.path(); }

  private:
    QTemporaryDir pasta_;
    VariavelAmbiente variavel_;
};

}  // namespace brasel::testing
