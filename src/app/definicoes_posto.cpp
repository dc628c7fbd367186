#include "app/definicoes_posto.h"

#include "common/cls_encripta.h"
#include "common/settings_store.h"

#include <QDate>

#include <optional>

namespace brasel::app {

namespace {

const QString kAppBrasel = QStringLiteral("Brasel");
const QString kAppMontiva = QStringLiteral("Montiva");
const QString kSeccaoAutenticacao = QStringLiteral("Autenticação");
const QString kNivelGrupos = QStringLiteral("TABGRUPOPRO");
constexpr QRgb kCorJanela = 0x404040;

std::optional<int> inteiro(const QString& texto) {
    bool ok = false;
    const int v = texto.trimmed().toInt(&ok);
    return ok ? std::optional<int>(v) : std::nullopt;
}

QString chaveEntrada(const char* nome, int n) {
    return QString::fromLatin1(nome) + QString::number(n);
}

}  // namespace

QString ChavePosto::lerTexto(const QString& omissao) const {
    return GetSetting(kAppBrasel, seccao(), chave(), omissao);
}

bool ChavePosto::gravarTexto(const QString& valor) const {
    return SaveSetting(kAppBrasel, seccao(), chave(), valor);
}

bool DefFlag::ler() const {
    return lerTexto(QString()).trimmed() == QLatin1String("1");
}

bool DefFlag::gravar(bool ligado) const {
    return gravarTexto(ligado ? QStringLiteral("1") : QStringLiteral("0"));
}

int DefInteiro::ler() const {
    const auto v = inteiro(lerTexto(QString()));
    return v && *v >= minimo_ && *v <= maximo_ ? *v : omissao_;
}

bool DefInteiro::gravar(int valor) const {
    return gravarTexto(QString::number(valor));
}

int DefGeometria::ler(int desenho) const {
    return inteiro(lerTexto(QString())).value_or(desenho);
}

bool DefGeometria::gravar(int valor) const {
    return gravarTexto(QString::number(valor));
}

QRect GeometriaJanela::ler(const QRect& desenho) const {
    const int w = w_.ler(desenho.width());
    const int h = h_.ler(desenho.height());
    const bool tamanhoValido = w > 0 && h > 0;
    return {l_.ler(desenho.left()), t_.ler(desenho.top()), tamanhoValido ? w : desenho.width(),
            tamanhoValido ? h : desenho.height()};
}

bool GeometriaJanela::gravar(const QRect& janela) const {
    // Every key is tried even when one fails.
    const bool l = l_.gravar(janela.left());
    const bool t = t_.gravar(janela.top());
    const bool w = w_.gravar(janela.width());
    const bool h = h_.gravar(janela.height());
    return l && t && w && h;
}

namespace {

std::optional<QString> nivelConhecido(const QString& valor) {
    const QString nivel = valor.trimmed().toUpper();
    if (nivel == kNivelGrupos || nivel == QLatin1String("TABFAMPRO") ||
        nivel == QLatin1String("TABSUBFAMPRO")) {
        return nivel;
    }
    return std::nullopt;
}

}  // namespace

QString DefNivelEmenta::ler() const {
    return nivelConhecido(lerTexto(kNivelGrupos)).value_or(kNivelGrupos);
}

bool DefNivelEmenta::gravar(const QString& nivel) const {
    const auto conhecido = nivelConhecido(nivel);
    return conhecido && gravarTexto(*conhecido);
}

QColor DefCorUtilizador::ler(const QString& utilizador) const {
    const QString texto =
        GetSetting(kAppBrasel, seccao(), chave() + utilizador).trimmed().remove(QLatin1Char('#'));
    bool ok = false;
    const uint rgb = texto.toUInt(&ok, 16);
    return ok && texto.size() <= 6 ? QColor::fromRgb(rgb) : QColor::fromRgb(kCorJanela);
}

bool DefCorUtilizador::gravar(const QString& utilizador, const QColor& cor) const {
    const QString texto =
        QStringLiteral("%1").arg(cor.rgb() & 0xFFFFFFu, 6, 16, QLatin1Char('0')).toUpper();
    return SaveSetting(kAppBrasel, seccao(), chave() + utilizador, texto);
}

QString DefAnoCorrente::ler() const {
    return lerTexto(QString::number(QDate::currentDate().year()));
}

QString EntradaServidor::password() const {
    return clsEncripta::Desencripta(0, clsEncripta::chaveEmpresas(), passwordCifrada);
}

void EntradaServidor::definirPassword(const QString& plain) {
    passwordCifrada = clsEncripta::Encripta(0, clsEncripta::chaveEmpresas(), plain);
}

ListaServidores lerServidores() {
    ListaServidores lista;
    for (int n = 1; n <= kEntradasServidor; ++n) {
        const auto ler = [n](const char* nome) {
            return GetSetting(kAppMontiva, kSeccaoAutenticacao, chaveEntrada(nome, n));
        };
        EntradaServidor& e = lista[static_cast<std::size_t>(n - 1)];
        e.servidor = ler("Servidor");
        e.login = ler("Login");
        e.passwordCifrada = ler("Password");
        e.tipoAutenticacao = ler("TipoAutenticacao").trimmed().toUpper();
        if (e.tipoAutenticacao.isEmpty()) e.tipoAutenticacao = QStringLiteral("SQL");
    }
    return lista;
}

bool gravarServidores(const ListaServidores& lista) {
    bool ok = true;
    for (int n = 1; n <= kEntradasServidor; ++n) {
        const EntradaServidor& e = lista[static_cast<std::size_t>(n - 1)];
        const auto gravar = [&](const char* nome, const QString& valor) {
            ok = SaveSetting(kAppMontiva, kSeccaoAutenticacao, chaveEntrada(nome, n), valor) && ok;
        };
        gravar("Servidor", e.servidor);
        gravar("Login", e.login);
        gravar("Password", e.passwordCifrada);
        gravar("TipoAutenticacao", e.tipoAutenticacao);
    }
    return ok;
}

}  // namespace brasel::app
