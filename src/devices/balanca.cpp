#include "devices/balanca.h"

#include "db/query_helpers.h"
#include "devices/balanca_cs300.h"
#include "devices/balanca_d70.h"

#include <QRegularExpression>

namespace brasel::devices {

namespace {

// The number a field starts with (blanks, then digits with at most one point), as decimal text;
// nothing when it starts with none. A sign is no digit: a negative entry reads as no number.
std::optional<Currency> numeroInicial(const QString& texto) {
    static const QRegularExpression inicio(QStringLiteral("^\\s*(\\d*)(?:\\.(\\d*))?"));
    const auto m = inicio.match(texto);
    const QString inteiros = m.captured(1);
    const QString decimais = m.captured(2);
    if (inteiros.isEmpty() && decimais.isEmpty()) return std::nullopt;
    return Currency::parse((inteiros.isEmpty() ? QStringLiteral("0") : inteiros) +
                           QLatin1Char('.') +
                           (decimais.isEmpty() ? QStringLiteral("0") : decimais));
}

bool modeloD70(const QString& tipoBalanca) {
    return tipoBalanca.trimmed().compare(QLatin1String(kBalancaD70), Qt::CaseInsensitive) == 0;
}

// A port number is a 16-bit integer.
constexpr std::int64_t kPortaMaxima = 32767;

}  // namespace

QString normalizaPortaCom(const QString& texto) {
    const auto valor = numeroInicial(texto);
    const std::int64_t porta = valor ? valor->raw() / Currency::kScale : 0;
    return porta > 0 && porta <= kPortaMaxima ? QString::number(porta) : QStringLiteral("1");
}

QString normalizaTimeOut(const QString& texto) {
    const auto valor = numeroInicial(texto);
    return valor && *valor > Currency() ? valor->toPlainText() : QStringLiteral("0.1");
}

DefinicoesBalanca DefinicoesBalanca::ler() {
    return {posto::MPortaCom.ler(), posto::MInicializar.ler(), posto::MTimeOut.ler(),
            posto::MTipoBalanca.ler()};
}

bool DefinicoesBalanca::gravar() const {
    const bool porta = posto::MPortaCom.gravar(portaCom);
    const bool inicializacao = posto::MInicializar.gravar(inicializar);
    const bool espera = posto::MTimeOut.gravar(timeOut);
    const bool tipo = posto::MTipoBalanca.gravar(tipoBalanca);
    return porta && inicializacao && espera && tipo;
}

int DefinicoesBalanca::porta() const {
    return normalizaPortaCom(portaCom).toInt();
}

double DefinicoesBalanca::segundos() const {
    return normalizaTimeOut(timeOut).toDouble();
}

bool DefinicoesBalanca::d70() const {
    return modeloD70(tipoBalanca);
}

std::unique_ptr<BalancaSerie> criaBalanca(const QString& tipoBalanca) {
    if (modeloD70(tipoBalanca)) return std::make_unique<clsD70>();
    return std::make_unique<clsCS300>();
}

ResultadoCaptura capturaPesagem(const DefinicoesBalanca& definicoes, LinhaSerie& linha,
                                Currency precoUnitario,
                                const std::function<void(const QString&)>& estado) {
    ResultadoCaptura resultado;
    const auto mostra = [&](const QString& texto) {
        resultado.estado = texto;
        if (estado) estado(texto);
    };
    mostra(QStringLiteral("Aguarde por Favor..."));
    mostra(definicoes.d70() ? QStringLiteral("Estabelecendo Ligação...")
                            : QStringLiteral("Inicializando..."));
    const std::unique_ptr<BalancaSerie> balanca = criaBalanca(definicoes.tipoBalanca);
    balanca->SetPortaComm(&linha, definicoes.porta(), definicoes.inicializar);
    balanca->OpenPort();
    const bool pesou = balanca->Pesagem(precoUnitario, Currency(), definicoes.segundos());
    balanca->ClosePort();
    if (!pesou) {
        // A status the scale does not explain still tells the person to try again.
        mostra(balanca->Erro().isEmpty() ? QString::fromUtf8(kErroSemCaptura) : balanca->Erro());
        return resultado;
    }
    resultado.capturada = true;
    resultado.peso = balanca->Peso();
    resultado.pvp = balanca->PVP();
    mostra(QStringLiteral("Captura efectuada   [ ") + resultado.peso.toText(3) +
           QStringLiteral(" ]"));
    return resultado;
}

std::optional<Currency> precoUnitarioBalanca(db::Connection& conn, Currency precoSemIva,
                                             const QString& tabIva, Currency precoComIva,
                                             double taxa) {
    const auto iva = db::primeiraLinha(
        conn, QStringLiteral("select Incluido from TabIva where codigo=?"), {tabIva});
    if (iva && iva->value(0).toString().trimmed() == QStringLiteral("1")) return precoComIva;
    try {
        return precoSemIva.withPercent(taxa);
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
}

Currency Balanca_cur(db::Connection& conn, PortaBalanca& dialogo, Currency precoSemIva,
                     const QString& tabIva, Currency precoComIva, double taxa) {
    const auto preco = precoUnitarioBalanca(conn, precoSemIva, tabIva, precoComIva, taxa);
    return preco ? dialogo.pesa(*preco) : Currency();
}

}  // namespace brasel::devices
