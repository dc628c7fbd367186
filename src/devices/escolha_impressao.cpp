#include "devices/escolha_impressao.h"

#include "devices/gaveta.h"
#include "devices/talao_comum.h"
#include "pricing/leitura.h"

#include <algorithm>

namespace brasel::devices {

namespace {

constexpr std::int64_t kUnidade = Currency::kScale;    // the choice
constexpr std::int64_t kVia = Currency::kScale / 100;  // one copy
constexpr std::int64_t kObservacao = Currency::kScale / 1000;

}  // namespace

Currency EmpacotaEscolha(const EscolhaImpressao& e) {
    const std::int64_t vias = std::clamp(e.vias, 0, 99);
    return Currency::fromRaw(e.escolha * kUnidade + vias * kVia + (e.observacao ? kObservacao : 0));
}

EscolhaImpressao DesempacotaEscolha(Currency valor) {
    const std::int64_t raw = std::max<std::int64_t>(valor.raw(), 0);
    EscolhaImpressao e;
    e.escolha = static_cast<int>(raw / kUnidade);
    e.vias = static_cast<int>((raw % kUnidade) / kVia);
    e.observacao = (raw % kVia) / kObservacao == 1;
    return e;
}

std::optional<int> CarregarVias(db::Connection& conn, MessagePort& mensagens,
                                const QString& utilizador, const QString& tipoDocumento) {
    const auto config = CarregaConfigImpressao(conn, utilizador, mensagens);
    if (!config) return std::nullopt;
    if (!config->viasDoTipo) return 1;
    const auto tipo = conn.firstRow(QStringLiteral("select Vias from TabTipoMov where codigo=?"),
                                    {pricing::textoSql(tipoDocumento)});
    return tipo ? std::clamp(tipo->value(0).toInt(), 0, 99) : 1;
}

void AbreGavetaTalao(app::Estado& estado, LinhaSerie& linha, const QString& tipoDocumento,
                     bool drivePermitido) {
    AbreGavetaOPOS(estado.gCaixaDinheiro);
    const auto config = LerConfigImpressao(estado.gConn, estado.gUtilizador);
    const MeiosGaveta meios{linha, QString(), config ? config->impressoraPagina() : QString()};
    AbreGaveta(estado.gConn, estado.gUtilizador, meios, tipoDocumento, drivePermitido);
}

}  // namespace brasel::devices
