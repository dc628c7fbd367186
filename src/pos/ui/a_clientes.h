#pragma once

#include "app/estado.h"
#include "common/message_port.h"

#include <QDialog>
#include <QString>

#include <optional>

namespace brasel::pos {

// The table picker: one large button per table of the user's ClientesDiv, with the picture of a
// free or an occupied table and " [$]" once its provisional bill was printed; cmdOutros looks up
// any other (not walk-in) customer. Choosing closes it with the code.
class AClientes : public QDialog {
    Q_OBJECT
  public:
    AClientes(app::Estado& estado, MessagePort& mensagens, QWidget* pai = nullptr);

    // Shows the picker modally: the chosen code, nothing when cancelled.
    std::optional<QString> escolher();
    // Fills the buttons again from the database.
    void CarregarClientes();

  private:
    void outros();

    app::Estado& estado_;
    MessagePort& mensagens_;
    QWidget* grelha_;
    QString escolhido_;
};

}  // namespace brasel::pos
