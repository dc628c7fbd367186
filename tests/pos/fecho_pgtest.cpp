// Closing a tab on PostgreSQL: a partial close numbered past a used number under the closing
// lock, its cash row and log; a failed signature rolls every statement back.
#include "pos/fecho_teste.h"
#include "support/empresa_pg.h"
#include "support/servidor_pg.h"

namespace brasel::pos {
namespace {

class FechoPg : public ::testing::Test {
  protected:
    void SetUp() override {
        if (!testing::servidorPg()) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
        ASSERT_TRUE(empresa_.pronta()) << empresa_.erro().toStdString();
        estado_.gVariosPagaComo = false;
        testing::usaChaveTeste(estado_);
        tab_ = std::make_unique<Tab>(estado_, m_, linha_);
        tab_->definirTipo(QStringLiteral("VD"));
        AbrirMesa(*tab_, QStringLiteral("M01"));
        m_.respostaFinal = true;
    }

    void adiciona(std::initializer_list<const char*> produtos) {
        for (const char* produto : produtos)
            ASSERT_GT(AdicionarProduto(*tab_, p_, QString::fromLatin1(produto)), 0) << produto;
    }
    qint64 contar(const QString& sql, const QVariantList& valores = {}) {
        auto r = estado_.gConn.firstRow(sql, valores);
        return r ? r->value(0).toLongLong() : -1;
    }
    QString ultNumero() {
        auto r = estado_.gConn.firstRow(
            QStringLiteral("select UltNumero from TabTipoMov where codigo='VD'"));
        return r ? r->value(0).toString() : QString();
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaPg empresa_{QLatin1Char('Q'), true};
    app::Estado& estado_ = empresa_.estado();
    testing::MensagensGravadas m_;
    devices::LinhaSerie linha_;
    teste::PerguntasGravadas p_;
    teste::PerguntasFechoGravadas f_;
    std::unique_ptr<Tab> tab_;
};

TEST_F(FechoPg, FechoParcialNumeradoDepoisDoUsado) {
    const QString ano = QString::number(QDate::currentDate().year());
    ASSERT_TRUE(estado_.gConn.exec(
        QStringLiteral(
            "insert into MovCliente (Tipo,Numero,Ano,Data) values ('VD','00000001',?,?)"),
        {ano, QDate::currentDate().toString(QStringLiteral("yyyy-MM-dd"))}));
    adiciona({"B001", "B002", "B003"});
    ASSERT_TRUE(tab_->marcarLinha(tab_->lista().linhas.back().numRegisto, false));
    const Currency total = tab_->lista().totais.total;
    f_.pagamentoDado = teste::pagamentoNumerario(total, Currency(20));

    const Fecho r = FecharTab(*tab_, f_);
    ASSERT_EQ(r.resultado, ResultadoFecho::Fechado) << m_.textos().join(u'|').toStdString();
    EXPECT_EQ(r.documento->numero, QStringLiteral("00000002"));
    EXPECT_EQ(ultNumero(), QStringLiteral("00000002"));
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovCliente where Numero='00000002' and "
                                    "HashControl=1 and TotalDoc=?"),
                     {total.toText()}),
              1);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Fechado='S' and "
                                    "Numero='00000002'")),
              2);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Fechado='N' and "
                                    "SelecFecha=1")),
              1);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovCaixa where Numero='00000002'")), 1);
    EXPECT_EQ(
        contar(QStringLiteral("select count(*) from LogGeral where Modulo='FC' and Accao='N'")), 1);
}

TEST_F(FechoPg, AssinaturaImpossivelNadaDeixa) {
    adiciona({"B001", "B002"});
    f_.pagamentoDado = teste::pagamentoNumerario(tab_->lista().totais.total, Currency{});
    estado_.config.ficheiroChave = QStringLiteral("/nao/existe/chave.key");
    EXPECT_EQ(FecharTab(*tab_, f_).resultado, ResultadoFecho::Falhou);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovCliente")), 0);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Fechado='N' and "
                                    "Numero=''")),
              2);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovCaixa")), 0);
    EXPECT_EQ(ultNumero(), QStringLiteral("00000000"));
}

}  // namespace
}  // namespace brasel::pos
