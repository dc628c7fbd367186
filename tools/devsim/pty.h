#pragma once

#include <QString>

#include <memory>

namespace devsim {

// A pseudo-terminal pair. The device plays on the master side; the program opens the slave
// path as if it were a serial port. The slave is also held open here, in raw mode, so that the
// master does not report a hang-up while the program has the port closed, and so that bytes
// pass untouched until the program sets its own line settings.
class Pty {
  public:
    // Nothing when the system has no pseudo-terminal to give.
    static std::unique_ptr<Pty> abrir();
    ~Pty();
    Pty(const Pty&) = delete;
    Pty& operator=(const Pty&) = delete;

    int mestre() const { return mestre_; }
    QString caminhoEscravo() const { return caminho_; }

  private:
    Pty(int mestre, int escravo, QString caminho);

    int mestre_;
    int escravo_;
    QString caminho_;
};

}  // namespace devsim
