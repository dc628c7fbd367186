#include "common/ui/indicadores_tacteis.h"

#include <QAbstractItemView>
#include <QCheckBox>
#include <QProxyStyle>
#include <QRadioButton>

namespace brasel {

namespace {

constexpr int kIndicador = 30;

// A style sheet would do the same but cuts the windows' font off its children; a style that
// only answers the indicator sizes leaves everything else to the program's style.
class EstiloIndicadores : public QProxyStyle {
  public:
    int pixelMetric(PixelMetric metrica, const QStyleOption* opcao,
                    const QWidget* widget) const override {
        switch (metrica) {
            case PM_IndicatorWidth:
            case PM_IndicatorHeight:
            case PM_ExclusiveIndicatorWidth:
            case PM_ExclusiveIndicatorHeight:
                return kIndicador;
            default:
                return QProxyStyle::pixelMetric(metrica, opcao, widget);
        }
    }
};

}  // namespace

void aplicaIndicadoresTacteis(QWidget* janela) {
    auto* estilo = new EstiloIndicadores;
    estilo->setParent(janela);
    for (QCheckBox* w : janela->findChildren<QCheckBox*>())
        w->setStyle(estilo);
    for (QRadioButton* w : janela->findChildren<QRadioButton*>())
        w->setStyle(estilo);
    for (QAbstractItemView* w : janela->findChildren<QAbstractItemView*>())
        w->setStyle(estilo);
}

}  // namespace brasel
