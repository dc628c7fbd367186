#include "pos/alteracao_linhas.h"

#include "app/passwords.h"
#include "documents/producao.h"
#include "pos/adicionar_produto.h"
#include "pos/cozinha/historico_copa.h"
#include "pricing/impostos.h"
#include "pricing/iva.h"
#include "pricing/leitura.h"

namespace brasel::pos {

namespace {

// The supervisor's password while the table's provisional bill is printed.
bool autorizado(Tab& tab, PerguntasTab& perguntas) {
    if (tab.edicaoLivre || !app::precisaPasswordSupervisor()) return true;
    return perguntas.passwordSupervisor();
}

QVariantList chave(Tab& tab, std::int64_t numRegisto) {
    return {QVariant::fromValue(numRegisto), tab.mesa().codigo, tab.tipo().codigo,
            pricing::textoSql(tab.utilizador())};
}

const QString kDaTab =
    QStringLiteral(" where NumRegisto=? and ") + QString::fromLatin1(kCondicaoTab);

}  // namespace

bool ApagaLinhaGravada(Tab& tab, std::int64_t NumRegisto, db::Connection& conn) {
    app::Estado& estado = tab.estado();
    const auto r = conn.firstRow(
        QStringLiteral("select l.Codigo,l.Descricao,l.QuantNormal,p.ImpCopa from MovProduto l "
                       "left join Produtos p on p.Codigo=l.Codigo where l.NumRegisto=? and "
                       "l.CliFor='C' and l.Terceiro=? and l.Tipo=? and l.Utilizador=? and "
                       "l.Fechado='N'"),
        chave(tab, NumRegisto));
    if (!r) return false;
    if (pricing::ligado(r->value(3))) {
        const cozinha::PedidoCozinha anulacao{r->value(0).toString(),
                                              r->value(1).toString(),
                                              Currency::fromVariant(r->value(2)),
                                              tab.mesa().codigo,
                                              QString(),
                                              tab.utilizador()};
        if (!cozinha::MeteAnulacaoCozinha(estado, anulacao, &conn)) return false;
    }
    pricing::Impostos impostos(estado, &conn);
    return documents::Producao_Anula(estado, NumRegisto, &conn) &&
           impostos.Delete_Produto_ImpostosMovProduto(NumRegisto) &&
           conn.exec(QStringLiteral("delete from MovProduto") + kDaTab, chave(tab, NumRegisto))
               .has_value();
}

bool EliminarLinha(Tab& tab, PerguntasTab& perguntas, std::int64_t NumRegisto) {
    if (tab.indiceLinha(NumRegisto) < 0 || !autorizado(tab, perguntas)) return false;
    if (!tab.mensagens().confirmar(QStringLiteral("Confirma a Eliminação ?"))) return false;
    db::Connection& conn = tab.estado().gConn;
    {
        db::WriteTransaction transaccao(conn);
        if (!transaccao.active() || !ApagaLinhaGravada(tab, NumRegisto, conn) ||
            !transaccao.commit())
            return false;
    }
    tab.retirarLinha(NumRegisto);
    if (tab.lista().linhas.empty()) {
        conn.exec(QStringLiteral("update Clientes set JaImprimiuTalao=0 where Codigo=?"),
                  {tab.mesa().codigo});
        tab.lerMesa(tab.mesa().codigo);
        tab.edicaoLivre = true;
    }
    return true;
}

std::int64_t AlterarQuantidade(Tab& tab, PerguntasTab& perguntas, std::int64_t NumRegisto) {
    const int i = tab.indiceLinha(NumRegisto);
    if (i < 0 || !autorizado(tab, perguntas)) return 0;
    if (!tab.mensagens().confirmar(QStringLiteral("Confirma a Alteração ?"))) return 0;
    const std::optional<Currency> quantidade = perguntas.pedirValor(QStringLiteral("Quantidade"));
    if (!quantidade || quantidade->isZero()) return 0;
    const pricing::LinhaLista linha = tab.lista().linhas[static_cast<std::size_t>(i)];
    // Added again as it was first entered: with VAT for a table whose prices include it (the
    // add takes the VAT out once more), without VAT otherwise.
    const std::optional<pricing::TaxaIva> iva = pricing::LerTaxaIva(tab.estado(), linha.ivaTabela);
    tab.pendentes.preco = iva && iva->incluido ? linha.precoAplicado : linha.preco;
    tab.pendentes.precoDefinido = true;
    tab.pendentes.quantidade = *quantidade;
    tab.pendentes.obs = linha.obsLinha;
    const std::int64_t nova = PremirProduto(tab, perguntas, linha.produto, NumRegisto);
    if (nova > 0)
        tab.retirarLinha(NumRegisto);
    else
        tab.pendentes.limpar();
    return nova;
}

}  // namespace brasel::pos
