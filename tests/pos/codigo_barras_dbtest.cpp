// The order screen's code box on the demo restaurant: conversion of typed codes, labels turned
// into what the line gets, and the price and quantity asked by registered barcodes.
#include "pos/codigo_barras.h"
#include "pos/preco_quant.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

namespace brasel::pos {
namespace {

class CodigoBarrasTeste : public ::testing::Test {
  protected:
    void executa(const QString& sql, const QVariantList& valores = {}) {
        ASSERT_TRUE(e_.gConn.exec(sql, valores)) << e_.gConn.lastError().toStdString();
    }
    // Price labels "29" + 5 code characters + 5 digits of cents; quantity labels "28" + 4 code
    // characters + 5 digits of grams.
    void ligaPrefixos() {
        executa(QStringLiteral(
                    "update ParamGeral set controlOficial=1,Prefixo1Preco=?,Prefixo2Preco=?,"
                    "PrefixoPrecoCorte1=5,PrefixoPrecoCorte2=5,PrefixoPrecoDivisor=100,"
                    "Prefixo1Quant=?,Prefixo2Quant=?,PrefixoQuantCorte1=4,PrefixoQuantCorte2=5,"
                    "PrefixoQuantDivisor=1000"),
                {QStringLiteral("29"), QStringLiteral("2A"), QStringLiteral("28"),
                 QStringLiteral("27")});
    }

