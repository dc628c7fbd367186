#include "devices/impressao_serie.h"

#include <QCoreApplication>

namespace brasel::devices {

bool ImprimeNaSerie(LinhaSerie& linha, const DefinicaoImpressora& definicao,
                    const OpcoesImpressaoSerie& opcoes, const CorpoTalao& corpo) {
    CImpressoraTalao impressora;
    impressora.setCtrlInterface(&linha);
    if (!impressora.SetPortaComm(definicao.porta, kDefinicoesTalao)) return false;
    impressora.defineCodigos(definicao.codigos, opcoes.comGaveta);

    GuardaPorta guarda(linha);
    if (!guarda.obtida()) return false;
    impressora.SetInternationalCHR(definicao.codigos.internacional);
    impressora.Reset();
    for (int via = 1; via <= opcoes.vias && impressora.semFalhas(); ++via) {
        corpo(impressora, via);
        for (int i = 0; i < opcoes.saltaLinhas; ++i)
            impressora.ImprimeLinha(QStringLiteral(" "), true, 1, false);
        QCoreApplication::processEvents();
        impressora.CortaPapel();
        QCoreApplication::processEvents();
        impressora.Reset();
    }
    return impressora.semFalhas();
}

}  // namespace brasel::devices
