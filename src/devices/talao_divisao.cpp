#include "devices/talao_divisao.h"

#include "devices/formata_colunas.h"

namespace brasel::devices {

namespace {

constexpr int kMaxLinhasNota = 10;

}  // namespace

LinhasTalao LinhasTalaoDivisao(const QStringList& cabecalho, const ConfigImpressao& config,
                               const TalaoDivisao& talao, int decimais, bool paraPagina) {
    const QDate data = talao.data.isValid() ? talao.data : QDate::currentDate();
    LinhasTalao l;
    for (const QString& c : cabecalho)
        l.push_back({c});
    l.push_back({QStringLiteral("<<<<<<<<  TALAO DE COMPRA  >>>>>>>>")});
    l.push_back(
        {QStringLiteral("Data de Emissão - ") + data.toString(QStringLiteral("dd-MM-yyyy"))});
    l.push_back({QString()});
    const QStringList nota = talao.nota.split(QStringLiteral("\r\n"));
    for (qsizetype i = 0; i < nota.size() && i < kMaxLinhasNota; ++i)
        l.push_back({nota.at(i)});
    l.push_back({QString()});
    const int largura = paraPagina ? kLarguraTalao : kLarguraTotais;
    if (paraPagina) {
        l.push_back({LinhaTotal(QStringLiteral("Total Geral"),
                                ValorTalao(talao.totalGeral, decimais), largura),
                     2});
    }
    l.push_back({LinhaTotal(QStringLiteral("Total Pagar"), ValorTalao(talao.valorPessoa, decimais),
                            largura),
                 2});
    l.push_back({QString()});
    for (const QString& o : config.obs)
        l.push_back({o});
    return l;
}

bool ImprimeTalaoDivisao(app::Estado& estado, MessagePort& mensagens, LinhaSerie& linha,
                         const TalaoDivisao& talao) {
    const auto config = CarregaConfigImpressao(estado.gConn, estado.gUtilizador, mensagens);
    if (!config) return false;
    const LinhasTalao linhas =
        LinhasTalaoDivisao(CabecalhoLoja(estado.gConn, estado.gArmazem), *config, talao,
                           DecimaisTalao(config->decimais, estado.param.casadec), !config->serie());
    return ImprimeLinhasTalao(estado.gConn, mensagens, linha, *config, linhas,
                              QStringLiteral("Talao de Compra"));
}

}  // namespace brasel::devices
