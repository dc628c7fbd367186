#include "devices/formata_colunas.h"
#include "devices/documento_impresso.h"
#include "devices/escolha_impressao.h"
#include "devices/talao_comum.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::devices {
namespace {

Currency v(const char* texto) {
    return *Currency::parse(QString::fromLatin1(texto));
}

TEST(FormataColunas, LargurasEAlinhamentos) {
    struct Caso {
        const char* nome;
        QString resultado;
        QString esperado;
    };
    const QString e = QStringLiteral("E");
    const QString d = QStringLiteral("D");
    const Caso casos[] = {
        {"o exemplo: total à esquerda, valor à direita",
         FormataColunas(QStringLiteral("Total Geral"), 20, e, QStringLiteral("12,50"), 20, d),
         QStringLiteral("Total Geral") + QString(9, u' ') + QString(15, u' ') +
             QStringLiteral("12,50")},
        {"segundo texto vazio: só a primeira coluna",
         FormataColunas(QStringLiteral("Total Geral"), 20, e, QString(), 20, d),
         QStringLiteral("Total Geral") + QString(9, u' ')},
        {"só brancos contam como vazio",
         FormataColunas(QStringLiteral("   "), 10, e, QStringLiteral("x"), 3, d),
         QStringLiteral("  x")},
        {"o texto é aparado antes de alinhado",
         FormataColunas(QStringLiteral("  a  "), 4, d, QStringLiteral(" b "), 3, e),
         QStringLiteral("   ab  ")},
        {"cortado à largura, pelo fim",
         FormataColunas(QStringLiteral("Pago por: (MB) Multibanco contactless"), 12, e,
                        QStringLiteral("1234567,89"), 6, d),
         QStringLiteral("Pago por: (M123456")},
        {"três colunas",
         FormataColunas(QStringLiteral("A"), 2, e, QStringLiteral("B"), 2, d, QStringLiteral("C"),
                        3, d),
         QStringLiteral("A  B  C")},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        EXPECT_EQ(c.resultado, c.esperado);
    }
    EXPECT_EQ(
        FormataColunas(QStringLiteral("Total Geral"), 20, e, QStringLiteral("12,50"), 20, d).size(),
        40);
}

TEST(ValoresDoTalao, VirgulaDecimalSemMilhares) {
    struct Caso {
        const char* valor;
        int decimais;
        const char* esperado;
    };
    const Caso casos[] = {
        {"1234.5", 2, "1234,50"}, {"0", 2, "0,00"}, {"-3.1", 2, "-3,10"},     {"2.125", 2, "2,12"},
        {"2.135", 2, "2,14"},     {"7", 0, "7"},    {"1.23456", 9, "1,2346"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.valor);
        EXPECT_EQ(ValorTalao(v(c.valor), c.decimais), QString::fromLatin1(c.esperado));
    }
    // DecimaisImpTaloes wins when above 0, else the company's decimals.
    EXPECT_EQ(DecimaisTalao(3, 2), 3);
    EXPECT_EQ(DecimaisTalao(0, 2), 2);
    EXPECT_EQ(DecimaisTalao(-1, 4), 4);
}

TEST(LinhasDoTalao, TotaisProdutosEResumoIva) {
    // The totals block: the value ends at column 32, the label is cut before it is overrun.
    EXPECT_EQ(LinhaTotal(QStringLiteral("Total Geral"), QStringLiteral("33,05")),
              QStringLiteral("Total Geral") + QString(16, u' ') + QStringLiteral("33,05"));
    EXPECT_EQ(LinhaTotal(QString(40, u'x'), QStringLiteral("1,00")).size(), 32);
    EXPECT_TRUE(LinhaTotal(QString(40, u'x'), QStringLiteral("1,00")).endsWith(u"x1,00"));

    LinhaImpressa vinho;
    vinho.descricao = QStringLiteral("Vinho tinto da casa");
    vinho.quantidade = v("0.5");
    vinho.valorIliq = v("4");
    vinho.desconto = v("0.4");
    vinho.iva = v("0.67");
    vinho.ivaIncluido = true;
    // 16 + 9 + 15: the VAT inside the price is not added again.
    EXPECT_EQ(LinhaProduto(vinho, 2, 3),
              QStringLiteral("Vinho tinto da c    0,500           3,60"));
    LinhaImpressa bife = vinho;
    bife.valorIliq = v("25");
    bife.desconto = Currency();
    bife.iva = v("3.25");
    bife.ivaIncluido = false;
    EXPECT_EQ(bife.total(), v("28.25"));

    bife.ivaTabela = QStringLiteral("IT");
    bife.ivaTaxa = v("13");
    vinho.ivaTabela = QStringLiteral("NO");
    vinho.ivaTaxa = v("23");
    LinhaImpressa agua = vinho;
    agua.valorIliq = v("1.2");
    agua.desconto = Currency();
    agua.iva = v("0.22");
    const auto grupos = AgrupaIva({bife, vinho, agua});
    ASSERT_EQ(grupos.size(), 2u);
    EXPECT_EQ(grupos[1].incidencia, v("3.91"));
    EXPECT_EQ(grupos[1].iva, v("0.89"));
    EXPECT_EQ(grupos[1].desconto, v("0.4"));
    EXPECT_EQ(ResumoIva(grupos, 2),
              (QStringList{QStringLiteral("IT        13          28,25         3,25"),
                           QStringLiteral("NO        23           4,80         0,89")}));
    EXPECT_EQ(TaxaTalao(v("6.5")), QStringLiteral("6,5"));
}

TEST(LinhasDoTalao, NotaEObservacaoEmPedacosDeQuarenta) {
    const QString quarenta(40, u'a');
    EXPECT_EQ(PedacosNota(quarenta + QStringLiteral("bb")),
              (QStringList{quarenta, QStringLiteral("bb")}));
    EXPECT_TRUE(PedacosNota(QString()).isEmpty());
    // Each line of the observation on its own, at most five pieces of it (200 characters).
    const QString longa = QString(230, u'x');
    const QStringList pedacos =
        PedacosObservacao(QStringLiteral("Sem sal\r\n") + longa + QStringLiteral("\r\nFim"));
    ASSERT_EQ(pedacos.size(), 7);
    EXPECT_EQ(pedacos.first(), QStringLiteral("Sem sal"));
    EXPECT_EQ(pedacos.at(5), QString(40, u'x'));
    EXPECT_EQ(pedacos.last(), QStringLiteral("Fim"));
}

TEST(EscolhaDaImpressao, EmpacotadaNumValorEDesempacotada) {
    struct Caso {
        EscolhaImpressao escolha;
        const char* valor;
    };
    const Caso casos[] = {
        {{EscolhaImpressao::Nenhum, 1, false}, "0.01"},
        {{EscolhaImpressao::TalaoCompra, 2, false}, "1.02"},
        {{EscolhaImpressao::Contabilistico, 0, false}, "2"},
        {{EscolhaImpressao::Contabilistico, 99, true}, "2.991"},
        {{EscolhaImpressao::TalaoCompra, 10, false}, "1.1"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.valor);
        const Currency empacotado = EmpacotaEscolha(c.escolha);
        EXPECT_EQ(empacotado, v(c.valor));
        const EscolhaImpressao e = DesempacotaEscolha(empacotado);
        EXPECT_EQ(e.escolha, c.escolha.escolha);
        EXPECT_EQ(e.vias, c.escolha.vias);
        EXPECT_EQ(e.observacao, c.escolha.observacao);
    }
    // A caller that packs choice + copies / 100 itself is read the same way.
    const EscolhaImpressao e = DesempacotaEscolha(v("1") + *Currency::parse(u"0.03"));
    EXPECT_EQ(e.escolha, 1);
    EXPECT_EQ(e.vias, 3);
    EXPECT_FALSE(e.observacao);
    // More than 99 copies do not spill into the choice.
    EXPECT_EQ(DesempacotaEscolha(EmpacotaEscolha({1, 150, false})).escolha, 1);
}

}  // namespace
}  // namespace brasel::devices
