#pragma once

#include "app/estado.h"
#include "common/message_port.h"

namespace brasel::app {

// The advisory checks run when the main window opens: stops at the first missing piece of
// configuration with its message and returns false; true when everything is in place.
bool VerificaConfiguracaoInicial(Estado& estado, MessagePort& mensagens);

}  // namespace brasel::app
