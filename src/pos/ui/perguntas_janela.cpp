#include "pos/ui/perguntas_janela.h"

#include "app/ui/frm_password_supervisor.h"
#include "devices/ui/frm_balanca.h"
#include "pos/ui/a_clientes.h"
#include "pos/ui/frm_lote.h"
#include "pos/ui/frm_referencia.h"

namespace brasel::pos {

PerguntasJanela::PerguntasJanela(app::Estado& estado, MessagePort& mensagens, QWidget* pai)
    : estado_(estado),
      mensagens_(mensagens),
      pai_(pai),
      janelaPesquisa_(estado, pai),
      pesquisa_(estado, mensagens, janelaPesquisa_),
      teclado_(mensagens, &pesquisa_, pai),
      precoQuant_(mensagens, estado.param.casadecpreco, estado.param.casadecquant, pai) {}

std::optional<Currency> PerguntasJanela::pedirValor(const QString& titulo) {
    return teclado_.pedirValor(titulo);
}

std::optional<QString> PerguntasJanela::pedirTexto(const QString& titulo, const QString& inicial,
                                                   bool mascara) {
    return teclado_.pedirTexto(titulo, inicial, mascara);
}

PrecoQuant PerguntasJanela::pedir(const QString& codigo, const PropostaPrecoQuant& proposta) {
    return precoQuant_.pedir(codigo, proposta);
}

Currency PerguntasJanela::pesa(Currency precoUnitario) {
    devices::frmBalanca balanca(estado_, pai_);
    return balanca.pesa(precoUnitario);
}

bool PerguntasJanela::passwordSupervisor() {
    app::frmPasswordSupervisor password(estado_, mensagens_, pai_);
    return password.Confirma_bln();
}

std::optional<QString> PerguntasJanela::mesa() {
    AClientes picker(estado_, mensagens_, pai_);
    return picker.escolher();
}

std::optional<QString> PerguntasJanela::tipoMovimento() {
    lookups::CampoCodigo campo;
    pesquisa_.TipoMov(campo, true);
    if (campo.codigo.isEmpty()) return std::nullopt;
    return campo.codigo;
}

std::optional<LoteEscolhido> PerguntasJanela::lote(const QString& produto, Currency jaLancado) {
    frmLote form(estado_, mensagens_, pesquisa_, teclado_, produto, jaLancado, pai_);
    return form.escolher();
}

std::optional<ReferenciaEscolhida> PerguntasJanela::referencia(const QString& produto) {
    frmReferencia form(estado_, pesquisa_, produto, pai_);
    return form.escolher();
}

}  // namespace brasel::pos
