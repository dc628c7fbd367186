#include "pos/cozinha/polling_cozinha.h"

#include "app/definicoes_posto.h"
#include "db/query_helpers.h"
#include "devices/definicao_impressora.h"

#include <algorithm>

namespace brasel::pos::cozinha {

namespace {

bool igual(const QString& texto, const char* valor) {
    return texto.trimmed().compare(QLatin1String(valor), Qt::CaseInsensitive) == 0;
}

// Clears the running mark of the poll however the tick ends.
class MarcaEmCurso {
  public:
    explicit MarcaEmCurso(bool& marca) : marca_(marca) { marca_ = true; }
    ~MarcaEmCurso() { marca_ = false; }
    MarcaEmCurso(const MarcaEmCurso&) = delete;
    MarcaEmCurso& operator=(const MarcaEmCurso&) = delete;

  private:
    bool& marca_;
};

}  // namespace

ViaCozinha EscolheViaCozinha(const QString& portaCozinha, const QString& portaTalao) {
    if (portaCozinha.trimmed().isEmpty()) {
        if (igual(portaTalao, "COM")) return ViaCozinha::Serie;
        if (igual(portaTalao, "LPT")) return ViaCozinha::Windows;
        return ViaCozinha::Nenhuma;
    }
    if (igual(portaCozinha, "COM")) return ViaCozinha::Serie;
    if (igual(portaCozinha, "PAR")) return ViaCozinha::Windows;
    return ViaCozinha::Nenhuma;
}

ResultadoPolling PollingCozinha::tmrPedidos_Timer() {
    ResultadoPolling resultado;
    if (emCurso_) return resultado;
    MarcaEmCurso marca(emCurso_);

    const auto config = devices::LerConfigTalao(estado_.gConn, estado_.gUtilizador);
    Destino destino;
    destino.via = EscolheViaCozinha(app::posto::ConfigRest_ImpTalaoCozinhaPorta.ler(),
                                    config ? config->portaTalao : QString());
    if (destino.via == ViaCozinha::Nenhuma) return resultado;
    const auto pedidos = PedidosLibertados(estado_);
    if (!pedidos || pedidos->isEmpty()) return resultado;
    for (const PedidoCopa& p : *pedidos)
        resultado.pendentes.append(p.numRegisto);

    if (destino.via == ViaCozinha::Serie) {
        const auto definicao = devices::LerDefinicaoImpressora(
            estado_.gConn, config ? config->tipoImpTalao : QString());
        if (!definicao) {
            avisa(ResultadoTalao::NaoConfigurada, resultado);
            return resultado;
        }
        destino.serie = *definicao;
    } else {
        destino.nomeWindows = app::posto::ConfigRest_ImpTalaoCozinhaNome.ler();
    }

    for (const QList<PedidoCopa>& talao : AgrupaTaloes(*pedidos)) {
        if (!imprimeTalao(talao, destino, resultado)) break;
    }
    return resultado;
}

bool PollingCozinha::imprimeTalao(const QList<PedidoCopa>& talao, const Destino& destino,
                                  ResultadoPolling& resultado) {
    const QString codigo = empregado(talao.first().utilizador);
    // A row whose ticket went out but that cannot be removed prints once more at the next poll:
    // better twice than lost, but no further rows go out while the queue cannot be written.
    auto retira = [&](const PedidoCopa& p) {
        if (!ApagaPedidoImpresso(estado_, p.numRegisto)) return false;
        resultado.pendentes.removeOne(p.numRegisto);
        resultado.impressos.append(p.numRegisto);
        avisado_ = false;
        return true;
    };
    if (destino.via == ViaCozinha::Windows) {
        QList<ItemTalaoCozinha> itens;
        for (qsizetype i = 0; i < talao.size(); ++i)
            itens.append(ItemDoTalao(talao, i, codigo));
        const ResultadoTalao r = ImprimeTalaoCozinhaWindows(destino.nomeWindows, itens);
        if (r != ResultadoTalao::Impresso) {
            avisa(r, resultado);
            return false;
        }
        return std::all_of(talao.begin(), talao.end(), retira);
    }
    for (qsizetype i = 0; i < talao.size(); ++i) {
        const ResultadoTalao r =
            ImprimeTalaoCozinhaSerie(linha_, destino.serie, ItemDoTalao(talao, i, codigo));
        if (r != ResultadoTalao::Impresso) {
            avisa(r, resultado);
            return false;
        }
        if (!retira(talao.at(i))) return false;
    }
    return true;
}

QString PollingCozinha::empregado(const QString& login) {
    // The ticket names the waiter by user code; a login without a user row still says who.
    const QString codigo =
        db::Select_Campo_str(estado_, QStringLiteral("Utilizador"), QStringLiteral("Codigo"),
                             QStringLiteral("Login"), login);
    return codigo.isEmpty() ? login : codigo;
}

void PollingCozinha::avisa(ResultadoTalao falha, ResultadoPolling& resultado) {
    // A line held by another printout is no fault: the next poll finds it free.
    if (falha == ResultadoTalao::PortaOcupada || avisado_) return;
    avisado_ = true;
    resultado.avisou = true;
    if (falha == ResultadoTalao::NaoConfigurada) {
        mensagens_.mensagem(
            QStringLiteral("A T E N Ç Ã O !  Impressora de Talões não Configurada!"),
            Icone::Critico);
        return;
    }
    mensagens_.mensagem(
        QStringLiteral("Não foi possível imprimir os pedidos da cozinha: a impressora não "
                       "responde.\nOs pedidos ficam guardados e serão impressos logo que a "
                       "impressora volte a responder."),
        Icone::Exclamacao, QStringLiteral("A T E N Ç Ã O !"));
}

}  // namespace brasel::pos::cozinha
