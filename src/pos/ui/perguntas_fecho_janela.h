#pragma once

#include "app/estado.h"
#include "cash/ui/frm_troco_espera.h"
#include "common/message_port.h"
#include "devices/linha_serie.h"
#include "pos/perguntas_fecho.h"
#include "pos/teclado.h"

#include <QWidget>

#include <memory>

namespace brasel::pos {

// The closing's questions answered by the windows: the user confirmation, the payment screen
// and the change display, the walk-in customer's data, the split over payment methods, the
// print choice and the supervisor's authorisation.
class PerguntasFechoJanela : public PerguntasFecho {
  public:
    PerguntasFechoJanela(app::Estado& estado, MessagePort& mensagens, devices::LinhaSerie& linha,
                         PedeValor& teclado, QWidget* pai);
    ~PerguntasFechoJanela() override;

    QString confirmaUtilizador() override;
    std::optional<cash::Pagamento> pagamento(const QString& cliente, Currency totalDoc,
                                             const AplicaDesconto& aplicaDesconto) override;
    void mostraTroco(const QString& documento, Currency total, Currency entregou,
                     Currency troco) override;
    std::optional<DadosClienteDiverso> clienteDiverso(const DadosClienteDiverso& propostos,
                                                      const QString& data) override;
    std::optional<std::vector<cash::ParcialPagamento>> divisaoCaixa(
        Currency totalDoc, const QString& pagaComo) override;
    devices::EscolhaImpressao escolhaImpressao(const QString& tipo) override;
    bool autorizaSupervisor() override;

    // Closes the change display, once the next customer's first product is added.
    void fechaTroco();

  private:
    app::Estado& estado_;
    MessagePort& mensagens_;
    devices::LinhaSerie& linha_;
    PedeValor& teclado_;
    QWidget* pai_;
    std::unique_ptr<cash::frmTrocoEspera> espera_;
};

}  // namespace brasel::pos
