#include "lookups/pesquisa_tabelas.h"

#include <QSqlRecord>

namespace brasel::lookups {

namespace {

// The document types the company keeps for its own postings (opening balances and the like):
// never offered to a person.
constexpr const char* kTiposReservados[] = {"TipoSICliD", "TipoSICliC", "TipoSIForD",
                                            "TipoSIForC", "TipoSIBanD", "TipoSIBanC",
                                            "TipoSIPro",  "TipoSICaiD", "TipoSICaiC"};

void junta(db::Condicao& destino, const db::Condicao& origem) {
    destino.sql += origem.sql;
    destino.valores += origem.valores;
}

}  // namespace

// Each lookup is its table's definition given to the one routine.
#define BRASEL_PESQUISA(nome, mestre)                                                         \
    void PesquisaTabelas::nome(CampoCodigo& campo, bool forcar, const db::Condicao& filtro) { \
        pesquisar(definicao(Mestre::mestre), campo, forcar, filtro);                          \
    }
BRASEL_PESQUISA(Documentos, Documentos)
BRASEL_PESQUISA(Cambios, Cambios)
BRASEL_PESQUISA(Produtos, Produtos)
BRASEL_PESQUISA(Clientes, Clientes)
BRASEL_PESQUISA(Fornecedores, Fornecedores)
BRASEL_PESQUISA(ClientesMoradas_LISTA, ClientesMoradas)
BRASEL_PESQUISA(FornecedoresMoradas_LISTA, FornecedoresMoradas)
BRASEL_PESQUISA(PagaComo, PagaComo)
BRASEL_PESQUISA(Vendedores, Vendedores)
BRASEL_PESQUISA(TabPostal, TabPostal)
BRASEL_PESQUISA(OutUnidades, OutUnidades)
BRASEL_PESQUISA(Armazens, Armazens)
BRASEL_PESQUISA(Localizacoes, Localizacoes)
BRASEL_PESQUISA(LotesTabela, LotesTabela)
BRASEL_PESQUISA(Utilizadores, Utilizadores)
BRASEL_PESQUISA(Estacao_Referencias, Estacao)
BRASEL_PESQUISA(Sexo_Referencias, Sexo)
BRASEL_PESQUISA(Referencia_Referencias, Referencia)
BRASEL_PESQUISA(Modelo_Referencias, Modelo)
BRASEL_PESQUISA(Cor_Referencias, Cor)
BRASEL_PESQUISA(Tamanho_Referencias, Tamanho)
BRASEL_PESQUISA(Comprimento_Referencias, Comprimento)
BRASEL_PESQUISA(Caixas, Caixas)
BRASEL_PESQUISA(Impressoras_Taloes, ImpressorasTaloes)
BRASEL_PESQUISA(Delegados, Delegados)
BRASEL_PESQUISA(Produtos_FacturaREST, ProdutosFacturaREST)
#undef BRASEL_PESQUISA

void PesquisaTabelas::TipoMov(CampoCodigo& campo, bool forcar, const db::Condicao& filtro) {
    db::Condicao condicao = filtro;
    junta(condicao, tiposReservados());
    pesquisar(definicao(Mestre::TipoMov), campo, forcar, condicao);
}

QString PesquisaTabelas::Observacoes_str(const QString& chave) {
    const DefinicaoPesquisa& d = definicao(Mestre::Observacoes);
    CampoCodigo campo;
    abrirJanela(d, campo, condicoes(d, {}), 1, chave);
    return campo.descricao;
}

void PesquisaTabelas::Erros(const QString& erro, const QString& tabela) {
    mensagens_.mensagem(mensagemErroBaseDados(erro, tabela), Icone::Critico);
}

void PesquisaTabelas::pesquisar(const DefinicaoPesquisa& d, CampoCodigo& campo, bool forcar,
                                const db::Condicao& filtro) {
    const db::Condicao condicao = condicoes(d, filtro);
    const QString texto = campo.codigo;
    if (texto.startsWith(u'\\')) return abrirJanela(d, campo, condicao, 1, texto.mid(1));
    if (texto.startsWith(u'/')) return abrirJanela(d, campo, condicao, 0, texto.mid(1));
    if (!texto.isEmpty() && !forcar) return validar(d, campo, condicao);
    abrirJanela(d, campo, condicao, 0, {});
}

db::Condicao PesquisaTabelas::condicoes(const DefinicaoPesquisa& d, const db::Condicao& filtro) {
    db::Condicao condicao = filtro;
    if (!condicao.sql.isEmpty()) condicao.sql = u' ' + condicao.sql.trimmed() + u' ';
    junta(condicao, filtroSituacoes(estado_, estado_.gUtilizador, d.tabela));
    return condicao;
}

db::Condicao PesquisaTabelas::tiposReservados() {
    db::Condicao condicao;
    QStringList colunas;
    for (const char* coluna : kTiposReservados)
        colunas << QString::fromLatin1(coluna);
    const auto linha = estado_.gConn.firstRow(QStringLiteral("select ") + colunas.join(u',') +
                                              QStringLiteral(" from ParamGeral limit 1"));
    if (!linha) return condicao;
    for (const QString& coluna : colunas) {
        const QString tipo = linha->value(coluna).toString().trimmed();
        if (tipo.isEmpty()) continue;
        condicao.sql += QStringLiteral(" and TabTipoMov.codigo<>? ");
        condicao.valores << tipo;
    }
    return condicao;
}

void PesquisaTabelas::validar(const DefinicaoPesquisa& d, CampoCodigo& campo,
                              const db::Condicao& condicao) {
    const QString sql = QStringLiteral("select ") + d.codigo + u',' + d.descricao +
                        QStringLiteral(" from ") + d.tabela + QStringLiteral(" where ") + d.tabela +
                        u'.' + colunaIdentidade(d.tabela) + QStringLiteral(">0 ") + condicao.sql +
                        QStringLiteral(" and ") + d.codigo + QStringLiteral("=? limit 1");
    QVariantList valores = condicao.valores;
    valores << campo.codigo;
    auto linha = estado_.gConn.exec(sql, valores);
    if (!linha) {
        // A code that could not be checked does not stand.
        Erros(estado_.gConn.lastError(), d.tabela);
        campo = {};
        return;
    }
    if (linha->next()) {
        campo.descricao = linha->value(1).toString();
        return;
    }
    if (!d.mensagem.isEmpty()) mensagens_.mensagem(d.mensagem, Icone::Critico);
    campo = {};
}

void PesquisaTabelas::abrirJanela(const DefinicaoPesquisa& d, CampoCodigo& campo,
                                  const db::Condicao& condicao, int campoPesquisa,
                                  const QString& chave) {
    PedidoPesquisa pedido;
    pedido.titulo = d.titulo;
    pedido.tabela = d.tabela;
    pedido.seleccao = d.seleccao;
    pedido.campos = d.campos;
    pedido.colunas = d.colunas;
    pedido.filtro = condicao;
    pedido.ordem = d.ordem;
    pedido.campo = campoPesquisa;
    pedido.chave = chave;
    const int limite = estado_.param.registosVisualizar;
    if (limite > 0) pedido.limite = QString::number(limite);
    const auto escolhida = janela_.Pesquisa(pedido);
    if (!escolhida) return;
    campo.codigo = escolhida->codigo;
    campo.descricao = escolhida->descricao;
}

}  // namespace brasel::lookups
