#pragma once

#include "app/estado.h"
#include "common/message_port.h"

#include <QMap>
#include <QString>

namespace brasel::app {

enum class LeituraConfig {
    Ok,
    Incompleta,  // one of the five lines is blank: the message was shown, the program goes on
    Terminar,    // the file is missing, unreadable or empty: the message was shown, end the process
};

// "Config.cfg" beside the program.
QString caminhoConfigCfg();

// Reads the five lines of Config.cfg (`caminho`, or the one beside the program when empty) into
// `config`, trimmed. Lines may end in CRLF or LF; a missing line counts as blank.
LeituraConfig LeConfigCfg(ConfigCfg& config, MessagePort& mensagens, const QString& caminho = {});

// The characters of `texto` before the first `c` (all of it when `c` does not occur).
QString TextoAte(const QString& texto, QChar c);

// Where each serial port COM n is: the file of line 4 holds lines "COMn=/dev/path"; a port it
// does not name is /dev/ttyS<n-1>. A missing file names none.
class MapaPortas {
  public:
    static MapaPortas ler(const QString& ficheiro);
    // "" for a port number below 1.
    QString dispositivo(int porta) const;

  private:
    QMap<int, QString> portas_;
};

}  // namespace brasel::app
