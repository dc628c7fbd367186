#include "devices/impressora_talao.h"

#include "devices/pagina_codigos.h"

namespace brasel::devices {

namespace {

const QByteArray kCr("\r");
const QByteArray kCrLf("\r\n");

}  // namespace

bool CImpressoraTalao::escreve(const QByteArray& bytes) {
    if (falhou_) return false;
    falhou_ = ctrlInterface_ == nullptr || !ctrlInterface_->Output(bytes);
    return !falhou_;
}

bool CImpressoraTalao::ImprimeLinha(const QString& texto, bool novaLinha, int tamanho, bool cor) {
    QByteArray linha = cor ? chrCOR1 : chrCOR0;
    if (tamanho == 1) {
        linha += chrSMALL_ON;
        linha += TraduzCaracteres(texto);
    } else if (tamanho == 2) {
        linha += chrMEDIUM_ON;
        linha += TraduzCaracteres(texto);
        linha += chrMEDIUM_OFF;
    } else {
        linha += chrLARGE_ON;
        linha += TraduzCaracteres(texto);
        linha += chrLARGE_OFF;
    }
    linha += novaLinha ? kCrLf : kCr;
    return escreve(linha);
}

bool CImpressoraTalao::ImprimeLinha_A(const QString& texto) {
    return escreve(TraduzCaracteres(texto));
}

bool CImpressoraTalao::CortaPapel() {
    return escreve(chrCORTE + kCr);
}

bool CImpressoraTalao::Reset() {
    return escreve(chrRESET + kCr);
}

bool CImpressoraTalao::FeedLinhas(int linhas) {
    if (linhas < 0 || linhas > 255) return false;
    return escreve(chrFEEDnLINES + static_cast<char>(linhas));
}

bool CImpressoraTalao::AbreCaixa() {
    return escreve(chrABRIRCAIXA);
}

bool CImpressoraTalao::SetPortaComm(int porta, const QString& settings) {
    // Both are refused while the line is open, so neither changes under another output.
    return ctrlInterface_ != nullptr && ctrlInterface_->setSettings(settings) &&
           ctrlInterface_->setCommPort(porta);
}

bool CImpressoraTalao::SetInternationalCHR(const QByteArray& codigo) {
    return escreve(codigo + kCr);
}

void CImpressoraTalao::defineCodigos(const CodigosImpressora& codigos, bool comGaveta) {
    chrFEEDnLINES = codigos.feedNLines;
    chrRESET = codigos.reset;
    chrSMALL_ON = codigos.smallOn;
    chrLARGE_ON = codigos.largeOn;
    chrLARGE_OFF = codigos.largeOff;
    chrMEDIUM_ON = codigos.mediumOn;
    chrCORTE = codigos.corte;
    chrCOR0 = codigos.cor0;
    chrCOR1 = codigos.cor1;
    chrABRIRCAIXA = comGaveta ? codigos.abrirCaixa : QByteArray();
}

}  // namespace brasel::devices
