#include "pos/cozinha/impressao_cozinha.h"

#include "devices/impressao_serie.h"
#include "devices/impressora_talao.h"
#include "devices/impressora_windows.h"

#include <QCoreApplication>

namespace brasel::pos::cozinha {

namespace {

constexpr int kTamanhoPequeno = 1;
constexpr int kTamanhoMedio = 2;
constexpr int kLinhasAvancoBar = 8;

}  // namespace

ResultadoTalao ImprimeTalaoCozinhaSerie(devices::LinhaSerie& linha,
                                        const devices::DefinicaoImpressora& impressora,
                                        const ItemTalaoCozinha& item) {
    // A line held by another printout is left alone: the row waits for the next poll.
    if (linha.aberta()) return ResultadoTalao::PortaOcupada;
    devices::CImpressoraTalao imp;
    imp.setCtrlInterface(&linha);
    imp.defineCodigos(impressora.codigos, false);
    if (!imp.SetPortaComm(impressora.porta, devices::kDefinicoesTalao)) {
        return ResultadoTalao::Falhou;
    }
    devices::GuardaPorta guarda(linha);
    if (!guarda.obtida()) return ResultadoTalao::Falhou;
    imp.SetInternationalCHR(impressora.codigos.internacional);
    imp.Reset();
    for (const LinhaTalao& l : LinhasTalaoCozinhaSerie(item)) {
        imp.ImprimeLinha(l.texto, true,
                         l.tamanho == TamanhoLetra::Medio ? kTamanhoMedio : kTamanhoPequeno, false);
    }
    QCoreApplication::processEvents();
    imp.Reset();
    return imp.semFalhas() ? ResultadoTalao::Impresso : ResultadoTalao::Falhou;
}

ResultadoTalao ImprimeTalaoCozinhaWindows(const QString& impressora,
                                          const QList<ItemTalaoCozinha>& itens) {
    devices::TrabalhoImpressao trabalho;
    if (!trabalho.inicia(impressora, QStringLiteral("Pedido da Cozinha"))) {
        return ResultadoTalao::Falhou;
    }
    for (const ItemTalaoCozinha& item : itens) {
        for (const QString& l : LinhasTalaoCozinhaWindows(item)) {
            if (!trabalho.imprimeLinha(l)) return ResultadoTalao::Falhou;
        }
    }
    return trabalho.termina() ? ResultadoTalao::Impresso : ResultadoTalao::Falhou;
}

ResultadoTalao ImprimeTalaoBar(db::Connection& conn, devices::LinhaSerie& linha,
                               const QString& codigoImpressora, const PedidoCozinha& pedido,
                               bool linhasExtra) {
    const auto impressora = devices::LerDefinicaoImpressora(conn, codigoImpressora);
    if (!impressora) return ResultadoTalao::NaoConfigurada;
    if (linha.aberta()) return ResultadoTalao::PortaOcupada;
    const bool impresso = devices::ImprimeNaSerie(
        linha, *impressora, {}, [&](devices::CImpressoraTalao& imp, int /*via*/) {
            for (const QString& l :
                 LinhasTalaoBar(pedido.mesa, pedido.quantidade, pedido.descricao, linhasExtra)) {
                imp.ImprimeLinha(l, true, kTamanhoPequeno, false);
            }
            imp.FeedLinhas(kLinhasAvancoBar);
        });
    return impresso ? ResultadoTalao::Impresso : ResultadoTalao::Falhou;
}

}  // namespace brasel::pos::cozinha
