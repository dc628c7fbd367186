#include "common/ui/estilo_tactil.h"

#include "app/definicoes_posto.h"

#include <QEvent>
#include <QPalette>
#include <QPushButton>

namespace brasel {

namespace {

// Saves the geometry of its window when it closes.
class GuardaGeometria : public QObject {
  public:
    GuardaGeometria(QWidget* janela, app::GeometriaJanela chaves)
        : QObject(janela), janela_(janela), chaves_(chaves) {
        janela->installEventFilter(this);
    }

  protected:
    bool eventFilter(QObject* alvo, QEvent* evento) override {
        if (alvo == janela_ &&
            (evento->type() == QEvent::Close || evento->type() == QEvent::Hide)) {
            chaves_.gravar(janela_->geometry());
        }
        return false;
    }

  private:
    QWidget* janela_;
    app::GeometriaJanela chaves_;
};

}  // namespace

void aplicaFonteTactil(QWidget* janela) {
    QFont fonte(app::posto::ConfigRest_Font.ler());
    fonte.setBold(true);
    fonte.setPointSize(qMax(12, janela->font().pointSize()));
    janela->setFont(fonte);
    for (QPushButton* botao : janela->findChildren<QPushButton*>()) {
        botao->setMinimumHeight(qMax(botao->minimumHeight(), 44));
    }
}

void aplicaCorFundo(QWidget* janela, const QString& utilizador) {
    QPalette paleta = janela->palette();
    paleta.setColor(QPalette::Window, app::posto::JanBackColor.ler(utilizador));
    paleta.setColor(QPalette::WindowText, Qt::white);
    janela->setPalette(paleta);
    janela->setAutoFillBackground(true);
}

void guardaGeometria(QWidget* janela, const app::GeometriaJanela& chaves) {
    janela->setGeometry(chaves.ler(janela->geometry()));
    new GuardaGeometria(janela, chaves);
}

}  // namespace brasel
