#include "documents/producao.h"

#include "documents/custos_linha.h"
#include "documents/lanca_mov_produto.h"
#include "documents/numeracao.h"
#include "documents/ultimos_precos.h"
#include "pricing/leitura.h"

#include <vector>

namespace brasel::documents {

namespace {

const QString kObsAutomatica = QStringLiteral("LANC. AUTO. DE PRODUTOS");

struct ConfigProducao {
    QString TipoSaida;
    QString TipoEnt;
    QString Fornece;
    QString cliente;
    bool completa() const {
        return !TipoSaida.trimmed().isEmpty() && !TipoEnt.trimmed().isEmpty() &&
               !Fornece.trimmed().isEmpty() && !cliente.trimmed().isEmpty();
    }
};

struct Componente {
    QString ProdutoPrima;
    Currency Quantidade;
    QString armazem;
};

// One production line to post: what differs between the exits and the entry.
struct LinhaProducao {
    QString produto;
    Currency quantidade;
    QString armazem;
    QString tipo;
    QString numero;
    QString cliFor;
    QString terceiro;
    QString afectaStk;
    QString textoLog;
};

// Everything a production needs, read before anything is written.
class Producao {
  public:
    Producao(app::Estado& estado, db::Connection& conn, const DestinoProducao& destino)
        : estado_(estado), conn_(conn), destino_(destino) {}

    // False when a reading failed; `componentes` empty when the product is not produced.
    bool lerNomenclatura(const QString& produto, std::vector<Componente>& componentes) {
        auto rs = conn_.exec(QStringLiteral("select ProdutoPrima, Quantidade, "
                                            "COALESCE(armazem,'') from Nomenclatura where "
                                            "ProdutoAcabado=? order by armazem, NumRegisto"),
                             {produto});
        if (!rs) return false;
        while (rs->next()) {
            componentes.push_back({rs->value(0).toString(), Currency::fromVariant(rs->value(1)),
                                   rs->value(2).toString().trimmed()});
        }
        return true;
    }

    std::optional<ConfigProducao> lerConfig() {
        auto rs =
            conn_.exec(QStringLiteral("select TipoSaida, TipoEnt, Fornece, cliente from "
                                      "ConfigProd order by NumRegisto limit 1"));
        if (!rs) return std::nullopt;
        ConfigProducao config;
        if (rs->next()) {
            config = {rs->value(0).toString(), rs->value(1).toString(), rs->value(2).toString(),
                      rs->value(3).toString()};
        }
        return config;
    }

    // Posts one line at its product's cost and links it to the sale line.
    bool lancar(const LinhaProducao& lp) {
        const auto produto = conn_.firstRow(
            QStringLiteral("select Descricao, precomediocusto from Produtos where Codigo=?"),
            {lp.produto});
        if (!produto) return false;
        const auto param = LerParamCustos(conn_);
        if (!param) return false;
        Currency custo = Currency::fromVariant(produto->value(1));
        if (param->PMCArmazem) {
            const auto armazem =
                UltimosPrecosArmazem(estado_, lp.produto, lp.armazem, destino_.Data, &conn_);
            if (!armazem) return false;
            custo = armazem->Armazem_PMCusto;
        }
        db::ValoresMovPro l;
        l.Codigo = lp.produto;
        l.Descricao = produto->value(0).toString();
        l.Tipo = lp.tipo;
        l.Numero = lp.numero;
        l.Ano = destino_.Data.left(4);
        l.Data = destino_.Data;
        l.Preco = custo;
        l.PrecoAplicado = custo;
        l.QuantNormal = lp.quantidade;
        l.ValorIliq = custo * lp.quantidade;
        l.CliFor = lp.cliFor;
        l.Terceiro = lp.terceiro;
        l.Armazem = lp.armazem;
        l.AfectaCli = QStringLiteral("NA");
        l.AfectaFor = QStringLiteral("NA");
        l.AfectaStk = lp.afectaStk;
        l.Aplic = QStringLiteral("FC");
        l.ObsLinha = kObsAutomatica;
        l.Fechado = QStringLiteral("S");
        l.Utilizador = estado_.gUtilizador;
        if (!LancaMovProduto(estado_, l, {lp.textoLog, {}}, &conn_)) return false;
        return conn_
            .exec(QStringLiteral("insert into MovProduto_Ligacoes (Origem_Tipo, Origem_Numero, "
                                 "Origem_Data, Origem_Identifica, Destino_Tipo, Destino_Numero, "
                                 "Destino_Data, Destino_Identifica, Quantidade) values "
                                 "(?,?,?,?,?,?,?,?,?)"),
                  {l.Tipo, l.Numero, l.Data, l.Identifica, pricing::textoSql(destino_.Tipo),
                   pricing::textoSql(destino_.Numero), pricing::textoSql(destino_.Data),
                   destino_.Identifica, l.QuantNormal.toText()})
            .has_value();
    }

