// The list of payment methods with an amount each, shared by the split and the count windows:
// the amounts read back from the cells, their sum, and the keypad on the selected row.
#include "cash/ui/lista_formas_valor.h"
#include "pricing/valores_teste.h"
#include "support/aplicacao_teste.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::cash {
namespace {

using pricing::teste::V;

const std::vector<FormaPagamento> kFormas{{7, QStringLiteral("NU"), QStringLiteral("Numerário")},
                                          {9, QStringLiteral("MB"), QStringLiteral("Multibanco")}};

class TecladoFixo : public pos::PedeValor {
  public:
    std::optional<Currency> pedirValor(const QString& titulo) override {
        titulos << titulo;
        return resposta;
    }
    std::optional<Currency> resposta;
    QStringList titulos;
};

class ListaFormas : public ::testing::Test {
  protected:
    void SetUp() override { lista_.preenche(kFormas); }

    QApplication& aplicacao_ = testing::aplicacaoTeste();
    ListaFormasValor lista_{QStringLiteral("Valor"), 2, nullptr};
};

TEST_F(ListaFormas, ShowsEachMethodWithItsAmountUngrouped) {
    lista_.preenche(kFormas, {{QStringLiteral("MB"), V("1234.5")}});
    ASSERT_EQ(lista_.rowCount(), 2);
    EXPECT_EQ(lista_.item(0, ListaFormasValor::NumInterno)->text(), QStringLiteral("7"));
    EXPECT_EQ(lista_.item(0, ListaFormasValor::Valor)->text(), QStringLiteral("0.00"));
    EXPECT_EQ(lista_.item(1, ListaFormasValor::Valor)->text(), QStringLiteral("1234.50"));
    EXPECT_EQ(lista_.currentRow(), 0);
    EXPECT_EQ(lista_.valor(1), V("1234.5"));
}

TEST_F(ListaFormas, AmountsTypedInTheCells) {
    struct Caso {
        const char* numerario;
        const char* multibanco;
        std::optional<Currency> total;
        bool lidos;
    };
    const Caso casos[] = {
        {"", "2,5", V("2.5"), true},
        {"-3", "1.005", V("-1.995"), true},
        {"1x", "2", std::nullopt, false},
        {"1.2.3", "", std::nullopt, false},
        // Each amount reads, their sum does not fit.
        {"900000000000000", "900000000000000", std::nullopt, true},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.numerario);
        int avisos = 0;
        const auto ligacao =
            QObject::connect(&lista_, &ListaFormasValor::valorAlterado, [&] { ++avisos; });
        lista_.item(0, ListaFormasValor::Valor)->setText(QString::fromLatin1(c.numerario));
        lista_.item(1, ListaFormasValor::Valor)->setText(QString::fromLatin1(c.multibanco));
        QObject::disconnect(ligacao);
        EXPECT_EQ(avisos, 2);
        EXPECT_EQ(lista_.total(), c.total);
        const auto lidos = lista_.valores<ContagemCaixa>();
        ASSERT_EQ(lidos.has_value(), c.lidos);
        if (lidos) {
            ASSERT_EQ(lidos->size(), 2u);
            EXPECT_EQ((*lidos)[0].pagaComo, QStringLiteral("NU"));
            EXPECT_EQ((*lidos)[1].pagaComo, QStringLiteral("MB"));
        }
    }
}

TEST_F(ListaFormas, TheKeypadFillsTheSelectedRow) {
    TecladoFixo teclado;
    lista_.selectRow(1);
    teclado.resposta = V("7.25");
    lista_.pedeValor(teclado);
    EXPECT_EQ(lista_.item(1, ListaFormasValor::Valor)->text(), QStringLiteral("7.25"));
    // Giving up leaves the amount as it was; without a selected row nothing is asked.
    teclado.resposta.reset();
    lista_.pedeValor(teclado);
    EXPECT_EQ(lista_.valor(1), V("7.25"));
    lista_.setCurrentCell(-1, -1);
    lista_.pedeValor(teclado);
    EXPECT_EQ(teclado.titulos,
              (QStringList{QStringLiteral("Multibanco"), QStringLiteral("Multibanco")}));
}

}  // namespace
}  // namespace brasel::cash
