// The reference form offscreen: captions as the company names its dimensions, typed codes
// checked against their tables (a wrong one keeps the form open), the supplier from the search
// window. Saves /tmp/frmReferencia.png for review.
#include "pos/ui/frm_referencia.h"
#include "pricing/insere_teste.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"
#include "support/mensagens_gravadas.h"

#include <QGridLayout>

namespace brasel::pos {
namespace {

using pricing::teste::insere;
using pricing::teste::T;
using testing::clicar;
using testing::noDialogo;

class PesquisaGravada : public lookups::JanelaPesquisa {
  public:
    std::optional<lookups::LinhaEscolhida> Pesquisa(const lookups::PedidoPesquisa& p) override {
        tabelas << p.tabela;
        return resposta;
    }
    QStringList tabelas;
    std::optional<lookups::LinhaEscolhida> resposta;
};

class FrmReferenciaTeste : public ::testing::Test {
  protected:
    void SetUp() override {
        testing::aplicacaoTeste();
        insere(e_, "TabEstacao", {{"Codigo", T("V")}, {"Descricao", T("Verão")}});
        insere(e_, "Cores", {{"Codigo", T("AZ")}, {"Descricao", T("Azul")}});
        e_.param.NomesDimensoes[1] = QStringLiteral("Época");
    }
    // Types a code into field `i` as a person would, leaving the field.
    static void escreve(frmReferencia* f, int i, const char* codigo) {
        f->txtCampo(i)->setText(QString::fromLatin1(codigo));
        f->txtCampo(i)->setModified(true);
    }
    std::optional<ReferenciaEscolhida> escolher(const std::function<void(frmReferencia*)>& accao) {
        frmReferencia form(e_, pesquisaTabelas_, QStringLiteral("B001"));
        noDialogo([&](QWidget* d) { accao(qobject_cast<frmReferencia*>(d)); });
        return form.escolher();
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaTeste empresa_{true};
    app::Estado& e_ = empresa_.estado();
    testing::MensagensGravadas mensagens_;
    PesquisaGravada pesquisa_;
    lookups::PesquisaTabelas pesquisaTabelas_{e_, mensagens_, pesquisa_};
};

TEST_F(FrmReferenciaTeste, AtributosVerificadosEFornecedorEscolhido) {
    QStringList rotulos;
    QStringList recusas;
    QString descricaoEstacao;
    bool corLimpa = false;
    const auto ref = escolher([&](frmReferencia* f) {
        ASSERT_NE(f, nullptr);
        auto* grelha = f->findChild<QGridLayout*>();
        ASSERT_NE(grelha, nullptr);
        for (int i = 0; i < frmReferencia::kCampos; ++i)
            rotulos << qobject_cast<QLabel*>(grelha->itemAtPosition(i, 0)->widget())->text();
        escreve(f, 0, "V");
        Q_EMIT f->txtCampo(0)->editingFinished();
        descricaoEstacao = f->lblCampo(0)->text();
        // A colour that does not exist: refused at OK, the form stays for another.
        escreve(f, 4, "XX");
        clicar(f, "cmdOK");
        recusas = mensagens_.textos();
        corLimpa = f->txtCampo(4)->text().isEmpty();
        escreve(f, 4, "AZ");
        pesquisa_.resposta =
            lookups::LinhaEscolhida{QStringLiteral("F01"), QStringLiteral("Têxteis do Norte")};
        clicar(f, "cmdFornecedor");
        f->grab().save(QStringLiteral("/tmp/frmReferencia.png"));
        clicar(f, "cmdOK");
    });
    EXPECT_EQ(rotulos, (QStringList{QStringLiteral("Época"), QStringLiteral("Sexo"),
                                    QStringLiteral("Referência"), QStringLiteral("Modelo"),
                                    QStringLiteral("Cor"), QStringLiteral("Tamanho"),
                                    QStringLiteral("Comprimento"), QStringLiteral("Fornecedor")}));
    EXPECT_EQ(descricaoEstacao, QStringLiteral("Verão"));
    EXPECT_EQ(recusas, QStringList{QStringLiteral("Cor Inexistente")});
    EXPECT_TRUE(corLimpa);
    EXPECT_EQ(pesquisa_.tabelas, QStringList{QStringLiteral("Fornece")});
    ASSERT_TRUE(ref.has_value());
    EXPECT_EQ(ref->atributos,
              (std::array<QString, 7>{QStringLiteral("V"), QString(), QString(), QString(),
                                      QStringLiteral("AZ"), QString(), QString()}));
    EXPECT_EQ(ref->fornecedor, QStringLiteral("F01"));

    EXPECT_FALSE(escolher([](frmReferencia* f) { clicar(f, "cmdCancelar"); }).has_value());
}

}  // namespace
}  // namespace brasel::pos
