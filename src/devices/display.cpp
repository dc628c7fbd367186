#include "devices/display.h"

namespace brasel::devices {

namespace {

// Blanks only, as the display's text is trimmed.
QString semBrancosNasPontas(const QString& texto) {
    qsizetype inicio = 0;
    qsizetype fim = texto.size();
    while (inicio < fim && texto.at(inicio) == QLatin1Char(' '))
        ++inicio;
    while (fim > inicio && texto.at(fim - 1) == QLatin1Char(' '))
        --fim;
    return texto.mid(inicio, fim - inicio);
}

// Half of the spare room, a half blank rounded to even: 3 spare gives 2, 5 gives 2, 1 gives 0.
qsizetype metadeParaPar(qsizetype folga) {
    const qsizetype metade = folga / 2;
    if (folga % 2 == 0) return metade;
    return metade % 2 == 0 ? metade : metade + 1;
}

}  // namespace

QString TiraAcentos(const QString& texto) {
    static const QString acentuadas = QStringLiteral("ÃÁÀãáàÈÊÉèêéÌÍìíÙÚùúÓÕÔÒóõôòÇç");
    static const QString simples = QStringLiteral("AAAaaaEEEeeeIIiiUUuuOOOOooooCc");
    QString resultado = texto;
    for (QChar& c : resultado) {
        const qsizetype i = acentuadas.indexOf(c);
        if (i >= 0) c = simples.at(i);
    }
    return resultado;
}

QString alinhaLinhaDisplay(const QString& texto, int alinhamento, int comprimento) {
    const QString limpo = semBrancosNasPontas(TiraAcentos(texto));
    const qsizetype folga = comprimento - limpo.size();
    if (folga <= 0 || alinhamento == kAlinhaInalterado) return limpo;
    const qsizetype antes = alinhamento == kAlinhaDireita ? folga : metadeParaPar(folga);
    return QString(antes, QLatin1Char(' ')) + limpo;
}

bool cDisplay::SetPortaComm(int porta, const QString& settings) {
    if (linha_ == nullptr) return false;
    const bool portaDefinida = linha_->setCommPort(porta);
    const bool settingsDefinidas = linha_->setSettings(settings);
    return portaDefinida && settingsDefinidas;
}

bool cDisplay::SendCommand(const QByteArray& bytes) {
    if (linha_ == nullptr) return false;
    GuardaPorta guarda(*linha_);
    return guarda.obtida() && linha_->Output(bytes);
}

bool cDisplay::CLSDisplay() {
    return SendCommand(limpa_);
}

bool cDisplay::InitDisplay() {
    return SendCommand(inicializa_);
}

bool cDisplay::Linha(const QString& texto, int alinhamento, int numeroLinha) {
    // One byte a character: the display has no code page for anything beyond Latin-1.
    const QByteArray corpo = alinhaLinhaDisplay(texto, alinhamento, comprimento_).toLatin1();
    if (numeroLinha == 1) return SendCommand(linha1Inicio_ + corpo + linha1Fim_);
    return SendCommand(linha2Inicio_ + corpo + linha2Fim_);
}

}  // namespace brasel::devices
