// The walk-in customer form: a tax number typed with the load-data box ticked brings the data of
// the newest document that carries it; confirming without a tax number stays on the form.
#include "pos/ui/frm_dados_cli_div.h"
#include "pricing/insere_teste.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"
#include "support/mensagens_gravadas.h"

#include <QTimer>

namespace brasel::pos {
namespace {

using pricing::teste::insere;
using pricing::teste::T;
using testing::clicar;
using testing::filho;

class FrmDadosCliDiv : public ::testing::Test {
  protected:
    FrmDadosCliDiv() : e_(true) {
        testing::aplicacaoTeste();
        for (const auto& [data, nome] :
             {std::pair{"2024-03-01", "Antigo Lda"}, std::pair{"2025-07-09", "Novo Lda"}}) {
            insere(e_.estado(), "MovCliente",
                   {{"Tipo", T("VD")},
                    {"Numero", T(data)},
                    {"Ano", T("2025")},
                    {"Data", T(data)},
                    {"Contribuinte", T("501964843")},
                    {"Descricao", T(nome)},
                    {"Morada", T("Rua do Ouro, 1")},
                    {"Local", T("Lisboa")},
                    {"CodPostal", T("1100-148")},
                    {"Pais", T("PT")}});
        }
    }
    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaTeste e_;
    testing::MensagensGravadas m_;
};

TEST_F(FrmDadosCliDiv, CarregaDadosDoDocumentoMaisRecente) {
    frmDadosCliDiv janela(e_.estado(), m_);
    std::optional<DadosClienteDiverso> dados;
    QTimer::singleShot(0, [&] {
        janela.chkCarregaDados()->setChecked(true);
        janela.txtContribuinte()->setText(QStringLiteral("501964843"));
        Q_EMIT janela.txtContribuinte()->editingFinished();
        clicar(&janela, "cmdFechaDiv");
    });
    dados = janela.Abrir({}, QStringLiteral("2026-01-05"), false);
    ASSERT_TRUE(dados);
    EXPECT_EQ(dados->nome, QStringLiteral("Novo Lda"));
    EXPECT_EQ(dados->morada, QStringLiteral("Rua do Ouro, 1"));
    EXPECT_EQ(dados->codPostal, QStringLiteral("1100-148"));
    EXPECT_TRUE(m_.textos().isEmpty());
    // The box is remembered by the workstation.
    frmDadosCliDiv outra(e_.estado(), m_);
    EXPECT_TRUE(outra.chkCarregaDados()->isChecked());
    janela.grab().save(QStringLiteral("/tmp/frmDadosCliDiv.png"));
}

TEST_F(FrmDadosCliDiv, SemCaixaMarcadaNadaCarregaESemContribuinteFica) {
    frmDadosCliDiv janela(e_.estado(), m_);
    janela.chkCarregaDados()->setChecked(false);
    bool ficou = false;
    QTimer::singleShot(0, [&] {
        janela.txtContribuinte()->setText(QStringLiteral("501964843"));
        Q_EMIT janela.txtContribuinte()->editingFinished();
        EXPECT_TRUE(filho<QLineEdit>(&janela, "txtNomeCli")->text().isEmpty());
        janela.txtContribuinte()->clear();
        clicar(&janela, "cmdFechaDiv");
        ficou = janela.isVisible();
        clicar(&janela, "cmdCancelar");
    });
    EXPECT_FALSE(janela.Abrir({}, QStringLiteral("2010-12-31"), false));
    EXPECT_TRUE(ficou);
    ASSERT_EQ(m_.mensagens().size(), 1);
    EXPECT_EQ(m_.mensagens()[0].titulo, QStringLiteral("ATENÇÃO"));
}

}  // namespace
}  // namespace brasel::pos
