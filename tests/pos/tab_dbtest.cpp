// What happens to a tab once it has lines: another user's lines taken over, lines deleted and
// changed behind the supervisor's password, ticked, moved to another table or type; and the
// table picker's buttons.
#include "pos/adicionar_produto.h"
#include "pos/alteracao_linhas.h"
#include "pos/mesas.h"
#include "pos/mover_tab.h"
#include "pos/pendentes_tab.h"
#include "pos/tab_teste.h"
#include "pricing/insere_teste.h"
#include "support/impressao_qt.h"

namespace brasel::pos {
namespace {

using pricing::teste::insere;
using pricing::teste::T;

class TabLinhasTeste : public teste::TabTeste {
  protected:
    qint64 adiciona(const char* produto) {
        const qint64 n = AdicionarProduto(tab_, p_, QString::fromLatin1(produto));
        EXPECT_GT(n, 0) << produto << m_.textos().join(u'|').toStdString();
        return n;
    }
    const BotaoMesa* botao(const std::vector<BotaoMesa>& botoes, const QString& codigo) {
        for (const BotaoMesa& b : botoes)
            if (b.codigo == codigo) return &b;
        return nullptr;
    }
};

TEST_F(TabLinhasTeste, PassagemDeOutroUtilizadorGuardaAsLinhasRecusadasComORazao) {
    insere(estado(), "TabIva", {{"codigo", T("Z4")}, {"Taxa", T("5")}});
    insere(estado(), "TabIva", {{"codigo", T("Z5")}, {"Taxa", T("7")}});
    // SUPERVISOR already holds four VAT tables on M01.
    linhaDe("SUPERVISOR", "M01", "A1", "RD");
    linhaDe("SUPERVISOR", "M01", "A2", "IT");
    linhaDe("SUPERVISOR", "M01", "A3", "NO");
    linhaDe("SUPERVISOR", "M01", "A4", "Z4");
    linhaDe("ANA", "M01", "N1", "NO");
    linhaDe("ANA", "M01", "N2", "Z5");
    linhaDe("ANA", "M01", "N3", "");
    linhaDe("ANA", "M02", "N4", "RD");

    // Said no: nothing moves.
    m_.responder({false});
    ASSERT_TRUE(AbrirMesa(tab_, QStringLiteral("M01")));
    EXPECT_TRUE(m_.perguntas().first().startsWith(
        QStringLiteral("Cliente/Mesa já Aberta por outro Utilizador.\r\nDeseja passar")));
    EXPECT_EQ(tab_.lista().linhas.size(), 4u);

    m_.limpar();
    m_.responder({true});
    ASSERT_TRUE(AbrirMesa(tab_, QStringLiteral("M01")));
    EXPECT_EQ(tab_.lista().linhas.size(), 6u);
    EXPECT_EQ(m_.textos(),
              QStringList{QStringLiteral("Não foi possível passar todos os Produtos:\r\n"
                                         "(N2) -> Atingido o Limite de quatro IVAS")});
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Utilizador='ANA'")), 2);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Codigo='N2' and "
                                    "Utilizador='ANA'")),
              1);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from LogGeral where Modulo='FC' and "
                                    "Accao='A' and Terceiro='M01' and Descricao=?"),
                     {QStringLiteral("Mudança de Produto Util. (ANA) para (SUPERVISOR)")}),
              2);
}

TEST_F(TabLinhasTeste, ApagarAUltimaLinhaLimpaOTalaoImpresso) {
    const qint64 n = adiciona("P002");
    ASSERT_TRUE(estado().gConn.exec(
        QStringLiteral("update Clientes set JaImprimiuTalao=1 where Codigo='M01'")));
    ASSERT_TRUE(AbrirMesa(tab_, QStringLiteral("M01")));
    EXPECT_FALSE(tab_.edicaoLivre);
    EXPECT_EQ(botao(CarregarClientes(estado()), QStringLiteral("M01"))->caption,
              QStringLiteral("Mesa 1 [$]"));

    // Without the supervisor's password nothing goes.
    p_.password = false;
    EXPECT_FALSE(EliminarLinha(tab_, p_, n));
    EXPECT_EQ(linhasMovProduto(), 1);
    // With it, and the confirmation.
    p_.password = true;
    m_.responder({true});
    ASSERT_TRUE(EliminarLinha(tab_, p_, n));
    EXPECT_TRUE(m_.perguntas().contains(QStringLiteral("Confirma a Eliminação ?")));
    EXPECT_EQ(linhasMovProduto(), 0);
    EXPECT_TRUE(tab_.lista().linhas.empty());
    EXPECT_TRUE(tab_.lista().totais.total.isZero());
    EXPECT_TRUE(tab_.edicaoLivre);
    const std::vector<BotaoMesa> mesas = CarregarClientes(estado());
    const BotaoMesa* m01 = botao(mesas, QStringLiteral("M01"));
    ASSERT_NE(m01, nullptr);
    EXPECT_EQ(m01->caption, QStringLiteral("Mesa 1"));
    EXPECT_FALSE(m01->ocupada);
    // The kitchen hears of it: the order and its cancellation, without a note.
    EXPECT_EQ(contar(QStringLiteral("select count(*) from HistoricoCopa where ANULACAO='S' and "
                                    "COALESCE(ObsLinha,'')='' and Produto='P002'")),
              1);
}

