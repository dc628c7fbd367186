#include "devices/conta_provisoria.h"
#include "devices/talao_teste.h"
#include "support/impressao_qt.h"
#include "support/texto_pdf.h"

#include <QDir>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace brasel::devices {
namespace {

using teste::m;
using teste::p;

class ContaProvisoriaTeste : public teste::TalaoTeste {
  protected:
    void SetUp() override {
        TalaoTeste::SetUp();
        ASSERT_TRUE(conn_.exec(QStringLiteral("update Clientes set Morada=?,Local=?,codpost=?,"
                                              "Contribuinte=? where Codigo='M01'"),
                               {QStringLiteral("Rua da Prata, 5"), QStringLiteral("Lisboa"),
                                QStringLiteral("1100-148"), QStringLiteral("123456789")}));
        // The tab of M01: two open lines of this user; a line of another user, a line of
        // another table and a closed line are not on the bill.
        linha(QStringLiteral("M01"), estado_.gLogin, QStringLiteral("N"), "Bitoque", "2", "18",
              "2.07", "IT", "13");
        linha(QStringLiteral("M01"), estado_.gLogin, QStringLiteral("N"), "Imperial", "3", "4.5",
              "0.84", "NO", "23");
        linha(QStringLiteral("M01"), QStringLiteral("ANA"), QStringLiteral("N"), "Da Ana", "1", "1",
              "0", "IT", "13");
        linha(QStringLiteral("M02"), estado_.gLogin, QStringLiteral("N"), "Outra mesa", "1", "1",
              "0", "IT", "13");
        linha(QStringLiteral("M01"), estado_.gLogin, QStringLiteral("S"), "Fechada", "1", "1", "0",
              "IT", "13");
    }

    void linha(const QString& mesa, const QString& login, const QString& fechado,
               const char* descricao, const char* quant, const char* iliq, const char* iva,
               const char* tabela, const char* taxa) {
        ASSERT_TRUE(conn_.exec(
            QStringLiteral("insert into MovProduto (Tipo,Numero,Ano,CliFor,Terceiro,Utilizador,"
                           "Fechado,Descricao,QuantNormal,ValorIliq,TotalDesconto,ValorIva,"
                           "IvaTabela,IvaTaxa) values ('VD','','2026','C',?,?,?,?,?,?,0,?,?,?)"),
            {mesa, login, fechado, QString::fromUtf8(descricao), QString::fromLatin1(quant),
             QString::fromLatin1(iliq), QString::fromLatin1(iva), QString::fromLatin1(tabela),
             QString::fromLatin1(taxa)}))
            << conn_.lastError().toStdString();
    }

    bool imprime() {
        return ImprimeContaProvisoria(estado_, mensagens_, linha_, QStringLiteral("M01"),
                                      QStringLiteral("VD"), estado_.gLogin);
    }
};

TEST_F(ContaProvisoriaTeste, LinhasAbertasDaMesaTotalEIva) {
    ASSERT_TRUE(imprime());
    const QString t = transcricao(1);
    const QString corpo =
        p(QStringLiteral("Mesa 1")) + p(QStringLiteral("Rua da Prata, 5")) +
        p(QStringLiteral("Lisboa")) + p(QStringLiteral("1100-148 Lisboa")) +
        p(QStringLiteral("Contribuinte : 123456789")) +
        p(QStringLiteral("   Empr.: ") + estado_.gLogin) + p(QString(40, u'=')) +
        p(QStringLiteral("Produto          Quantidade        Total")) +
        // 18 + 2.07 of VAT on top; the beer's 4.50 already holds its VAT.
        p(QStringLiteral("Bitoque               2,000        20,07")) +
        p(QStringLiteral("Imperial              3,000         4,50")) + p(QString(40, u'=')) +
        m(QStringLiteral("Total Geral                24,57")) +
        p(QStringLiteral("IVA      Tx.     Valor Inc.    Valor IVA")) +
        p(QStringLiteral("IT        13          20,07         2,07")) +
        p(QStringLiteral("NO        23           4,50         0,84")) + p(QString(40, u'-')) +
        p(QStringLiteral("Processado por Computador")) +
        p(QStringLiteral("* artº 7 Dec. Lei 147/2003 *")) +
        p(QStringLiteral("Obrigado pela sua visita!")) + p(QStringLiteral("Volte sempre."));
    EXPECT_TRUE(t.contains(corpo)) << t.toStdString();
    EXPECT_TRUE(t.startsWith(u"[CHARSET][RESET]")) << "a bill opens no drawer";
    EXPECT_TRUE(t.endsWith(u"[CORTE][RESET]"));
}

TEST_F(ContaProvisoriaTeste, NaImpressoraDoSistema) {
    QTemporaryDir pasta;
    teste::configura(conn_, QStringLiteral("PortaTalao"), QStringLiteral("LPT"));
    teste::configura(conn_, QStringLiteral("Impressora"), pasta.path());
    ASSERT_TRUE(imprime());
    const QStringList pdfs = QDir(pasta.path()).entryList({QStringLiteral("*.pdf")});
    ASSERT_EQ(pdfs.size(), 1);
    const auto texto = testing::textoPdf(pasta.filePath(pdfs.first()));
    if (!texto) GTEST_SKIP() << "pdftotext em falta";
    for (const char* parte :
         {"Bitoque 2,000 20,07", "Total Geral 24,57", "Processado por Computador"})
        EXPECT_TRUE(texto->simplified().contains(QString::fromUtf8(parte))) << parte;
    EXPECT_FALSE(texto->contains(QStringLiteral("Da Ana")));
}

}  // namespace
}  // namespace brasel::devices
