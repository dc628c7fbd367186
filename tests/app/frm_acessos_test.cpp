// The rights editor's tree: every right under its parent, whatever order or damage the rows
// come with.
#include "app/editor_acessos.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

DireitoAcesso direito(const char* chave, const char* chave1) {
    DireitoAcesso d;
    d.chave = QString::fromUtf8(chave);
    d.chave1 = QString::fromUtf8(chave1);
    return d;
}

TEST(EditorAcessos, EveryRightHangsUnderItsParent) {
    struct Caso {
        const char* nome;
        QList<DireitoAcesso> direitos;
        QList<int> pais;
    } casos[] = {
        {"programa, janela e botão",
         {direito("Brasel", ""), direito("BraselfrmX", "Brasel"),
          direito("BraselfrmX.cmdGravar", "BraselfrmX")},
         {-1, 0, 1}},
        {"filho antes do pai",
         {direito("BraselfrmX.cmdGravar", "BraselfrmX"), direito("BraselfrmX", "Brasel"),
          direito("Brasel", "")},
         {1, 2, -1}},
        {"pai que não está na lista", {direito("BraselfrmX", "Brasel")}, {-1}},
        {"pai de si mesmo", {direito("Brasel", "Brasel")}, {-1}},
        {"ciclo", {direito("A", "B"), direito("B", "A"), direito("C", "A")}, {-1, 0, 0}},
        {"ciclo longo", {direito("A", "C"), direito("B", "A"), direito("C", "B")}, {-1, 0, 1}},
        {"vazio", {}, {}},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        EXPECT_EQ(paisDireitos(c.direitos), c.pais);
    }
}

TEST(EditorAcessos, TextOfARight) {
    DireitoAcesso janela;
    janela.chave = QStringLiteral("BraselfrmRegistoDeCaixa");
    janela.form = QStringLiteral("frmRegistoDeCaixa");
    janela.caption = QStringLiteral("Registo de Caixa");
    EXPECT_EQ(textoDireito(janela), QStringLiteral("Registo de Caixa (frmRegistoDeCaixa)"));

    DireitoAcesso botao = janela;
    botao.chave += QStringLiteral(".cmdImprimir");
    botao.ctrl = QStringLiteral("cmdImprimir");
    botao.ctrlcap = QStringLiteral("Imprimir");
    EXPECT_EQ(textoDireito(botao), QStringLiteral("Imprimir (cmdImprimir)"));

    DireitoAcesso programa;
    programa.chave = QStringLiteral("Brasel");
    programa.caption = QStringLiteral("Brasel");
    EXPECT_EQ(textoDireito(programa), QStringLiteral("Brasel"));
    botao.ctrlcap.clear();
    EXPECT_EQ(textoDireito(botao), botao.chave);
}

}  // namespace
}  // namespace brasel::app
