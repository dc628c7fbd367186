// The count of a register and the register report's figures.
#include "cash/caixa_teste.h"
#include "cash/registo_caixa.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

namespace brasel::cash {
namespace {

using teste::V;

class RegistoCaixaTeste : public ::testing::Test {
  protected:
    int linhasRegisto() {
        return e.gConn.firstRow(QStringLiteral("select count(*) from RegistoCaixa"))
            ->value(0)
            .toInt();
    }

    // A movement of one method on register `caixa`.
    void movimento(const char* numero, const char* data, const char* afecta, const char* pagaComo,
                   const char* valor, const char* caixa = "01") {
        MovimentoCaixa m = teste::vendaDinheiro(QString::fromLatin1(numero), pagaComo);
        m.data = QString::fromLatin1(data);
        m.afecta = QString::fromLatin1(afecta);
        m.valorTotal = V(valor);
        e.gCaixa = QString::fromLatin1(caixa);
        ASSERT_TRUE(LancaMovCaixa(e, e.gConn, m)) << numero;
    }

    testing::EmpresaTeste empresa_{true};
    app::Estado& e = empresa_.estado();
    testing::MensagensGravadas mensagens_;
    const QString dia_ = QStringLiteral("2026-03-14");
};

TEST_F(RegistoCaixaTeste, CountingTwiceKeepsOnlyTheSecondCount) {
    ASSERT_TRUE(GravaRegistoCaixa(e, mensagens_, QStringLiteral("02"), dia_,
                                  {{QStringLiteral("NU"), V("7")}}));
    ASSERT_TRUE(
        GravaRegistoCaixa(e, mensagens_, QStringLiteral("01"), dia_,
                          {{QStringLiteral("NU"), V("100")}, {QStringLiteral("MB"), V("50")}}));
    ASSERT_TRUE(GravaRegistoCaixa(e, mensagens_, QStringLiteral("01"), dia_,
                                  {{QStringLiteral("NU"), V("80.25")}}));
    const auto contado = CarregaRegistoCaixa(e.gConn, QStringLiteral("01"), dia_);
    ASSERT_TRUE(contado);
    EXPECT_EQ(contado->size(), 1);
    EXPECT_EQ(contado->value(QStringLiteral("NU")), V("80.25"));
    // Another register's count of the same day stays.
    EXPECT_EQ(CarregaRegistoCaixa(e.gConn, QStringLiteral("02"), dia_)->value(QStringLiteral("NU")),
              V("7"));
    EXPECT_TRUE(mensagens_.mensagens().isEmpty());
}

TEST_F(RegistoCaixaTeste, WithoutARegisterOrADateNothingIsWritten) {
    ASSERT_TRUE(GravaRegistoCaixa(e, mensagens_, QStringLiteral("01"), dia_,
                                  {{QStringLiteral("NU"), V("1")}}));
    const struct {
        const char* caixa;
        const char* data;
        const char* mensagem;
    } casos[] = {
        {"", "2026-03-14", "Não definiu o Caixa!"},
        {"  ", "2026-03-14", "Não definiu o Caixa!"},
        {"01", "", "Não definiu a Data!"},
        {"01", "2026-13-40", "Não definiu a Data!"},
    };
    for (const auto& c : casos) {
        SCOPED_TRACE(std::string(c.caixa) + "|" + c.data);
        mensagens_.limpar();
        EXPECT_FALSE(GravaRegistoCaixa(e, mensagens_, QString::fromLatin1(c.caixa),
                                       QString::fromLatin1(c.data), {}));
        EXPECT_EQ(mensagens_.textos(), QStringList{QString::fromUtf8(c.mensagem)});
        EXPECT_EQ(linhasRegisto(), 1);
    }
}

TEST_F(RegistoCaixaTeste, ACountThatFailsHalfwayKeepsTheEarlierOne) {
    ASSERT_TRUE(GravaRegistoCaixa(e, mensagens_, QStringLiteral("01"), dia_,
                                  {{QStringLiteral("NU"), V("100")}}));
    ASSERT_TRUE(e.gConn.exec(
        QStringLiteral("create trigger recusa_mb before insert on RegistoCaixa when "
                       "new.PagaComo='MB' begin select raise(abort, 'recusado'); end")));
    EXPECT_FALSE(
        GravaRegistoCaixa(e, mensagens_, QStringLiteral("01"), dia_,
                          {{QStringLiteral("NU"), V("1")}, {QStringLiteral("MB"), V("2")}}));
    EXPECT_TRUE(mensagens_.contem(QStringLiteral("Não foi possível gravar o Registo de Caixa!")));
    const auto contado = CarregaRegistoCaixa(e.gConn, QStringLiteral("01"), dia_);
    ASSERT_TRUE(contado);
    EXPECT_EQ(*contado, (QHash<QString, Currency>{{QStringLiteral("NU"), V("100")}}));
}

TEST_F(RegistoCaixaTeste, TheReportSetsTheDaysMovementsAgainstTheCount) {
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("update PagaComo set Reembolso=1 where codigo=?"),
                             {QStringLiteral("CC")}));
    // The day on register 01.
    movimento("1", "2026-03-14", "R+", "NU", "12.30");
    movimento("2", "2026-03-14", "R+", "MB", "7.30");
    movimento("3", "2026-03-14", "R-", "NU", "2");
    movimento("4", "2026-03-14", "P+", "NU", "3");
    movimento("5", "2026-03-14", "P-", "MB", "1");
    movimento("6", "2026-03-14", "R+", "CC", "10");  // a refund method: "NA"
    movimento("7", "2026-03-14", "R+", "ZZ", "4");   // a method no longer listed
    movimento("8", "2026-03-14", "NA", "NU", "99");
    // Before, after, and on another register.
    movimento("9", "2026-03-13", "R+", "NU", "20");
    movimento("10", "2026-03-01", "P+", "MB", "5");
    movimento("11", "2026-03-15", "R+", "NU", "100");
    movimento("12", "2026-03-14", "R+", "NU", "50", "02");
    ASSERT_TRUE(
        GravaRegistoCaixa(e, mensagens_, QStringLiteral("01"), dia_,
                          {{QStringLiteral("NU"), V("20")}, {QStringLiteral("MB"), V("5")}}));

