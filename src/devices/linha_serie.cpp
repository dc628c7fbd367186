#include "devices/linha_serie.h"

#include <QDeadlineTimer>
#include <QStringList>

#include <cmath>

namespace brasel::devices {

namespace {

// Beyond the time the bytes need on the wire, what a slow system may take to accept them.
constexpr int kMargemEnvioMs = 2000;

std::optional<QSerialPort::Parity> lerParidade(const QString& letra) {
    const QString l = letra.trimmed().toLower();
    if (l == QStringLiteral("n")) return QSerialPort::NoParity;
    if (l == QStringLiteral("o")) return QSerialPort::OddParity;
    if (l == QStringLiteral("e")) return QSerialPort::EvenParity;
    if (l == QStringLiteral("m")) return QSerialPort::MarkParity;
    if (l == QStringLiteral("s")) return QSerialPort::SpaceParity;
    return std::nullopt;
}

std::optional<QSerialPort::StopBits> lerBitsParagem(const QString& texto) {
    const QString t = texto.trimmed();
    if (t == QStringLiteral("1")) return QSerialPort::OneStop;
    if (t == QStringLiteral("1.5")) return QSerialPort::OneAndHalfStop;
    if (t == QStringLiteral("2")) return QSerialPort::TwoStop;
    return std::nullopt;
}

}  // namespace

std::optional<DefinicoesSerie> DefinicoesSerie::ler(const QString& texto) {
    const QStringList partes = texto.split(QLatin1Char(','));
    if (partes.size() != 4) return std::nullopt;
    bool okBaud = false;
    bool okDados = false;
    const int baud = partes[0].trimmed().toInt(&okBaud);
    const int dados = partes[2].trimmed().toInt(&okDados);
    const auto p = lerParidade(partes[1]);
    const auto s = lerBitsParagem(partes[3]);
    if (!okBaud || baud <= 0 || !okDados || dados < 5 || dados > 8 || !p || !s) {
        return std::nullopt;
    }
    return DefinicoesSerie{baud, *p, static_cast<QSerialPort::DataBits>(dados), *s};
}

double DefinicoesSerie::bitsPorCaracter() const {
    const double paragem = bitsParagem == QSerialPort::OneStop          ? 1.0
                           : bitsParagem == QSerialPort::OneAndHalfStop ? 1.5
                                                                        : 2.0;
    return 1.0 + static_cast<int>(bitsDados) + (paridade == QSerialPort::NoParity ? 0 : 1) +
           paragem;
}

LinhaSerie::LinhaSerie(app::MapaPortas mapa) : mapa_(std::move(mapa)) {}

LinhaSerie::~LinhaSerie() {
    fechar();
}

bool LinhaSerie::setCommPort(int porta) {
    if (aberta()) return false;
    commPort_ = porta;
    return true;
}

bool LinhaSerie::setSettings(const QString& texto) {
    if (aberta()) return false;
    const auto lidas = DefinicoesSerie::ler(texto);
    if (!lidas) return false;
    settings_ = texto;
    definicoes_ = *lidas;
    return true;
}

bool LinhaSerie::abrir() {
    if (aberta()) return false;
    const QString caminho = dispositivo();
    if (caminho.isEmpty()) return false;
    porta_.setPortName(caminho);
    if (!porta_.open(QIODevice::ReadWrite)) return false;
    const bool configurada =
        porta_.setBaudRate(definicoes_.baud) && porta_.setParity(definicoes_.paridade) &&
        porta_.setDataBits(definicoes_.bitsDados) && porta_.setStopBits(definicoes_.bitsParagem) &&
        porta_.setFlowControl(QSerialPort::NoFlowControl);
    if (!configurada) {
        porta_.close();
        return false;
    }
    return true;
}

void LinhaSerie::fechar() {
    if (porta_.isOpen()) porta_.close();
    porta_.clearError();
}

bool LinhaSerie::Output(const QByteArray& bytes) {
    if (!aberta()) return false;
    if (bytes.isEmpty()) return true;
    if (porta_.write(bytes) != bytes.size()) return false;
    const double segundos = bytes.size() * definicoes_.bitsPorCaracter() / definicoes_.baud;
    QDeadlineTimer prazo(static_cast<qint64>(std::ceil(segundos * 1000)) + kMargemEnvioMs);
    while (porta_.bytesToWrite() > 0) {
        if (!porta_.waitForBytesWritten(static_cast<int>(prazo.remainingTime()))) return false;
    }
    return true;
}

QByteArray LinhaSerie::lerDisponivel() {
    if (!aberta()) return {};
    // Without an event loop running, only a wait moves what the system holds into the port.
    if (porta_.bytesAvailable() == 0) porta_.waitForReadyRead(0);
    return porta_.readAll();
}

bool LinhaSerie::esperaDados(int milissegundos) {
    if (!aberta()) return false;
    if (porta_.bytesAvailable() > 0) return true;
    return porta_.waitForReadyRead(milissegundos);
}

void LinhaSerie::limpaEntrada() {
    if (!aberta()) return;
    lerDisponivel();
    porta_.clear(QSerialPort::Input);
}

GuardaPorta::GuardaPorta(LinhaSerie& linha) : linha_(linha), obtida_(linha.abrir()) {}

GuardaPorta::~GuardaPorta() {
    if (obtida_) linha_.fechar();
}

}  // namespace brasel::devices
