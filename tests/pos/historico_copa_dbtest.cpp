// The kitchen queue: what a queued order or cancellation stores, the order screen's indicator,
// and what releasing, dropping and editing on APedidos do to the rows.
#include "pos/copa_teste.h"
#include "pos/cozinha/historico_copa.h"
#include "pos/cozinha/pedidos_cozinha.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

namespace brasel::pos::cozinha {
namespace {

using testing::EmpresaTeste;
using testing::MensagensGravadas;

// Answers the note editor from a script.
class EditorGravado : public EditorTexto {
  public:
    std::optional<QString> resposta;
    QString recebido;
    std::optional<QString> editar(const QString& texto) override {
        recebido = texto;
        return resposta;
    }
};

TEST(HistoricoCopa, OrderAndCancellationStoreTheirValuesExactly) {
    EmpresaTeste empresa(true);
    db::Sessao& s = empresa.estado();
    const QString aspas = QStringLiteral("sem 'sal'; -- e \"bem\" passado");
    struct Caso {
        const char* nome;
        bool anulacao;
        QString obs;
        QString obsGuardada;
        const char* marca;
    } casos[] = {
        {"order keeps a note with quotes", false, aspas, aspas, "N"},
        {"cancellation never keeps a note", true, aspas, QStringLiteral(""), "S"},
        {"order without a note", false, QString(), QStringLiteral(""), "N"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        PedidoCozinha p{QStringLiteral("BIT'1"),
                        QStringLiteral("Bitoque d'Ouro"),
                        *Currency::parse(u"2.5"),
                        QStringLiteral("M01"),
                        c.obs,
                        QStringLiteral("ANA")};
        ASSERT_TRUE(c.anulacao ? MeteAnulacaoCozinha(s, p) : MetePedidoCozinha(s, p));
        auto r = s.gConn.firstRow(QStringLiteral(
            "select Produto, Descricao, Quantidade, Cliente, ObsLinha, PodeImprimir, Utilizador, "
            "DataSys, ANULACAO from HistoricoCopa order by NumRegisto desc limit 1"));
        ASSERT_TRUE(r);
        EXPECT_EQ(r->value(0).toString(), p.produto);
        EXPECT_EQ(r->value(1).toString(), p.descricao);
        EXPECT_EQ(Currency::fromVariant(r->value(2)), p.quantidade);
        EXPECT_EQ(r->value(3).toString(), QStringLiteral("M01"));
        EXPECT_EQ(r->value(4).toString(), c.obsGuardada);
        // '' and not NULL: the queue's readers and "ObsLinha=''" must see an empty note.
        EXPECT_FALSE(r->value(4).isNull());
        EXPECT_EQ(r->value(5).toInt(), 0);
        EXPECT_EQ(r->value(6).toString(), QStringLiteral("ANA"));
        EXPECT_EQ(r->value(7).toString().size(), 19) << r->value(7).toString().toStdString();
        EXPECT_EQ(r->value(8).toString(), QString::fromUtf8(c.marca));
    }
}

TEST(HistoricoCopa, IndicatorLightsOnlyWhileARowWaitsForRelease) {
    EmpresaTeste empresa(true);
    db::Sessao& s = empresa.estado();
    EXPECT_FALSE(ExistemPedidosPorLibertar(s));
    const qint64 n = teste::enfileira(s, QStringLiteral("M01"), QStringLiteral("SOPA"));
    EXPECT_TRUE(ExistemPedidosPorLibertar(s));
    ASSERT_TRUE(LibertaPedido(s, n));
    EXPECT_FALSE(ExistemPedidosPorLibertar(s));
}

TEST(HistoricoCopa, WaitingListIsOrderedByTableAndTimeWithTheTableName) {
    EmpresaTeste empresa(true);
    db::Sessao& s = empresa.estado();
    const qint64 a = teste::enfileira(s, QStringLiteral("M02"), QStringLiteral("A"), {}, false,
                                      QStringLiteral("2024-05-01 12:00:00"));
    const qint64 b = teste::enfileira(s, QStringLiteral("M01"), QStringLiteral("B"), {}, false,
                                      QStringLiteral("2024-05-01 12:05:00"));
    const qint64 c = teste::enfileira(s, QStringLiteral("M01"), QStringLiteral("C"), {}, false,
                                      QStringLiteral("2024-05-01 11:00:00"));
    const qint64 d = teste::enfileira(s, QStringLiteral("X99"), QStringLiteral("D"));
    const qint64 libertado = teste::enfileira(s, QStringLiteral("M01"), QStringLiteral("E"));
    ASSERT_TRUE(LibertaPedido(s, libertado));

    const auto lista = PedidosPorLibertar(s);
    ASSERT_TRUE(lista);
    QList<qint64> ordem;
    for (const PedidoCopa& p : *lista)
        ordem.append(p.numRegisto);
    EXPECT_EQ(ordem, (QList<qint64>{c, b, a, d}));
    EXPECT_EQ(lista->at(0).descricaoMesa, QStringLiteral("Mesa 1"));
    EXPECT_EQ(lista->at(3).descricaoMesa, QString());  // a table no longer in Clientes

    const auto libertados = PedidosLibertados(s);
    ASSERT_TRUE(libertados);
    ASSERT_EQ(libertados->size(), 1);
    EXPECT_EQ(libertados->at(0).numRegisto, libertado);
}

TEST(PedidosCozinha, ReleaseAndDropActOnlyOnTheCheckedRowsAfterYes) {
    struct Caso {
        const char* nome;
        bool libertar;  // else drop
        bool resposta;
        QList<int> esperadosFila;        // indices of the three rows still waiting
        QList<int> esperadosLibertados;  // indices released
    } casos[] = {
        {"release, yes", true, true, {1}, {0, 2}},
        {"release, no", true, false, {0, 1, 2}, {}},
        {"drop, yes", false, true, {1}, {}},
        {"drop, no", false, false, {0, 1, 2}, {}},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        EmpresaTeste empresa(true);
        db::Sessao& s = empresa.estado();
        QList<qint64> n;
        for (const char* mesa : {"M01", "M02", "M03"})
            n.append(teste::enfileira(s, QString::fromUtf8(mesa), QStringLiteral("SOPA")));
        MensagensGravadas mensagens;
        mensagens.responder({c.resposta});
        EditorGravado editor;
        PedidosCozinha pedidos(s, mensagens, editor);
        const QList<qint64> marcados{n[0], n[2]};
        const bool mudou =
            c.libertar ? pedidos.liberta(marcados, false) : pedidos.elimina(marcados);
        EXPECT_EQ(mudou, c.resposta);
        EXPECT_EQ(mensagens.perguntas(),
                  QStringList{c.libertar ? QStringLiteral("Confirma a Impressão?")
                                         : QStringLiteral("Confirma a Eliminação?")});
        QList<qint64> fila, libertados;
        for (int i : c.esperadosFila)
            fila.append(n[i]);
        for (int i : c.esperadosLibertados)
            libertados.append(n[i]);
        EXPECT_EQ(teste::naFila(s, 0), fila);
        EXPECT_EQ(teste::naFila(s, 1), libertados);
    }
}

TEST(PedidosCozinha, NothingIsAskedToReleaseAnEmptyList) {
    EmpresaTeste empresa(true);
    MensagensGravadas mensagens;
    mensagens.respostaFinal = true;
    EditorGravado editor;
    PedidosCozinha pedidos(empresa.estado(), mensagens, editor);
    EXPECT_FALSE(pedidos.liberta({}, true));
    EXPECT_TRUE(mensagens.perguntas().isEmpty());
}

TEST(PedidosCozinha, DroppingLeavesARowReleasedMeanwhileByAnotherWorkstation) {
    EmpresaTeste empresa(true);
    db::Sessao& s = empresa.estado();
    const qint64 n = teste::enfileira(s, QStringLiteral("M01"), QStringLiteral("SOPA"));
    ASSERT_TRUE(LibertaPedido(s, n));  // the other workstation, after this one read the list
    MensagensGravadas mensagens;
    mensagens.respostaFinal = true;
    EditorGravado editor;
    PedidosCozinha(s, mensagens, editor).elimina({n});
    EXPECT_EQ(teste::naFila(s, 1), QList<qint64>{n});
}

TEST(PedidosCozinha, EditingANoteStoresTheTypedTextOrNothingWhenGivenUp) {
    EmpresaTeste empresa(true);
    db::Sessao& s = empresa.estado();
    const qint64 n =
        teste::enfileira(s, QStringLiteral("M01"), QStringLiteral("SOPA"), QStringLiteral("antes"));
    MensagensGravadas mensagens;
    EditorGravado editor;
    PedidosCozinha pedidos(s, mensagens, editor);
    auto obs = [&] {
        return s.gConn
            .firstRow(QStringLiteral("select ObsLinha from HistoricoCopa where NumRegisto=?"), {n})
            ->value(0)
            .toString();
    };

    editor.resposta = std::nullopt;
    EXPECT_FALSE(pedidos.editaObs(n, QStringLiteral("antes")));
    EXPECT_EQ(editor.recebido, QStringLiteral("antes"));
    EXPECT_EQ(obs(), QStringLiteral("antes"));

    editor.resposta = QStringLiteral("O'Neill: sem \"gelo\"\r\nmal passado");
    EXPECT_EQ(pedidos.editaObs(n, QStringLiteral("antes")), editor.resposta);
    EXPECT_EQ(obs(), *editor.resposta);
}

}  // namespace
}  // namespace brasel::pos::cozinha