    const auto r = CalculaRelatorioCaixa(e, QStringLiteral("01"), dia_);
    ASSERT_TRUE(r);
    EXPECT_EQ(r->titulo, QStringLiteral("Diário do Caixa - Caixa principal (01)"));
    EXPECT_EQ(r->data, QStringLiteral("Data: 14-03-2026"));
    struct Esperado {
        const char* pagaComo;
        const char* recebimentos;
        const char* pagamentos;
        const char* saldo;
        const char* registo;
        const char* diferenca;
    };
    const Esperado esperado[] = {
        {"CC", "0", "0", "0", "0", "0"},
        {"MW", "0", "0", "0", "0", "0"},
        {"MB", "7.30", "-1", "8.30", "5", "-3.30"},
        {"NU", "10.30", "3", "7.30", "20", "12.70"},
        {"ZZ", "4", "0", "4", "0", "-4"},
    };
    ASSERT_EQ(r->linhas.size(), std::size(esperado));
    for (std::size_t i = 0; i < r->linhas.size(); ++i) {
        const LinhaRelatorioCaixa& l = r->linhas[i];
        const Esperado& x = esperado[i];
        SCOPED_TRACE(x.pagaComo);
        EXPECT_EQ(l.pagaComo, QString::fromLatin1(x.pagaComo));
        EXPECT_EQ(l.recebimentos, V(x.recebimentos));
        EXPECT_EQ(l.pagamentos, V(x.pagamentos));
        EXPECT_EQ(l.saldo, V(x.saldo));
        EXPECT_EQ(l.registo, V(x.registo));
        EXPECT_EQ(l.diferenca, V(x.diferenca));
    }
    EXPECT_EQ(r->linhas[3].descricao, QStringLiteral("Numerário"));
    EXPECT_EQ(r->saldoAnterior, V("15"));
    EXPECT_EQ(r->saldoDia, V("19.60"));
    EXPECT_EQ(r->saldoActual, V("34.60"));
}

}  // namespace
}  // namespace brasel::cash
