#include "pos/ui/perguntas_fecho_janela.h"

#include "app/ui/frm_confirmacao_utilizador.h"
#include "app/ui/frm_password_supervisor.h"
#include "cash/ui/frm_lanc_mov_caixa.h"
#include "cash/ui/frm_troco.h"
#include "devices/ui/frm_impresao.h"
#include "pos/fecho_tab.h"
#include "pos/ui/frm_dados_cli_div.h"

namespace brasel::pos {

PerguntasFechoJanela::PerguntasFechoJanela(app::Estado& estado, MessagePort& mensagens,
                                           devices::LinhaSerie& linha, PedeValor& teclado,
                                           QWidget* pai)
    : estado_(estado), mensagens_(mensagens), linha_(linha), teclado_(teclado), pai_(pai) {}

PerguntasFechoJanela::~PerguntasFechoJanela() = default;

QString PerguntasFechoJanela::confirmaUtilizador() {
    app::frmConfirmacaoUtilizador janela(estado_, mensagens_, pai_);
    return janela.UtilizadorConfirma_str();
}

std::optional<cash::Pagamento> PerguntasFechoJanela::pagamento(
    const QString& cliente, Currency totalDoc, const AplicaDesconto& aplicaDesconto) {
    cash::frmTroco janela(estado_, mensagens_, teclado_, pai_);
    return janela.Abrir(cliente, totalDoc, aplicaDesconto);
}

void PerguntasFechoJanela::mostraTroco(const QString& documento, Currency total, Currency entregou,
                                       Currency troco) {
    if (!espera_) espera_ = std::make_unique<cash::frmTrocoEspera>(estado_, pai_);
    espera_->Abrir(documento, QStringLiteral("ABRIR"), total, entregou, troco);
}

void PerguntasFechoJanela::fechaTroco() {
    if (espera_) espera_->Abrir(QString(), QStringLiteral("FECHAR"), {}, {}, {});
}

std::optional<DadosClienteDiverso> PerguntasFechoJanela::clienteDiverso(
    const DadosClienteDiverso& propostos, const QString& data) {
    frmDadosCliDiv janela(estado_, mensagens_, pai_);
    return janela.Abrir(propostos, data, LerConfigFecho(estado_).lancaSemContribuinte);
}

std::optional<std::vector<cash::ParcialPagamento>> PerguntasFechoJanela::divisaoCaixa(
    Currency totalDoc, const QString& pagaComo) {
    cash::frmLancMovCaixa janela(estado_, mensagens_, pai_);
    return janela.Carregar(totalDoc, pagaComo);
}

devices::EscolhaImpressao PerguntasFechoJanela::escolhaImpressao(const QString& tipo) {
    devices::frmImpresao janela(estado_, mensagens_, linha_, pai_);
    return devices::DesempacotaEscolha(janela.Abrir(tipo));
}

bool PerguntasFechoJanela::autorizaSupervisor() {
    // Always asked: a workstation that skips the password for kitchen lines does not skip it here.
    app::frmPasswordSupervisor password(estado_, mensagens_, pai_);
    return password.Confirma_bln();
}

}  // namespace brasel::pos
