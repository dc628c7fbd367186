#pragma once

#include "dispositivo.h"

#include <QByteArray>
#include <QMutex>
#include <QString>
#include <QStringList>

namespace devsim {

// The control codes of one display model, as bytes (what a TabDisplay row becomes). The
// defaults are those of the demo's two-line, 20-column display.
struct CodigosDisplay {
    QByteArray limpa = QByteArrayLiteral("\x0C");
    QByteArray inicializa = QByteArrayLiteral("\x1B@");
    QByteArray inicioLinha1 = QByteArrayLiteral("\x1BQA");
    QByteArray fimLinha1 = QByteArrayLiteral("\r");
    QByteArray inicioLinha2 = QByteArrayLiteral("\x1BQB");
    QByteArray fimLinha2 = QByteArrayLiteral("\r");
    int colunas = 20;
};

// A two-line customer pole display. It understands the codes it was built with and shows what
// each line received, cut to its columns as the glass would. The transcript keeps every event
// with the text as it arrived (uncut), so a test can tell what the program sent from what the
// customer sees:
//   [LIMPA]  [INICIA]  1|  Aguarde Por Favor|  2|2x3.5 EUR   7 EUR|  [?27]  (a stray byte)
class Display : public Dispositivo {
  public:
    explicit Display(CodigosDisplay codigos = {});

    void recebe(const QByteArray& bytes) override;
    QString transcricao() const override;

    // What the customer sees on line 1 and line 2 now.
    QString linha1() const;
    QString linha2() const;
    // The events so far, one a line of the transcript.
    QStringList eventos() const;

  private:
    enum class Modo { Comandos, Linha1, Linha2 };

    void processa();
    bool processaComando();
    bool processaTexto();
    void terminaLinha();

    const CodigosDisplay codigos_;
    mutable QMutex mutex_;
    QByteArray pendente_;
    Modo modo_ = Modo::Comandos;
    QByteArray texto_;  // text of the line being written, as received
    QString linhas_[2];
    QStringList eventos_;
};

}  // namespace devsim
