#include "app/utilconfig_div.h"

#include "db/query_helpers.h"

namespace brasel::app {

namespace {

struct Texto {
    QString tipo;
    QString conteudo;
};

Texto paraTexto(const ValorDiv& valor) {
    return std::visit(
        [](const auto& v) -> Texto {
            using T = std::decay_t<decltype(v)>;
            if constexpr (std::is_same_v<T, Currency>) {
                return {QStringLiteral("Currency"), v.toPlainText()};
            } else if constexpr (std::is_same_v<T, std::int32_t>) {
                return {QStringLiteral("Long"), QString::number(v)};
            } else if constexpr (std::is_same_v<T, float>) {
                return {QStringLiteral("Single"), QString::number(v, 'g', 9)};
            } else if constexpr (std::is_same_v<T, std::int16_t>) {
                return {QStringLiteral("Integer"), QString::number(v)};
            } else if constexpr (std::is_same_v<T, double>) {
                return {QStringLiteral("Double"), QString::number(v, 'g', 17)};
            } else if constexpr (std::is_same_v<T, bool>) {
                return {QStringLiteral("Boolean"),
                        v ? QStringLiteral("True") : QStringLiteral("False")};
            } else {
                return {QStringLiteral("String"), v};
            }
        },
        valor);
}

ValorDiv deTexto(const QString& tipo, const QString& conteudo) {
    const QString t = tipo.trimmed();
    if (t == QStringLiteral("Currency")) {
        // Written with "." but older rows may hold "," as the decimal separator.
        QString texto = conteudo.trimmed();
        if (!texto.contains(QLatin1Char('.'))) texto.replace(QLatin1Char(','), QLatin1Char('.'));
        const auto valor = Currency::parse(texto);
        return valor ? *valor : Currency();
    }
    if (t == QStringLiteral("Long")) return static_cast<std::int32_t>(conteudo.trimmed().toLong());
    if (t == QStringLiteral("Integer"))
        return static_cast<std::int16_t>(conteudo.trimmed().toShort());
    if (t == QStringLiteral("Single")) return conteudo.trimmed().toFloat();
    if (t == QStringLiteral("Double")) return conteudo.trimmed().toDouble();
    if (t == QStringLiteral("Boolean")) {
        const QString b = conteudo.trimmed().toLower();
        return b == QStringLiteral("true") || b == QStringLiteral("1") || b == QStringLiteral("-1");
    }
    return conteudo;
}

}  // namespace

bool UtilConfig_Div_Guarda_bln(db::Sessao& sessao, const QString& utilizador,
                               const QString& nomeForm, const QString& chave,
                               const ValorDiv& valor) {
    db::Connection& conn = sessao.gConn;
    const Texto texto = paraTexto(valor);
    const QString agora = db::Get_DataSysServer_InsertIntoSQL(sessao);
    const QVariantList chaveLinha{utilizador, nomeForm, chave};
    const bool existe =
        db::primeiraLinha(conn,
                          QStringLiteral("select Chave from UtilConfig_Div where Utilizador=? and "
                                         "NomeForm=? and Chave=?"),
                          chaveLinha)
            .has_value();
    if (existe) {
        return conn
            .exec(QStringLiteral("update UtilConfig_Div set Conteudo=?, TipoConteudo=?, DataSys=? "
                                 "where Utilizador=? and NomeForm=? and Chave=?"),
                  QVariantList{texto.conteudo, texto.tipo, agora} + chaveLinha)
            .has_value();
    }
    return conn
        .exec(QStringLiteral("insert into UtilConfig_Div (Utilizador, NomeForm, Chave, Conteudo, "
                             "TipoConteudo, DataSys) values (?,?,?,?,?,?)"),
              chaveLinha + QVariantList{texto.conteudo, texto.tipo, agora})
        .has_value();
}

ValorDiv UtilConfig_Div_Retorna_var(db::Sessao& sessao, const QString& utilizador,
                                    const QString& nomeForm, const QString& chave) {
    const auto linha = db::primeiraLinha(
        sessao.gConn,
        QStringLiteral("select Conteudo, TipoConteudo from UtilConfig_Div where Utilizador=? and "
                       "NomeForm=? and Chave=?"),
        {utilizador, nomeForm, chave});
    if (!linha) return QString();
    return deTexto(linha->value(1).toString(), linha->value(0).toString());
}

}  // namespace brasel::app
