// Kitchen and bar tickets on the wire: the poll prints released rows as tickets on the simulated
// printer, keeps every row it could not print, and warns once; the bar ticket goes out at once.
#include "app/definicoes_posto.h"
#include "devices/definicao_impressora.h"
#include "impressora.h"
#include "pos/copa_teste.h"
#include "pos/cozinha/envio_pedido.h"
#include "pos/cozinha/polling_cozinha.h"
#include "support/aplicacao_gui.h"
#include "support/apoio_arranque.h"
#include "support/devsim_teste.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <QDir>
#include <QProcess>
#include <QTimer>

#include <gtest/gtest.h>

#include <functional>
#include <memory>

namespace brasel::pos::cozinha {
namespace {

using testing::MensagensGravadas;

// What the simulated printer shows for the lines of a ticket.
QString pequena(const QString& texto) {
    return QStringLiteral("[COR0][PEQUENO]") + texto + QStringLiteral("\n");
}
QString media(const QString& texto) {
    return QStringLiteral("[COR0][MEDIO]") + texto + QStringLiteral("\n");
}
// One kitchen row: the character set and a reset ahead, a reset after, no cut.
QString linhaCozinha(const QString& corpo) {
    return QStringLiteral("[CHARSET][RESET]") + corpo + QStringLiteral("[RESET]");
}
// The first row of a ticket: four blank lines, then (after the frame of a cancellation) this.
const QString kBrancos = pequena({}).repeated(4);
QString cabecalho(const QString& mesa, const QString& hora) {
    return media(QStringLiteral("PEDIDO DA MESA ->   ") + mesa) +
           pequena(QStringLiteral("Data/Hora Emissao - 2024-05-01 ") + hora) +
           pequena(QStringLiteral("Empreg. -> 02"));
}
QString produto(const QString& codigo) {
    return pequena(QStringLiteral("Produto -> 1  - Descrição de ") + codigo);
}

const QString kMoldura = QStringLiteral(" ======================================= ");

class CozinhaTeste : public ::testing::Test {
  protected:
    void SetUp() override { testing::aplicacaoGui(); }

    // Queues and releases a row of `mesa` ordered at 2024-05-01 `hora`.
    qint64 libertado(const char* mesa, const char* codigo, const char* hora, bool anulacao = false,
                     const QString& obs = {}) {
        const qint64 n =
            teste::enfileira(e_, QString::fromUtf8(mesa), QString::fromUtf8(codigo), obs, anulacao,
                             QStringLiteral("2024-05-01 ") + QString::fromUtf8(hora));
        EXPECT_TRUE(LibertaPedido(e_, n));
        return n;
    }

    // Runs `accao` the next time the message loop runs (the pause of a kitchen row), never
    // after the returned timer is gone.
    static std::unique_ptr<QTimer> duranteAPausa(std::function<void()> accao) {
        auto timer = std::make_unique<QTimer>();
        timer->setSingleShot(true);
        QObject::connect(timer.get(), &QTimer::timeout, std::move(accao));
        timer->start(0);
        return timer;
    }

    QByteArray reset() const { return definicao_.codigos.reset + '\r'; }
    qsizetype resetsRecebidos() const { return impressora_.recebidos().count(reset()); }

