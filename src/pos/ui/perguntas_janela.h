#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "lookups/pesquisa_tabelas.h"
#include "lookups/ui/w_pesquisa_nova.h"
#include "pos/perguntas_tab.h"
#include "pos/ui/frm_preco_quant.h"
#include "pos/ui/frm_teclado.h"

#include <QPointer>
#include <QWidget>

namespace brasel::pos {

// The order screen's answers to the tab's questions: the touch keypad and keyboard, the
// supervisor's password, the table picker, the type lookup, the lot and reference forms, the
// barcode interaction form and the weighing dialog, each modal over `pai`.
class PerguntasJanela : public PerguntasTab {
  public:
    PerguntasJanela(app::Estado& estado, MessagePort& mensagens, QWidget* pai);

    std::optional<Currency> pedirValor(const QString& titulo) override;
    std::optional<QString> pedirTexto(const QString& titulo, const QString& inicial = {},
                                      bool mascara = false) override;
    PrecoQuant pedir(const QString& codigo, const PropostaPrecoQuant& proposta) override;
    Currency pesa(Currency precoUnitario) override;
    bool passwordSupervisor() override;
    std::optional<QString> mesa() override;
    std::optional<QString> tipoMovimento() override;
    std::optional<LoteEscolhido> lote(const QString& produto, Currency jaLancado) override;
    std::optional<ReferenciaEscolhida> referencia(const QString& produto) override;

  private:
    app::Estado& estado_;
    MessagePort& mensagens_;
    QPointer<QWidget> pai_;
    lookups::PesquisaEmJanela janelaPesquisa_;
    lookups::PesquisaTabelas pesquisa_;
    TecladoJanela teclado_;
    PrecoQuantJanela precoQuant_;
};

}  // namespace brasel::pos
