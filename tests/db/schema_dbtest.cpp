// The company schema on the embedded engine: what it creates, the keys it enforces, the defaults
// rows get, and bringing an older or damaged database up to date.
#include "common/versao.h"
#include "db/schema/ddl.h"
#include "db/schema/definicao.h"
#include "db/schema/esquema.h"
#include "support/empresa_teste.h"

#include <QRegularExpression>
#include <QSet>

#include <gtest/gtest.h>

namespace brasel::db::schema {
namespace {

QVariant valor(Connection& conn, const QString& sql, const QVariantList& valores = {}) {
    const auto linha = conn.firstRow(sql, valores);
    return linha ? linha->value(0) : QVariant();
}

// Names the definition writes unquoted must be plain identifiers that neither engine reserves.
TEST(DefinicaoEsquema, NamesAreUniquePlainIdentifiersAndKeysNameRealColumns) {
    static const QRegularExpression identificador(QStringLiteral("^[A-Za-z_][A-Za-z0-9_]*$"));
    const QSet<QString> reservadas = {
        QStringLiteral("select"), QStringLiteral("from"),   QStringLiteral("where"),
        QStringLiteral("order"),  QStringLiteral("group"),  QStringLiteral("user"),
        QStringLiteral("table"),  QStringLiteral("check"),  QStringLiteral("default"),
        QStringLiteral("limit"),  QStringLiteral("offset"), QStringLiteral("end"),
        QStringLiteral("to"),     QStringLiteral("desc"),   QStringLiteral("primary")};
    QSet<QString> tabelas;
    QSet<QString> indices;
    for (const Tabela& t : tabelasEmpresa()) {
        SCOPED_TRACE(t.nome.toStdString());
        EXPECT_TRUE(identificador.match(t.nome).hasMatch());
        EXPECT_FALSE(tabelas.contains(t.nome.toLower())) << "tabela repetida";
        tabelas.insert(t.nome.toLower());
        QSet<QString> colunas;
        int identidades = 0;
        for (const Coluna& c : t.colunas) {
            EXPECT_TRUE(identificador.match(c.nome).hasMatch()) << c.nome.toStdString();
            EXPECT_FALSE(reservadas.contains(c.nome.toLower())) << c.nome.toStdString();
            EXPECT_FALSE(colunas.contains(c.nome.toLower()))
                << "coluna repetida " << c.nome.toStdString();
            colunas.insert(c.nome.toLower());
            if (c.tipo == Tipo::Identidade) ++identidades;
        }
        EXPECT_EQ(identidades, 1);
        for (const Indice& i : t.indices) {
            for (const QString& c : i.colunas) {
                EXPECT_TRUE(colunas.contains(c.toLower()))
                    << "chave com coluna inexistente " << c.toStdString();
            }
            // One name per index, short enough for PostgreSQL not to cut it into another's.
            const QString nome = nomeIndice(t, i);
            EXPECT_LE(nome.size(), 63) << nome.toStdString();
            EXPECT_FALSE(indices.contains(nome)) << nome.toStdString();
            indices.insert(nome);
        }
    }
    // Tables the program reads before anything else.
    for (const char* nome : {"ParamGeral", "UtilConfGeral", "MovProduto", "MovCliente", "LogGeral",
                             "Actualiza", "LockFacCli", "LockCli", "TabTipoMov", "PontosConfig"}) {
        EXPECT_TRUE(tabelas.contains(QString::fromLatin1(nome).toLower())) << nome;
    }
}

TEST(EsquemaEmbutido, EveryTableAndColumnOfTheDefinitionCanBeRead) {
    testing::EmpresaTeste empresa;
    Connection& conn = empresa.estado().gConn;
    for (const Tabela& t : tabelasEmpresa()) {
        QStringList colunas;
        for (const Coluna& c : t.colunas)
            colunas << c.nome;
        EXPECT_TRUE(conn.exec(QStringLiteral("select %1 from %2 where 1=0")
                                  .arg(colunas.join(QLatin1Char(',')), t.nome)))
            << t.nome.toStdString() << ": " << conn.lastError().toStdString();
    }
    EXPECT_TRUE(verificarEsquema(conn).isEmpty())
        << verificarEsquema(conn).join(QLatin1Char('\n')).toStdString();
}

TEST(EsquemaEmbutido, OneRowTablesHoldTheirRowAndTheVersion) {
    testing::EmpresaTeste empresa;
    Connection& conn = empresa.estado().gConn;
    for (const char* tabela : {"ParamGeral", "Actualiza", "LockFacCli", "LockCli"}) {
        EXPECT_EQ(valor(conn, QStringLiteral("select count(*) from %1").arg(QLatin1String(tabela)))
                      .toInt(),
                  1)
            << tabela;
    }
    EXPECT_EQ(versaoBaseDados(conn), versaoTexto12());
    EXPECT_EQ(valor(conn, QStringLiteral("select ConverteuNVARCHAR from ParamGeral")).toInt(), 1);
    // The closing lock is a plain update of that row.
    EXPECT_TRUE(conn.exec(QStringLiteral("update lockfaccli set tmp=1")));
}

// A document is named by its type, number and year: a second header with the same three is
// refused by the database itself, whatever two workstations do at the same moment.
TEST(EsquemaEmbutido, DocumentHeadersAreUniqueByTypeNumberAndYear) {
    testing::EmpresaTeste empresa;
    Connection& conn = empresa.estado().gConn;
    struct Caso {
        const char* tabela;
        const char* tipo;
        const char* numero;
        const char* ano;
        bool aceite;
    };
    const Caso casos[] = {
        {"MovCliente", "VD", "00000001", "2026", true},
        {"MovCliente", "VD", "00000001", "2026", false},
        {"MovCliente", "VD", "00000001", "2027", true},
        {"MovCliente", "FT", "00000001", "2026", true},
        {"MovCliente", "VD", "00000002", "2026", true},
        {"MovFornece", "VD", "00000001", "2026", true},
        {"MovFornece", "VD", "00000001", "2026", false},
    };
    for (const Caso& c : casos) {
        const bool ok =
            conn.exec(
                    QStringLiteral("insert into %1 (Tipo, Numero, Ano, TotalDoc) values (?,?,?,?)")
                        .arg(QLatin1String(c.tabela)),
                    {QLatin1String(c.tipo), QLatin1String(c.numero), QLatin1String(c.ano),
                     QStringLiteral("10.50")})
                .has_value();
        EXPECT_EQ(ok, c.aceite) << c.tabela << " " << c.tipo << " " << c.numero << " " << c.ano;
    }
}

TEST(EsquemaEmbutido, OtherKeysRefuseDuplicatesButLetEmptyLineKeysRepeat) {
    testing::EmpresaTeste empresa;
    Connection& conn = empresa.estado().gConn;
    struct Caso {
        const char* sql;
        QVariantList valores;
        bool aceite;
    };
    const Caso casos[] = {
        {"insert into MovProduto (Codigo, Identifica) values ('P1', '')", {}, true},
        {"insert into MovProduto (Codigo, Identifica) values ('P2', '')", {}, true},
        {"insert into MovProduto (Codigo, Identifica) values ('P1', ?)",
         {QStringLiteral("L-1")},
         true},
        {"insert into MovProduto (Codigo, Identifica) values ('P2', ?)",
         {QStringLiteral("L-1")},
         false},
        {"insert into UtilConfGeral (utilizador) values ('05')", {}, true},
        {"insert into UtilConfGeral (utilizador) values ('05')", {}, false},
        {"insert into MovCaixa (Tipo, Numero, Ano, PagaComo) values ('VD','1','2026','NU')",
         {},
         true},
        {"insert into MovCaixa (Tipo, Numero, Ano, PagaComo) values ('VD','1','2026','MB')",
         {},
         true},
        {"insert into MovCaixa (Tipo, Numero, Ano, PagaComo) values ('VD','1','2026','NU')",
         {},
         false},
        {"insert into Produtos (Codigo) values ('001')", {}, true},
        {"insert into Produtos (Codigo) values ('001')", {}, false},
        // Codes are texts: leading zeros make a different code.
        {"insert into Produtos (Codigo) values ('01')", {}, true},
    };
    for (const Caso& c : casos) {
        EXPECT_EQ(conn.exec(QString::fromLatin1(c.sql), c.valores).has_value(), c.aceite) << c.sql;
    }
}

TEST(EsquemaEmbutido, RowsInsertedWithFewColumnsGetDefaultsTheProgramCanCompare) {
    testing::EmpresaTeste empresa;
    Connection& conn = empresa.estado().gConn;
    ASSERT_TRUE(conn.exec(QStringLiteral("insert into Clientes (Codigo) values ('M1')")));
    ASSERT_TRUE(
        conn.exec(QStringLiteral("insert into Produtos (Codigo, ImpCopa) values ('K', 1)")));
    ASSERT_TRUE(conn.exec(QStringLiteral("insert into Produtos (Codigo, ImpCopa) values ('B', ?)"),
                          {QStringLiteral("0")}));
    ASSERT_TRUE(conn.exec(QStringLiteral("insert into UtilConfGeral (utilizador) values ('02')")));
    ASSERT_TRUE(conn.exec(QStringLiteral("insert into MovCaixa (Tipo) values ('VD')")));
    struct Caso {
        const char* sql;
        QVariantList valores;
        QVariant esperado;
    };
    const Caso casos[] = {
        {"select count(*) from Clientes where Impostos=''", {}, 1},
        {"select count(*) from Clientes where Diversos<>'1'", {}, 1},
        {"select Desconto1 + decvalor from Clientes", {}, 0},
        // A flag answers to 1 and to "1" alike, written or bound.
        {"select Codigo from Produtos where ImpCopa=1", {}, QStringLiteral("K")},
        {"select Codigo from Produtos where ImpCopa='1'", {}, QStringLiteral("K")},
        {"select Codigo from Produtos where ImpCopa=?", {QStringLiteral("1")}, QStringLiteral("K")},
        {"select Codigo from Produtos where ImpCopa=?", {1}, QStringLiteral("K")},
        {"select Codigo from Produtos where ImpCopa=?", {0}, QStringLiteral("B")},
        // Logging stays on for a user row that does not say otherwise.
        {"select ActivaLogGeral from UtilConfGeral where utilizador='02'", {}, 1},
        // A cash movement without a time is found by the journal's repair.
        {"select count(*) from MovCaixa where Hora is null", {}, 1},
    };
    for (const Caso& c : casos) {
        const QVariant v = valor(conn, QString::fromLatin1(c.sql), c.valores);
        EXPECT_EQ(v.toString(), c.esperado.toString()) << c.sql;
    }
}

TEST(EsquemaEmbutido, TextsWithQuotesSurviveInsertAndRead) {
    testing::EmpresaTeste empresa;
    Connection& conn = empresa.estado().gConn;
    const QString textos[] = {QStringLiteral("Vinho d'Ouro \"reserva\""),
                              QStringLiteral("'); drop table Produtos; --"),
                              QStringLiteral("Pão de ló § 1,5 €"), QStringLiteral("")};
    int n = 0;
    for (const QString& texto : textos) {
        const QString codigo = QStringLiteral("Q'%1").arg(++n);
        ASSERT_TRUE(
            conn.exec(QStringLiteral("insert into Produtos (Codigo, Descricao) values (?,?)"),
                      {codigo, texto}));
        EXPECT_EQ(
            valor(conn, QStringLiteral("select Descricao from Produtos where Codigo=?"), {codigo})
                .toString(),
            texto);
    }
    EXPECT_EQ(valor(conn, QStringLiteral("select count(*) from Produtos")).toInt(), n);
}

TEST(ActualizacaoEsquema, RestoresADroppedColumnAndTableAndKeepsTheData) {
    testing::EmpresaTeste empresa;
    Connection& conn = empresa.estado().gConn;
    ASSERT_TRUE(
        conn.exec(QStringLiteral("insert into Produtos (Codigo, Descricao) values ('P', 'Sopa')")));
    ASSERT_TRUE(conn.exec(QStringLiteral("alter table Produtos drop column ImpCopa")));
    ASSERT_TRUE(conn.exec(QStringLiteral("drop table HistoricoCopa")));
    const QStringList faltas = verificarEsquema(conn);
    EXPECT_TRUE(faltas.contains(QStringLiteral("Falta a coluna Produtos.ImpCopa")))
        << faltas.join(QLatin1Char('\n')).toStdString();
    EXPECT_TRUE(faltas.contains(QStringLiteral("Falta a tabela HistoricoCopa")));

    QStringList alteracoes;
    QString erro;
    ASSERT_TRUE(actualizarEsquema(conn, &alteracoes, &erro)) << erro.toStdString();
    EXPECT_TRUE(alteracoes.contains(QStringLiteral("Coluna acrescentada: Produtos.ImpCopa")));
    EXPECT_TRUE(alteracoes.contains(QStringLiteral("Tabela criada: HistoricoCopa")));
    EXPECT_TRUE(verificarEsquema(conn).isEmpty());
    EXPECT_EQ(
        valor(conn, QStringLiteral("select Descricao || '/' || ImpCopa from Produtos")).toString(),
        QStringLiteral("Sopa/0"));

    // Nothing is left to do the second time.
    alteracoes.clear();
    ASSERT_TRUE(actualizarEsquema(conn, &alteracoes, &erro));
    EXPECT_TRUE(alteracoes.isEmpty()) << alteracoes.join(QLatin1Char('\n')).toStdString();
}

TEST(ActualizacaoEsquema, StampsOlderDatabasesAndRefusesNewerOnes) {
    struct Caso {
        QString versao;
        bool aceite;
    };
    const Caso casos[] = {{QString(), true},
                          {QStringLiteral("000000090001"), true},
                          {versaoTexto12(), true},
                          {QStringLiteral("999900000000"), false}};
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.versao.toStdString());
        testing::EmpresaTeste empresa;
        Connection& conn = empresa.estado().gConn;
        ASSERT_TRUE(conn.exec(QStringLiteral("update Actualiza set Versao=?"), {c.versao}));
        ASSERT_TRUE(conn.exec(QStringLiteral("update ParamGeral set ConverteuNVARCHAR=0")));
        ASSERT_TRUE(conn.exec(QStringLiteral("drop table Delegados")));
        QString erro;
        EXPECT_EQ(actualizarEsquema(conn, nullptr, &erro), c.aceite);
        if (c.aceite) {
            EXPECT_EQ(versaoBaseDados(conn), versaoTexto12());
            EXPECT_EQ(
                valor(conn, QStringLiteral("select ConverteuNVARCHAR from ParamGeral")).toInt(), 1);
            EXPECT_TRUE(verificarEsquema(conn).isEmpty());
        } else {
            // A newer program's database is left exactly as it was.
            EXPECT_TRUE(erro.contains(QStringLiteral("superior"))) << erro.toStdString();
            EXPECT_EQ(versaoBaseDados(conn), c.versao);
            EXPECT_TRUE(
                verificarEsquema(conn).contains(QStringLiteral("Falta a tabela Delegados")));
        }
    }
}

TEST(ActualizacaoEsquema, ReportsOneRowTablesThatLostOrGainedRows) {
    testing::EmpresaTeste empresa;
    Connection& conn = empresa.estado().gConn;
    ASSERT_TRUE(conn.exec(QStringLiteral("delete from LockCli")));
    ASSERT_TRUE(conn.exec(QStringLiteral("insert into ParamGeral (NomeEmpresa) values ('B')")));
    const QStringList faltas = verificarEsquema(conn);
    EXPECT_TRUE(faltas.contains(QStringLiteral("A tabela LockCli deve ter uma linha e tem 0")));
    EXPECT_TRUE(faltas.contains(QStringLiteral("A tabela ParamGeral deve ter uma linha e tem 2")));
    // The missing lock row comes back; a second parameters row is for a person to sort out.
    ASSERT_TRUE(actualizarEsquema(conn, nullptr, nullptr));
    EXPECT_EQ(verificarEsquema(conn),
              QStringList{QStringLiteral("A tabela ParamGeral deve ter uma linha e tem 2")});
}

}  // namespace
}  // namespace brasel::db::schema
