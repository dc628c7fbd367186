#pragma once

#include "common/message_port.h"
#include "pos/preco_quant.h"

#include <QDialog>
#include <QLineEdit>
#include <QPointer>
#include <QWidget>

namespace brasel::pos {

// The form of a registered barcode that asks for its price and quantity: units, price and
// quantity, the fields not offered greyed out, closed by Continue (cmdContinuar) once every
// offered field holds a number.
class frmProdutosCodigosBarrasInteractividade : public QDialog {
    Q_OBJECT
  public:
    frmProdutosCodigosBarrasInteractividade(MessagePort& mensagens, const QString& codigo,
                                            const PropostaPrecoQuant& proposta, int casasPreco,
                                            int casasQuantidade, QWidget* pai = nullptr);

    // What the fields hold once the form was continued (fields not offered stay empty).
    PrecoQuant resultado() const { return resultado_; }

    QLineEdit* txtUnidades() const { return txtUnidades_; }
    QLineEdit* txtPreco() const { return txtPreco_; }
    QLineEdit* txtQuantidade() const { return txtQuantidade_; }

  private:
    void continuar();

    MessagePort& mensagens_;
    PropostaPrecoQuant proposta_;
    PrecoQuant resultado_;
    QLineEdit* txtUnidades_;
    QLineEdit* txtPreco_;
    QLineEdit* txtQuantidade_;
};

// The interaction form as AdicionarProduto asks for it.
class PrecoQuantJanela : public JanelaPrecoQuant {
  public:
    PrecoQuantJanela(MessagePort& mensagens, int casasPreco, int casasQuantidade,
                     QWidget* pai = nullptr)
        : mensagens_(mensagens),
          casasPreco_(casasPreco),
          casasQuantidade_(casasQuantidade),
          pai_(pai) {}
    PrecoQuant pedir(const QString& codigo, const PropostaPrecoQuant& proposta) override;

  private:
    MessagePort& mensagens_;
    int casasPreco_;
    int casasQuantidade_;
    QPointer<QWidget> pai_;
};

}  // namespace brasel::pos
