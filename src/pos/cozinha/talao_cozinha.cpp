#include "pos/cozinha/talao_cozinha.h"

namespace brasel::pos::cozinha {

namespace {

constexpr qsizetype kTamanhoObs = 29;
constexpr qsizetype kLinhasObsWindows = 5;
constexpr qsizetype kLarguraTalao = 40;

const QString kMoldura = QStringLiteral(" ======================================= ");

QStringList caixaAnulacao() {
    return {kMoldura, QStringLiteral("||                                     ||"),
            QStringLiteral("||           A N U L Ç Ã O             ||"),
            QStringLiteral("||                                     ||"), kMoldura};
}

QStringList linhasEmBranco(bool linhasExtra) {
    return QStringList(linhasExtra ? 4 : 1, QString());
}

QString linhaObs(const QString& obs) {
    return QStringLiteral("      Obs. ") + obs.left(kTamanhoObs);
}

// Ahead of the notes: the blank lines, the frame of a cancellation, then the header lines that
// the item carries and its product line. The table line is the only one printed medium.
QList<LinhaTalao> cabecalhoEProduto(const ItemTalaoCozinha& item) {
    QList<LinhaTalao> linhas;
    auto pequena = [&linhas](const QString& texto) { linhas.append({texto}); };
    for (const QString& l : linhasEmBranco(item.linhasExtra))
        pequena(l);
    if (item.anulacao) {
        for (const QString& l : caixaAnulacao())
            pequena(l);
    }
    if (!item.mesa.isEmpty())
        linhas.append({QStringLiteral("PEDIDO DA MESA ->   ") + item.mesa, TamanhoLetra::Medio});
    if (!item.dataHora.isEmpty()) pequena(QStringLiteral("Data/Hora Emissao - ") + item.dataHora);
    if (!item.empregado.isEmpty())
        pequena((QStringLiteral("Empreg. -> ") + item.empregado).left(kLarguraTalao));
    if (!item.produto.isEmpty()) {
        pequena(QStringLiteral("Produto -> ") + item.quantidade.toPlainText() +
                QStringLiteral("  - ") + item.descricao);
    }
    return linhas;
}

}  // namespace

QList<QList<PedidoCopa>> AgrupaTaloes(const QList<PedidoCopa>& pedidos) {
    QList<QList<PedidoCopa>> taloes;
    for (const PedidoCopa& p : pedidos) {
        const bool continua = !taloes.isEmpty() && taloes.last().first().mesa == p.mesa &&
                              taloes.last().first().anulacao == p.anulacao;
        if (!continua) taloes.append(QList<PedidoCopa>{});
        taloes.last().append(p);
    }
    return taloes;
}

ItemTalaoCozinha ItemDoTalao(const QList<PedidoCopa>& talao, qsizetype indice,
                             const QString& empregado) {
    const PedidoCopa& p = talao.at(indice);
    ItemTalaoCozinha item;
    item.produto = p.produto;
    item.descricao = p.descricao;
    item.quantidade = p.quantidade;
    item.obs = p.obs;
    item.anulacao = p.anulacao;
    if (indice == 0) {
        item.mesa = p.mesa;
        item.dataHora = p.dataSys;
        item.empregado = empregado;
        item.linhasExtra = true;
    }
    return item;
}

QList<LinhaTalao> LinhasTalaoCozinhaSerie(const ItemTalaoCozinha& item) {
    QList<LinhaTalao> linhas = cabecalhoEProduto(item);
    if (!item.obs.isEmpty()) linhas.append({linhaObs(item.obs)});
    if (item.anulacao) linhas.append({kMoldura});
    return linhas;
}

QStringList LinhasTalaoCozinhaWindows(const ItemTalaoCozinha& item) {
    QStringList linhas;
    for (const LinhaTalao& l : cabecalhoEProduto(item))
        linhas.append(l.texto);
    const QStringList partes = item.obs.split(QStringLiteral("\r\n"), Qt::SkipEmptyParts);
    for (const QString& parte : partes.mid(0, kLinhasObsWindows))
        linhas.append(linhaObs(parte));
    return linhas;
}

QStringList LinhasTalaoBar(const QString& mesa, Currency quantidade, const QString& descricao,
                           bool linhasExtra) {
    QStringList linhas = linhasEmBranco(linhasExtra);
    if (!mesa.isEmpty()) {
        linhas.append(QStringLiteral("MESA -> ") + mesa.right(4) + QStringLiteral("    ") +
                      quantidade.toPlainText() + QStringLiteral("  - ") + descricao);
    }
    return linhas;
}

}  // namespace brasel::pos::cozinha
