// The tab on PostgreSQL: lines added, read back all at once (their taxes are asked while the
// lines are read), a quote in a table code and a note, and the last line's deletion; the
// location and lots a line is taken from, and another region's line kept by its user.
#include "pos/abertura_mesa.h"
#include "pos/adicionar_produto.h"
#include "pos/adicionar_produto_localizacao.h"
#include "pos/adicionar_produto_lote.h"
#include "pos/alteracao_linhas.h"
#include "pos/tab_teste.h"
#include "support/empresa_pg.h"
#include "support/servidor_pg.h"

#include <tuple>
#include <utility>

namespace brasel::pos {
namespace {

class TabPg : public ::testing::Test {
  protected:
    void SetUp() override {
        if (!testing::servidorPg()) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
        ASSERT_TRUE(empresa_.pronta()) << empresa_.erro().toStdString();
        tab_ = std::make_unique<Tab>(estado_, m_, linha_);
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaPg empresa_{QLatin1Char('J'), true};
    app::Estado& estado_ = empresa_.estado();
    testing::MensagensGravadas m_;
    devices::LinhaSerie linha_;
    teste::PerguntasGravadas p_;
    std::unique_ptr<Tab> tab_;
};

TEST_F(TabPg, LinhasLidasDeUmaVezEApagadas) {
    ASSERT_TRUE(estado_.gConn.exec(
        QStringLiteral("insert into Clientes (Codigo,Descricao,PrecoStock,JaImprimiuTalao) values "
                       "('M''9','Mesa d''Ouro',1,1)")));
    // It rounds as the dining room's tables do.
    for (const char* tipo : {"valor", "iva", "desc", "merlin", "desclin", "ivalin", "mergeral",
                             "descgeral", "ivageral", "totalgeral"}) {
        for (const char* prefixo : {"dec", "arre"}) {
            const QString coluna = QLatin1String(prefixo) + QLatin1String(tipo);
            ASSERT_TRUE(estado_.gConn.exec(
                QStringLiteral("update Clientes set %1=(select %1 from Clientes where "
                               "Codigo='M01') where Codigo=?")
                    .arg(coluna),
                {QStringLiteral("M'9")}));
        }
    }
    ASSERT_TRUE(tab_->definirTipo(QStringLiteral("VD")));
    ASSERT_TRUE(AbrirMesa(*tab_, QStringLiteral("M'9")));
    tab_->pendentes.obs = QStringLiteral("sem 'sal'");
    std::vector<qint64> linhas;
    for (const char* produto : {"B003", "B015", "P002"}) {
        linhas.push_back(AdicionarProduto(*tab_, p_, QString::fromLatin1(produto)));
        ASSERT_GT(linhas.back(), 0) << produto << m_.textos().join(u'|').toStdString();
    }
    // 1.80 + 0.80 + 13 % + 2.50 + 13 %
    ASSERT_TRUE(AbrirMesa(*tab_, QStringLiteral("M'9")));
    ASSERT_EQ(tab_->lista().linhas.size(), 3u);
    EXPECT_EQ(tab_->lista().linhas[0].obsLinha, QStringLiteral("sem 'sal'"));
    EXPECT_EQ(tab_->lista().totais.total, pricing::teste::V("5.53"));
    EXPECT_FALSE(tab_->edicaoLivre);

    m_.respostaFinal = true;
    for (qint64 n : linhas)
        ASSERT_TRUE(EliminarLinha(*tab_, p_, n));
    EXPECT_TRUE(tab_->lista().linhas.empty());
    auto r = estado_.gConn.firstRow(
        QStringLiteral("select JaImprimiuTalao from Clientes where Codigo=?"),
        {QStringLiteral("M'9")});
    ASSERT_TRUE(r);
    EXPECT_EQ(r->value(0).toInt(), 0);
}

TEST_F(TabPg, LocalizacaoLotesEZonaDoIva) {
    int n = 0;
    for (const auto& [local, lote, quantidade] :
         {std::tuple{"BAR", "L1", "3"}, std::tuple{"COZ", "L2", "5"}, std::tuple{"", "L2", "-1"}}) {
        ASSERT_TRUE(estado_.gConn.exec(
            QStringLiteral("insert into MovProduto (Codigo,AfectaStk,QuantNormal,Armazem,"
                           "Localizacao,Lote,DataValidade,Identifica) values "
                           "('P002','E+',?,'001',?,?,'2026-06-30',?)"),
            {QString::fromLatin1(quantidade), QString::fromLatin1(local), QString::fromLatin1(lote),
             QStringLiteral("PG%1").arg(++n)}))
            << estado_.gConn.lastError().toStdString();
    }
    const auto local =
        LocalizacaoProduto_Procura(estado_.gConn, QStringLiteral("P002"), QStringLiteral("001"));
    ASSERT_TRUE(local.has_value());
    EXPECT_EQ(local->codigo, QStringLiteral("COZ"));
    EXPECT_TRUE(local->registada);
    const auto lotes =
        LotesDisponiveis(estado_.gConn, QStringLiteral("P002"), QStringLiteral("001"));
    ASSERT_TRUE(lotes.has_value());
    ASSERT_EQ(lotes->size(), 2u);
    EXPECT_EQ((*lotes)[0].lote, QStringLiteral("L1"));
    EXPECT_EQ((*lotes)[1].saldo, pricing::teste::V("4"));
    EXPECT_EQ((*lotes)[1].dataValidade, QStringLiteral("2026-06-30"));

    ASSERT_TRUE(estado_.gConn.exec(
        QStringLiteral("insert into TabIva (codigo,Taxa,Zona) values ('RM',4,'M')")));
    for (const auto& [produto, iva] : {std::pair{"N1", "NO"}, std::pair{"N2", "RM"}}) {
        ASSERT_TRUE(estado_.gConn.exec(
            QStringLiteral("insert into MovProduto (Codigo,Tipo,Numero,CliFor,Terceiro,"
                           "Utilizador,Fechado,IvaTabela,Identifica) values "
                           "(?,'VD','','C','M01','ANA','N',?,?)"),
            {QString::fromLatin1(produto), QString::fromLatin1(iva),
             QString::fromLatin1(produto)}));
    }
    ASSERT_TRUE(tab_->definirTipo(QStringLiteral("VD")));
    m_.responder({true});
    ASSERT_TRUE(AbrirMesa(*tab_, QStringLiteral("M01")));
    EXPECT_EQ(m_.textos(), QStringList{QStringLiteral("Não foi possível passar todos os "
                                                      "Produtos:\r\n(N2) -> IVA de Zonas "
                                                      "Diferentes")});
    EXPECT_EQ(tab_->lista().linhas.size(), 1u);
}

}  // namespace
}  // namespace brasel::pos
