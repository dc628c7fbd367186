#pragma once

#include "app/muda_utilizador.h"
#include "common/message_port.h"

#include <QDialog>
#include <QLineEdit>
#include <QVBoxLayout>

#include <optional>

namespace brasel::app {

// The password prompts of the program: a question, a password box and OK / Cancelar, in large
// type for a touch screen. OK closes the prompt only once the password was accepted; a refused
// password is cleared and the prompt stays for another try.
class PromptPassword : public QDialog {
    Q_OBJECT
  public:
    PromptPassword(const QString& nome, const QString& titulo, const QString& pergunta,
                   QWidget* pai);

    QLineEdit* txtPassword() const { return txtPassword_; }

  protected:
    // Whether what was typed is accepted; the subclass tells the person why not.
    virtual bool aceita() = 0;
    // Where a subclass adds its own boxes, above the password box.
    QVBoxLayout* campos() const { return campos_; }

  private:
    void ok();

    QVBoxLayout* campos_;
    QLineEdit* txtPassword_;
};

// The password asked when changing user on a workstation that asks for it.
class frmMudaUtilizadorPassword : public PromptPassword {
    Q_OBJECT
  public:
    frmMudaUtilizadorPassword(const UtilizadorMudanca& utilizador, MessagePort& mensagens,
                              QWidget* pai = nullptr);

    // The user's password once typed right; nothing when the prompt was cancelled.
    std::optional<QString> Password_str();

  protected:
    bool aceita() override;

  private:
    UtilizadorMudanca utilizador_;
    MessagePort& mensagens_;
};

}  // namespace brasel::app
