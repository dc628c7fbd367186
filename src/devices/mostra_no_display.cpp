#include "devices/mostra_no_display.h"

#include "common/currency.h"
#include "db/query_helpers.h"
#include "devices/codigo_impressora.h"
#include "devices/display.h"

namespace brasel::devices {

namespace {

// The display's line is fixed at 9600 baud, no parity, 8 data bits, 1 stop bit.
const QString kSettingsDisplay = QStringLiteral("9600,n,8,1");

// The decimal separator of an amount's text, or '\0' when it has none: a single "." or ","
// is one; a separator repeated, or followed by the other kind, groups thousands.
QChar separadorDecimal(const QString& texto) {
    const qsizetype ponto = texto.lastIndexOf(QLatin1Char('.'));
    const qsizetype virgula = texto.lastIndexOf(QLatin1Char(','));
    if (ponto < 0 && virgula < 0) return QChar();
    const QChar ultimo = ponto > virgula ? QLatin1Char('.') : QLatin1Char(',');
    const bool ambos = ponto >= 0 && virgula >= 0;
    return ambos || texto.count(ultimo) == 1 ? ultimo : QChar();
}

}  // namespace

std::optional<DefinicaoDisplay> displayDoUtilizador(db::Connection& conn,
                                                    const QString& utilizador) {
    const auto uso = db::primeiraLinha(
        conn,
        QStringLiteral("select UsaDisplay, CodigoDisplay from UtilConfGeral where utilizador=?"),
        {utilizador});
    if (!uso || uso->value(0).toString().trimmed() != QStringLiteral("1")) return std::nullopt;
    const auto linha = db::primeiraLinha(
        conn,
        QStringLiteral("select Porta, NumLetras, Limpa, InitMostrador, InitLinha1, FimLinha1, "
                       "InitLinha2, FimLinha2, Alinha1, Alinha2 from TabDisplay where Codigo=?"),
        {uso->value(1).toString()});
    if (!linha) return std::nullopt;
    DefinicaoDisplay d;
    d.porta = linha->value(0).toInt();
    d.numLetras = linha->value(1).toInt();
    d.limpa = ConstroiCodigo(linha->value(2).toString());
    d.inicializa = ConstroiCodigo(linha->value(3).toString());
    d.linha1Inicio = ConstroiCodigo(linha->value(4).toString());
    d.linha1Fim = ConstroiCodigo(linha->value(5).toString());
    d.linha2Inicio = ConstroiCodigo(linha->value(6).toString());
    d.linha2Fim = ConstroiCodigo(linha->value(7).toString());
    d.alinha1 = linha->value(8).toInt();
    d.alinha2 = linha->value(9).toInt();
    return d;
}

QString valorDisplay(const QString& texto) {
    QString numero = texto.trimmed();
    const QChar decimal = separadorDecimal(numero);
    for (QChar separador : {QLatin1Char('.'), QLatin1Char(',')}) {
        if (separador != decimal) numero.remove(separador);
    }
    if (!decimal.isNull()) numero.replace(decimal, QLatin1Char('.'));
    const auto valor = Currency::parse(numero);
    return valor ? valor->toPlainText() : QString();
}

QString linha2Display(const QString& quantidade, const QString& preco, const QString& total,
                      const QString& moeda, int numLetras) {
    QString linha;
    if (!quantidade.isEmpty()) linha += quantidade + QLatin1Char('x');
    if (!preco.isEmpty()) linha += preco + QLatin1Char(' ') + moeda;
    const QString fim = total.isEmpty() ? QString() : total + QLatin1Char(' ') + moeda;
    const qsizetype brancos = numLetras - linha.size() - fim.size();
    if (brancos > 0) linha += QString(brancos, QLatin1Char(' '));
    return linha + fim;
}

bool MostraNoDisplay(app::Estado& estado, LinhaSerie& linha, const QString& primeiraLinha,
                     const QString& total, const QString& preco, const QString& quantidade,
                     const QString& moeda) {
    const auto definicao = displayDoUtilizador(estado.gConn, estado.gUtilizador);
    if (!definicao) return false;
    cDisplay display;
    display.ctrlInterface(&linha);
    display.SetPortaComm(definicao->porta, kSettingsDisplay);
    display.ConfigSetComprimentoLinha(definicao->numLetras);
    display.ConfigCLSChar(definicao->limpa);
    display.ConfigInitDisplayChar(definicao->inicializa);
    display.ConfigLinha1IniChar(definicao->linha1Inicio);
    display.ConfigLinha1FimChar(definicao->linha1Fim);
    display.ConfigLinha2IniChar(definicao->linha2Inicio);
    display.ConfigLinha2FimChar(definicao->linha2Fim);

    const QString linha1 = primeiraLinha.left(std::max(0, definicao->numLetras));
    const QString linha2 = linha2Display(valorDisplay(quantidade), valorDisplay(preco),
                                         valorDisplay(total), moeda, definicao->numLetras);
    const bool limpo = display.CLSDisplay();
    const bool primeira = display.Linha(linha1, definicao->alinha1, 1);
    const bool segunda = display.Linha(linha2, definicao->alinha2, 2);
    return limpo && primeira && segunda;
}

bool MostraAguardeNoDisplay(app::Estado& estado, LinhaSerie& linha) {
    return MostraNoDisplay(estado, linha, QString::fromUtf8(kDisplayAguarde));
}

bool MostraEncerradoNoDisplay(app::Estado& estado, LinhaSerie& linha) {
    return MostraNoDisplay(estado, linha, QString::fromUtf8(kDisplayEncerrado));
}

}  // namespace brasel::devices
