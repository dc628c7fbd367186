#include "devices/impressora_windows.h"
#include "support/aplicacao_gui.h"
#include "support/impressao_qt.h"
#include "support/texto_pdf.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace brasel::devices {
namespace {

class ImpressoraWindowsTeste : public ::testing::Test {
  protected:
    void SetUp() override { testing::aplicacaoGui(); }

    QStringList pdfs() const {
        return QDir(pasta_.path()).entryList({QStringLiteral("*.pdf")}, QDir::Files);
    }
    QString texto(const QString& ficheiro) {
        const auto t = testing::textoPdf(ficheiro);
        if (!t) ADD_FAILURE() << "pdftotext não leu " << ficheiro.toStdString();
        return t.value_or(QString());
    }

    QTemporaryDir pasta_;
};

TEST_F(ImpressoraWindowsTeste, PastaRecebeUmPdfComOTituloEAsLinhas) {
    TrabalhoImpressao trabalho;
    ASSERT_TRUE(trabalho.inicia(pasta_.path(), QStringLiteral("Talão: Mesa 4/5")));
    EXPECT_TRUE(trabalho.imprimeLinha(QStringLiteral("Açúcar            1,50")));
    EXPECT_TRUE(trabalho.imprimeLinha(QStringLiteral("Total Geral      12,00")));
    ASSERT_TRUE(trabalho.termina());
    const QStringList ficheiros = pdfs();
    ASSERT_EQ(ficheiros.size(), 1);
    // The characters a file name cannot hold are replaced.
    EXPECT_TRUE(ficheiros[0].startsWith(QStringLiteral("Talão_ Mesa 4_5 ")))
        << ficheiros[0].toStdString();
    EXPECT_EQ(QFileInfo(trabalho.ficheiroPdf()).fileName(), ficheiros[0]);
    // The text extraction does not keep runs of blanks.
    const QString t = texto(trabalho.ficheiroPdf()).simplified();
    EXPECT_TRUE(t.contains(QStringLiteral("Açúcar 1,50 Total Geral 12,00"))) << t.toStdString();
}

TEST_F(ImpressoraWindowsTeste, FicheiroPdfComNomeDado) {
    const QString ficheiro = QDir(pasta_.path()).filePath(QStringLiteral("cozinha.PDF"));
    TrabalhoImpressao trabalho;
    ASSERT_TRUE(trabalho.inicia(ficheiro, QStringLiteral("Cozinha")));
    EXPECT_EQ(trabalho.ficheiroPdf(), ficheiro);
    // Enough lines for more than one page: each page holds whole lines, none is lost.
    for (int i = 1; i <= 150; ++i)
        ASSERT_TRUE(
            trabalho.imprimeLinha(QStringLiteral("Linha %1").arg(i, 3, 10, QLatin1Char('0'))));
    ASSERT_TRUE(trabalho.termina());
    const QString t = texto(ficheiro);
    EXPECT_GE(t.count(QLatin1Char('\f')), 2);
    for (int i = 1; i <= 150; ++i)
        EXPECT_TRUE(t.contains(QStringLiteral("Linha %1").arg(i, 3, 10, QLatin1Char('0')))) << i;
}

TEST_F(ImpressoraWindowsTeste, TrabalhoQueNaoComecaNaoImprime) {
    struct Caso {
        const char* nome;
        QString impressora;
    };
    const Caso casos[] = {
        {"impressora não instalada", QStringLiteral("Impressora Que Não Existe")},
        {"pdf numa pasta inexistente",
         QDir(pasta_.path()).filePath(QStringLiteral("nao/existe/talao.pdf"))},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        TrabalhoImpressao trabalho;
        EXPECT_FALSE(trabalho.inicia(c.impressora, QStringLiteral("Talão")));
        EXPECT_FALSE(trabalho.emCurso());
        EXPECT_FALSE(trabalho.imprimeLinha(QStringLiteral("---")));
        EXPECT_FALSE(trabalho.termina());
    }
}

TEST_F(ImpressoraWindowsTeste, TrabalhoAbortadoNaoDeixaFicheiro) {
    {
        TrabalhoImpressao trabalho;
        ASSERT_TRUE(trabalho.inicia(pasta_.path(), QStringLiteral("Abortado")));
        trabalho.imprimeLinha(QStringLiteral("meio"));
        trabalho.aborta();
        EXPECT_FALSE(trabalho.emCurso());
    }
    {
        // A job left unfinished is dropped as well.
        TrabalhoImpressao trabalho;
        ASSERT_TRUE(trabalho.inicia(pasta_.path(), QStringLiteral("Esquecido")));
        trabalho.imprimeLinha(QStringLiteral("meio"));
    }
    EXPECT_TRUE(pdfs().isEmpty()) << pdfs().join(QLatin1Char(',')).toStdString();
}

TEST_F(ImpressoraWindowsTeste, NomesDePdfNuncaRepetem) {
    const QDateTime quando(QDate(2024, 12, 31), QTime(23, 59, 58));
    const QString primeiro = ficheiroPdfNaPasta(pasta_.path(), QStringLiteral("Fecho"), quando);
    EXPECT_EQ(QFileInfo(primeiro).fileName(), QStringLiteral("Fecho 2024-12-31 23.59.58.pdf"));
    QFile(primeiro).open(QIODevice::WriteOnly);
    const QString segundo = ficheiroPdfNaPasta(pasta_.path(), QStringLiteral("Fecho"), quando);
    EXPECT_EQ(QFileInfo(segundo).fileName(), QStringLiteral("Fecho 2024-12-31 23.59.58 (2).pdf"));
    EXPECT_EQ(
        QFileInfo(ficheiroPdfNaPasta(pasta_.path(), QStringLiteral(" :: "), quando)).fileName(),
        QStringLiteral("__ 2024-12-31 23.59.58.pdf"));
    EXPECT_EQ(QFileInfo(ficheiroPdfNaPasta(pasta_.path(), QString(), quando)).fileName(),
              QStringLiteral("Impressao 2024-12-31 23.59.58.pdf"));
}

}  // namespace
}  // namespace brasel::devices
