// Four workstations closing tabs of the same document type at the same moment on one
// PostgreSQL company: every number is issued once and in order, each signature chains to the one
// before it, and the till holds exactly what the documents say. Each workstation is a process of
// its own (this program run again with the workstation's test), as in a restaurant.
#include "app/carrega_parametros.h"
#include "db/schema/servidor.h"
#include "documents/assinatura.h"
#include "pos/abertura_mesa.h"
#include "pos/adicionar_produto.h"
#include "pos/fecho_tab.h"
#include "pos/tab_teste.h"
#include "support/chave_teste.h"
#include "support/empresa_pg.h"
#include "support/servidor_pg.h"

#include <QDate>
#include <QFileInfo>
#include <QProcess>
#include <QProcessEnvironment>

#include <cstdio>
#include <vector>

namespace brasel::pos {
namespace {

constexpr int kPostos = 4;
constexpr int kMesasPorPosto = 50;
const char* const kProdutos[] = {"B001", "B006", "B010"};

// What a workstation process is told through its environment.
const char* const kEnvPosto = "BRASEL_FECHO_POSTO";
const char* const kEnvEmpresa = "BRASEL_FECHO_EMPRESA";
const char* const kEnvChave = "BRASEL_FECHO_CHAVE";

QString env(const char* nome) {
    return qEnvironmentVariable(nome);
}

bool abreEmpresa(app::Estado& estado, const testing::ServidorPg& pg, const QString& empresa,
                 QString* erro) {
    const auto servidor = db::ServerAddress::parse(pg.servidor).value_or(db::ServerAddress{});
    if (!db::schema::abrirEmpresa(estado.gConn, servidor, {pg.login, pg.password}, empresa, erro))
        return false;
    estado.gServidor = pg.servidor;
    estado.gEmpresa = empresa;
    estado.gLogin = QStringLiteral("SUPERVISOR");
    estado.gUtilizador = QStringLiteral("01");
    return true;
}

// One workstation: table M0n under the cash-sale type, filled and closed 50 times. A closing
// that loses to another workstation's lock is what a cashier would press again: it is retried.
TEST(FechoConcorrente, Posto) {
    const int posto = env(kEnvPosto).toInt();
    const auto pg = testing::servidorPg();
    if (posto <= 0 || !pg) GTEST_SKIP() << "corre só como posto do teste concorrente";

    app::Estado estado;
    QString erro;
    ASSERT_TRUE(abreEmpresa(estado, *pg, env(kEnvEmpresa), &erro)) << erro.toStdString();
    testing::MensagensGravadas m;
    app::CarregaParametros(estado, m, {});
    estado.config.ficheiroChave = env(kEnvChave);
    estado.config.numeroCertificado = QStringLiteral("0000");
    devices::LinhaSerie linha;
    teste::PerguntasGravadas p;
    Tab tab(estado, m, linha);
    ASSERT_TRUE(tab.definirTipo(QStringLiteral("VD")));
    ASSERT_TRUE(AbrirMesa(tab, QStringLiteral("M%1").arg(posto, 2, 10, QLatin1Char('0'))));

    const QString hoje = QDate::currentDate().toString(QStringLiteral("yyyy-MM-dd"));
    int repeticoes = 0;
    for (int i = 0; i < kMesasPorPosto; ++i) {
        for (const char* produto : kProdutos)
            ASSERT_GT(PremirProduto(tab, p, QString::fromLatin1(produto)), 0);
        ASSERT_TRUE(tab.CarregarDoc(0));
        std::optional<DocumentoFechado> doc;
        for (int tentativa = 0; tentativa < 5 && !doc; ++tentativa) {
            repeticoes += tentativa > 0;
            doc = GravaDocumento(tab, DadosFecho{{}, hoje, {}, {}, {}});
        }
        ASSERT_TRUE(doc) << "mesa " << i << ": " << m.textos().join(u'|').toStdString();
        ASSERT_TRUE(tab.CarregarDoc(0));
        ASSERT_TRUE(tab.lista().linhas.empty());
    }
    std::printf("repeticoes=%d\n", repeticoes);
}

class FechoConcorrenteSala : public ::testing::Test {
  protected:
    void SetUp() override {
        if (!testing::servidorPg()) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
        if (!env(kEnvPosto).isEmpty()) GTEST_SKIP() << "um posto não lança outros";
        ASSERT_TRUE(empresa_.pronta()) << empresa_.erro().toStdString();
        testing::usaChaveTeste(estado_);
    }

