#include "pos/adicionar_produto_lote.h"

#include "db/procedimentos/saldo_produto_sp.h"
#include "pricing/leitura.h"

#include <QDate>

#include <algorithm>

namespace brasel::pos {

namespace {

// A date as the lines store it; an empty text is no date and passes.
bool dataValida(const QString& texto) {
    if (texto.isEmpty()) return true;
    const QDate d = QDate::fromString(texto, QStringLiteral("yyyy-MM-dd"));
    return d.isValid() && d.toString(QStringLiteral("yyyy-MM-dd")) == texto;
}

}  // namespace

std::optional<std::vector<LoteDisponivel>> LotesDisponiveis(db::Connection& conn,
                                                            const QString& produto,
                                                            const QString& armazem) {
    const QString codigoArmazem = pricing::textoSql(armazem);
    auto q = conn.exec(QStringLiteral("select Lote, max(DataFabrico), max(DataValidade) from "
                                      "MovProduto where Codigo=? and Lote<>'' and "
                                      "(Armazem=? or ArmazemDest=?) group by Lote"),
                       {pricing::textoSql(produto), codigoArmazem, codigoArmazem});
    if (!q) return std::nullopt;
    std::vector<LoteDisponivel> lotes;
    while (q->next())
        lotes.push_back({q->value(0).toString(), q->value(1).toString().trimmed(),
                         q->value(2).toString().trimmed(), Currency{}});
    q.reset();

    std::vector<LoteDisponivel> comSaldo;
    for (LoteDisponivel& l : lotes) {
        db::ChavesSaldo chaves;
        chaves.Produto = produto;
        chaves.Armazem = codigoArmazem;
        chaves.Lote = l.lote;
        const std::optional<Currency> saldo = db::SaldoProduto(conn, chaves);
        if (!saldo) return std::nullopt;
        l.saldo = *saldo;
        if (l.saldo > Currency{}) comSaldo.push_back(l);
    }
    std::sort(comSaldo.begin(), comSaldo.end(),
              [](const LoteDisponivel& a, const LoteDisponivel& b) {
                  if (a.dataValidade.isEmpty() != b.dataValidade.isEmpty())
                      return b.dataValidade.isEmpty();
                  if (a.dataValidade != b.dataValidade) return a.dataValidade < b.dataValidade;
                  return a.lote < b.lote;
              });
    return comSaldo;
}

QString ValidaLote(const LoteEscolhido& lote) {
    if (lote.lote.trimmed().isEmpty()) return QStringLiteral("Não seleccionou qualquer Lote");
    if (!dataValida(lote.dataFabrico)) return QStringLiteral("Data de Fabrico Inválida!");
    if (!dataValida(lote.dataValidade)) return QStringLiteral("Data de Validade Inválida!");
    if (!lote.dataFabrico.isEmpty() && !lote.dataValidade.isEmpty() &&
        lote.dataValidade < lote.dataFabrico)
        return QStringLiteral("A Data de Validade é anterior à Data de Fabrico!");
    return {};
}

}  // namespace brasel::pos