TEST_F(TabLinhasTeste, ApagarUmaLinhaDeVariasMantemOTalaoEAsOutras) {
    const qint64 a = adiciona("B015");
    adiciona("B001");
    ASSERT_TRUE(estado().gConn.exec(
        QStringLiteral("update Clientes set JaImprimiuTalao=1 where Codigo='M01'")));
    m_.responder({true});
    ASSERT_TRUE(EliminarLinha(tab_, p_, a));
    EXPECT_EQ(tab_.lista().linhas.size(), 1u);
    EXPECT_EQ(contar(QStringLiteral("select JaImprimiuTalao from Clientes where Codigo='M01'")), 1);
    // A drink's deletion is not the kitchen's business.
    EXPECT_EQ(pedidosCozinha(), 0);
}

TEST_F(TabLinhasTeste, AlterarQuantidadeSubstituiALinhaAoMesmoPreco) {
    const qint64 n = adiciona("B003");  // 1.80 with VAT included
    m_.respostaFinal = true;
    p_.numeros = {Currency(3)};
    const qint64 nova = AlterarQuantidade(tab_, p_, n);
    ASSERT_GT(nova, 0);
    ASSERT_EQ(tab_.lista().linhas.size(), 1u);
    const pricing::LinhaLista& l = tab_.lista().linhas.front();
    EXPECT_EQ(l.numRegisto, nova);
    EXPECT_EQ(l.quantidade, Currency(3));
    EXPECT_EQ(l.preco, *Currency::parse(u"1.463"));  // three price decimals
    EXPECT_EQ(tab_.lista().totais.total, *Currency::parse(u"5.40"));
    EXPECT_EQ(linhasMovProduto(), 1);

    // A quantity of 0, or no answer, changes nothing.
    p_.numeros = {Currency{}};
    EXPECT_EQ(AlterarQuantidade(tab_, p_, nova), 0);
    EXPECT_EQ(AlterarQuantidade(tab_, p_, nova), 0);
    EXPECT_EQ(tab_.lista().linhas.front().numRegisto, nova);
}

TEST_F(TabLinhasTeste, AlterarQuantidadeRecusadaGuardaALinhaAntiga) {
    const qint64 n = adiciona("B015");
    ASSERT_TRUE(estado().gConn.exec(
        QStringLiteral("update Produtos set Situacao='I' where Codigo='B015'")));
    m_.respostaFinal = true;
    p_.numeros = {Currency(2)};
    EXPECT_EQ(AlterarQuantidade(tab_, p_, n), 0);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where NumRegisto=?"), {n}), 1);
    EXPECT_EQ(tab_.lista().linhas.size(), 1u);
    EXPECT_FALSE(tab_.pendentes.precoDefinido);
}

TEST_F(TabLinhasTeste, LinhaDesmarcadaSaiDosTotais) {
    const qint64 a = adiciona("B015");  // 0.80 + 13 %
    adiciona("B001");                   // 1.20 + 6 %
    const Currency total = tab_.lista().totais.total;
    ASSERT_TRUE(tab_.marcarLinha(a, false));
    EXPECT_EQ(contar(QStringLiteral("select SelecFecha from MovProduto where NumRegisto=?"), {a}),
              0);
    EXPECT_EQ(tab_.lista().totais.total, *Currency::parse(u"1.27"));
    ASSERT_TRUE(tab_.marcarLinha(a, true));
    EXPECT_EQ(tab_.lista().totais.total, total);
}