    testing::EmpresaPg empresa_{QLatin1Char('K'), true};
    app::Estado& estado_ = empresa_.estado();
};

TEST_F(FechoConcorrenteSala, QuatroPostosNumeramSemFalhasNemRepeticoes) {
    const qint64 ultimoAntes =
        estado_.gConn
            .firstRow(QStringLiteral("select UltNumero from TabTipoMov where Codigo='VD'"))
            ->value(0)
            .toLongLong();

    std::vector<std::unique_ptr<QProcess>> postos;
    for (int posto = 1; posto <= kPostos; ++posto) {
        auto processo = std::make_unique<QProcess>();
        QProcessEnvironment ambiente = QProcessEnvironment::systemEnvironment();
        ambiente.insert(QString::fromLatin1(kEnvPosto), QString::number(posto));
        ambiente.insert(QString::fromLatin1(kEnvEmpresa), empresa_.empresa());
        ambiente.insert(QString::fromLatin1(kEnvChave), testing::ficheiroChaveTeste());
        processo->setProcessEnvironment(ambiente);
        processo->setProcessChannelMode(QProcess::MergedChannels);
        processo->start(QFileInfo(QStringLiteral("/proc/self/exe")).symLinkTarget(),
                        {QStringLiteral("--gtest_filter=FechoConcorrente.Posto")});
        postos.push_back(std::move(processo));
    }
    for (auto& processo : postos) {
        ASSERT_TRUE(processo->waitForFinished(600000));
        const QString saida = QString::fromUtf8(processo->readAll());
        EXPECT_EQ(processo->exitCode(), 0) << saida.toStdString();
        EXPECT_TRUE(saida.contains(QStringLiteral("[  PASSED  ] 1 test"))) << saida.toStdString();
        // How often a closing had to be pressed again (a lock lost to another workstation).
        const auto repeticoes = saida.indexOf(QStringLiteral("repeticoes="));
        if (repeticoes >= 0)
            std::printf("%s\n", qPrintable(saida.mid(repeticoes).section(u'\n', 0, 0)));
    }

    // Numbers: 200 documents, one each, following the counter without a gap.
    QSqlQuery docs = *estado_.gConn.exec(QStringLiteral(
        "select Numero,Ano,TotalDoc from MovCliente where Tipo='VD' order by Numero"));
    std::vector<QString> numeros;
    QString ano;
    Currency totalDocs;
    while (docs.next()) {
        numeros.push_back(docs.value(0).toString());
        ano = docs.value(1).toString();
        totalDocs += Currency::fromVariant(docs.value(2));
    }
    ASSERT_EQ(numeros.size(), std::size_t(kPostos * kMesasPorPosto));
    for (std::size_t i = 0; i < numeros.size(); ++i)
        EXPECT_EQ(numeros[i].toLongLong(), ultimoAntes + qint64(i) + 1) << "posição " << i;
    EXPECT_EQ(estado_.gConn
                  .firstRow(QStringLiteral("select UltNumero from TabTipoMov where Codigo='VD'"))
                  ->value(0)
                  .toLongLong(),
              ultimoAntes + kPostos * kMesasPorPosto);

    // The chain: each document signs again to its stored signature with the one before it.
    for (const QString& numero : numeros)
        EXPECT_TRUE(documents::VerificaAssinatura(estado_, estado_.gConn, QStringLiteral("VD"),
                                                  numero, ano))
            << numero.toStdString();

    // The till: one movement per document, adding up to the documents.
    const auto caixa = estado_.gConn.firstRow(
        QStringLiteral("select count(*),sum(ValorTotal) from MovCaixa where Tipo='VD'"));
    ASSERT_TRUE(caixa);
    EXPECT_EQ(caixa->value(0).toInt(), kPostos * kMesasPorPosto);
    EXPECT_EQ(Currency::fromVariant(caixa->value(1)), totalDocs);
    EXPECT_EQ(estado_.gConn
                  .firstRow(QStringLiteral("select count(*) from MovProduto where Tipo='VD' and "
                                           "Fechado='N'"))
                  ->value(0)
                  .toInt(),
              0);
}

}  // namespace
}  // namespace brasel::pos
