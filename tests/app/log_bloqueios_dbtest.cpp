// The activity log with its per-user switch, and the record locks.
#include "app/bloqueios.h"
#include "app/registo_log.h"
#include "db/query_helpers.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

using testing::EmpresaTeste;

int linhasLog(Estado& e) {
    return e.gConn.firstRow(QStringLiteral("select count(*) from LogGeral"))->value(0).toInt();
}

db::EntradaLog entrada() {
    db::EntradaLog l;
    l.modulo = QStringLiteral("FC");
    l.accao = QStringLiteral("N");
    l.observa = QStringLiteral("Mesa 'Terraço' passou para \"Sala\"");
    l.descricao = QString(150, QLatin1Char('d'));
    l.valor = *Currency::parse(u"12.34");
    l.tipo = QStringLiteral("VD");
    l.numero = QStringLiteral("00000012");
    l.ano = QStringLiteral("2026");
    l.terceiro = QStringLiteral("M'1");
    return l;
}

TEST(RegistaLogGeral, StoresTheTwelveValuesUnlessTheUserSwitchedItOff) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    e.gUtilizador = QStringLiteral("01");
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("delete from LogGeral")));
    ASSERT_TRUE(e.gConn.exec(
        QStringLiteral("update UtilConfGeral set ActivaLogGeral=1 where Utilizador='01'")));
    EXPECT_TRUE(RegistaLogGeral(e, entrada()));
    const auto linha = e.gConn.firstRow(QStringLiteral(
        "select Utilizador, Modulo, Accao, Observa, Descricao, Valor, Tipo, Numero, Ano, Produto, "
        "Terceiro, DataSys from LogGeral"));
    ASSERT_TRUE(linha);
    EXPECT_EQ(linha->value(0).toString(), QStringLiteral("01"));
    EXPECT_EQ(linha->value(3).toString(), entrada().observa);
    EXPECT_EQ(linha->value(4).toString().size(), 100);
    EXPECT_EQ(Currency::fromVariant(linha->value(5)), *Currency::parse(u"12.34"));
    EXPECT_EQ(linha->value(10).toString(), QStringLiteral("M'1"));
    EXPECT_EQ(linha->value(11).toString().size(), 19);

    ASSERT_TRUE(e.gConn.exec(
        QStringLiteral("update UtilConfGeral set ActivaLogGeral=0 where Utilizador='01'")));
    EXPECT_FALSE(RegistaLogGeral(e, entrada()));
    EXPECT_EQ(linhasLog(e), 1);
    // NULL, or no row for the user, leaves logging on.
    ASSERT_TRUE(e.gConn.exec(
        QStringLiteral("update UtilConfGeral set ActivaLogGeral=NULL where Utilizador='01'")));
    EXPECT_TRUE(RegistaLogGeral(e, entrada()));
    e.gUtilizador = QStringLiteral("88");
    EXPECT_TRUE(RegistaLogGeral(e, entrada()));
    EXPECT_EQ(linhasLog(e), 3);
    // A log that cannot be written only says so.
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("drop table LogGeral")));
    EXPECT_FALSE(RegistaLogGeral(e, entrada()));
}

TEST(Bloqueios, LockRowsOnlyInsideATransaction) {
    EmpresaTeste empresa;
    Estado& e = empresa.estado();
    EXPECT_FALSE(BloqueiaDocumentos(e.gConn));
    db::WriteTransaction tx(e.gConn);
    EXPECT_TRUE(BloqueiaDocumentos(e.gConn));
    EXPECT_TRUE(BloqueiaClientes(e.gConn));
    EXPECT_TRUE(tx.commit());
}

TEST(Bloqueios, TableLockIsDroppedWhenItExists) {
    EmpresaTeste empresa;
    Estado& e = empresa.estado();
    const QString mesa = QStringLiteral("Mesa \"1\"'");
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("create table ") + nomeTabelaLockMesa(mesa) +
                             QStringLiteral(" (x INTEGER)")));
    ApagaLockMesa(e, mesa);
    EXPECT_FALSE(db::Ver_Se_Existe_Tabela_bln(e, nullptr, QStringLiteral("LockLinRec") + mesa));
    ApagaLockMesa(e, QStringLiteral("SemLock"));  // nothing to drop: nothing happens
    EXPECT_TRUE(e.gConn.isOpen());
}

}  // namespace
}  // namespace brasel::app
