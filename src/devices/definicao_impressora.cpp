#include "devices/definicao_impressora.h"

#include "devices/codigo_impressora.h"

namespace brasel::devices {

namespace {

enum Coluna {
    kCodigo,
    kDescricao,
    kCom,
    kAbrirCaixa,
    kFeedNLines,
    kSmallOn,
    kMediumOn,
    kLargeOn,
    kLargeOff,
    kCorte,
    kCor0,
    kCor1,
    kReset,
    kInternacional,
};

QString texto(const QSqlRecord& linha, int coluna) {
    return linha.value(coluna).toString();
}

QByteArray codigo(const QSqlRecord& linha, int coluna) {
    return ConstroiCodigo(texto(linha, coluna));
}

}  // namespace

QString colunasImpTaloes() {
    return QStringLiteral(
        "Codigo,Descricao,COM,abrircaixa,feednlines,small_on,medium_on,large_on,large_off,"
        "corte,cor0,cor1,reset,setinternationalCHR");
}

DefinicaoImpressora definicaoDaLinha(const QSqlRecord& linha) {
    DefinicaoImpressora d;
    d.codigo = texto(linha, kCodigo);
    d.descricao = texto(linha, kDescricao);
    d.porta = portaDoTexto(texto(linha, kCom));
    CodigosImpressora& c = d.codigos;
    c.abrirCaixa = codigo(linha, kAbrirCaixa);
    c.feedNLines = codigo(linha, kFeedNLines);
    c.smallOn = codigo(linha, kSmallOn);
    c.mediumOn = codigo(linha, kMediumOn);
    c.largeOn = codigo(linha, kLargeOn);
    c.largeOff = codigo(linha, kLargeOff);
    c.corte = codigo(linha, kCorte);
    c.cor0 = codigo(linha, kCor0);
    c.cor1 = codigo(linha, kCor1);
    c.reset = codigo(linha, kReset);
    c.internacional = codigo(linha, kInternacional);
    return d;
}

int portaDoTexto(const QString& com) {
    const QString t = com.trimmed();
    qsizetype n = 0;
    while (n < t.size() && n < 9 && t.at(n) >= QLatin1Char('0') && t.at(n) <= QLatin1Char('9'))
        ++n;
    return t.left(n).toInt();
}

std::optional<DefinicaoImpressora> LerDefinicaoImpressora(db::Connection& conn,
                                                          const QString& codigo) {
    const auto linha = conn.firstRow(QStringLiteral("select ") + colunasImpTaloes() +
                                         QStringLiteral(" from ImpTaloes where Codigo=?"),
                                     {codigo});
    if (!linha) return std::nullopt;
    return definicaoDaLinha(*linha);
}

std::optional<DefinicaoImpressora> CarregaDefinicaoImpressora(db::Connection& conn,
                                                              const QString& codigo,
                                                              MessagePort& mensagens) {
    auto definicao = LerDefinicaoImpressora(conn, codigo);
    if (!definicao) {
        mensagens.mensagem(QStringLiteral("A T E N Ç Ã O !  Impressora de Talões não Configurada!"),
                           Icone::Critico);
    }
    return definicao;
}

std::optional<ConfigTalao> LerConfigTalao(db::Connection& conn, const QString& utilizador) {
    const auto linha = conn.firstRow(
        QStringLiteral("select PortaTalao,TipoImpTalao,SaltaLinhas,PausaImpressao,abrecaixa,"
                       "CaixaDinheiroPorDrive from UtilConfGeral where utilizador=?"),
        {utilizador});
    if (!linha) return std::nullopt;
    ConfigTalao c;
    c.portaTalao = linha->value(0).toString().trimmed();
    c.tipoImpTalao = linha->value(1).toString();
    c.saltaLinhas = std::max(0, linha->value(2).toInt());
    c.pausaImpressao = linha->value(3).toInt() == 1;
    c.abreCaixa = linha->value(4).toString().trimmed() == QStringLiteral("1");
    c.caixaDinheiroPorDrive = linha->value(5).toInt() == 1;
    return c;
}

}  // namespace brasel::devices