    // The printer's transcript once `resets` resets arrived (two for each kitchen row).
    QString transcricao(qsizetype resets) {
        EXPECT_TRUE(impressora_.espera(
            [&](const QByteArray& b) { return b.count(reset()) >= resets; }, 3000));
        return impressora_.transcricao();
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaTeste empresa_{true};
    app::Estado& e_ = empresa_.estado();
    devices::DefinicaoImpressora definicao_ =
        devices::LerDefinicaoImpressora(e_.gConn, QStringLiteral("EP1")).value();
    testing::DevsimTeste devsim_;
    devsim::ServidorDispositivo& impressora_ =
        devsim_.liga(1, std::make_shared<devsim::ImpressoraTalao>(definicao_.codigos));
    devices::LinhaSerie linha_{devsim_.mapa()};
    MensagensGravadas mensagens_;
    PollingCozinha poll_{e_, linha_, mensagens_};
};

TEST_F(CozinhaTeste, RowsOfOneTableShareAHeaderAndACancellationPrintsFramed) {
    const qint64 a = libertado("M01", "BIT", "12:00:00", false,
                               QStringLiteral("Bem passado, sem sal e batata frita à parte"));
    const qint64 b = libertado("M01", "SOPA", "12:01:00");
    const qint64 c = libertado("M02", "FRANGO", "12:02:00");
    const qint64 d = libertado("M03", "BIT", "12:03:00", true, QStringLiteral("ignorada"));
    const qint64 espera = teste::enfileira(e_, QStringLiteral("M01"), QStringLiteral("CAFE"));

    const ResultadoPolling r = poll_.tmrPedidos_Timer();
    EXPECT_EQ(r.impressos, (QList<qint64>{a, b, c, d}));
    EXPECT_TRUE(r.pendentes.isEmpty());
    EXPECT_FALSE(r.avisou);
    EXPECT_TRUE(mensagens_.mensagens().isEmpty());
    EXPECT_TRUE(teste::naFila(e_, 1).isEmpty());
    EXPECT_EQ(teste::naFila(e_, 0), QList<qint64>{espera});  // not released: not printed

    QString caixa;
    for (const char* l :
         {"||                                     ||", "||           A N U L Ç Ã O             ||",
          "||                                     ||"})
        caixa += pequena(QString::fromUtf8(l));
    const QString esperado =
        linhaCozinha(kBrancos + cabecalho(QStringLiteral("M01"), QStringLiteral("12:00:00")) +
                     produto(QStringLiteral("BIT")) +
                     pequena(QStringLiteral("      Obs. Bem passado, sem sal e batata"))) +
        linhaCozinha(pequena({}) + produto(QStringLiteral("SOPA"))) +
        linhaCozinha(kBrancos + cabecalho(QStringLiteral("M02"), QStringLiteral("12:02:00")) +
                     produto(QStringLiteral("FRANGO"))) +
        linhaCozinha(kBrancos + pequena(kMoldura) + caixa + pequena(kMoldura) +
                     cabecalho(QStringLiteral("M03"), QStringLiteral("12:03:00")) +
                     produto(QStringLiteral("BIT")) + pequena(kMoldura));
    EXPECT_EQ(transcricao(8), esperado);
}

TEST_F(CozinhaTeste, AnUnpluggedPrinterKeepsEveryRowWarnsOnceAndPrintsWhenBack) {
    const QList<qint64> rows = {libertado("M01", "BIT", "12:00:00"),
                                libertado("M01", "SOPA", "12:01:00"),
                                libertado("M02", "FRANGO", "12:02:00")};
    impressora_.parar();
    for (int tick = 1; tick <= 2; ++tick) {
        SCOPED_TRACE(tick);
        const ResultadoPolling r = poll_.tmrPedidos_Timer();
        EXPECT_TRUE(r.impressos.isEmpty());
        EXPECT_EQ(r.pendentes, rows);
        EXPECT_EQ(r.avisou, tick == 1);
        EXPECT_EQ(mensagens_.mensagens().size(), 1);
        EXPECT_EQ(teste::naFila(e_, 1), rows);
    }
    EXPECT_TRUE(mensagens_.contem(QStringLiteral("a impressora não responde")));

    ASSERT_TRUE(impressora_.iniciar());
    const ResultadoPolling r = poll_.tmrPedidos_Timer();
    EXPECT_EQ(r.impressos, rows);
    EXPECT_TRUE(teste::naFila(e_, 1).isEmpty());
    EXPECT_EQ(
        transcricao(6),
        linhaCozinha(kBrancos + cabecalho(QStringLiteral("M01"), QStringLiteral("12:00:00")) +
                     produto(QStringLiteral("BIT"))) +
            linhaCozinha(pequena({}) + produto(QStringLiteral("SOPA"))) +
            linhaCozinha(kBrancos + cabecalho(QStringLiteral("M02"), QStringLiteral("12:02:00")) +
                         produto(QStringLiteral("FRANGO"))));

    // Printing worked again, so the next failure is told again.
    impressora_.parar();
    libertado("M04", "BIT", "12:05:00");
    EXPECT_TRUE(poll_.tmrPedidos_Timer().avisou);
    EXPECT_EQ(mensagens_.mensagens().size(), 2);
}

TEST_F(CozinhaTeste, APrinterUnpluggedInTheMiddleOfAPollLosesNoRow) {
    const QList<qint64> rows = {libertado("M01", "BIT", "12:00:00"),
                                libertado("M01", "SOPA", "12:01:00"),
                                libertado("M02", "FRANGO", "12:02:00")};
    // Runs while the first row's ticket lets the message loop run, before its closing reset.
    const auto desliga = duranteAPausa([this] { impressora_.parar(); });
    const ResultadoPolling r = poll_.tmrPedidos_Timer();
    EXPECT_TRUE(r.impressos.isEmpty());
    EXPECT_EQ(r.pendentes, rows);
    EXPECT_TRUE(r.avisou);
    EXPECT_EQ(teste::naFila(e_, 1), rows);

    // Whatever of the interrupted row reached the printer before it went away.
    const qsizetype antes = impressora_.transcricao().size();
    const qsizetype resetsAntes = resetsRecebidos();
    ASSERT_TRUE(impressora_.iniciar());
    EXPECT_EQ(poll_.tmrPedidos_Timer().impressos, rows);
    // The interrupted row prints again, whole, under its header.
    EXPECT_EQ(
        transcricao(resetsAntes + 6).mid(antes),
        linhaCozinha(kBrancos + cabecalho(QStringLiteral("M01"), QStringLiteral("12:00:00")) +
                     produto(QStringLiteral("BIT"))) +
            linhaCozinha(pequena({}) + produto(QStringLiteral("SOPA"))) +
            linhaCozinha(kBrancos + cabecalho(QStringLiteral("M02"), QStringLiteral("12:02:00")) +
                         produto(QStringLiteral("FRANGO"))));
}

TEST_F(CozinhaTeste, APortHeldByAnotherPrintoutOrAPollAlreadyRunningSendsNothing) {
    const QList<qint64> rows = {libertado("M01", "BIT", "12:00:00"),
                                libertado("M02", "SOPA", "12:01:00")};
    {
        devices::GuardaPorta outra(linha_);
        ASSERT_TRUE(outra.obtida());
        const ResultadoPolling r = poll_.tmrPedidos_Timer();
        EXPECT_TRUE(r.impressos.isEmpty());
        EXPECT_FALSE(r.avisou);
        EXPECT_TRUE(mensagens_.mensagens().isEmpty());
        EXPECT_EQ(teste::naFila(e_, 1), rows);
    }
    // A tick that comes while the first row lets the message loop run does nothing.
    ResultadoPolling aninhado;
    aninhado.pendentes = {-1};
    const auto outro = duranteAPausa([&] { aninhado = poll_.tmrPedidos_Timer(); });
    EXPECT_EQ(poll_.tmrPedidos_Timer().impressos, rows);
    EXPECT_TRUE(aninhado.impressos.isEmpty());
    EXPECT_TRUE(aninhado.pendentes.isEmpty());
    EXPECT_EQ(transcricao(4).count(QStringLiteral("PEDIDO DA MESA")), 2);
}

TEST_F(CozinhaTeste, AMissingPrinterDefinitionIsToldOnceAndKeepsTheRows) {
    ASSERT_TRUE(e_.gConn.exec(
        QStringLiteral("update UtilConfGeral set TipoImpTalao='ZZ' where utilizador=?"),
        {e_.gUtilizador}));
    const qint64 n = libertado("M01", "BIT", "12:00:00");
    EXPECT_TRUE(poll_.tmrPedidos_Timer().avisou);
    EXPECT_FALSE(poll_.tmrPedidos_Timer().avisou);
    EXPECT_EQ(
        mensagens_.textos(),
        QStringList{QStringLiteral("A T E N Ç Ã O !  Impressora de Talões não Configurada!")});
    EXPECT_EQ(teste::naFila(e_, 1), QList<qint64>{n});
    EXPECT_TRUE(impressora_.recebidos().isEmpty());
}

TEST_F(CozinhaTeste, AWorkstationWithoutAKitchenWayLeavesTheRowsToAnother) {
    ASSERT_TRUE(
        e_.gConn.exec(QStringLiteral("update UtilConfGeral set PortaTalao='' where utilizador=?"),
                      {e_.gUtilizador}));
    const qint64 n = libertado("M01", "BIT", "12:00:00");
    const ResultadoPolling r = poll_.tmrPedidos_Timer();
    EXPECT_TRUE(r.pendentes.isEmpty());
    EXPECT_FALSE(r.avisou);
    EXPECT_TRUE(mensagens_.mensagens().isEmpty());
    EXPECT_EQ(teste::naFila(e_, 1), QList<qint64>{n});
}

TEST_F(CozinhaTeste, ThePagePrinterWayPrintsATicketAsOneJob) {
    ASSERT_TRUE(app::posto::ConfigRest_ImpTalaoCozinhaPorta.gravar(QStringLiteral("PAR")));
    ASSERT_TRUE(app::posto::ConfigRest_ImpTalaoCozinhaNome.gravar(
        QStringLiteral("Impressora que não existe")));
    const QList<qint64> rows = {
        libertado("M01", "BIT", "12:00:00", false, QStringLiteral("sem sal\r\nbem passado")),
        libertado("M01", "SOPA", "12:01:00")};
    EXPECT_TRUE(poll_.tmrPedidos_Timer().avisou);
    EXPECT_EQ(teste::naFila(e_, 1), rows);

    QTemporaryDir pasta;
    ASSERT_TRUE(app::posto::ConfigRest_ImpTalaoCozinhaNome.gravar(pasta.path()));
    EXPECT_EQ(poll_.tmrPedidos_Timer().impressos, rows);
    EXPECT_TRUE(impressora_.recebidos().isEmpty());
    const QStringList pdfs = QDir(pasta.path()).entryList({QStringLiteral("*.pdf")});
    ASSERT_EQ(pdfs.size(), 1);
    QProcess texto;
    texto.start(QStringLiteral("pdftotext"),
                {QStringLiteral("-layout"), QDir(pasta.path()).filePath(pdfs.first()),
                 QStringLiteral("-")});
    if (!texto.waitForFinished(10000)) GTEST_SKIP() << "pdftotext is not available";
    // The text of the page, blanks run together (the PDF keeps no exact spacing).
    const QString impresso = QString::fromUtf8(texto.readAllStandardOutput()).simplified();
    for (const char* linha :
         {"PEDIDO DA MESA ->   M01", "Empreg. -> 02", "Produto -> 1  - Descrição de BIT",
          "Obs. sem sal", "Obs. bem passado", "Produto -> 1  - Descrição de SOPA"}) {
        EXPECT_TRUE(impresso.contains(QString::fromUtf8(linha).simplified())) << linha;
    }
    EXPECT_EQ(impresso.count(QStringLiteral("PEDIDO DA MESA")), 1);
}

TEST_F(CozinhaTeste, BarTicketShowsTheLastFourCharactersOfTheTableAndCuts) {
    PedidoCozinha p{QStringLiteral("IMP"),
                    QStringLiteral("Imperial"),
                    Currency(2),
                    QStringLiteral("ESPLANADA07"),
                    {},
                    QStringLiteral("ANA")};
    EXPECT_EQ(ImprimeTalaoBar(e_.gConn, linha_, QStringLiteral("EP1"), p, false),
              ResultadoTalao::Impresso);
    EXPECT_EQ(transcricao(2), QStringLiteral("[CHARSET][RESET]") + pequena({}) +
                                  pequena(QStringLiteral("MESA -> DA07    2  - Imperial")) +
                                  QStringLiteral("[FEED 8][CORTE][RESET]"));
    EXPECT_EQ(ImprimeTalaoBar(e_.gConn, linha_, QStringLiteral("ZZ"), p, false),
              ResultadoTalao::NaoConfigurada);
}

TEST_F(CozinhaTeste, ALineGoesToTheKitchenQueueOrToTheBarAndALostBarTicketIsTold) {
    PedidoCozinha p{QStringLiteral("IMP"), QStringLiteral("Imperial"), Currency(1),
                    QStringLiteral("M01"), QStringLiteral("fresca"),   QStringLiteral("ANA")};
    struct Caso {
        const char* nome;
        bool cozinha;
        const char* impressoraBar;
        bool ligada;
        bool enviado;
        bool naFila;
        bool impresso;
        bool avisado;
    } casos[] = {
        {"kitchen product", true, "EP1", true, true, true, false, false},
        {"bar product", false, "EP1", true, true, false, true, false},
        {"no bar printer here", false, "", true, true, false, false, false},
        {"bar printer unplugged", false, "EP1", false, false, false, false, true},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        ASSERT_TRUE(e_.gConn.exec(QStringLiteral("delete from HistoricoCopa")));
        mensagens_.limpar();
        ASSERT_TRUE(app::posto::ConfigRest_ImpTalaoBar.gravar(QString::fromUtf8(c.impressoraBar)));
        if (c.ligada && !impressora_.activo()) {
            ASSERT_TRUE(impressora_.iniciar());
        } else if (!c.ligada) {
            impressora_.parar();
        }
        const qsizetype antes = impressora_.recebidos().size();
        EXPECT_EQ(EnviaPedido(e_, linha_, p, c.cozinha, mensagens_), c.enviado);
        EXPECT_EQ(teste::naFila(e_, 0).size(), c.naFila ? 1 : 0);
        if (c.impresso) {
            EXPECT_TRUE(transcricao(2).contains(QStringLiteral("MESA -> M01    1  - Imperial")));
        } else {
            EXPECT_EQ(impressora_.recebidos().size(), antes);
        }
        EXPECT_EQ(mensagens_.contem(QStringLiteral("Avise o bar")), c.avisado);
    }
}

}  // namespace
}  // namespace brasel::pos::cozinha