  private:
    app::Estado& estado_;
    db::Connection& conn_;
    const DestinoProducao& destino_;
};

bool produzir(Producao& producao, const ConfigProducao& config,
              const std::vector<Componente>& componentes, const QString& produto,
              Currency quantidade, const QString& armazem, db::Connection& conn) {
    const auto numSaida = ProximoNumTabTipoMov(conn, config.TipoSaida);
    if (!numSaida) return false;
    for (const Componente& c : componentes) {
        const LinhaProducao saida{c.ProdutoPrima,
                                  quantidade * c.Quantidade,
                                  c.armazem.isEmpty() ? armazem : c.armazem,
                                  config.TipoSaida,
                                  *numSaida,
                                  QStringLiteral("C"),
                                  config.cliente,
                                  QStringLiteral("S+"),
                                  QStringLiteral("Facturação Clientes (Produção - Saídas)")};
        if (!producao.lancar(saida)) return false;
    }
    const auto numEntrada = ProximoNumTabTipoMov(conn, config.TipoEnt);
    if (!numEntrada) return false;
    return producao.lancar({produto, quantidade, armazem, config.TipoEnt, *numEntrada,
                            QStringLiteral("F"), config.Fornece, QStringLiteral("E+"),
                            QStringLiteral("Facturação Clientes (Produção - Entrada)")});
}

QString descricaoProduto(db::Connection& conn, const QString& produto) {
    const auto linha =
        conn.firstRow(QStringLiteral("select Descricao from Produtos where Codigo=?"), {produto});
    return linha ? linha->value(0).toString() : QString();
}

}  // namespace

bool Producao_Lanca(app::Estado& estado, const QString& Produto, Currency Quantidade,
                    const DestinoProducao& destino, const QString& Armazem, MessagePort& mensagens,
                    db::Connection* conn) {
    db::Connection& c = estado.ligacao(conn);
    const auto falhou = [&] {
        Producao_AnulaIdentifica(estado, destino.Identifica, &c);
        mensagens.mensagem(QStringLiteral("Não foi possível Produzir do Produto [ %1 ] [ %2 ]")
                               .arg(Produto, descricaoProduto(c, Produto)),
                           Icone::Critico);
        return false;
    };
    Producao producao(estado, c, destino);
    std::vector<Componente> componentes;
    try {
        if (!producao.lerNomenclatura(Produto, componentes)) return falhou();
        if (componentes.empty()) return true;
        const auto config = producao.lerConfig();
        if (!config) return falhou();
        if (!config->completa()) {
            mensagens.mensagem(QStringLiteral("As Configurações para produção, estão Incompletas!"),
                               Icone::Critico);
            return false;
        }
        // Without a key of the sale line the production could never be undone.
        if (destino.Identifica.trimmed().isEmpty()) return falhou();
        pricing::TransacaoSeNecessaria transaccao(c);
        if (!transaccao.active() ||
            !produzir(producao, *config, componentes, Produto, Quantidade, Armazem, c) ||
            !transaccao.commit()) {
            return falhou();
        }
    } catch (const CurrencyOverflow&) {
        return falhou();
    }
    return true;
}

bool Producao_AnulaIdentifica(app::Estado& estado, const QString& Identifica,
                              db::Connection* conn) {
    // An empty key would match every line and link that has none.
    if (Identifica.trimmed().isEmpty()) return true;
    db::Connection& c = estado.ligacao(conn);
    pricing::TransacaoSeNecessaria transaccao(c);
    return transaccao.active() &&
           c.exec(QStringLiteral("delete from MovProduto where Identifica<>'' and Identifica in "
                                 "(select Origem_Identifica from MovProduto_Ligacoes where "
                                 "Destino_Identifica=?)"),
                  {Identifica}) &&
           c.exec(QStringLiteral("delete from MovProduto_Ligacoes where Destino_Identifica=?"),
                  {Identifica}) &&
           transaccao.commit();
}

bool Producao_Anula(app::Estado& estado, std::int64_t NumRegisto, db::Connection* conn) {
    db::Connection& c = estado.ligacao(conn);
    auto rs =
        c.exec(QStringLiteral("select COALESCE(Identifica,'') from MovProduto where NumRegisto=?"),
               {QVariant::fromValue<qlonglong>(NumRegisto)});
    if (!rs) return false;
    if (!rs->next()) return true;
    const QString identifica = rs->value(0).toString();
    rs->finish();
    return Producao_AnulaIdentifica(estado, identifica, &c);
}

bool Producao_ActualizaDestino(app::Estado& estado, const QString& provisoria,
                               const QString& definitiva, db::Connection* conn) {
    if (provisoria.trimmed().isEmpty() || provisoria == definitiva) return true;
    return estado.ligacao(conn)
        .exec(QStringLiteral(
                  "update MovProduto_Ligacoes set Destino_Identifica=? where Destino_Identifica=?"),
              {definitiva, provisoria})
        .has_value();
}

}  // namespace brasel::documents
