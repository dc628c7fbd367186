#pragma once

#include "devices/definicao_impressora.h"
#include "devices/linha_serie.h"

#include <QByteArray>
#include <QString>

namespace brasel::devices {

// A serial ticket printer for one printout (or one drawer opening): it writes texts and the
// codes of its model to the serial control it is given. Every write goes out whole in one
// Output; after the first write that fails (port closed, printer off or unplugged) nothing more
// is sent, and semFalhas() tells the printout that it did not really go out.
class CImpressoraTalao {
  public:
    // One line: colour code, size-on code, the translated text, size-off code, then CR LF with
    // `novaLinha`, CR alone without. Size 1 is small (there is no small-off code), 2 medium,
    // any other value large; colour true is the second colour.
    bool ImprimeLinha(const QString& texto, bool novaLinha, int tamanho, bool cor);
    // Only the translated text: no colour, size or line end.
    bool ImprimeLinha_A(const QString& texto);
    bool CortaPapel();
    bool Reset();
    // The feed prefix and one byte with the count; a count that is no byte sends nothing.
    bool FeedLinhas(int linhas);
    // The drawer code as it is, nothing after it.
    bool AbreCaixa();

    void setCtrlInterface(LinhaSerie* linha) { ctrlInterface_ = linha; }
    // Port number and settings of the serial control; false (and nothing changed) while another
    // output holds the line open or for settings that cannot be read.
    bool SetPortaComm(int porta, const QString& settings);
    bool SetInternationalCHR(const QByteArray& codigo);

    // The codes of a model, as a printout loads them; the drawer code only when the printout
    // may open the drawer.
    void defineCodigos(const CodigosImpressora& codigos, bool comGaveta);

    // Whether every write so far reached the line.
    bool semFalhas() const { return !falhou_; }

    QByteArray chrABRIRCAIXA;
    QByteArray chrFEEDnLINES;
    QByteArray chrSMALL_ON;
    QByteArray chrMEDIUM_ON;
    QByteArray chrMEDIUM_OFF;  // no printer definition holds it: empty unless a caller sets it
    QByteArray chrLARGE_ON;
    QByteArray chrLARGE_OFF;
    QByteArray chrRESET;
    QByteArray chrCORTE;
    QByteArray chrCOR0;
    QByteArray chrCOR1;

  private:
    bool escreve(const QByteArray& bytes);

    LinhaSerie* ctrlInterface_ = nullptr;
    bool falhou_ = false;
};

}  // namespace brasel::devices
