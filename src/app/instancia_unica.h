#pragma once

#include "common/message_port.h"

#include <QLockFile>
#include <QString>

namespace brasel::app {

// Only one instance of the program runs per workstation and OS user: the holder keeps a lock
// file in the settings folder for as long as it lives. A lock left by a process that died is
// taken over; a folder where no lock file can be made lets the program run unguarded.
class InstanciaUnica {
  public:
    // `pasta`: the folder of the lock; the settings folder when empty.
    explicit InstanciaUnica(const QString& pasta = {});

    // True when this is the only instance. Otherwise tells the person so; the caller then ends
    // the process without touching any setting.
    bool adquirir(MessagePort& mensagens);

  private:
    QString pasta_;
    QLockFile lock_;
};

}  // namespace brasel::app
