// The search statement: keys, limits, distinct rows and filters become bound values, never text
// of the statement, and the row filter follows the table's identity column.
#include "lookups/pesquisa.h"
#include "lookups/definicoes_pesquisa.h"

#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::lookups {
namespace {

PedidoPesquisa pedidoProdutos() {
    const DefinicaoPesquisa& d = definicao(Mestre::Produtos);
    PedidoPesquisa p;
    p.tabela = d.tabela;
    p.seleccao = d.seleccao;
    p.campos = d.campos;
    p.colunas = d.colunas;
    p.ordem = d.ordem;
    return p;
}

TEST(LimiteLinhas, TextThatIsNotACountListsEverything) {
    const struct {
        const char* texto;
        int limite;
    } casos[] = {{"500", 500},       {" 20 ", 20},        {"1", 1},
                 {"abc", 999999999}, {"", 999999999},     {"0", 999999999},
                 {"-5", 999999999},  {"12.5", 999999999}, {"99999999999", 999999999}};
    for (const auto& caso : casos) {
        SCOPED_TRACE(caso.texto);
        EXPECT_EQ(limiteLinhas(QString::fromUtf8(caso.texto)), caso.limite);
    }
}

TEST(PadraoChave, StarsBecomeWildcardsAndTheKeyIsAPrefix) {
    EXPECT_EQ(padraoChave(QStringLiteral("ab*c")), QStringLiteral("ab%c%"));
    EXPECT_EQ(padraoChave(QStringLiteral("agua")), QStringLiteral("agua%"));
    EXPECT_EQ(padraoChave(QStringLiteral("*x*")), QStringLiteral("%x%%"));
    EXPECT_EQ(padraoChave(QStringLiteral("d'avó")), QStringLiteral("d'avó%"));
}

TEST(ConstruirConsulta, KeyLimitAndOrder) {
    const PedidoPesquisa p = pedidoProdutos();
    const Consulta c = construirConsulta(p, 1, QStringLiteral("ab*c"), QStringLiteral("abc"));
    EXPECT_TRUE(c.sql.startsWith(QStringLiteral("select Produtos.Codigo,Produtos.Descricao,")));
    EXPECT_TRUE(c.sql.contains(QStringLiteral(" where Produtos.NumRegisto>0 ")));
    EXPECT_TRUE(
        c.sql.contains(QStringLiteral("lower(cast(Produtos.Descricao as text)) like lower(?)")));
    EXPECT_TRUE(c.sql.endsWith(QStringLiteral("Order by Produtos.Codigo limit ?")));
    EXPECT_EQ(c.valores, (QVariantList{QStringLiteral("ab%c%"), 999999999}));
}

TEST(ConstruirConsulta, EmptyKeyFiltersNothing) {
    const Consulta c = construirConsulta(pedidoProdutos(), 0, {}, QStringLiteral("25"));
    EXPECT_FALSE(c.sql.contains(QStringLiteral(" like ")));
    EXPECT_EQ(c.valores, QVariantList{25});
}

TEST(ConstruirConsulta, QuotesInTheKeyAreBound) {
    const QString chave = QStringLiteral("x' or '1'='1");
    const Consulta c = construirConsulta(pedidoProdutos(), 1, chave, {});
    EXPECT_FALSE(c.sql.contains(QStringLiteral("'1'")));
    EXPECT_EQ(c.valores.value(0).toString(), chave + u'%');
}

TEST(ConstruirConsulta, FilterValuesComeFirstInOrder) {
    PedidoPesquisa p = pedidoProdutos();
    p.filtro = {QStringLiteral(" and (Produtos.Situacao=? or Produtos.Situacao=?) "),
                {QStringLiteral("A"), QStringLiteral("B")}};
    const Consulta c = construirConsulta(p, 0, QStringLiteral("B0"), QStringLiteral("10"));
    EXPECT_LT(c.sql.indexOf(QStringLiteral("Situacao=?")), c.sql.indexOf(QStringLiteral("like")));
    EXPECT_EQ(c.valores,
              (QVariantList{QStringLiteral("A"), QStringLiteral("B"), QStringLiteral("B0%"), 10}));
}

TEST(ConstruirConsulta, DistinctAndTheDocumentLayoutsIdentity) {
    PedidoPesquisa p;
    p.tabela = QStringLiteral("PDOCUMENTOS");
    p.seleccao = QStringLiteral(" Distinct PDocumentos.Codigo from PDocumentos ");
    const Consulta c = construirConsulta(p, 0, {}, {});
    EXPECT_TRUE(
        c.sql.startsWith(QStringLiteral("select distinct PDocumentos.Codigo from PDocumentos where "
                                        "PDOCUMENTOS.Record>0 ")));
    // A list whose first column merely begins with the word is not distinct.
    p.tabela = QStringLiteral("Distintos");
    p.seleccao = QStringLiteral("DistinctivoCodigo from Distintos");
    const Consulta d = construirConsulta(p, 0, {}, {});
    EXPECT_TRUE(d.sql.startsWith(
        QStringLiteral("select DistinctivoCodigo from Distintos where Distintos.NumRegisto>0")));
}

TEST(MensagemErroBaseDados, EachKindOfTrouble) {
    const struct {
        const char* erro;
        const char* mensagem;
    } casos[] = {
        {"no such column: Produtos.Cor Unable to execute statement",
         "Campo Inexistente na Tabela Produtos"},
        {"ERROR:  column produtos.cor does not exist", "Campo Inexistente na Tabela Produtos"},
        {"no such table: Produtos", "Tabela Inexistente ou Base de Dados"},
        {"ERROR:  relation \"produtos\" does not exist", "Tabela Inexistente ou Base de Dados"},
        {"A ligação à base de dados não está aberta.",
         "Falha na Ligação ao Servidor ou não pode abrir mais Ligações na Transacção"},
        {"server closed the connection unexpectedly",
         "Falha na Ligação ao Servidor ou não pode abrir mais Ligações na Transacção"},
    };
    for (const auto& caso : casos) {
        SCOPED_TRACE(caso.erro);
        EXPECT_EQ(mensagemErroBaseDados(QString::fromUtf8(caso.erro), QStringLiteral("Produtos")),
                  QString::fromUtf8(caso.mensagem));
    }
}

TEST(DefinicoesPesquisa, CodeFirstDescriptionSecond) {
    // "/" and "\" rely on the first two fields; the window returns the first two columns.
    for (int m = 0; m <= static_cast<int>(Mestre::ProdutosFacturaREST); ++m) {
        const DefinicaoPesquisa& d = definicao(static_cast<Mestre>(m));
        SCOPED_TRACE(d.tabela.toStdString());
        ASSERT_GE(d.campos.size(), 2u);
        EXPECT_EQ(d.campos[0].coluna, d.codigo);
        EXPECT_EQ(d.campos[1].coluna, d.descricao);
        const QString lista = d.seleccao.trimmed().remove(QStringLiteral("Distinct "));
        EXPECT_TRUE(lista.startsWith(d.codigo + u',' + d.descricao)) << lista.toStdString();
        EXPECT_FALSE(d.titulo.isEmpty());
    }
}

}  // namespace
}  // namespace brasel::lookups
