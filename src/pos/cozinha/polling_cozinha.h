#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "devices/linha_serie.h"
#include "pos/cozinha/impressao_cozinha.h"

#include <QList>
#include <QString>
#include <QtGlobal>

namespace brasel::pos::cozinha {

// Where this workstation prints the kitchen's tickets.
enum class ViaCozinha { Serie, Windows, Nenhuma };

// The workstation's kitchen connection (ConfigRest_ImpTalaoCozinhaPorta: "COM" serial, "PAR"
// page printer) decides; when it is empty the user's ticket printer (PortaTalao: "COM" serial,
// "LPT" page printer) does. Anything else prints nothing here: another workstation prints.
ViaCozinha EscolheViaCozinha(const QString& portaCozinha, const QString& portaTalao);

// What one poll did.
struct ResultadoPolling {
    QList<qint64> impressos;  // rows whose ticket went out, removed from the queue, in order
    QList<qint64> pendentes;  // released rows left in the queue for a later poll
    bool avisou = false;      // this poll told the person that the printer cannot be reached
};

// The kitchen poll of the main window: prints the released rows of the queue as tickets
// (consecutive rows of one table and kind under one header) and removes each row only once its
// ticket really went out. When the printer cannot be reached, the rows stay released, the next
// poll tries them again, and the person is warned once, not again until a ticket has printed.
class PollingCozinha {
  public:
    PollingCozinha(app::Estado& estado, devices::LinhaSerie& linha, MessagePort& mensagens)
        : estado_(estado), linha_(linha), mensagens_(mensagens) {}

    // One tick. A tick that starts while another is still running (the printout and the warning
    // let the message loop run) does nothing.
    ResultadoPolling tmrPedidos_Timer();

  private:
    // The printer of this poll.
    struct Destino {
        ViaCozinha via = ViaCozinha::Nenhuma;
        devices::DefinicaoImpressora serie;  // the serial way's model and port
        QString nomeWindows;                 // the page printer's name
    };

    // Prints one ticket and removes its rows as they go out; false (the poll stops) at the first
    // row that does not go out or cannot be removed.
    bool imprimeTalao(const QList<PedidoCopa>& talao, const Destino& destino,
                      ResultadoPolling& resultado);
    QString empregado(const QString& login);
    void avisa(ResultadoTalao falha, ResultadoPolling& resultado);

    app::Estado& estado_;
    devices::LinhaSerie& linha_;
    MessagePort& mensagens_;
    bool emCurso_ = false;
    bool avisado_ = false;
};

}  // namespace brasel::pos::cozinha
