// The order screen's line list: its 42 columns in order and what each shows for a line.
#include "pos/colunas_tab.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::pos {
namespace {

TEST(ColunasTab, OrdemLargurasEAtributos) {
    app::Parametros param;
    const char* nomes[] = {"", "Estação", "Sexo", "Ref.", "Modelo", "Cor", "Tam."};
    for (int i = 1; i <= 6; ++i)
        param.NomesDimensoes[static_cast<std::size_t>(i)] = QString::fromUtf8(nomes[i]);
    const auto c = ColunasTab(param, 700, 1300, 1100);
    ASSERT_EQ(c.size(), 42u);
    EXPECT_EQ(c[1].titulo, QStringLiteral("Produto"));
    EXPECT_EQ(c[1].twips, 0);  // hidden: the code
    EXPECT_EQ(c[kColunaQty].titulo, QStringLiteral("Qty."));
    EXPECT_TRUE(c[kColunaQty].direita);
    EXPECT_EQ(c[kColunaDescricao].twips, 1300);
    EXPECT_EQ(c[kColunaPreco].twips, 1100);
    EXPECT_EQ(c[19].titulo, QStringLiteral("Estação"));
    EXPECT_EQ(c[24].titulo, QStringLiteral("Tam."));
    EXPECT_EQ(c[25].titulo, QStringLiteral("Forn."));
    EXPECT_EQ(c[35].titulo, QStringLiteral("Qty * Preço"));
    EXPECT_EQ(c[41].titulo, QStringLiteral("Out. Impostos (Não Sujeito a IVA)"));
}

TEST(ColunasTab, TextosDaLinha) {
    app::Parametros param;
    param.casadec = 2;
    param.casadecpreco = 3;
    param.casadecquant = 3;
    pricing::LinhaLista l;
    l.numRegisto = 17;
    l.produto = QStringLiteral("B003");
    l.quantidade = Currency(1234);
    l.preco = *Currency::parse(u"1.4634");
    l.precoAplicado = *Currency::parse(u"1.8");
    l.valorLinha = *Currency::parse(u"2220.12");
    l.obsLinha = QStringLiteral("sem 'gelo'");
    const QStringList semIva = TextosLinha(l, param, false);
    ASSERT_EQ(semIva.size(), 42);
    EXPECT_EQ(semIva[0], QStringLiteral("17"));
    EXPECT_EQ(semIva[kColunaQty], QStringLiteral("1,234.000"));
    EXPECT_EQ(semIva[kColunaPreco], QStringLiteral("1.463"));
    EXPECT_EQ(semIva[14], QStringLiteral("2,220.12"));
    EXPECT_EQ(semIva[17], QStringLiteral("sem 'gelo'"));
    // ConfigRest_PrecoIncBrowse: the price column shows the price as applied.
    EXPECT_EQ(TextosLinha(l, param, true)[kColunaPreco], QStringLiteral("1.800"));
}

}  // namespace
}  // namespace brasel::pos
