#pragma once

#include "common/currency.h"
#include "devices/linha_serie.h"

#include <QByteArray>
#include <QString>

namespace brasel::devices {

// What both scale drivers share: the serial control of the weighing dialog (its own, never
// the main window's), the weight and price of the last weighing and the text of the last error.
class BalancaSerie {
  public:
    virtual ~BalancaSerie() = default;

    Currency Peso() const { return peso_; }
    Currency PVP() const { return pvp_; }
    QString Erro() const { return erro_; }

    // Opens the control; false when it is missing, its settings were refused or the port
    // cannot be opened.
    bool OpenPort();
    void ClosePort();
    // False (and the port is then never opened) for settings the control cannot take.
    bool SetPortaComm(LinhaSerie* linha, int porta, const QString& settings);

    // Weighs with the unit price and tare given, waiting at most `segundos` for each reply;
    // true when a weight was captured.
    virtual bool Pesagem(Currency precoUnitario, Currency tara, double segundos) = 0;

  protected:
    // Whether the bytes received so far make a whole reply, so the wait may end before the
    // time-out.
    using RespostaCompleta = bool (*)(const QByteArray&);

    // Sends `pedido` after forgetting anything left unread (a late answer to an earlier
    // question must not pass for this one's), lets the windows breathe once, and collects the
    // reply until it is whole or `segundos` have passed on the monotonic clock, so that
    // neither midnight nor a change of the wall clock can stretch or cut the wait.
    QByteArray pergunta(const QByteArray& pedido, double segundos, RespostaCompleta completa);

    Currency peso_;
    Currency pvp_;
    QString erro_;

  private:
    LinhaSerie* linha_ = nullptr;
    bool configurada_ = false;
};

// What a failed weighing says when nothing more precise is known.
inline constexpr const char* kErroSemCaptura =
    "Não foi possível efectuar a captura do Peso.\r\nPor favor tente novamente";

// The longest wait for one reply; a larger time-out setting is held to it so that a typing slip
// cannot freeze the dialog.
inline constexpr int kEsperaMaximaMs = 60'000;
// The time-out setting in milliseconds, 0 to kEsperaMaximaMs (0 for a value that is no number).
int milissegundosEspera(double segundos);

}  // namespace brasel::devices