TEST_F(TabLinhasTeste, ConsumidorFinalSoVendaAPronto) {
    // A return ("S-") on M01 cannot move to the walk-in customer...
    ASSERT_TRUE(tab_.definirTipo(QStringLiteral("DV")));
    adiciona("B015");
    p_.mesaEscolhida = QStringLiteral("CF");
    EXPECT_FALSE(MudarMesa(tab_, p_));
    EXPECT_TRUE(m_.contem(QStringLiteral(
        "Cliente apenas de Vendas a Pronto\r\nNão pode Alterar para este Cliente!")));
    EXPECT_EQ(m_.mensagens().last().titulo, QStringLiteral("A T E N Ç Ã O !"));
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Terceiro='CF'")), 0);

    // ...while the walk-in customer's own tab may become a return, but not an invoice.
    tab_.definirTipo(QStringLiteral("VD"));
    ASSERT_TRUE(AbrirMesa(tab_, QStringLiteral("CF")));
    adiciona("B001");
    m_.limpar();
    p_.tipoEscolhido = QStringLiteral("FT");
    EXPECT_FALSE(MudarTipo(tab_, p_));
    EXPECT_TRUE(
        m_.contem(QStringLiteral("Não pode aplicar este tipo de Movimento a este Cliente!")));
    p_.tipoEscolhido = QStringLiteral("DV");
    m_.responder({true});
    ASSERT_TRUE(MudarTipo(tab_, p_));
    EXPECT_EQ(tab_.tipo().codigo, QStringLiteral("DV"));
    ASSERT_EQ(tab_.lista().linhas.size(), 1u);
    auto r = estado().gConn.firstRow(QStringLiteral(
        "select Tipo,AfectaCli,AfectaStk,Caixa from MovProduto where Terceiro='CF'"));
    ASSERT_TRUE(r);
    EXPECT_EQ(r->value(0).toString(), QStringLiteral("DV"));
    EXPECT_EQ(r->value(1).toString(), QStringLiteral("S-"));
    EXPECT_EQ(r->value(2).toString(), QStringLiteral("S-"));
    EXPECT_EQ(r->value(3).toString(), QStringLiteral("R-"));
}

TEST_F(TabLinhasTeste, MudarDeMesaLevaAsLinhas) {
    adiciona("B015");
    adiciona("P002");
    p_.mesaEscolhida = QStringLiteral("M02");
    m_.responder({true});
    ASSERT_TRUE(MudarMesa(tab_, p_));
    EXPECT_EQ(tab_.mesa().codigo, QStringLiteral("M02"));
    EXPECT_EQ(tab_.lista().linhas.size(), 2u);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Terceiro='M01'")), 0);
    const auto botoes = CarregarClientes(estado());
    EXPECT_FALSE(botao(botoes, QStringLiteral("M01"))->ocupada);
    EXPECT_TRUE(botao(botoes, QStringLiteral("M02"))->ocupada);
}

TEST_F(TabLinhasTeste, MesaInexistenteLimpaAMesaEGuardaOTipo) {
    adiciona("B015");
    EXPECT_FALSE(AbrirMesa(tab_, QStringLiteral("NAOHA")));
    EXPECT_TRUE(tab_.mesa().codigo.isEmpty());
    EXPECT_TRUE(tab_.lista().linhas.empty());
    EXPECT_EQ(tab_.tipo().codigo, QStringLiteral("VD"));
}

TEST_F(TabLinhasTeste, BotoesDosValoresPendentes) {
    struct Caso {
        const char* caso;
        std::optional<Currency> teclado;
        const char* caption;
        Currency quantidade;
    };
    const Caso quantidades[] = {{"positiva", Currency(2), "Qty Alt.", Currency(2)},
                                {"zero volta a uma", Currency{}, "Qty", Currency(1)},
                                {"desistiu", std::nullopt, "Qty", Currency(1)}};
    for (const Caso& c : quantidades) {
        SCOPED_TRACE(c.caso);
        p_.numeros = {c.teclado};
        EXPECT_EQ(PedeQuantidadePendente(tab_, p_), QString::fromUtf8(c.caption));
        EXPECT_EQ(tab_.pendentes.quantidade, c.quantidade);
    }
    p_.numeros = {Currency{}};
    EXPECT_EQ(PedePrecoPendente(tab_, p_), QStringLiteral("Preço Alt."));
    EXPECT_TRUE(tab_.pendentes.precoDefinido);
    p_.numeros = {std::nullopt};
    EXPECT_EQ(PedePrecoPendente(tab_, p_), QStringLiteral("Preço"));
    EXPECT_FALSE(tab_.pendentes.precoDefinido);
}

}  // namespace
}  // namespace brasel::pos
