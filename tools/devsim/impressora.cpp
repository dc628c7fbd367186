#include "impressora.h"

#include <array>

namespace devsim {

namespace {

// Code page 860 from 128 to 255.
constexpr std::array<char16_t, 128> kPagina860{
    u'\u00C7', u'\u00FC', u'\u00E9', u'\u00E2', u'\u00E3', u'\u00E0', u'\u00C1', u'\u00E7',
    u'\u00EA', u'\u00CA', u'\u00E8', u'\u00CD', u'\u00D4', u'\u00EC', u'\u00C3', u'\u00C2',
    u'\u00C9', u'\u00C0', u'\u00C8', u'\u00F4', u'\u00F5', u'\u00F2', u'\u00DA', u'\u00F9',
    u'\u00CC', u'\u00D5', u'\u00DC', u'\u00A2', u'\u00A3', u'\u00D9', u'\u20A7', u'\u00D3',
    u'\u00E1', u'\u00ED', u'\u00F3', u'\u00FA', u'\u00F1', u'\u00D1', u'\u00AA', u'\u00BA',
    u'\u00BF', u'\u00D2', u'\u00AC', u'\u00BD', u'\u00BC', u'\u00A1', u'\u00AB', u'\u00BB',
    u'\u2591', u'\u2592', u'\u2593', u'\u2502', u'\u2524', u'\u2561', u'\u2562', u'\u2556',
    u'\u2555', u'\u2563', u'\u2551', u'\u2557', u'\u255D', u'\u255C', u'\u255B', u'\u2510',
    u'\u2514', u'\u2534', u'\u252C', u'\u251C', u'\u2500', u'\u253C', u'\u255E', u'\u255F',
    u'\u255A', u'\u2554', u'\u2569', u'\u2566', u'\u2560', u'\u2550', u'\u256C', u'\u2567',
    u'\u2568', u'\u2564', u'\u2565', u'\u2559', u'\u2558', u'\u2552', u'\u2553', u'\u256B',
    u'\u256A', u'\u2518', u'\u250C', u'\u2588', u'\u2584', u'\u258C', u'\u2590', u'\u2580',
    u'\u03B1', u'\u00DF', u'\u0393', u'\u03C0', u'\u03A3', u'\u03C3', u'\u00B5', u'\u03C4',
    u'\u03A6', u'\u0398', u'\u03A9', u'\u03B4', u'\u221E', u'\u03C6', u'\u03B5', u'\u2229',
    u'\u2261', u'\u00B1', u'\u2265', u'\u2264', u'\u2320', u'\u2321', u'\u00F7', u'\u2248',
    u'\u00B0', u'\u2219', u'\u00B7', u'\u221A', u'\u207F', u'\u00B2', u'\u25A0', u'\u00A0',
};

}  // namespace

QChar caracter860(unsigned char byte) {
    return byte < 128 ? QChar(char16_t{byte}) : QChar(kPagina860[byte - 128]);
}

ImpressoraTalao::ImpressoraTalao(const brasel::devices::CodigosImpressora& c)
    : feed_(c.feedNLines) {
    const Comando todos[] = {
        {c.internacional, QStringLiteral("[CHARSET]")},
        {c.reset, QStringLiteral("[RESET]")},
        {c.cor0, QStringLiteral("[COR0]")},
        {c.cor1, QStringLiteral("[COR1]")},
        {c.smallOn, QStringLiteral("[PEQUENO]")},
        {c.mediumOn, QStringLiteral("[MEDIO]")},
        {c.largeOn, QStringLiteral("[GRANDE]")},
        {c.largeOff, QStringLiteral("[GRANDE-FIM]")},
        {c.corte, QStringLiteral("[CORTE]")},
        {c.abrirCaixa, QStringLiteral("[GAVETA]")},
    };
    for (const Comando& comando : todos) {
        if (!comando.codigo.isEmpty()) comandos_.append(comando);
    }
}

void ImpressoraTalao::recebe(const QByteArray& bytes) {
    pendente_ += bytes;
    while (!pendente_.isEmpty() && leUm() == Leitura::Feito) {
    }
}

QString ImpressoraTalao::transcricao() const {
    // Bytes still waiting to complete a code are shown as they are.
    QString texto = impresso_;
    for (const char byte : pendente_)
        texto += textoDoByte(static_cast<unsigned char>(byte));
    return texto;
}

// Takes the longest code at the start of what is pending, or one byte of text. Waits while the
// pending bytes could still grow into a longer code.
ImpressoraTalao::Leitura ImpressoraTalao::leUm() {
    qsizetype comprimento = 0;
    QString marcador;
    bool podeCrescer = false;
    for (const Comando& comando : comandos_) {
        if (pendente_.startsWith(comando.codigo) && comando.codigo.size() > comprimento) {
            comprimento = comando.codigo.size();
            marcador = comando.marcador;
        } else if (pendente_.size() < comando.codigo.size() &&
                   comando.codigo.startsWith(pendente_)) {
            podeCrescer = true;
        }
    }
    if (!feed_.isEmpty()) {
        if (pendente_.startsWith(feed_) && pendente_.size() > feed_.size()) {
            if (feed_.size() + 1 > comprimento) {
                comprimento = feed_.size() + 1;
                marcador = QStringLiteral("[FEED %1]")
                               .arg(static_cast<unsigned char>(pendente_.at(feed_.size())));
            }
        } else if (pendente_.size() <= feed_.size() && feed_.startsWith(pendente_)) {
            podeCrescer = true;
        }
    }
    if (podeCrescer) return Leitura::Espera;
    if (comprimento > 0) {
        impresso_ += marcador;
        pendente_.remove(0, comprimento);
        return Leitura::Feito;
    }
    impresso_ += textoDoByte(static_cast<unsigned char>(pendente_.at(0)));
    pendente_.remove(0, 1);
    return Leitura::Feito;
}

QString ImpressoraTalao::textoDoByte(unsigned char byte) {
    if (byte == '\n') return QStringLiteral("\n");
    if (byte == '\r') return {};
    if (byte < 32 || byte == 127) return QStringLiteral("[#%1]").arg(byte);
    return QString(caracter860(byte));
}

}  // namespace devsim
