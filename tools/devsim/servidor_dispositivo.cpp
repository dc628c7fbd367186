#include "servidor_dispositivo.h"

#include <QFile>

#include <fcntl.h>
#include <poll.h>
#include <unistd.h>
#include <cerrno>
#include <chrono>

namespace devsim {

ServidorDispositivo::ServidorDispositivo(std::shared_ptr<Dispositivo> dispositivo, QString ligacao)
    : dispositivo_(std::move(dispositivo)), ligacao_(std::move(ligacao)) {
    dispositivo_->defineResponder([this](const QByteArray& bytes) { envia(bytes); });
    iniciar();
}

ServidorDispositivo::~ServidorDispositivo() {
    parar();
    dispositivo_->defineResponder({});
}

bool ServidorDispositivo::iniciar() {
    parar();
    std::unique_ptr<Pty> pty = Pty::abrir();
    if (!pty) return false;
    if (pipe2(acordar_, O_CLOEXEC) != 0) return false;
    if (!ligacao_.isEmpty()) {
        QFile::remove(ligacao_);
        if (!QFile::link(pty->caminhoEscravo(), ligacao_)) {
            ::close(acordar_[0]);
            ::close(acordar_[1]);
            acordar_[0] = acordar_[1] = -1;
            return false;
        }
    }
    {
        std::lock_guard escrita(mutexEscrita_);
        pty_ = std::move(pty);
    }
    leitor_ = std::thread(&ServidorDispositivo::escuta, this, pty_->mestre(), acordar_[0]);
    return true;
}

void ServidorDispositivo::parar() {
    if (leitor_.joinable()) {
        const char sinal = 1;
        while (::write(acordar_[1], &sinal, 1) < 0 && errno == EINTR) {
        }
        leitor_.join();
        ::close(acordar_[0]);
        ::close(acordar_[1]);
        acordar_[0] = acordar_[1] = -1;
    }
    std::lock_guard escrita(mutexEscrita_);
    if (pty_ && !ligacao_.isEmpty()) QFile::remove(ligacao_);
    pty_.reset();
}

bool ServidorDispositivo::activo() const {
    return leitor_.joinable();
}

QString ServidorDispositivo::caminho() const {
    return ligacao_.isEmpty() ? caminhoEscravo() : ligacao_;
}

QString ServidorDispositivo::caminhoEscravo() const {
    return pty_ ? pty_->caminhoEscravo() : QString();
}

void ServidorDispositivo::escuta(int mestre, int acordar) {
    char bloco[4096];
    for (;;) {
        pollfd fds[2] = {{mestre, POLLIN, 0}, {acordar, POLLIN, 0}};
        if (poll(fds, 2, -1) < 0) {
            if (errno == EINTR) continue;
            return;
        }
        if (fds[1].revents != 0) return;
        if ((fds[0].revents & POLLIN) == 0) return;  // the terminal broke: nothing more comes
        const ssize_t n = ::read(mestre, bloco, sizeof bloco);
        if (n < 0 && (errno == EINTR || errno == EAGAIN)) continue;
        if (n <= 0) return;
        const QByteArray bytes(bloco, static_cast<qsizetype>(n));
        {
            std::lock_guard guarda(mutex_);
            recebidos_ += bytes;
            dispositivo_->recebe(bytes);
        }
        chegou_.notify_all();
    }
}

QByteArray ServidorDispositivo::recebidos() const {
    std::lock_guard guarda(mutex_);
    return recebidos_;
}

QString ServidorDispositivo::transcricao() const {
    std::lock_guard guarda(mutex_);
    return dispositivo_->transcricao();
}

bool ServidorDispositivo::espera(const std::function<bool(const QByteArray&)>& condicao,
                                 int milissegundos) const {
    std::unique_lock guarda(mutex_);
    return chegou_.wait_for(guarda, std::chrono::milliseconds(milissegundos),
                            [&] { return condicao(recebidos_); });
}

bool ServidorDispositivo::esperaBytes(qsizetype total, int milissegundos) const {
    return espera([total](const QByteArray& r) { return r.size() >= total; }, milissegundos);
}

bool ServidorDispositivo::envia(const QByteArray& bytes) {
    std::lock_guard escrita(mutexEscrita_);
    if (!pty_) return false;
    qsizetype feitos = 0;
    while (feitos < bytes.size()) {
        const ssize_t n = ::write(pty_->mestre(), bytes.constData() + feitos,
                                  static_cast<size_t>(bytes.size() - feitos));
        if (n < 0 && errno == EINTR) continue;
        if (n <= 0) return false;
        feitos += n;
    }
    return true;
}

void ServidorDispositivo::comDispositivo(const std::function<void(Dispositivo&)>& accao) {
    std::lock_guard guarda(mutex_);
    accao(*dispositivo_);
}

}  // namespace devsim
