#include "db/schema/esquema.h"

#include "common/versao.h"
#include "db/schema/ddl.h"
#include "db/schema/definicao.h"

#include <QSqlRecord>

namespace brasel::db::schema {

namespace {

bool existeTabela(Connection& conn, const QString& tabela) {
    auto q = conn.exec(conn.dialect().tableExistsQuery(), {tabela});
    return q && q->next();
}

// The columns an existing table has, as the engine names them; one question per table.
QStringList colunasDe(Connection& conn, const QString& tabela) {
    QStringList nomes;
    if (auto q = conn.exec(QStringLiteral("select * from %1 where 1=0").arg(tabela))) {
        const QSqlRecord registo = q->record();
        for (int i = 0; i < registo.count(); ++i)
            nomes << registo.fieldName(i);
    }
    return nomes;
}

// -1 when the table cannot be read.
qint64 contaLinhas(Connection& conn, const QString& tabela) {
    auto q = conn.exec(QStringLiteral("select count(*) from ") + tabela);
    return q && q->next() ? q->value(0).toLongLong() : -1;
}

// Runs one statement of the upgrade; on failure keeps the reason with the statement.
bool executa(Connection& conn, const QString& sql, QString* erro) {
    if (conn.exec(sql)) return true;
    if (erro) *erro = conn.lastError() + QStringLiteral(" [") + sql + QLatin1Char(']');
    return false;
}

bool actualizaTabela(Connection& conn, const Tabela& tabela, QStringList& alteracoes,
                     QString* erro) {
    const Dialect& dialect = conn.dialect();
    if (!existeTabela(conn, tabela.nome)) {
        if (!executa(conn, criarTabelaSql(tabela, dialect), erro)) return false;
        alteracoes << QStringLiteral("Tabela criada: ") + tabela.nome;
    } else {
        const QStringList existentes = colunasDe(conn, tabela.nome);
        for (const Coluna& coluna : tabela.colunas) {
            if (existentes.contains(coluna.nome, Qt::CaseInsensitive)) continue;
            if (coluna.tipo == Tipo::Identidade) {
                if (erro) {
                    *erro = QStringLiteral(
                                "A tabela %1 não tem a coluna %2, que não pode ser "
                                "acrescentada a uma tabela existente.")
                                .arg(tabela.nome, coluna.nome);
                }
                return false;
            }
            if (!executa(conn, adicionarColunaSql(tabela, coluna, dialect), erro)) return false;
            alteracoes
                << QStringLiteral("Coluna acrescentada: %1.%2").arg(tabela.nome, coluna.nome);
        }
    }
    for (const Indice& indice : tabela.indices) {
        if (!executa(conn, criarIndiceSql(tabela, indice), erro)) return false;
    }
    if (tabela.umaLinha && contaLinhas(conn, tabela.nome) == 0) {
        if (!executa(conn, QStringLiteral("insert into %1 default values").arg(tabela.nome),
                     erro)) {
            return false;
        }
        alteracoes << QStringLiteral("Linha criada: ") + tabela.nome;
    }
    return true;
}

}  // namespace

QString versaoBaseDados(Connection& conn) {
    if (!existeTabela(conn, QStringLiteral("Actualiza"))) return {};
    auto q = conn.exec(QStringLiteral("select Versao from Actualiza"));
    return q && q->next() ? q->value(0).toString().trimmed() : QString();
}

bool actualizarEsquema(Connection& conn, QStringList* alteracoes, QString* erro) {
    WriteTransaction transaccao(conn);
    if (!transaccao.active()) {
        if (erro) *erro = conn.lastError();
        return false;
    }
    const QString versao = versaoBaseDados(conn);
    if (versao > versaoTexto12()) {
        if (erro) {
            *erro = QStringLiteral(
                        "A base de dados foi actualizada por uma versão do aplicativo "
                        "superior à sua (%1); nada foi alterado.")
                        .arg(versao);
        }
        return false;
    }
    QStringList feitas;
    for (const Tabela& tabela : tabelasEmpresa()) {
        if (!actualizaTabela(conn, tabela, feitas, erro)) return false;
    }
    auto convertida = conn.exec(QStringLiteral(
        "update ParamGeral set ConverteuNVARCHAR=1 where COALESCE(ConverteuNVARCHAR,0)=0"));
    if (!convertida) {
        if (erro) *erro = conn.lastError();
        return false;
    }
    if (convertida->numRowsAffected() > 0)
        feitas << QStringLiteral("Empresa marcada como convertida");
    if (versao != versaoTexto12()) {
        if (!conn.exec(QStringLiteral("update Actualiza set Versao=?"), {versaoTexto12()})) {
            if (erro) *erro = conn.lastError();
            return false;
        }
        feitas << QStringLiteral("Versão da base de dados: ") + versaoTexto12();
    }
    if (!transaccao.commit()) {
        if (erro) *erro = conn.lastError();
        return false;
    }
    if (alteracoes) *alteracoes << feitas;
    return true;
}

QStringList verificarEsquema(Connection& conn) {
    QStringList problemas;
    for (const Tabela& tabela : tabelasEmpresa()) {
        if (!existeTabela(conn, tabela.nome)) {
            problemas << QStringLiteral("Falta a tabela ") + tabela.nome;
            continue;
        }
        const QStringList existentes = colunasDe(conn, tabela.nome);
        for (const Coluna& coluna : tabela.colunas) {
            if (!existentes.contains(coluna.nome, Qt::CaseInsensitive)) {
                problemas << QStringLiteral("Falta a coluna %1.%2").arg(tabela.nome, coluna.nome);
            }
        }
        if (tabela.umaLinha) {
            const qint64 linhas = contaLinhas(conn, tabela.nome);
            if (linhas != 1) {
                problemas << QStringLiteral("A tabela %1 deve ter uma linha e tem %2")
                                 .arg(tabela.nome)
                                 .arg(linhas);
            }
        }
    }
    return problemas;
}

}  // namespace brasel::db::schema
