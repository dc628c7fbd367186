#pragma once

#include <QString>

namespace brasel {

// The program's version (major, minor, revision), as the build sets it.
int versaoMaior();
int versaoMenor();
int versaoRevisao();

// Each part zero-padded to 4 digits and joined: "000100000000" for 1.0.0. This is the text kept
// in Actualiza.Versao and compared with it.
QString versaoTexto12();
QString versaoTexto12(int maior, int menor, int revisao);
// "1.0.0".
QString versaoComPontos();

}  // namespace brasel
