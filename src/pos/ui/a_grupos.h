#pragma once

#include "app/estado.h"

#include <QDialog>
#include <QString>

#include <optional>

namespace brasel::pos {

// The group picker of the order screen: one large button per row of the menu level's table
// (NivelEmenta: groups, families or sub-families), by description.
class aGrupos : public QDialog {
    Q_OBJECT
  public:
    aGrupos(app::Estado& estado, const QString& nivel, QWidget* pai = nullptr);

    // Shows the picker modally: the chosen code, nothing when cancelled.
    std::optional<QString> escolher();

  private:
    void CarregarGrupos(app::Estado& estado, const QString& nivel);

    QString escolhido_;
};

}  // namespace brasel::pos
