#include "common/versao.h"

namespace brasel {

int versaoMaior() {
    return BRASEL_VERSION_MAJOR;
}
int versaoMenor() {
    return BRASEL_VERSION_MINOR;
}
int versaoRevisao() {
    return BRASEL_VERSION_PATCH;
}

QString versaoTexto12(int maior, int menor, int revisao) {
    return QStringLiteral("%1%2%3")
        .arg(maior, 4, 10, QLatin1Char('0'))
        .arg(menor, 4, 10, QLatin1Char('0'))
        .arg(revisao, 4, 10, QLatin1Char('0'));
}

QString versaoTexto12() {
    return versaoTexto12(versaoMaior(), versaoMenor(), versaoRevisao());
}

QString versaoComPontos() {
    return QStringLiteral("%1.%2.%3").arg(versaoMaior()).arg(versaoMenor()).arg(versaoRevisao());
}

}  // namespace brasel
