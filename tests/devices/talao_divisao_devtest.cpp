#include "devices/talao_divisao.h"
#include "devices/talao_teste.h"
#include "support/impressao_qt.h"
#include "support/texto_pdf.h"

#include <QDir>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace brasel::devices {
namespace {

using teste::m;
using teste::p;

using TalaoDivisaoTeste = teste::TalaoTeste;

TEST_F(TalaoDivisaoTeste, TalaoDeCadaPessoa) {
    QString nota;
    for (int i = 1; i <= 12; ++i)
        nota += QStringLiteral("Nota %1\r\n").arg(i);
    TalaoDivisao talao{*Currency::parse(u"8.19"), *Currency::parse(u"24.57"), nota,
                       QDate(2026, 3, 14)};
    ASSERT_TRUE(ImprimeTalaoDivisao(estado_, mensagens_, linha_, talao));
    const QString t = transcricao(1);
    EXPECT_TRUE(t.contains(p(QStringLiteral("<<<<<<<<  TALAO DE COMPRA  >>>>>>>>")) +
                           p(QStringLiteral("Data de Emissão - 14-03-2026")) + p({}) +
                           p(QStringLiteral("Nota 1"))))
        << t.toStdString();
    // At most ten lines of the note.
    EXPECT_TRUE(t.contains(p(QStringLiteral("Nota 10")) + p({}) +
                           m(QStringLiteral("Total Pagar                 8,19"))));
    EXPECT_FALSE(t.contains(QStringLiteral("Nota 11")));
    EXPECT_FALSE(t.contains(QStringLiteral("Total Geral")));

    // The page printer adds the whole tab's total.
    QTemporaryDir pasta;
    teste::configura(conn_, QStringLiteral("PortaTalao"), QStringLiteral("LPT"));
    teste::configura(conn_, QStringLiteral("Impressora"), pasta.path());
    ASSERT_TRUE(ImprimeTalaoDivisao(estado_, mensagens_, linha_, talao));
    const QStringList pdfs = QDir(pasta.path()).entryList({QStringLiteral("*.pdf")});
    ASSERT_EQ(pdfs.size(), 1);
    const auto texto = testing::textoPdf(pasta.filePath(pdfs.first()));
    if (!texto) GTEST_SKIP() << "pdftotext em falta";
    EXPECT_TRUE(texto->simplified().contains(QStringLiteral("Total Geral 24,57 Total Pagar 8,19")));
}

}  // namespace
}  // namespace brasel::devices
