#pragma once

#include "devices/balanca_serie.h"

#include <QByteArray>
#include <QString>

#include <optional>

namespace brasel::devices {

// The weighing indicator: ASCII commands ended by CR. "EX" starts the conversation, "XZ" asks
// whether a weight can be read (a status code in columns 1-4), "Xn" reads it: "$" in column 1,
// the weight in columns 2-10, a status code in columns 25-28. It knows no prices.
class clsD70 : public BalancaSerie {
  public:
    bool Pesagem(Currency precoUnitario, Currency tara, double segundos) override;

  private:
    bool falha(const QString& erro);
};

// The message of a status code ("??", "B300", "2100", "2500") at `coluna` (counted from 1) of a
// reply; nothing when the reply carries none of them there.
std::optional<QString> erroEstadoD70(const QByteArray& resposta, int coluna);

// The weight of an "Xn" reply: only a reply marked "$" in its first column carries one; the
// weight is columns 2 to 10 with "." as decimal separator. Nothing when unmarked or unreadable.
std::optional<Currency> pesoD70(const QByteArray& resposta);

}  // namespace brasel::devices
