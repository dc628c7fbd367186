// Loading the company's parameters and the user's configuration, and the free per-user store.
#include "app/carrega_parametros.h"
#include "app/utilconfig_div.h"
#include "db/query_helpers.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

using testing::EmpresaTeste;
using testing::MensagensGravadas;

void executa(Estado& e, const QString& sql, const QVariantList& valores = {}) {
    ASSERT_TRUE(e.gConn.exec(sql, valores)) << e.gConn.lastError().toStdString();
}

TEST(CarregaParametros, ReadsEveryKindOfColumn) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    executa(
        e,
        QStringLiteral(
            "update ParamGeral set casadec=3, casadecpreco=4, cliarretotalgeral=3, clidecvalor=1, "
            "caiarreivageral=2, GridLine=1, ContinuaAdicionar=-1, ImpCabecalhos='1', NomeCor=?, "
            "taxajuromora=?, ano='2026', clidiversos=?"),
        {QStringLiteral("Cor d'Água"), QStringLiteral("7.125"), QStringLiteral("CLI'1")});
    MensagensGravadas m;
    CarregaParametros(e, m, QString());
    EXPECT_TRUE(m.mensagens().isEmpty()) << m.textos().join(QLatin1Char('|')).toStdString();
    EXPECT_EQ(e.param.casadec, 3);
    EXPECT_EQ(e.param.casadecpreco, 4);
    EXPECT_EQ(e.param.cliarre[static_cast<int>(KindArre::totalgeral)], 3);
    EXPECT_EQ(e.param.clidec[static_cast<int>(KindArre::valor)], 1);
    EXPECT_EQ(e.param.caiarre[static_cast<int>(KindCaixa::ivageral)], 2);
    EXPECT_TRUE(e.param.GridLine);
    EXPECT_FALSE(e.param.ContinuaAdicionar);
    EXPECT_TRUE(e.param.ImpCabecalhos);
    EXPECT_EQ(e.param.NomesDimensoes[5], QStringLiteral("Cor d'Água"));
    EXPECT_EQ(e.param.taxajuromora, *Currency::parse(u"7.125"));
    EXPECT_EQ(e.param.ano, QStringLiteral("2026"));
    EXPECT_EQ(e.param.clidiversos, QStringLiteral("CLI'1"));
}

TEST(CarregaParametros, FlagOutsideOneZeroMinusOneWarnsAndIsFalse) {
    EmpresaTeste empresa;
    Estado& e = empresa.estado();
    executa(e, QStringLiteral("update ParamGeral set GridLine=7, ContinuaAdicionar=1"));
    MensagensGravadas m;
    CarregaParametros(e, m, QString());
    EXPECT_FALSE(e.param.GridLine);
    EXPECT_TRUE(e.param.ContinuaAdicionar);
    EXPECT_TRUE(
        m.contem(QStringLiteral("Esta Função só deve ser utilizada com valores de 1; 0 e -1")));
}

TEST(CarregaParametros, MissingColumnKeepsItsValueAndLoadingGoesOn) {
    EmpresaTeste empresa;
    Estado& e = empresa.estado();
    executa(e, QStringLiteral("alter table ParamGeral drop column casadecpreco"));
    executa(e, QStringLiteral("update ParamGeral set casadec=1"));
    e.param.casadecpreco = 9;
    MensagensGravadas m;
    CarregaParametros(e, m, QString());
    EXPECT_EQ(e.param.casadecpreco, 9);
    EXPECT_EQ(e.param.casadec, 1);
}

