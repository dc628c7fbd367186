#pragma once

#include "app/config_cfg.h"

#include <QByteArray>
#include <QSerialPort>
#include <QString>

#include <optional>

namespace brasel::devices {

// The way a serial line is framed: "9600,n,8,1" is 9600 baud, no parity, 8 data bits, 1 stop
// bit. Parity is one of n (none), o (odd), e (even), m (mark), s (space); stop bits 1, 1.5 or 2.
struct DefinicoesSerie {
    qint32 baud = 9600;
    QSerialPort::Parity paridade = QSerialPort::NoParity;
    QSerialPort::DataBits bitsDados = QSerialPort::Data8;
    QSerialPort::StopBits bitsParagem = QSerialPort::OneStop;

    // Nothing for a text that is not of that form (an unknown letter, 9 data bits, no baud).
    static std::optional<DefinicoesSerie> ler(const QString& texto);
    // Bits on the wire for one character: start, data, parity and stop bits.
    double bitsPorCaracter() const;
};

// The serial control: one port number, its settings text, an open flag and byte output, plus
// reading for the devices that answer (scales). The main window owns one, shared by the ticket
// printer, the customer display and the drawer; each printout or display output sets the port,
// holds it open through a GuardaPorta and closes it. Port n is the device the Config.cfg map
// names for "COMn".
class LinhaSerie {
  public:
    explicit LinhaSerie(app::MapaPortas mapa = {});
    ~LinhaSerie();
    LinhaSerie(const LinhaSerie&) = delete;
    LinhaSerie& operator=(const LinhaSerie&) = delete;

    int CommPort() const { return commPort_; }
    // Refused (false) while the line is open: a holder's port must not change under it.
    bool setCommPort(int porta);
    QString Settings() const { return settings_; }
    // Refused (false) while the line is open or for a text that DefinicoesSerie cannot read.
    bool setSettings(const QString& texto);

    // The device path of the current port.
    QString dispositivo() const { return mapa_.dispositivo(commPort_); }

    // False when the line is already open (somebody holds it) or the device cannot be opened.
    bool abrir();
    void fechar();
    bool aberta() const { return porta_.isOpen(); }

    // Sends every byte and waits until the system has taken them; false when the line is
    // closed, a write fails or the bytes are not taken within the time they need on the wire
    // (with a margin), as with a printer that is off or unplugged.
    bool Output(const QByteArray& bytes);

    // What arrived and was not read yet (nothing when closed).
    QByteArray lerDisponivel();
    // Waits until some byte is there to read, at most `milissegundos`; false on time-out or when
    // the line is closed. The wait sleeps in the system, it never spins.
    bool esperaDados(int milissegundos);
    // Forgets what arrived unread, before a question whose answer must be fresh.
    void limpaEntrada();

  private:
    app::MapaPortas mapa_;
    int commPort_ = 1;
    QString settings_ = QStringLiteral("9600,n,8,1");
    DefinicoesSerie definicoes_;
    QSerialPort porta_;
};

// Holds a line open for one printout, display output or drawer opening, and closes it at the
// end of the scope. When the line is already open (another output holds it) the guard is
// refused and leaves the line alone, so two outputs never interleave on the one port.
class GuardaPorta {
  public:
    explicit GuardaPorta(LinhaSerie& linha);
    ~GuardaPorta();
    GuardaPorta(const GuardaPorta&) = delete;
    GuardaPorta& operator=(const GuardaPorta&) = delete;

    bool obtida() const { return obtida_; }

  private:
    LinhaSerie& linha_;
    bool obtida_;
};

}  // namespace brasel::devices
