#include "devices/conta_provisoria.h"

#include "devices/formata_colunas.h"
#include "pos/tab.h"
#include "pricing/leitura.h"

namespace brasel::devices {

std::optional<ContaProvisoria> LerContaProvisoria(app::Estado& estado, const QString& mesa,
                                                  const QString& tipo, const QString& login) {
    db::Connection& conn = estado.gConn;
    auto linhas = LerLinhasImpressas(
        conn, QString::fromLatin1(pos::kCondicaoTab),
        {pricing::textoSql(mesa), pricing::textoSql(tipo), pricing::textoSql(login)});
    if (!linhas) return std::nullopt;
    ContaProvisoria c;
    c.cabecalho = CabecalhoLoja(conn, estado.gArmazem);
    c.login = login;
    c.linhas = std::move(*linhas);
    const auto cli = conn.firstRow(
        QStringLiteral("select Descricao,Morada,Local,codpost,Contribuinte from Clientes "
                       "where Codigo=?"),
        {pricing::textoSql(mesa)});
    if (cli) {
        const QString codPostal = cli->value(3).toString();
        c.cliente = BlocoCliente(cli->value(0).toString(), cli->value(1).toString(),
                                 cli->value(2).toString(), codPostal,
                                 DescricaoPostal(conn, codPostal), cli->value(4).toString());
    } else {
        c.cliente = BlocoCliente(mesa, {}, {}, {}, {}, {});
    }
    return c;
}

LinhasTalao LinhasContaProvisoria(const ContaProvisoria& conta, const ConfigImpressao& config,
                                  int decimais, int decimaisQuant) {
    LinhasTalao l;
    for (const QString& c : conta.cabecalho)
        l.push_back({c});
    for (const QString& c : conta.cliente)
        l.push_back({c});
    l.push_back({QStringLiteral("   Empr.: ") + conta.login});
    l.push_back({QString(kLarguraTalao, QLatin1Char('='))});
    l.push_back({QStringLiteral("Produto          Quantidade        Total")});
    Currency total;
    for (const LinhaImpressa& li : conta.linhas) {
        l.push_back(
            {LinhaFixa(li.descricao, 17) +
                 ValorTalao(li.quantidade, decimaisQuant).rightJustified(10, QLatin1Char(' ')) +
                 ValorTalao(li.total(), decimais).rightJustified(13, QLatin1Char(' ')),
             1, true});
        total += li.total();
    }
    l.push_back({QString(kLarguraTalao, QLatin1Char('='))});
    l.push_back({LinhaTotal(QStringLiteral("Total Geral"), ValorTalao(total, decimais)), 2});
    if (config.impIvas) {
        l.push_back({QStringLiteral("IVA      Tx.     Valor Inc.    Valor IVA")});
        for (const QString& r : ResumoIva(AgrupaIva(conta.linhas), decimais))
            l.push_back({r});
    }
    l.push_back({QString(kLarguraTalao, QLatin1Char('-'))});
    l.push_back({QStringLiteral("Processado por Computador")});
    l.push_back({QStringLiteral("* artº 7 Dec. Lei 147/2003 *")});
    for (const QString& o : config.obs)
        l.push_back({o});
    return l;
}

bool ImprimeContaProvisoria(app::Estado& estado, MessagePort& mensagens, LinhaSerie& linha,
                            const QString& mesa, const QString& tipo, const QString& login) {
    const auto config = CarregaConfigImpressao(estado.gConn, estado.gUtilizador, mensagens);
    if (!config) return false;
    const auto conta = LerContaProvisoria(estado, mesa, tipo, login);
    if (!conta) return false;
    const LinhasTalao linhas = LinhasContaProvisoria(
        *conta, *config, DecimaisTalao(config->decimais, estado.param.casadec),
        estado.param.casadecquant);
    return ImprimeLinhasTalao(estado.gConn, mensagens, linha, *config, linhas,
                              QStringLiteral("Conta ") + mesa);
}

}  // namespace brasel::devices
