#pragma once

#include "app/acessos.h"
#include "common/message_port.h"

#include <QWidget>

namespace brasel::app {

// A window as the rights see it: its objectName, caption and every QPushButton by objectName.
JanelaAcesso descreverJanela(const QWidget* janela, const QString& caption = {});

// Enables or disables the window's restrictable buttons as the check decided.
void aplicarAcessos(QWidget* janela, const ResultadoAcesso& resultado);

// The access check of a window before it is shown: false (and "Acesso Negado !" shown) when the
// user may not open it; otherwise its buttons follow their rights.
bool verificarAcesso(Estado& estado, QWidget* janela, const QString& caption,
                     MessagePort& mensagens, const QString& sufixo = {});

}  // namespace brasel::app
