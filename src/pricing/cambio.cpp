#include "pricing/cambio.h"

#include "db/query_helpers.h"

#include <QLocale>

namespace brasel::pricing {

namespace {

constexpr std::int64_t kMilionesimosPorValor = 100;  // Currency ten-thousandths to millionths

// A rate as an exact decimal: mantissa / 10^escala.
struct Taxa {
    __int128 mantissa = 0;
    int escala = 0;
};

std::optional<Taxa> lerTaxa(const QVariant& valor) {
    if (valor.isNull() || !valor.isValid()) return std::nullopt;
    const QString texto = valor.typeId() == QMetaType::Double
                              ? QLocale::c().toString(valor.toDouble(), 'f', 12)
                              : valor.toString().trimmed();
    Taxa taxa;
    bool negativo = false;
    bool ponto = false;
    bool algum = false;
    for (qsizetype i = 0; i < texto.size(); ++i) {
        const QChar c = texto[i];
        if (i == 0 && (c == u'-' || c == u'+')) {
            negativo = c == u'-';
        } else if (c == u'.' && !ponto) {
            ponto = true;
        } else if (c.isDigit() && taxa.escala < 18 && taxa.mantissa < (__int128{1} << 100)) {
            taxa.mantissa = taxa.mantissa * 10 + c.digitValue();
            if (ponto) ++taxa.escala;
            algum = true;
        } else if (!c.isDigit()) {
            return std::nullopt;
        }
    }
    if (!algum || taxa.mantissa == 0) return std::nullopt;
    if (negativo) taxa.mantissa = -taxa.mantissa;
    return taxa;
}

__int128 potencia10(int n) {
    __int128 p = 1;
    for (int k = 0; k < n; ++k)
        p *= 10;
    return p;
}

}  // namespace

QString ValorSeisDecimais::toText() const {
    const bool negativo = milionesimos < 0;
    const __int128 magnitude = negativo ? -static_cast<__int128>(milionesimos) : milionesimos;
    return QStringLiteral("%1%2.%3")
        .arg(negativo ? QStringLiteral("-") : QString())
        .arg(static_cast<std::uint64_t>(magnitude / 1000000))
        .arg(static_cast<std::uint64_t>(magnitude % 1000000), 6, 10, QLatin1Char('0'));
}

Currency ValorSeisDecimais::paraValor() const {
    return Currency::fromRaw(
        static_cast<std::int64_t>(divideTiesToEven(milionesimos, kMilionesimosPorValor)));
}

std::optional<ValorSeisDecimais> ConverteCambio_SEIS_Decimais(app::Estado& estado, Currency Valor,
                                                              const QString& Moeda,
                                                              const QString& Sentido,
                                                              db::Connection* conn) {
    const __int128 milionesimos = static_cast<__int128>(Valor.raw()) * kMilionesimosPorValor;
    const ValorSeisDecimais igual{static_cast<std::int64_t>(milionesimos)};
    const QString moeda = Moeda.trimmed().toUpper();
    if (moeda.isEmpty() || moeda == estado.param.cambiodef.trimmed().toUpper()) return igual;
    const bool entra = Sentido.trimmed() == u"+";
    if (!entra && Sentido.trimmed() != u"-") return igual;
    db::Connection& ligacao = estado.ligacao(conn);
    const auto linha = db::primeiraLinha(
        ligacao, QStringLiteral("select valor from Cambios where codigo=?"), {Moeda.trimmed()});
    const auto taxa = linha ? lerTaxa(linha->value(0)) : std::nullopt;
    if (!taxa) return igual;
    const auto formula =
        db::primeiraLinha(ligacao, QStringLiteral("select FormulaCalcCambioB from ParamGeral"));
    const bool inversa = formula && formula->value(0).toInt() == kCambioUnidadesPorMoedaEmpresa;
    const bool multiplica = entra != inversa;
    __int128 produto = 0;
    const __int128 factor = multiplica ? taxa->mantissa : potencia10(taxa->escala);
    if (__builtin_mul_overflow(milionesimos, factor, &produto)) return std::nullopt;
    const __int128 resultado =
        divideTiesToEven(produto, multiplica ? potencia10(taxa->escala) : taxa->mantissa);
    if (resultado > std::numeric_limits<std::int64_t>::max() ||
        resultado < std::numeric_limits<std::int64_t>::min()) {
        return std::nullopt;
    }
    return ValorSeisDecimais{static_cast<std::int64_t>(resultado)};
}

QString AcertaDecimais(const QString& Texto) {
    qsizetype digitos = 0;
    for (qsizetype i = Texto.size() - 1; i >= 0 && Texto[i].isDigit(); --i)
        ++digitos;
    if (digitos == 0 && Texto.endsWith(u'.')) return Texto + QStringLiteral("000000");
    if (digitos == Texto.size() || digitos == 0) return Texto + QStringLiteral(".000000");
    if (digitos >= 6) return Texto;
    return Texto + QString(6 - digitos, u'0');
}

}  // namespace brasel::pricing
