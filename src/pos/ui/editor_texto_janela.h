#pragma once

#include "pos/cozinha/pedidos_cozinha.h"

#include <QPointer>
#include <QWidget>

namespace brasel::pos {

// The note editor of the windows until the touch keyboard takes its place: a modal box of
// several lines ("frmEditorTexto", buttons cmdOK and cmdCancelar) opened over `pai`.
class EditorTextoJanela : public cozinha::EditorTexto {
  public:
    explicit EditorTextoJanela(QWidget* pai = nullptr) : pai_(pai) {}
    std::optional<QString> editar(const QString& texto) override;

  private:
    QPointer<QWidget> pai_;
};

}  // namespace brasel::pos
