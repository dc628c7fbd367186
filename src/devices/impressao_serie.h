#pragma once

#include "devices/definicao_impressora.h"
#include "devices/impressora_talao.h"
#include "devices/linha_serie.h"

#include <QString>

#include <functional>

namespace brasel::devices {

// Every serial ticket printer is driven at 9600 baud, no parity, 8 data bits, 1 stop bit.
inline const QString kDefinicoesTalao = QStringLiteral("9600,n,8,1");

struct OpcoesImpressaoSerie {
    int vias = 1;            // copies
    int saltaLinhas = 0;     // blank lines before each cut
    bool comGaveta = false;  // the printout may send the drawer code (a receipt whose user and
                             // document type both open the drawer)
};

// Prints one copy's lines (ImprimeLinha, FeedLinhas, ...); `via` counts copies from 1.
using CorpoTalao = std::function<void(CImpressoraTalao& impressora, int via)>;

// The course of one serial printout on `linha`: the port of the definition at 9600,n,8,1, the
// character set and a reset, then for each copy its lines, the blank lines, the cut and a reset,
// and the port closed again. The message loop runs between the lines and the cut, so a timer
// may start another output meanwhile; that output finds the port held and is refused.
// True only when the port was obtained and every byte was written: a caller that must not lose
// a ticket (a queued kitchen order) keeps it until this says it went out.
bool ImprimeNaSerie(LinhaSerie& linha, const DefinicaoImpressora& definicao,
                    const OpcoesImpressaoSerie& opcoes, const CorpoTalao& corpo);

}  // namespace brasel::devices