TEST(CarregaParametros, UserRowWorkstationRegisterAndHeadings) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    MensagensGravadas m;
    const QString armazem =
        e.gConn.firstRow(QStringLiteral("select min(codigo) from armazens"))->value(0).toString();
    executa(e,
            QStringLiteral("update UtilConfGeral set armazem=?, caixa='01', tipofac='VD', "
                           "VariosPagaComo=1 where utilizador='01'"),
            {armazem});
    executa(e, QStringLiteral("update armazens set linha2=?, linha7=? where codigo=?"),
            {QStringLiteral("  Rua d'Ouro 12  "), QStringLiteral("NIF 500000000 "), armazem});
    e.gUtilizador = QStringLiteral("01");
    CarregaParametros(e, m, QStringLiteral("   "));  // blanks do not replace the user's register
    EXPECT_EQ(e.gArmazem, armazem);
    EXPECT_EQ(e.gCaixa, QStringLiteral("01"));
    EXPECT_EQ(e.gTipoFac, QStringLiteral("VD"));
    EXPECT_TRUE(e.gVariosPagaComo);
    EXPECT_EQ(e.gLinhasCabecalho[0], QStringLiteral("Rua d'Ouro 12"));
    EXPECT_EQ(e.gLinhasCabecalho[5], QStringLiteral("NIF 500000000"));

    CarregaParametros(e, m, QStringLiteral(" 03 "));
    EXPECT_EQ(e.gCaixa, QStringLiteral("03"));

    for (const QVariant& varios : {QVariant(0), QVariant()}) {
        executa(e,
                QStringLiteral("update UtilConfGeral set VariosPagaComo=? where utilizador='01'"),
                {varios});
        CarregaParametros(e, m, QString());
        EXPECT_FALSE(e.gVariosPagaComo);
    }

    // A user without a row keeps the previous user's warehouse, register and document type.
    e.gUtilizador = QStringLiteral("77");
    CarregaParametros(e, m, QString());
    EXPECT_EQ(e.gArmazem, armazem);
    EXPECT_EQ(e.gCaixa, QStringLiteral("01"));
    EXPECT_EQ(e.gTipoFac, QStringLiteral("VD"));
}

TEST(UtilConfigDiv, ValuesComeBackWithTheirType) {
    EmpresaTeste empresa;
    Estado& e = empresa.estado();
    const QString u = QStringLiteral("01");
    const QString f = QStringLiteral("frmFacturacao");
    ASSERT_TRUE(
        UtilConfig_Div_Guarda_bln(e, u, f, QStringLiteral("moeda"), *Currency::parse(u"1.5")));
    const auto linha = db::primeiraLinha(
        e.gConn,
        QStringLiteral(
            "select Conteudo, TipoConteudo, DataSys from UtilConfig_Div where Chave='moeda'"));
    ASSERT_TRUE(linha);
    EXPECT_EQ(linha->value(0).toString(), QStringLiteral("1.5"));
    EXPECT_EQ(linha->value(1).toString(), QStringLiteral("Currency"));
    EXPECT_EQ(linha->value(2).toString().size(), 19);
    EXPECT_EQ(std::get<Currency>(UtilConfig_Div_Retorna_var(e, u, f, QStringLiteral("moeda"))),
              *Currency::parse(u"1.5"));

    const std::pair<const char*, ValorDiv> casos[] = {
        {"long", std::int32_t{-42}},
        {"integer", std::int16_t{7}},
        {"double", 0.1},
        {"boolean", true},
        {"texto", QStringLiteral("Nota d'\"ela\"")},
    };
    for (const auto& [chave, valor] : casos) {
        ASSERT_TRUE(UtilConfig_Div_Guarda_bln(e, u, f, QString::fromLatin1(chave), valor));
        EXPECT_EQ(UtilConfig_Div_Retorna_var(e, u, f, QString::fromLatin1(chave)), valor) << chave;
    }
    // Rewriting keeps one row; another user or window does not see it.
    ASSERT_TRUE(
        UtilConfig_Div_Guarda_bln(e, u, f, QStringLiteral("texto"), QStringLiteral("novo")));
    EXPECT_EQ(
        db::primeiraLinha(e.gConn,
                          QStringLiteral("select count(*) from UtilConfig_Div where Chave='texto'"))
            ->value(0)
            .toInt(),
        1);
    EXPECT_EQ(UtilConfig_Div_Retorna_var(e, QStringLiteral("02"), f, QStringLiteral("texto")),
              ValorDiv(QString()));
    EXPECT_EQ(UtilConfig_Div_Retorna_var(e, u, QStringLiteral("outra"), QStringLiteral("texto")),
              ValorDiv(QString()));
    // An amount stored with a decimal comma still reads back.
    executa(e, QStringLiteral("update UtilConfig_Div set Conteudo='2,75' where Chave='moeda'"));
    EXPECT_EQ(std::get<Currency>(UtilConfig_Div_Retorna_var(e, u, f, QStringLiteral("moeda"))),
              *Currency::parse(u"2.75"));
}

}  // namespace
}  // namespace brasel::app
