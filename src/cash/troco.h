#pragma once

#include "app/estado.h"
#include "cash/pagamento.h"
#include "common/currency.h"
#include "common/message_port.h"

#include <QByteArray>
#include <QString>

#include <functional>
#include <optional>
#include <vector>

namespace brasel::cash {

// A payment method as its button shows it.
struct BotaoPagaComo {
    QString codigo;
    QString descricao;
    QByteArray foto;  // the stored picture (an image file's bytes); empty without one
};

// Applies a discount percent to the open document (the order screen's discount calculation) and
// gives the document's new total; nullopt when it could not.
using AplicaDesconto = std::function<std::optional<Currency>(double percentagem)>;

// The payment and change screen without the screen: the amounts, the method and the currency
// of one closing, and the rules of each button. Every amount is in the company's currency but
// the tendered amount, which is in `txtCambio`. The tendered amount is always either 0 or
// enough for the amount charged, so the change is never negative. A step that fails (a rate
// out of range, a discount the document refused) leaves every field as it was.
class Troco {
  public:
    Troco(app::Estado& estado, MessagePort& mensagens, Currency totalDoc,
          AplicaDesconto aplicaDesconto);

    // Every payment method ordered by description, with its picture. An empty txtPagaComo first
    // takes the default method of `cliente` (Clientes.PagaComo), when that method exists.
    std::vector<BotaoPagaComo> CarregarFPagamento(const QString& cliente);

    // A method of the list chosen; a code that is not a method changes nothing.
    void EscolhePagaComo(const QString& codigo);
    // cmdAltEntregou: below the amount charged it counts as nothing tendered.
    void AlteraEntregou(Currency valor);
    // cmdAltTotalDoc: the amount actually charged, at most the total; a negative amount changes
    // nothing. A discount percent already applied to the document is taken off it first.
    void AlteraValorPagar(Currency valor);
    // cmdDescontoPer: 100 or more (or below 0) counts as 0; the percent is applied to the
    // document, whose new total becomes the total and the amount charged.
    void AlteraDescontoPer(double percentagem);
    // cmdCambio: the currency of the tendered amount ("" for the company's); a different
    // currency clears the tendered amount and the change.
    void AlteraCambio(const QString& codigo);
    void AlteraObserva(const QString& texto) { txtObserva_ = texto; }

    // cmdFechaDiv: without a method, "Não definiu a Forma de Pagamento" and nullopt (the screen
    // stays). Nothing tendered records the amount charged, in the company's currency, as
    // tendered; an amount charged of 0 charges the total.
    std::optional<Pagamento> Confirmar();

    Currency evalTotalDoc() const { return totalDoc_; }
    Currency evalValor_Pagar() const { return valorPagar_; }
    double evalDescontoPer() const { return descontoPer_; }
    Currency evalDesconto() const { return desconto_; }
    Currency evalEntregou() const { return entregou_; }
    Currency evalTroco() const { return troco_; }
    const QString& txtPagaComo() const { return txtPagaComo_; }
    const QString& lblPagaComo() const { return lblPagaComo_; }
    const QString& txtCambio() const { return txtCambio_; }
    const QString& lblCambio() const { return lblCambio_; }
    const QString& txtObserva() const { return txtObserva_; }

  private:
    // The amount due: the amount charged, or the total while none is set.
    Currency aCobrar() const { return valorPagar_.isZero() ? totalDoc_ : valorPagar_; }
    // An amount in txtCambio in the company's currency, rounded to its decimals.
    std::optional<Currency> convertido(Currency valor, const QString& cambio);
    // The discount amount, and the change from the tendered amount; a tendered amount short of
    // the amount due is cleared. False (and nothing changed) when the arithmetic failed.
    bool recalcula();
    QString abreviatura(const QString& cambio);

    app::Estado& estado_;
    MessagePort& mensagens_;
    AplicaDesconto aplicaDesconto_;
    Currency totalDoc_;
    Currency valorPagar_;
    double descontoPer_ = 0.0;
    Currency desconto_;
    Currency entregou_;
    Currency entregouConvertido_;
    Currency troco_;
    QString txtPagaComo_;
    QString lblPagaComo_;
    QString txtCambio_;
    QString lblCambio_;
    QString txtObserva_;
};

}  // namespace brasel::cash
