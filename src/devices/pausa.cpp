#include "devices/pausa.h"

#include <QCoreApplication>
#include <QEventLoop>
#include <QThread>
#include <QTimer>

#include <algorithm>
#include <climits>

namespace brasel::devices {

void Pausa(int segundos) {
    if (segundos <= 0) return;
    const int ms = static_cast<int>(std::min<qint64>(qint64{segundos} * 1000, INT_MAX));
    if (QCoreApplication::instance() == nullptr) {
        QThread::msleep(static_cast<unsigned long>(ms));
        return;
    }
    QEventLoop espera;
    QTimer relogio;
    relogio.setSingleShot(true);
    relogio.setTimerType(Qt::PreciseTimer);
    QObject::connect(&relogio, &QTimer::timeout, &espera, &QEventLoop::quit);
    relogio.start(ms);
    espera.exec();
}

}  // namespace brasel::devices
