#pragma once

#include "dispositivo.h"

#include <QByteArray>
#include <QMutex>
#include <QString>
#include <QStringList>

#include <optional>

namespace devsim {

// What is on the plate and how the scale behaves; a test may change it between weighings.
struct SituacaoBalanca {
    int pesoGramas = 0;                // may be negative (below zero)
    std::optional<int> precoCentimos;  // price-computing scale: answer this price instead
    bool instavel = false;             // the weight does not settle
    bool sobrecarga = false;           // beyond the maximum load
    bool recusa = false;               // refuses what it is sent (NAK, or "??")
    bool silencio = false;             // answers nothing at all

    // Options such as "peso=1.250,instavel,preco=15.63" (weight in kilograms, price in euros;
    // the flags instavel, sobrecarga, recusa, silencio). nullopt for an option it does not know.
    static std::optional<SituacaoBalanca> deOpcoes(const QString& opcoes);
};

// Control bytes shown by name: "[EOT][STX]01[ESC]001250[ESC][ETX]".
QString legivel(const QByteArray& bytes);

// The base of both scales: the situation, the frames exchanged and the transcript
// ("-> " what the program sent, "<- " what the scale answered).
class BalancaSimulada : public Dispositivo {
  public:
    explicit BalancaSimulada(SituacaoBalanca situacao) : situacao_(situacao) {}

    QString transcricao() const override;
    void defineSituacao(const SituacaoBalanca& situacao);
    // The frames the program sent, whole, in order.
    QList<QByteArray> pedidos() const;

  protected:
    void regista(const QByteArray& pedido);
    void respondeRegistando(const QByteArray& resposta);

    mutable QMutex mutex_;
    SituacaoBalanca situacao_;
    QByteArray pendente_;

  private:
    QList<QByteArray> pedidos_;
    QStringList transcricao_;
};

// The price-computing scale: takes the unit price (and a tare) in a record, answers ACK or NAK,
// and on EOT ENQ answers the weight, the unit price and the price it computed (rounded half up
// to the cent, as the scale does), or NAK when it cannot weigh; EOT STX "08" ETX asks its status.
class BalancaCS300 : public BalancaSimulada {
  public:
    explicit BalancaCS300(SituacaoBalanca situacao = {}) : BalancaSimulada(situacao) {}
    void recebe(const QByteArray& bytes) override;

  private:
    QByteArray trataPedido(const QByteArray& pedido);
    QByteArray trataRegistoPreco(const QByteArray& corpo);
    QByteArray trataLeitura();

    std::optional<int> precoUnitarioCentimos_;
    int taraGramas_ = 0;
    QByteArray estado_ = QByteArrayLiteral("00");
};

// The weighing indicator: ASCII commands ended by CR. "XZ" answers a four-character status
// ("0000", "B300" no weight, "2100" unstable, "2500" overload, "??" refused); "Xn" answers
// "$", the weight in nine characters (kilograms, three decimals), blanks to column 24 and the
// status in columns 25 to 28; "EX" answers "0000".
class IndicadorD70 : public BalancaSimulada {
  public:
    explicit IndicadorD70(SituacaoBalanca situacao = {}) : BalancaSimulada(situacao) {}
    void recebe(const QByteArray& bytes) override;

  private:
    QByteArray estado() const;
    QByteArray trataComando(const QByteArray& comando) const;
};

}  // namespace devsim
