#include "db/schema/ddl.h"

#include <QStringList>

namespace brasel::db::schema {

QString tipoSql(const Coluna& coluna, const Dialect& dialect) {
    switch (coluna.tipo) {
        case Tipo::Texto:
            return dialect.textType();
        case Tipo::Inteiro:
            return dialect.integerType();
        case Tipo::Inteiro64:
            return QStringLiteral("BIGINT");
        case Tipo::Montante:
            return dialect.amountType();
        case Tipo::Cambio:
            return dialect.rateType();
        case Tipo::Quantidade10:
            return QStringLiteral("NUMERIC(19,10)");
        case Tipo::Imagem:
            return dialect.blobType();
        case Tipo::Identidade:
            return dialect.identityColumn();
    }
    return {};
}

namespace {

QString defeitoSql(const Coluna& coluna) {
    if (!coluna.defeito.isEmpty()) return coluna.defeito;
    switch (coluna.tipo) {
        case Tipo::Texto:
            return QStringLiteral("''");
        case Tipo::Inteiro:
        case Tipo::Inteiro64:
        case Tipo::Montante:
        case Tipo::Cambio:
        case Tipo::Quantidade10:
            return QStringLiteral("0");
        case Tipo::Imagem:
        case Tipo::Identidade:
            return {};
    }
    return {};
}

}  // namespace

QString colunaSql(const Coluna& coluna, const Dialect& dialect) {
    QString sql = coluna.nome + QLatin1Char(' ') + tipoSql(coluna, dialect);
    const QString defeito = defeitoSql(coluna);
    if (!defeito.isEmpty()) sql += QStringLiteral(" DEFAULT ") + defeito;
    return sql;
}

QString criarTabelaSql(const Tabela& tabela, const Dialect& dialect) {
    QStringList colunas;
    for (const Coluna& coluna : tabela.colunas)
        colunas << colunaSql(coluna, dialect);
    return QStringLiteral("CREATE TABLE ") + tabela.nome + QStringLiteral(" (") +
           colunas.join(QStringLiteral(", ")) + QLatin1Char(')');
}

QString adicionarColunaSql(const Tabela& tabela, const Coluna& coluna, const Dialect& dialect) {
    return QStringLiteral("ALTER TABLE ") + tabela.nome + QStringLiteral(" ADD COLUMN ") +
           colunaSql(coluna, dialect);
}

QString nomeIndice(const Tabela& tabela, const Indice& indice) {
    return ((indice.unico ? QStringLiteral("ux_") : QStringLiteral("ix_")) + tabela.nome +
            QLatin1Char('_') + indice.colunas.join(QLatin1Char('_')))
        .toLower();
}

QString criarIndiceSql(const Tabela& tabela, const Indice& indice) {
    QString sql = (indice.unico ? QStringLiteral("CREATE UNIQUE INDEX IF NOT EXISTS ")
                                : QStringLiteral("CREATE INDEX IF NOT EXISTS ")) +
                  nomeIndice(tabela, indice) + QStringLiteral(" ON ") + tabela.nome +
                  QStringLiteral(" (") + indice.colunas.join(QStringLiteral(", ")) +
                  QLatin1Char(')');
    if (!indice.condicao.isEmpty()) sql += QStringLiteral(" WHERE ") + indice.condicao;
    return sql;
}

}  // namespace brasel::db::schema
