#include "db/query_helpers.h"

#include "common/currency.h"

#include <QSqlField>

namespace brasel::db {

namespace {

// Val(): the number at the start of a text ("12ab" is 12, "ab" is 0).
Currency valorInicial(const QString& texto) {
    const QString t = texto.trimmed();
    int fim = 0;
    if (fim < t.size() && (t[fim] == QLatin1Char('-') || t[fim] == QLatin1Char('+'))) ++fim;
    bool ponto = false;
    while (fim < t.size() && (t[fim].isDigit() || (!ponto && t[fim] == QLatin1Char('.')))) {
        if (t[fim] == QLatin1Char('.')) ponto = true;
        ++fim;
    }
    const auto valor = Currency::parse(t.left(fim));
    return valor ? *valor : Currency();
}

QString maisUm(const QVariant& maximo) {
    try {
        return (Currency::fromVariant(maximo) + Currency(1)).toPlainText();
    } catch (const CurrencyOverflow&) {
        return {};
    }
}

}  // namespace

std::optional<QSqlRecord> primeiraLinha(Connection& conn, const QString& sql,
                                        const QVariantList& valores) {
    return conn.firstRow(sql, valores);
}

QString Select_Campo_str(Sessao& sessao, const QString& tabela, const QString& campo,
                         const QString& campoChave, const QString& valorChave,
                         const Condicao& extra, Connection* conn) {
    QString sql = QStringLiteral("select ") + campo + QStringLiteral(" from ") + tabela;
    QVariantList valores;
    if (!campoChave.isEmpty() || !valorChave.isEmpty()) {
        sql += QStringLiteral(" where ") + campoChave + QStringLiteral("=? ") + extra.sql;
        valores << valorChave;
        valores += extra.valores;
    }
    sql += QStringLiteral(" limit 1");
    const auto linha = primeiraLinha(sessao.ligacao(conn), sql, valores);
    if (!linha || linha->isEmpty()) return {};
    const QVariant valor = linha->value(0);
    return valor.isNull() ? QString() : valor.toString();
}

QVariant Select_Retorna_Campo_var(Sessao& sessao, const QString& sql, const QVariantList& valores,
                                  const QString& campo, Connection* conn, bool numerico) {
    const auto linha = primeiraLinha(sessao.ligacao(conn), sql, valores);
    const QVariant vazio = numerico ? QVariant(0) : QVariant(QString());
    if (!linha || linha->indexOf(campo) < 0) return vazio;
    return linha->value(campo);
}

bool Ver_Se_Existe_Tabela_bln(Sessao& sessao, Connection* conn, const QString& tabela) {
    Connection& c = sessao.ligacao(conn);
    return primeiraLinha(c, c.dialect().tableExistsQuery(), {tabela}).has_value();
}

bool Existe_Coluna_bln(Sessao& sessao, Connection* conn, const QString& tabela,
                       const QString& coluna) {
    Connection& c = sessao.ligacao(conn);
    return primeiraLinha(c, c.dialect().columnExistsQuery(), {tabela, coluna}).has_value();
}

bool Adiciona_Coluna(Sessao& sessao, Connection* conn, const QString& tabela,
                     const QString& definicao) {
    return sessao.ligacao(conn)
        .exec(QStringLiteral("alter table ") + tabela + QStringLiteral(" add ") + definicao)
        .has_value();
}

bool RecordsetVazio_bln(QSqlQuery& rs) {
    if (!rs.isActive()) return true;
    if (rs.isValid()) return false;
    return !rs.next();
}

QString ProximoCodigoNumerico(Sessao& sessao, const QString& tabela, const QString& campo,
                              const Condicao& extra, Connection* conn) {
    Connection& c = sessao.ligacao(conn);
    // Only codes that are whole numbers count; the maximum is taken on their numeric value,
    // so "9" < "10".
    const QString sql = QStringLiteral("select max(cast(") + campo +
                        QStringLiteral(" as numeric)) from ") + tabela + QStringLiteral(" where ") +
                        c.dialect().numericTextCondition(campo) + QLatin1Char(' ') + extra.sql;
    const auto linha = primeiraLinha(c, sql, extra.valores);
    if (!linha || linha->value(0).isNull()) return QStringLiteral("1");
    return maisUm(linha->value(0));
}

QString GetProximoCodigo(Sessao& sessao, Connection* conn, const QString& tabela,
                         const QString& campo) {
    const auto linha =
        primeiraLinha(sessao.ligacao(conn), QStringLiteral("select coalesce(max(") + campo +
                                                QStringLiteral("),'') from ") + tabela);
    if (!linha) return QStringLiteral("1");
    try {
        return (valorInicial(linha->value(0).toString()) + Currency(1)).toPlainText();
    } catch (const CurrencyOverflow&) {
        return {};
    }
}

QDateTime Get_DataSysServer(Sessao& sessao, Connection* conn) {
    Connection& c = sessao.ligacao(conn);
    if (c.isOpen()) {
        const auto linha =
            primeiraLinha(c, QStringLiteral("select ") + c.dialect().serverTimeExpression());
        if (linha) {
            const QDateTime quando = QDateTime::fromString(linha->value(0).toString(),
                                                           QStringLiteral("yyyy-MM-dd HH:mm:ss"));
            if (quando.isValid()) return quando;
        }
    }
    return QDateTime::currentDateTime();
}

QString Get_DataServer(Sessao& sessao, Connection* conn) {
    return Get_DataSysServer(sessao, conn).toString(QStringLiteral("dd-MM-yyyy"));
}

QString Get_DataSysServer_InsertIntoSQL(Sessao& sessao, Connection* conn) {
    return textoDataSys(Get_DataSysServer(sessao, conn));
}

QString Select_Retorna_GData(const QString& campo, const QString& alias) {
    const QString nome = alias.isEmpty() ? campo + QStringLiteral("M") : alias;
    return QStringLiteral("substr(%1,9,2) || '-' || substr(%1,6,2) || '-' || substr(%1,1,4) as %2")
        .arg(campo, nome);
}

QString textoDataSys(const QDateTime& when) {
    return when.toString(QStringLiteral("yyyy-MM-dd HH:mm:ss"));
}

}  // namespace brasel::db
