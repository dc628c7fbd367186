#pragma once

#include "devices/definicao_impressora.h"
#include "dispositivo.h"

#include <QByteArray>
#include <QChar>
#include <QList>
#include <QString>

namespace devsim {

// The character a printer set to code page 860 prints for `byte`.
QChar caracter860(unsigned char byte);

// A serial ticket printer of one model: it understands the codes of that model's printer
// definition and prints text in code page 860. Its transcript is the printed text, LF ending a
// line, with each code shown as a marker: [CHARSET] [RESET] [COR0] [COR1] [PEQUENO] [MEDIO]
// [GRANDE] [GRANDE-FIM] [CORTE] [GAVETA] [FEED n]. Any other control byte shows as [#n]; CR
// prints nothing. A code may arrive split across reads.
class ImpressoraTalao : public Dispositivo {
  public:
    explicit ImpressoraTalao(const brasel::devices::CodigosImpressora& codigos);

    void recebe(const QByteArray& bytes) override;
    QString transcricao() const override;

  private:
    struct Comando {
        QByteArray codigo;
        QString marcador;
    };
    enum class Leitura { Feito, Espera };
    Leitura leUm();
    static QString textoDoByte(unsigned char byte);

    QList<Comando> comandos_;
    QByteArray feed_;
    QByteArray pendente_;
    QString impresso_;
};

}  // namespace devsim
