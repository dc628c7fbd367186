#include "devices/formata_colunas.h"

#include <algorithm>

namespace brasel::devices {

namespace {

QString coluna(const QString& texto, int largura, const QString& alinhamento) {
    const QString t = texto.trimmed();
    if (t.isEmpty() || largura <= 0) return {};
    const QString cortado = t.left(largura);
    return alinhamento.trimmed().compare(QStringLiteral("D"), Qt::CaseInsensitive) == 0
               ? cortado.rightJustified(largura, QLatin1Char(' '))
               : cortado.leftJustified(largura, QLatin1Char(' '));
}

}  // namespace

QString FormataColunas(const QString& texto1, int largura1, const QString& alinhamento1,
                       const QString& texto2, int largura2, const QString& alinhamento2,
                       const QString& texto3, int largura3, const QString& alinhamento3) {
    return coluna(texto1, largura1, alinhamento1) + coluna(texto2, largura2, alinhamento2) +
           coluna(texto3, largura3, alinhamento3);
}

QString LinhaFixa(const QString& texto, int largura) {
    return texto.left(largura).leftJustified(largura, QLatin1Char(' '));
}

QString ValorTalao(Currency valor, int decimais) {
    return valor.toText(std::clamp(decimais, 0, 4)).replace(QLatin1Char('.'), QLatin1Char(','));
}

int DecimaisTalao(int decimaisImpTaloes, int casadec) {
    return decimaisImpTaloes > 0 ? decimaisImpTaloes : casadec;
}

QString LinhaTotal(const QString& rotulo, const QString& valor, int largura) {
    const QString v = valor.trimmed().left(largura);
    const int resto = largura - static_cast<int>(v.size());
    return rotulo.left(resto).leftJustified(resto, QLatin1Char(' ')) + v;
}

}  // namespace brasel::devices
