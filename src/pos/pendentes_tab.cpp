#include "pos/pendentes_tab.h"

namespace brasel::pos {

QString PedeQuantidadePendente(Tab& tab, PerguntasTab& perguntas) {
    const std::optional<Currency> valor = perguntas.pedirValor(QStringLiteral("Quantidade"));
    if (valor && *valor > Currency{}) {
        tab.pendentes.quantidade = *valor;
        return QStringLiteral("Qty Alt.");
    }
    tab.pendentes.quantidade = Currency(1);
    return QStringLiteral("Qty");
}

QString PedePrecoPendente(Tab& tab, PerguntasTab& perguntas) {
    const std::optional<Currency> valor = perguntas.pedirValor(QStringLiteral("Preço"));
    if (!valor) {
        tab.pendentes.preco = Currency{};
        tab.pendentes.precoDefinido = false;
        return QStringLiteral("Preço");
    }
    tab.pendentes.preco = *valor;
    tab.pendentes.precoDefinido = true;
    return QStringLiteral("Preço Alt.");
}

void PedeObservacaoPendente(Tab& tab, PerguntasTab& perguntas) {
    const std::optional<QString> texto =
        perguntas.pedirTexto(QStringLiteral("Observações"), tab.pendentes.obs);
    if (texto) tab.pendentes.obs = *texto;
}

}  // namespace brasel::pos
