// The table bill printed from an open tab: its messages, and the signed copy of the open lines
// that leaves the tab itself open and locked against free changes.
#include "app/definicoes_posto.h"
#include "pos/fecho_teste.h"
#include "pos/imprime_doc_aberto.h"
#include "pricing/insere_teste.h"
#include "support/impressao_qt.h"

namespace brasel::pos {
namespace {

using pricing::teste::insere;
using pricing::teste::T;

class ImprimeDocAbertoTeste : public teste::FechoTeste {};

struct Recusa {
    const char* caso;
    const char* tipoImprimeMesa;
    bool confirma;
    const char* mensagem;  // "" when only the question was asked
};

const Recusa kRecusas[] = {
    {"sem tipo", "", true,
     "Não tem o Tipo de Movimento previsto para este processo!\r\n"
     "Favor de alterar as Configurações e definir o Tipo de Movimento para o efeito.\r\n"
     "Nota: O referido Tipo de Movimento tem que ser criado no Montiva com as seguintes "
     "definições:\r\n"
     "  - Módulo -> FC;\r\n"
     "  - Afectação em Clientes -> NA;\r\n"
     "  - Afectação em Stocks -> NA;\r\n"
     "  - Afectação em Caixa -> NA;\r\n"
     "  - Afectação em Bancos -> NA;"},
    {"tipo sem assinatura", "CS", true,
     "O Tipo de Movimento CS não está configurado para gerar Assinatura."},
    {"tipo inexistente", "ZZ", true,
     "O Tipo de Movimento ZZ não está configurado para gerar Assinatura."},
    {"não confirma", "CM", false, ""},
};

class RecusaTeste : public ImprimeDocAbertoTeste, public ::testing::WithParamInterface<Recusa> {};

TEST_P(RecusaTeste, NadaEscrito) {
    const Recusa& c = GetParam();
    insere(estado(), "TabTipoMov",
           {{"codigo", T("CS")}, {"Modulo", T("FC")}, {"AfectaCli", T("NA")}, {"ControloHash", 0}});
    ASSERT_TRUE(app::posto::TipoImprimeMesa.gravar(QString::fromLatin1(c.tipoImprimeMesa)));
    adiciona({"B001"});
    m_.responder({c.confirma});
    EXPECT_EQ(ImprimeDocAberto(tab_), std::nullopt);
    if (*c.mensagem) {
        EXPECT_EQ(m_.textos(), QStringList{QString::fromUtf8(c.mensagem)});
        EXPECT_TRUE(m_.perguntas().isEmpty());
    } else {
        EXPECT_EQ(m_.perguntas(),
                  QStringList{QStringLiteral("Confirma a Impressão do Talão (M)?")});
    }
    EXPECT_EQ(cabecalhos(), 0);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto")), 1);
    EXPECT_TRUE(tab_.edicaoLivre);
}

INSTANTIATE_TEST_SUITE_P(Mensagens, RecusaTeste, ::testing::ValuesIn(kRecusas),
                         [](const ::testing::TestParamInfo<Recusa>& i) {
                             return std::string("caso") + std::to_string(i.index);
                         });

TEST_F(ImprimeDocAbertoTeste, CopiaAsLinhasParaUmDocumentoAssinadoEBloqueiaAMesa) {
    ASSERT_TRUE(app::posto::TipoImprimeMesa.gravar(QStringLiteral("CM")));
    adiciona({"B001", "B002"});
    const Currency total = tab_.lista().totais.total;
    m_.responder({true});
    const auto numero = ImprimeDocAberto(tab_);
    ASSERT_EQ(numero, QStringLiteral("00000001")) << m_.textos().join(u'|').toStdString();
    EXPECT_FALSE(tab_.edicaoLivre);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovCliente where Tipo='CM' and "
                                    "Numero='00000001' and Codigo='M01' and Hash<>'' and "
                                    "Observa='Processamento automático.' and TotalDoc=?"),
                     {total.toText()}),
              1);
    EXPECT_EQ(ultNumero("CM"), QStringLiteral("00000001"));
    EXPECT_EQ(ultNumero("VD"), QStringLiteral("00000000"));
    // The tab's own lines stay open; each copy is closed and points at its original.
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Tipo='VD' and "
                                    "Fechado='N' and Numero=''")),
              2);
    EXPECT_EQ(contar(QStringLiteral(
                  "select count(*) from MovProduto c join MovProduto o on "
                  "o.Identifica=c.IdentificaRelacionado where c.Tipo='CM' and c.Fechado='S' and "
                  "c.Numero='00000001' and c.AfectaStk='NA' and o.Tipo='VD' and c.Codigo=o.Codigo "
                  "and c.Identifica<>o.Identifica")),
              2);
    EXPECT_EQ(texto(QStringLiteral("select JaImprimiuTalao from Clientes where Codigo='M01'")),
              QStringLiteral("1"));
    EXPECT_EQ(movimentosCaixa(), 0);
    // Closing the tab afterwards clears the bill's mark.
    estado().gVariosPagaComo = false;
    f_.pagamentoDado = teste::pagamentoNumerario(total, Currency{});
    m_.respostaFinal = true;
    ASSERT_EQ(FecharTab(tab_, f_).resultado, ResultadoFecho::Fechado)
        << m_.textos().join(u'|').toStdString();
    EXPECT_EQ(texto(QStringLiteral("select JaImprimiuTalao from Clientes where Codigo='M01'")),
              QStringLiteral("0"));
}

}  // namespace
}  // namespace brasel::pos
