#pragma once

#include "devices/balanca_serie.h"

#include <QByteArray>
#include <QString>

#include <optional>

namespace brasel::devices {

// The price-computing scale: it receives the unit price (and a tare) in a record, weighs, and
// answers the weight and the price it computed.
//   price record   EOT STX "01" ESC price ESC ETX  or  EOT STX "03" ESC price ESC tare ETX
//   reading        EOT ENQ   ->  STX ... weight in columns 7-11, price in columns 20-25 ... ETX
//   status query   EOT STX "08" ETX   ->  the status in columns 5-6 of the reply
class clsCS300 : public BalancaSerie {
  public:
    bool Pesagem(Currency precoUnitario, Currency tara, double segundos) override;

  private:
    void consultaEstado(double segundos);
};

// The unit price as the scale takes it: cents, six digits ("001250" for 12.5); nothing for a
// price that is negative or does not fit.
std::optional<QByteArray> campoPrecoCS300(Currency preco);
// The tare in grams, four digits ("0500" for 0.5 kg); nothing when negative or too heavy.
std::optional<QByteArray> campoTaraCS300(Currency tara);

// The price record: "01" without a tare (zero or less), "03" with it. Nothing when the price or
// the tare cannot be written, together with the error that says which.
struct PedidoCS300 {
    QByteArray bytes;
    QString erro;
};
PedidoCS300 pedidoPrecoCS300(Currency precoUnitario, Currency tara);

// The weight (kilograms) and price of a reading; nothing when the reply is not a reading.
struct LeituraCS300 {
    Currency peso;
    Currency pvp;
};
std::optional<LeituraCS300> leituraCS300(const QByteArray& resposta);

// The error text of a status code; "" for "00" (no error), nothing for a code it does not know.
std::optional<QString> textoEstadoCS300(const QByteArray& estado);

}  // namespace brasel::devices
