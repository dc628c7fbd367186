#pragma once

#include "common/message_port.h"
#include "db/connection.h"

#include <QByteArray>
#include <QSqlRecord>
#include <QString>

#include <optional>

namespace brasel::devices {

// The control codes of one ticket-printer model (a row of ImpTaloes), already turned into bytes.
struct CodigosImpressora {
    QByteArray abrirCaixa;
    QByteArray feedNLines;
    QByteArray smallOn;
    QByteArray mediumOn;
    QByteArray largeOn;
    QByteArray largeOff;
    QByteArray corte;
    QByteArray cor0;
    QByteArray cor1;
    QByteArray reset;
    QByteArray internacional;  // selects the printer's international character set
};

// A ticket printer as ImpTaloes defines it.
struct DefinicaoImpressora {
    QString codigo;
    QString descricao;
    int porta = 0;  // COM n
    CodigosImpressora codigos;
};

// The columns read for a definition, in the order definicaoDaLinha expects them.
QString colunasImpTaloes();
// A definition from a row selected with colunasImpTaloes().
DefinicaoImpressora definicaoDaLinha(const QSqlRecord& linha);

// The number a COM column holds: its leading digits after any blanks ("2", " 3x"); 0 when it
// starts with anything else.
int portaDoTexto(const QString& com);

// The definition `codigo` names; nothing when there is no such row or the query fails.
std::optional<DefinicaoImpressora> LerDefinicaoImpressora(db::Connection& conn,
                                                          const QString& codigo);
// The same for a printout: a missing definition is told to the person and the printout is off.
std::optional<DefinicaoImpressora> CarregaDefinicaoImpressora(db::Connection& conn,
                                                              const QString& codigo,
                                                              MessagePort& mensagens);

// The printing columns of a user's UtilConfGeral row.
struct ConfigTalao {
    QString portaTalao;    // "COM" serial ticket printer, "LPT" Windows printer
    QString tipoImpTalao;  // the ImpTaloes row of the serial printer
    int saltaLinhas = 0;   // blank lines before the cut
    bool pausaImpressao = false;
    bool abreCaixa = false;              // this user's printouts may open the drawer
    bool caixaDinheiroPorDrive = false;  // the drawer hangs on the Windows printer
};

// The row of `utilizador`; nothing when the user has none or the query fails.
std::optional<ConfigTalao> LerConfigTalao(db::Connection& conn, const QString& utilizador);

}  // namespace brasel::devices