    testing::EmpresaTeste empresa_{true};
    app::Estado& e_ = empresa_.estado();
    testing::MensagensGravadas mensagens_;
};

TEST_F(CodigoBarrasTeste, ConvertsTypedCodesToProducts) {
    executa(QStringLiteral(
                "insert into ProdutosOutrosDados (Produto,Fornecedor,RefProduto) values (?,?,?)"),
            {QStringLiteral("B006"), QStringLiteral("F01"), QStringLiteral("REF'6")});
    struct Caso {
        const char* nome;
        const char* fornecedor;
        const char* codigo;
        bool usaFornecedor;
        const char* esperado;
    } casos[] = {
        {"product code", "", "B001", false, "B001"},
        {"registered barcode", "", "5601234000023", false, "B002"},
        {"unknown code unchanged", "", "X'99", false, "X'99"},
        {"supplier reference with a quote", "F01", "REF'6", true, "B006"},
        {"supplier reference not asked for", "F01", "REF'6", false, "REF'6"},
        {"other supplier: the conversion procedure", "F02", "5601234000030", true, "B003"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        EXPECT_EQ(ConverteCodigo(e_.gConn, QString::fromUtf8(c.fornecedor),
                                 QString::fromUtf8(c.codigo), c.usaFornecedor),
                  QString::fromUtf8(c.esperado));
    }
}

TEST_F(CodigoBarrasTeste, ZeroFillingFindsTheProductOnlyWhenAsked) {
    executa(QStringLiteral("insert into Produtos (Codigo,Descricao) values (?,?)"),
            {QStringLiteral("000123"), QStringLiteral("Numerado")});
    EXPECT_EQ(Zerar_Produto_str(e_.gConn, QStringLiteral(" 123 "), true), QStringLiteral("000123"));
    EXPECT_EQ(Zerar_Produto_str(e_.gConn, QStringLiteral("123"), false), QStringLiteral("123"));
    EXPECT_EQ(Zerar_Produto_str(e_.gConn, QStringLiteral("5601234000016"), true),
              QStringLiteral("5601234000016"));
    EXPECT_EQ(Zerar_Produto_str(e_.gConn, QStringLiteral("B001"), true), QStringLiteral("B001"));
}

TEST_F(CodigoBarrasTeste, CodeBoxGivesWhatTheLineGets) {
    ligaPrefixos();
    executa(QStringLiteral("insert into Produtos (Codigo,Descricao,PrecoVenda1) values (?,?,?)"),
            {QStringLiteral("Z0000"), QStringLiteral("Sem preço"), QStringLiteral("0")});
    struct Caso {
        const char* nome;
        const char* codigo;
        const char* precario;
        const char* produto;
        Currency quantidade;
        std::optional<Currency> preco;
        const char* precarioFinal;
    } casos[] = {
        {"price label of an unknown product", "2aZZZZZ005009", "1", "ZZZZZ", Currency(1),
         Currency(5), "1"},
        {"price label, empty tier", "29ZZZZZ005009", "", "ZZZZZ", Currency(1), Currency(5), "1"},
        {"price label of a product without a price", "29Z0000003509", "1", "Z0000", Currency(1),
         Currency::fromRaw(35000), "1"},
        {"quantity label", "28B001015009", "1", "B001", Currency::fromRaw(15000), std::nullopt,
         "1"},
        {"quantity label of 0 grams", "28B001000009", "1", "B001", Currency(1), std::nullopt, "1"},
        {"plain code", "B003", "3", "B003", Currency(1), std::nullopt, "3"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        const auto lido = cmdImputCodigoBarras(e_, mensagens_, QString::fromUtf8(c.codigo),
                                               QString::fromUtf8(c.precario));
        ASSERT_TRUE(lido);
        EXPECT_EQ(lido->produto, QString::fromUtf8(c.produto));
        EXPECT_EQ(lido->texto, QString::fromUtf8(c.codigo));
        EXPECT_EQ(lido->quantidade, c.quantidade);
        EXPECT_EQ(lido->preco, c.preco);
        EXPECT_EQ(lido->precario, QString::fromUtf8(c.precarioFinal));
    }
    EXPECT_TRUE(mensagens_.mensagens().isEmpty());
}

TEST_F(CodigoBarrasTeste, PriceLabelBecomesUnitsOfTheProductsPrice) {
    ligaPrefixos();
    // Four code characters: B005 costs 2.50 on tier 1 and 2.80 on tier 2.
    executa(QStringLiteral("update ParamGeral set PrefixoPrecoCorte1=4"));
    struct Caso {
        const char* codigo;
        const char* precario;
        Currency quantidade;
        Currency preco;
    } casos[] = {
        {"29B005005009", "1", Currency(2), Currency::fromRaw(25000)},
        {"29B005005609", "2", Currency(2), Currency::fromRaw(28000)},
        {"29B005001259", "1", Currency::fromRaw(5000), Currency::fromRaw(25000)},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.codigo);
        const auto lido = cmdImputCodigoBarras(e_, mensagens_, QString::fromUtf8(c.codigo),
                                               QString::fromUtf8(c.precario));
        ASSERT_TRUE(lido);
        EXPECT_EQ(lido->produto, QStringLiteral("B005"));
        EXPECT_EQ(lido->quantidade, c.quantidade);
        EXPECT_EQ(lido->preco, c.preco);
        EXPECT_EQ(lido->quantidade * *lido->preco,
                  Currency::parse(QString::fromUtf8(c.codigo).mid(6, 5))->dividedBy(100));
    }
}

TEST_F(CodigoBarrasTeste, LabelsAreCutWithTheCompanysSettings) {
    const QString etiqueta = QStringLiteral("29B005001257");
    EXPECT_EQ(LerCodigoBarras(e_.gConn, etiqueta).produto, QString());  // no scheme on
    ligaPrefixos();
    executa(QStringLiteral("update ParamGeral set PrefixoPrecoCorte1=4"));
    const LeituraCodigo l = LerCodigoBarras(e_.gConn, etiqueta);
    EXPECT_EQ(l.produto + u'|' + l.valor + u'|' + l.tipo, QStringLiteral("B005|1.25|P"));
    executa(QStringLiteral("delete from ParamGeral"));
    const LeituraCodigo semParametros = LerCodigoBarras(e_.gConn, etiqueta);
    EXPECT_EQ(semParametros.produto + semParametros.valor + semParametros.tipo, QString());
}

TEST_F(CodigoBarrasTeste, BlankOrUnreadableCodesAddNothing) {
    EXPECT_FALSE(cmdImputCodigoBarras(e_, mensagens_, QStringLiteral("   "), QStringLiteral("1")));
    EXPECT_TRUE(mensagens_.mensagens().isEmpty());
    ligaPrefixos();
    executa(QStringLiteral("update ParamGeral set PrefixoPrecoDivisor=0"));
    EXPECT_FALSE(
        cmdImputCodigoBarras(e_, mensagens_, QStringLiteral("29B005005009"), QStringLiteral("1")));
    EXPECT_TRUE(mensagens_.contem(QStringLiteral("Código de Barras Inválido!")));
}

class JanelaGravada : public JanelaPrecoQuant {
  public:
    PrecoQuant pedir(const QString& codigo, const PropostaPrecoQuant& p) override {
        pedidos << codigo;
        proposta = p;
        return resposta;
    }
    QStringList pedidos;
    PropostaPrecoQuant proposta;
    PrecoQuant resposta;
};

TEST_F(CodigoBarrasTeste, RegisteredBarcodesProposeTheirPriceAndQuantity) {
    const QString sql = QStringLiteral(
        "insert into ProdutosCodigosBarras (CodigoBarras,ProdutoBase,Interactividade,ActivaPreco,"
        "PrecoVenda,PrecoDigitado,ActivaQuantidade,Quantidade) values (?,?,?,?,?,?,?,?)");
    executa(sql, {QStringLiteral("INT-0"), QStringLiteral("B005"), 1, 1, 0, QStringLiteral("9.99"),
                  0, QStringLiteral("0")});
    executa(sql, {QStringLiteral("INT-2"), QStringLiteral("B005"), 1, 1, 2, QStringLiteral("9.99"),
                  1, QStringLiteral("0.5")});
    executa(sql, {QStringLiteral("SEM"), QStringLiteral("B005"), 0, 1, 1, QStringLiteral("1"), 1,
                  QStringLiteral("1")});
    JanelaGravada janela;
    janela.resposta = {Currency(7), Currency(3)};

    const PrecoQuant digitado = AbrirPrecoQuant(e_.gConn, janela, QStringLiteral("INT-0"));
    EXPECT_TRUE(janela.proposta.comPreco);
    EXPECT_FALSE(janela.proposta.comQuantidade);
    EXPECT_EQ(janela.proposta.preco, Currency::fromRaw(99900));
    EXPECT_EQ(digitado.preco, Currency(7));
    EXPECT_EQ(digitado.quantidade, std::nullopt);

    const PrecoQuant tier2 = AbrirPrecoQuant(e_.gConn, janela, QStringLiteral("INT-2"));
    EXPECT_EQ(janela.proposta.preco, Currency::fromRaw(28000));
    EXPECT_EQ(janela.proposta.quantidade, Currency::fromRaw(5000));
    EXPECT_EQ(tier2.preco, Currency(7));
    EXPECT_EQ(tier2.quantidade, Currency(3));

    for (const char* codigo : {"SEM", "5601234000016", "B005"}) {
        const PrecoQuant nada = AbrirPrecoQuant(e_.gConn, janela, QString::fromUtf8(codigo));
        EXPECT_EQ(nada.preco, std::nullopt) << codigo;
        EXPECT_EQ(nada.quantidade, std::nullopt) << codigo;
    }
    EXPECT_EQ(janela.pedidos, (QStringList{QStringLiteral("INT-0"), QStringLiteral("INT-2")}));
}

}  // namespace
}  // namespace brasel::pos
