#include "pty.h"

#include <fcntl.h>
#include <stdlib.h>
#include <termios.h>
#include <unistd.h>

namespace devsim {

std::unique_ptr<Pty> Pty::abrir() {
    const int mestre = posix_openpt(O_RDWR | O_NOCTTY | O_CLOEXEC);
    if (mestre < 0) return nullptr;
    const char* nome = nullptr;
    if (grantpt(mestre) != 0 || unlockpt(mestre) != 0 || (nome = ptsname(mestre)) == nullptr) {
        ::close(mestre);
        return nullptr;
    }
    const QString caminho = QString::fromLocal8Bit(nome);
    const int escravo = ::open(nome, O_RDWR | O_NOCTTY | O_CLOEXEC);
    termios modo{};
    if (escravo < 0 || tcgetattr(escravo, &modo) != 0) {
        if (escravo >= 0) ::close(escravo);
        ::close(mestre);
        return nullptr;
    }
    cfmakeraw(&modo);
    cfsetispeed(&modo, B9600);
    cfsetospeed(&modo, B9600);
    tcsetattr(escravo, TCSANOW, &modo);
    return std::unique_ptr<Pty>(new Pty(mestre, escravo, caminho));
}

Pty::Pty(int mestre, int escravo, QString caminho)
    : mestre_(mestre), escravo_(escravo), caminho_(std::move(caminho)) {}

Pty::~Pty() {
    ::close(escravo_);
    ::close(mestre_);
}

}  // namespace devsim
