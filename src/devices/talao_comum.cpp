#include "devices/talao_comum.h"

#include "devices/formata_colunas.h"
#include "devices/impressao_serie.h"
#include "devices/impressora_windows.h"
#include "devices/pausa.h"
#include "pricing/leitura.h"

#include <QSqlQuery>
#include <QSqlRecord>

#include <algorithm>
#include <iterator>

namespace brasel::devices {

namespace {

QString texto(const QSqlRecord& r, const char* campo) {
    return r.value(QString::fromLatin1(campo)).toString();
}

Currency valor(const QSqlRecord& r, const char* campo) {
    return Currency::fromVariant(r.value(QString::fromLatin1(campo)));
}

}  // namespace

bool ConfigImpressao::talaoTermico() const {
    return impressora.trimmed().compare(QStringLiteral("T"), Qt::CaseInsensitive) == 0;
}

QString ConfigImpressao::impressoraPagina() const {
    return talaoTermico() ? QString() : impressora.trimmed();
}

std::optional<ConfigImpressao> LerConfigImpressao(db::Connection& conn, const QString& utilizador) {
    auto talao = LerConfigTalao(conn, utilizador);
    if (!talao) return std::nullopt;
    const auto r = conn.firstRow(
        QStringLiteral("select Impressora,imptotal,impivas,DecimaisImpTaloes,ImpTalaoViasTipoMov,"
                       "Obs1,Obs2,Obs3 from UtilConfGeral where utilizador=?"),
        {pricing::textoSql(utilizador)});
    if (!r) return std::nullopt;
    ConfigImpressao c;
    c.talao = *talao;
    c.impressora = texto(*r, "Impressora");
    c.impTotal = pricing::ligado(r->value(QStringLiteral("imptotal")));
    c.impIvas = pricing::ligado(r->value(QStringLiteral("impivas")));
    c.decimais = r->value(QStringLiteral("DecimaisImpTaloes")).toInt();
    c.viasDoTipo = r->value(QStringLiteral("ImpTalaoViasTipoMov")).toInt() == 1;
    for (const char* campo : {"Obs1", "Obs2", "Obs3"}) {
        const QString obs = texto(*r, campo);
        if (!obs.trimmed().isEmpty()) c.obs << obs;
    }
    return c;
}

std::optional<ConfigImpressao> CarregaConfigImpressao(db::Connection& conn,
                                                      const QString& utilizador,
                                                      MessagePort& mensagens) {
    auto config = LerConfigImpressao(conn, utilizador);
    if (!config) {
        mensagens.mensagem(
            QStringLiteral("Não tem o POS configurado para o utilizador ") + utilizador,
            Icone::Critico);
    }
    return config;
}

QStringList CabecalhoLoja(db::Connection& conn, const QString& armazem) {
    const auto r = conn.firstRow(
        QStringLiteral("select linha1,linha2,linha3,linha4,linha5,linha6,linha7 from armazens "
                       "where codigo=?"),
        {pricing::textoSql(armazem)});
    QStringList linhas;
    for (int i = 0; i < 7; ++i)
        linhas << (r ? r->value(i).toString() : QString());
    return linhas;
}

QString LoginUtilizador(db::Connection& conn, const QString& utilizador) {
    const auto r = conn.firstRow(QStringLiteral("select Login from Utilizador where Codigo=?"),
                                 {pricing::textoSql(utilizador)});
    return r ? r->value(0).toString() : utilizador;
}

QStringList BlocoCliente(const QString& nome, const QString& morada, const QString& local,
                         const QString& codPostal, const QString& descricaoPostal,
                         const QString& contribuinte) {
    return {nome, morada, local, (codPostal + QLatin1Char(' ') + descricaoPostal).trimmed(),
            QStringLiteral("Contribuinte : ") + contribuinte};
}

QString DescricaoPostal(db::Connection& conn, const QString& codPostal) {
    if (codPostal.trimmed().isEmpty()) return {};
    const auto r = conn.firstRow(QStringLiteral("select Descricao from TabPostal where Codigo=?"),
                                 {codPostal});
    return r ? r->value(0).toString() : QString();
}

std::vector<GrupoIva> AgrupaIva(const std::vector<LinhaImpressa>& linhas) {
    std::vector<GrupoIva> grupos;
    for (const LinhaImpressa& l : linhas) {
        auto g = std::find_if(grupos.begin(), grupos.end(), [&](const GrupoIva& x) {
            return x.tabela == l.ivaTabela && x.taxa == l.ivaTaxa;
        });
        if (g == grupos.end()) {
            grupos.push_back({l.ivaTabela, l.ivaTaxa, {}, {}, {}});
            g = std::prev(grupos.end());
        }
        g->incidencia += l.total() - l.iva;
        g->desconto += l.desconto;
        g->iva += l.iva;
    }
    return grupos;
}

std::optional<std::vector<LinhaImpressa>> LerLinhasImpressas(db::Connection& conn,
                                                             const QString& condicao,
                                                             const QVariantList& valores) {
    // The condition names MovProduto's columns unqualified: none of them is in the joined tables.
    auto q = conn.exec(
        QStringLiteral(
            "select "
            "MovProduto.Descricao,MovProduto.QuantNormal,MovProduto.Preco,MovProduto.ValorIliq,"
            "MovProduto.TotalDesconto,MovProduto.ValorIva,MovProduto.IvaTabela,"
            "MovProduto.IvaTaxa,MovProduto.OutUniQuant,MovProduto.OutUniCod,"
            "COALESCE(i.Incluido,0) as Incluido,COALESCE(o.descricao,'') as Unidade "
            "from MovProduto left join TabIva i on i.codigo=MovProduto.IvaTabela "
            "left join OutUnidades o on o.Codigo=MovProduto.OutUniCod where ") +
            condicao + QStringLiteral(" order by MovProduto.NumRegisto"),
        valores);
    if (!q) return std::nullopt;
    std::vector<LinhaImpressa> linhas;
    while (q->next()) {
        const QSqlRecord r = q->record();
        LinhaImpressa l;
        l.descricao = texto(r, "Descricao");
        l.quantidade = valor(r, "QuantNormal");
        l.preco = valor(r, "Preco");
        l.valorIliq = valor(r, "ValorIliq");
        l.desconto = valor(r, "TotalDesconto");
        l.iva = valor(r, "ValorIva");
        l.ivaTabela = texto(r, "IvaTabela");
        l.ivaTaxa = valor(r, "IvaTaxa");
        l.ivaIncluido = pricing::ligado(r.value(QStringLiteral("Incluido")));
        if (!texto(r, "OutUniCod").trimmed().isEmpty()) {
            l.outQuant = valor(r, "OutUniQuant");
            l.outUnidade = texto(r, "Unidade");
            if (l.outUnidade.isEmpty()) l.outUnidade = texto(r, "OutUniCod");
        }
        linhas.push_back(l);
    }
    return linhas;
}

QString TaxaTalao(Currency taxa) {
    return taxa.toPlainText().replace(QLatin1Char('.'), QLatin1Char(','));
}

QStringList ResumoIva(const std::vector<GrupoIva>& grupos, int decimais) {
    QStringList linhas;
    for (const GrupoIva& g : grupos) {
        linhas << LinhaFixa(g.tabela.left(2).leftJustified(2, QLatin1Char(' ')) +
                            TaxaTalao(g.taxa).rightJustified(10, QLatin1Char(' ')) +
                            ValorTalao(g.comIva(), decimais).rightJustified(15, QLatin1Char(' ')) +
                            ValorTalao(g.iva, decimais).rightJustified(13, QLatin1Char(' ')));
    }
    return linhas;
}

QString LinhaProduto(const LinhaImpressa& linha, int decimais, int decimaisQuant) {
    return LinhaFixa(linha.descricao, 16) +
           ValorTalao(linha.quantidade, decimaisQuant)
               .right(9)
               .rightJustified(9, QLatin1Char(' ')) +
           ValorTalao(linha.total(), decimais).right(15).rightJustified(15, QLatin1Char(' '));
}

bool ImprimeLinhasSerie(LinhaSerie& linha, const DefinicaoImpressora& impressora,
                        const ConfigImpressao& config, const LinhasTalao& linhas, int vias) {
    OpcoesImpressaoSerie opcoes;
    opcoes.vias = vias;
    opcoes.saltaLinhas = config.talao.saltaLinhas;
    const bool pausas = config.talao.pausaImpressao;
    return ImprimeNaSerie(linha, impressora, opcoes, [&](CImpressoraTalao& saida, int) {
        for (const LinhaTalao& l : linhas) {
            const int largura = l.tamanho == 1 ? kLarguraTalao : kLarguraTotais;
            saida.ImprimeLinha(LinhaFixa(l.texto, largura), true, l.tamanho, false);
            if (pausas && l.pausa) Pausa(1);
        }
    });
}

bool ImprimeLinhasPagina(const QString& impressora, const QString& titulo,
                         const QStringList& linhas, int vias, QString* pdf) {
    bool ok = true;
    for (int via = 1; via <= vias; ++via) {
        TrabalhoImpressao trabalho;
        if (!trabalho.inicia(impressora, titulo)) return false;
        for (const QString& l : linhas)
            ok = trabalho.imprimeLinha(l) && ok;
        if (pdf) *pdf = trabalho.ficheiroPdf();
        ok = trabalho.termina() && ok;
    }
    return ok;
}

bool ImprimeLinhasTalao(db::Connection& conn, MessagePort& mensagens, LinhaSerie& linha,
                        const ConfigImpressao& config, const LinhasTalao& linhas,
                        const QString& titulo) {
    if (config.serie()) {
        const auto impressora =
            CarregaDefinicaoImpressora(conn, config.talao.tipoImpTalao, mensagens);
        return impressora && ImprimeLinhasSerie(linha, *impressora, config, linhas, 1);
    }
    QStringList textos;
    for (const LinhaTalao& l : linhas)
        textos << l.texto;
    return ImprimeLinhasPagina(config.impressoraPagina(), titulo, textos, 1);
}

}  // namespace brasel::devices
