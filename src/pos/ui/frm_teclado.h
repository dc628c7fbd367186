#pragma once

#include "common/message_port.h"
#include "lookups/pesquisa_tabelas.h"
#include "pos/cozinha/pedidos_cozinha.h"
#include "pos/teclado.h"

#include <QCheckBox>
#include <QDialog>
#include <QLineEdit>
#include <QList>
#include <QPointer>
#include <QPushButton>
#include <QWidget>

#include <optional>

namespace brasel::pos {

// The touch keyboard and keypad: the letter keys with the dead accents and Caps Lock on the
// left, the number pad on the right. As a keypad (`numerico`) only the pad is shown and Enter
// takes nothing but a number. Enter (cmdEnter) closes it with the text, cmdCancelar without.
class frmTeclado : public QDialog {
    Q_OBJECT
  public:
    // `textos` gives the predefined texts of cmdTemplates; without it the key is hidden.
    frmTeclado(MessagePort& mensagens, bool numerico, lookups::PesquisaTabelas* textos = nullptr,
               QWidget* pai = nullptr);

    // Shows the keyboard modally starting from `inicial`; with `mascara` the result box shows
    // "*" for each character. The typed text, or nullopt when the person gave up.
    std::optional<QString> Teclado(bool mascara, const QString& titulo, const QString& inicial);
    void CarregaLetra(const QString& letra);

    QLineEdit* txtResultado() const { return txtResultado_; }
    QCheckBox* chkCapsLock() const { return chkCapsLock_; }

  private:
    QWidget* criaLetras();
    QWidget* criaTeclado();
    QPushButton* tecla(const QString& nome, const QString& texto, QWidget* pai);
    QPushButton* teclaLetra(const QString& nome, const QString& letra, QWidget* pai);
    void capsLock();
    void mostra();
    void enter();

    MessagePort& mensagens_;
    bool numerico_;
    lookups::PesquisaTabelas* textos_;
    pos::Teclado teclado_;
    QLineEdit* txtResultado_;
    QCheckBox* chkCapsLock_;
    QList<QPushButton*> letras_;
};

// The touch keyboard as the order screen and the kitchen orders ask for it: a number on the
// keypad, a text or a note on the keyboard.
class TecladoJanela : public PedeValor, public PedeTexto, public cozinha::EditorTexto {
  public:
    TecladoJanela(MessagePort& mensagens, lookups::PesquisaTabelas* textos = nullptr,
                  QWidget* pai = nullptr)
        : mensagens_(mensagens), textos_(textos), pai_(pai) {}

    std::optional<Currency> pedirValor(const QString& titulo) override;
    std::optional<QString> pedirTexto(const QString& titulo, const QString& inicial = {},
                                      bool mascara = false) override;
    std::optional<QString> editar(const QString& texto) override;

  private:
    MessagePort& mensagens_;
    lookups::PesquisaTabelas* textos_;
    QPointer<QWidget> pai_;
};

}  // namespace brasel::pos
