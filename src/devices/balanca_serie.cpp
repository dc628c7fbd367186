#include "devices/balanca_serie.h"

#include <QCoreApplication>
#include <QDeadlineTimer>

#include <cmath>

namespace brasel::devices {

int milissegundosEspera(double segundos) {
    if (!std::isfinite(segundos) || segundos <= 0) return 0;
    const double ms = std::round(segundos * 1000);
    return ms >= kEsperaMaximaMs ? kEsperaMaximaMs : static_cast<int>(ms);
}

bool BalancaSerie::SetPortaComm(LinhaSerie* linha, int porta, const QString& settings) {
    linha_ = linha;
    configurada_ = linha_ != nullptr && linha_->setCommPort(porta) && linha_->setSettings(settings);
    return configurada_;
}

bool BalancaSerie::OpenPort() {
    return configurada_ && linha_->abrir();
}

void BalancaSerie::ClosePort() {
    if (linha_ != nullptr) linha_->fechar();
}

QByteArray BalancaSerie::pergunta(const QByteArray& pedido, double segundos,
                                  RespostaCompleta completa) {
    if (linha_ == nullptr || !linha_->aberta()) return {};
    linha_->limpaEntrada();
    linha_->Output(pedido);
    QCoreApplication::processEvents();
    const QDeadlineTimer prazo(milissegundosEspera(segundos));
    QByteArray resposta;
    while (linha_->aberta() && !completa(resposta) && !prazo.hasExpired()) {
        if (linha_->esperaDados(static_cast<int>(prazo.remainingTime()))) {
            resposta += linha_->lerDisponivel();
        }
    }
    return resposta;
}

}  // namespace brasel::devices
