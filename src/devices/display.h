#pragma once

#include "devices/linha_serie.h"

#include <QByteArray>
#include <QString>

namespace brasel::devices {

// How a display model aligns a line (TabDisplay.Alinha1 / Alinha2): 0 leaves it, 1 pushes it
// to the right, any other value centres it.
inline constexpr int kAlinhaInalterado = 0;
inline constexpr int kAlinhaDireita = 1;

// The display has no accented letters: Ã Á À È Ê É Ì Í Ù Ú Ó Õ Ô Ò Ç and their small forms
// become plain letters; every other character (â, ª, º ...) is left as it is.
QString TiraAcentos(const QString& texto);

// The text a line shows: accents taken off, blanks trimmed at both ends, and when it is shorter
// than the line, blanks before it as the alignment asks (centring rounds half a blank to even).
// Nothing is added after the text and a longer text is not cut.
QString alinhaLinhaDisplay(const QString& texto, int alinhamento, int comprimento);

// The customer pole display of one model, written through the shared serial control. Each
// writing member takes the line for itself and gives it back, so the display never holds the
// port between calls; when a printout holds it, the output is skipped and false comes back.
class cDisplay {
  public:
    void ctrlInterface(LinhaSerie* linha) { linha_ = linha; }
    // False when the port cannot be set (no control, or a printout holds the line open).
    bool SetPortaComm(int porta, const QString& settings);

    bool CLSDisplay();
    bool InitDisplay();
    // Line 1 for line number 1, line 2 for any other number.
    bool Linha(const QString& texto, int alinhamento, int numeroLinha);
    bool SendCommand(const QByteArray& bytes);

    void ConfigCLSChar(const QByteArray& codigo) { limpa_ = codigo; }
    void ConfigInitDisplayChar(const QByteArray& codigo) { inicializa_ = codigo; }
    void ConfigLinha1IniChar(const QByteArray& codigo) { linha1Inicio_ = codigo; }
    void ConfigLinha2IniChar(const QByteArray& codigo) { linha2Inicio_ = codigo; }
    void ConfigLinha1FimChar(const QByteArray& codigo) { linha1Fim_ = codigo; }
    void ConfigLinha2FimChar(const QByteArray& codigo) { linha2Fim_ = codigo; }
    void ConfigSetComprimentoLinha(int comprimento) { comprimento_ = comprimento; }

  private:
    LinhaSerie* linha_ = nullptr;
    QByteArray limpa_;
    QByteArray inicializa_;
    QByteArray linha1Inicio_;
    QByteArray linha2Inicio_;
    QByteArray linha1Fim_;
    QByteArray linha2Fim_;
    int comprimento_ = 0;
};

}  // namespace brasel::devices
