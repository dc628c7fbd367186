#pragma once

#include "dispositivo.h"
#include "pty.h"

#include <QByteArray>
#include <QString>

#include <condition_variable>
#include <functional>
#include <memory>
#include <mutex>
#include <thread>

namespace devsim {

// Runs one device on one pseudo-terminal: a thread of its own waits in the system for the bytes
// the program writes, hands them to the device and keeps them; the device's answers are
// written back to the program. With a link path, that path is made a symbolic link to the
// terminal, so the same path serves again after a restart (the COM map names the link).
class ServidorDispositivo {
  public:
    explicit ServidorDispositivo(std::shared_ptr<Dispositivo> dispositivo, QString ligacao = {});
    ~ServidorDispositivo();
    ServidorDispositivo(const ServidorDispositivo&) = delete;
    ServidorDispositivo& operator=(const ServidorDispositivo&) = delete;

    // Opens a new terminal (and points the link at it); false when none could be opened.
    bool iniciar();
    // Closes the terminal and removes the link, as a device that is switched off or unplugged:
    // a program still holding the port gets write errors, a later open finds nothing.
    void parar();
    bool activo() const;

    // The path the program opens: the link when there is one, otherwise the terminal itself.
    QString caminho() const;
    QString caminhoEscravo() const;

    // Every byte received since the start (restarts included).
    QByteArray recebidos() const;
    QString transcricao() const;
    // Waits until `condicao` holds for the bytes received so far, at most `milissegundos`.
    bool espera(const std::function<bool(const QByteArray&)>& condicao, int milissegundos) const;
    // Waits until at least `total` bytes were received.
    bool esperaBytes(qsizetype total, int milissegundos) const;

    // Bytes from the device to the program (a scale's reading sent on its own).
    bool envia(const QByteArray& bytes);
    // Runs `accao` on the device while no byte is being handed to it.
    void comDispositivo(const std::function<void(Dispositivo&)>& accao);

  private:
    void escuta(int mestre, int acordar);

    std::shared_ptr<Dispositivo> dispositivo_;
    QString ligacao_;
    std::unique_ptr<Pty> pty_;
    int acordar_[2] = {-1, -1};
    std::thread leitor_;

    mutable std::mutex mutex_;  // the device and the bytes received
    mutable std::condition_variable chegou_;
    QByteArray recebidos_;
    std::mutex mutexEscrita_;  // the terminal, against a restart while answering
};

}  // namespace devsim
