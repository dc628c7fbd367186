// The column layout text shapes every list of the program: a misread width shows a password
// column, a misread kind sorts dates as text. Sort keys must order cells as dates and amounts.
#include "lookups/colunas_lista.h"

#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::lookups {
namespace {

TEST(LerColunasLista, EntryForms) {
    struct Caso {
        const char* formato;
        std::size_t quantas;
        int largura;  // of the last column
        Alinhamento alinhamento;
        TipoColuna tipo;
    };
    const Caso casos[] = {
        {"Código,1800", 1, 1800, Alinhamento::Esquerda, TipoColuna::Texto},  // no final "/"
        {"Código,1800/", 1, 1800, Alinhamento::Esquerda, TipoColuna::Texto},
        {"A,100/Data,1000,C,DATA/", 2, 1000, Alinhamento::Centro, TipoColuna::Data},
        {"A,100/Total,1200,D,VALOR", 2, 1200, Alinhamento::Direita, TipoColuna::Valor},
        {"Total,1200,d,valor/", 1, 1200, Alinhamento::Direita, TipoColuna::Valor},
        {"Data,900,e,data/", 1, 900, Alinhamento::Esquerda, TipoColuna::Data},
        {"Obs,900,X,TEXTO/", 1, 900, Alinhamento::Esquerda, TipoColuna::Texto},
        {"Obs,abc/", 1, 0, Alinhamento::Esquerda, TipoColuna::Texto},
        {"Obs/", 1, 0, Alinhamento::Esquerda, TipoColuna::Texto},
        {"", 0, 0, Alinhamento::Esquerda, TipoColuna::Texto},
    };
    for (const Caso& caso : casos) {
        SCOPED_TRACE(caso.formato);
        const auto colunas = lerColunasLista(QString::fromUtf8(caso.formato));
        ASSERT_EQ(colunas.size(), caso.quantas);
        if (colunas.empty()) continue;
        EXPECT_EQ(colunas.back().larguraTwips, caso.largura);
        EXPECT_EQ(colunas.back().alinhamento, caso.alinhamento);
        EXPECT_EQ(colunas.back().tipo, caso.tipo);
        EXPECT_EQ(colunas.back().oculta(), caso.largura == 0);
    }
}

TEST(LerColunasLista, KeepsFortyColumns) {
    QString formato;
    for (int i = 1; i <= 41; ++i)
        formato += QStringLiteral("C%1,%2/").arg(i).arg(i * 10);
    const auto colunas = lerColunasLista(formato);
    ASSERT_EQ(colunas.size(), 40u);
    EXPECT_EQ(colunas.back().titulo, QStringLiteral("C40"));
    EXPECT_EQ(colunas.back().larguraTwips, 400);
}

TEST(TwipsParaPixeis, AtTheScreensDpi) {
    EXPECT_EQ(twipsParaPixeis(1800), 120);
    EXPECT_EQ(twipsParaPixeis(15), 1);
    EXPECT_EQ(twipsParaPixeis(7), 0);
    EXPECT_EQ(twipsParaPixeis(8), 1);
    EXPECT_EQ(twipsParaPixeis(1440, 120.0), 120);
    EXPECT_EQ(twipsParaPixeis(3600, 144.0), 360);
    EXPECT_EQ(twipsParaPixeis(0), 0);
}

TEST(ChaveOrdenacaoData, BothDateFormsGiveOneKey) {
    const struct {
        const char* texto;
        const char* chave;
    } casos[] = {
        {"31-12-2023", "2023-12-31"},
        {"2023-12-31", "2023-12-31"},
        {"01/02/2024", "2024-02-01"},
        {" 05-06-2024 ", "2024-06-05"},
        {"2024-01-15 10:30:00", "2024-01-15 10:30:00"},
        {"2024-01-15T10:30:00", "2024-01-15 10:30:00"},
        {"15-01-2024 09:05", "2024-01-15 09:05"},
        {"", ""},
        {"hoje", ""},
        {"2024-1-5", ""},
        {"ab-cd-efgh", ""},
        {"2024-01-15x", ""},
    };
    for (const auto& caso : casos) {
        SCOPED_TRACE(caso.texto);
        EXPECT_EQ(chaveOrdenacaoData(QString::fromUtf8(caso.texto)), QString::fromUtf8(caso.chave));
    }
}

TEST(ChaveOrdenacaoData, SortsAcrossYearsNotByDay) {
    // As text "31-01-2023" would come after "01-02-2024".
    EXPECT_LT(chaveOrdenacaoData(u"31-01-2023"), chaveOrdenacaoData(u"01-02-2024"));
    EXPECT_LT(chaveOrdenacaoData(u"2023-12-31"), chaveOrdenacaoData(u"01-01-2024"));
    EXPECT_LT(chaveOrdenacaoData(u"--"), chaveOrdenacaoData(u"01-01-1900"));
}

TEST(ChaveOrdenacaoValor, OrdersAsNumbers) {
    // Ascending amounts: each key must sort before the next.
    const char* emOrdem[] = {
        "abc", "-1,234,567.89", "-10",      "-9.5",         "-0.0001", "0", "0.0001", "2", "9.99",
        "10",  "1,000",         "1,000.01", "123,456,789.5"};
    for (std::size_t i = 0; i + 1 < std::size(emOrdem); ++i) {
        SCOPED_TRACE(std::string(emOrdem[i]) + " < " + emOrdem[i + 1]);
        EXPECT_LT(chaveOrdenacaoValor(QString::fromUtf8(emOrdem[i])),
                  chaveOrdenacaoValor(QString::fromUtf8(emOrdem[i + 1])));
    }
    EXPECT_EQ(chaveOrdenacaoValor(u"1,000.50"), chaveOrdenacaoValor(u"1000.5"));
    EXPECT_EQ(chaveOrdenacaoValor(u""), QString());
}

}  // namespace
}  // namespace brasel::lookups
