// The text of kitchen and bar tickets: which rows share a header, what each row prints on the
// serial and on the page printer, and the bar ticket's short table code.
#include "pos/cozinha/talao_cozinha.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

// Failed expectations show the lines as text.
inline void PrintTo(const QStringList& linhas, std::ostream* os) {
    *os << '\n' << linhas.join(u'\n').toStdString();
}

namespace brasel::pos::cozinha {
namespace {

PedidoCopa pedido(qint64 n, const char* mesa, bool anulacao = false) {
    PedidoCopa p;
    p.numRegisto = n;
    p.mesa = QString::fromUtf8(mesa);
    p.anulacao = anulacao;
    p.produto = QStringLiteral("P%1").arg(n);
    p.descricao = QStringLiteral("Prato %1").arg(n);
    p.quantidade = Currency(1);
    p.dataSys = QStringLiteral("2024-05-01 12:30:00");
    p.utilizador = QStringLiteral("ANA");
    return p;
}

QList<QList<qint64>> numeros(const QList<QList<PedidoCopa>>& taloes) {
    QList<QList<qint64>> r;
    for (const auto& t : taloes) {
        r.append(QList<qint64>{});
        for (const PedidoCopa& p : t)
            r.last().append(p.numRegisto);
    }
    return r;
}

TEST(AgrupaTaloes, ConsecutiveRowsOfOneTableAndKindShareATicket) {
    struct Caso {
        const char* nome;
        QList<PedidoCopa> pedidos;
        QList<QList<qint64>> esperado;
    } casos[] = {
        {"nothing released", {}, {}},
        {"two rows of one table, then another table",
         {pedido(1, "M01"), pedido(2, "M01"), pedido(3, "M02")},
         {{1, 2}, {3}}},
        {"a cancellation between orders of the same table starts its own ticket",
         {pedido(1, "M01"), pedido(2, "M01", true), pedido(3, "M01")},
         {{1}, {2}, {3}}},
        {"two cancellations of one table share the frame's ticket",
         {pedido(1, "M01", true), pedido(2, "M01", true)},
         {{1, 2}}},
        {"table codes differing only in case or blanks are different tables",
         {pedido(1, "M01"), pedido(2, "m01"), pedido(3, "M01 ")},
         {{1}, {2}, {3}}},
        {"a table coming back later starts a new ticket",
         {pedido(1, "M01"), pedido(2, "M02"), pedido(3, "M01")},
         {{1}, {2}, {3}}},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        EXPECT_EQ(numeros(AgrupaTaloes(c.pedidos)), c.esperado);
    }
}

ItemTalaoCozinha item(bool primeiro, bool anulacao, const QString& obs) {
    ItemTalaoCozinha i;
    i.produto = QStringLiteral("BIT");
    i.descricao = QStringLiteral("Bitoque à casa");
    i.quantidade = *Currency::parse(u"1.5");
    i.obs = obs;
    i.anulacao = anulacao;
    if (primeiro) {
        i.mesa = QStringLiteral("M01");
        i.dataHora = QStringLiteral("2024-05-01 12:30:00");
        i.empregado = QStringLiteral("02");
        i.linhasExtra = true;
    }
    return i;
}

QStringList textos(const QList<LinhaTalao>& linhas) {
    QStringList r;
    for (const LinhaTalao& l : linhas)
        r.append(l.texto);
    return r;
}

const QString kMoldura = QStringLiteral(" ======================================= ");
const QStringList kCaixa = {kMoldura, QStringLiteral("||                                     ||"),
                            QStringLiteral("||           A N U L Ç Ã O             ||"),
                            QStringLiteral("||                                     ||"), kMoldura};
const QString kMesa = QStringLiteral("PEDIDO DA MESA ->   M01");
const QString kData = QStringLiteral("Data/Hora Emissao - 2024-05-01 12:30:00");
const QString kEmpregado = QStringLiteral("Empreg. -> 02");
const QString kProduto = QStringLiteral("Produto -> 1.5  - Bitoque à casa");

TEST(LinhasTalaoCozinhaSerie, HeaderProductNoteAndCancellationFrame) {
    const QString obs = QStringLiteral("Bem passado, sem sal e batata frita à parte");
    const QString obsCortada = QStringLiteral("      Obs. Bem passado, sem sal e batata");
    struct Caso {
        const char* nome;
        ItemTalaoCozinha item;
        QStringList esperado;
    } casos[] = {
        {"first row of an order",
         item(true, false, {}),
         {{}, {}, {}, {}, kMesa, kData, kEmpregado, kProduto}},
        {"following row with a long note cut at 29 characters",
         item(false, false, obs),
         {{}, kProduto, obsCortada}},
        {"first row of a cancellation, framed and closed", item(true, true, {}),
         QStringList{{}, {}, {}, {}} + kCaixa +
             QStringList{kMesa, kData, kEmpregado, kProduto, kMoldura}},
        {"following cancellation row", item(false, true, {}),
         QStringList{{}} + kCaixa + QStringList{kProduto, kMoldura}},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        EXPECT_EQ(textos(LinhasTalaoCozinhaSerie(c.item)), c.esperado);
    }
}

TEST(LinhasTalaoCozinhaSerie, TheWaiterLineIsCutAtTheTicketWidth) {
    ItemTalaoCozinha i = item(true, false, {});
    i.empregado = QString(50, u'X');
    const QStringList linhas = textos(LinhasTalaoCozinhaSerie(i));
    EXPECT_TRUE(linhas.contains(QStringLiteral("Empreg. -> ") + QString(29, u'X')));
}

TEST(LinhasTalaoCozinhaWindows, NoteSplitIntoAtMostFiveLinesAndNoClosingFrame) {
    struct Caso {
        const char* nome;
        ItemTalaoCozinha item;
        QStringList esperado;
    } casos[] = {
        {"a note of several lines, empty ones skipped",
         item(false, false, QStringLiteral("sem sal\r\n\r\nbem passado\r\n")),
         {{},
          kProduto,
          QStringLiteral("      Obs. sem sal"),
          QStringLiteral("      Obs. bem passado")}},
        {"seven lines keep the first five, each cut at 29",
         item(false, false,
              QStringLiteral("1\r\n2\r\n3\r\n4\r\n") + QString(40, u'5') +
                  QStringLiteral("\r\n6\r\n7")),
         {{},
          kProduto,
          QStringLiteral("      Obs. 1"),
          QStringLiteral("      Obs. 2"),
          QStringLiteral("      Obs. 3"),
          QStringLiteral("      Obs. 4"),
          QStringLiteral("      Obs. ") + QString(29, u'5')}},
        {"a cancellation keeps its box but has no closing line", item(true, true, {}),
         QStringList{{}, {}, {}, {}} + kCaixa + QStringList{kMesa, kData, kEmpregado, kProduto}},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        EXPECT_EQ(LinhasTalaoCozinhaWindows(c.item), c.esperado);
    }
}

TEST(LinhasTalaoBar, ShowsTheLastFourCharactersOfTheTable) {
    const Currency dois(2);
    struct Caso {
        const char* mesa;
        bool extra;
        QStringList esperado;
    } casos[] = {
        {"ESPLANADA07", false, {{}, QStringLiteral("MESA -> DA07    2  - Imperial")}},
        {"M1", true, {{}, {}, {}, {}, QStringLiteral("MESA -> M1    2  - Imperial")}},
        {"", false, {{}}},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.mesa);
        EXPECT_EQ(
            LinhasTalaoBar(QString::fromUtf8(c.mesa), dois, QStringLiteral("Imperial"), c.extra),
            c.esperado);
    }
}

}  // namespace
}  // namespace brasel::pos::cozinha
