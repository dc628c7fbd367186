#include "devices/documento_pagina.h"
#include "devices/talao_teste.h"
#include "support/impressao_qt.h"
#include "support/texto_pdf.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace brasel::devices {
namespace {

// The demo's cash sale 00000007, signed with a key made for the test as a closing signs it.
class DocumentoPaginaTeste : public ::testing::Test {
  protected:
    void SetUp() override {
        testing::aplicacaoGui();
        teste::escreveDocumento(conn_);
        teste::assinaDocumento(estado_, chaves_.filePath(QStringLiteral("chave.txt")), nota_);
    }

    bool imprime(const QString& impressora, QString* pdf) {
        return ImprimeDocumentoPagina(estado_, mensagens_, QStringLiteral("VD"),
                                      QStringLiteral("00000007"), QStringLiteral("2026"),
                                      impressora, pdf);
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaTeste empresa_{true};
    app::Estado& estado_ = empresa_.estado();
    db::Connection& conn_ = estado_.gConn;
    testing::MensagensGravadas mensagens_;
    QTemporaryDir chaves_;
    QString nota_;
};

TEST_F(DocumentoPaginaTeste, PaginaA4ComTodosOsBlocos) {
    QTemporaryDir pasta;
    QString pdf;
    ASSERT_TRUE(imprime(pasta.path(), &pdf)) << mensagens_.textos().join(u'|').toStdString();
    EXPECT_TRUE(mensagens_.textos().isEmpty());
    EXPECT_EQ(QFileInfo(pdf).absolutePath(), QDir(pasta.path()).absolutePath());
    QFile::remove(QStringLiteral("/tmp/documento-a4.pdf"));
    QFile::copy(pdf, QStringLiteral("/tmp/documento-a4.pdf"));
    const auto texto = testing::textoPdf(pdf);
    if (!texto) GTEST_SKIP() << "pdftotext em falta";
    const QString t = texto->simplified();
    // The shop, the document, the customer with the taxpayer number, the lines, the VAT
    // summary, the totals, the payment and the certification note.
    for (const QString& parte :
         {QStringLiteral("Largo do Chafariz, 12"), QStringLiteral("Venda a Dinheiro"),
          QStringLiteral("Nº 00000007"), QStringLiteral("Data: 14-03-2026 13:45"),
          QStringLiteral("Mesa 1 (João & Filhos)"), QStringLiteral("Contribuinte : 123456789"),
          QStringLiteral("Bife à casa com batata frita 2,000 12,50 0,00 13 28,25"),
          QStringLiteral("Vinho tinto (3,000 Copo) 0,500 8,00 0,40 23 3,60"),
          QStringLiteral("NO 23% 3,91 0,89 4,80"), QStringLiteral("Total IVA 4,14"),
          QStringLiteral("Total Geral 33,05"), QStringLiteral("Pago por: (NU) Numerário 33,05"),
          QStringLiteral("Troco 16,95"), nota_}) {
        EXPECT_TRUE(t.contains(parte)) << parte.toStdString();
    }
    EXPECT_FALSE(t.contains(QStringLiteral("não serve de Factura")));
}

TEST_F(DocumentoPaginaTeste, SemImpressoraVaiParaAPastaDosDocumentos) {
    QString pdf;
    ASSERT_TRUE(imprime(QString(), &pdf));
    EXPECT_EQ(QFileInfo(pdf).absolutePath(),
              QDir(definicoes_.pasta() + QStringLiteral("/Documentos")).absolutePath());
    EXPECT_GT(QFileInfo(pdf).size(), 0);
    // A second copy never overwrites the first.
    QString segundo;
    ASSERT_TRUE(imprime(QString(), &segundo));
    EXPECT_NE(segundo, pdf);
    EXPECT_TRUE(QFileInfo::exists(pdf));
}

TEST_F(DocumentoPaginaTeste, RecusasNaoImprimem) {
    // Each case changes the document further, in this order.
    struct Caso {
        const char* nome;
        QStringList sql;
        const char* impressora;
        const char* mensagem;
    };
    const Caso casos[] = {
        {"impressora que não existe",
         {},
         "Impressora Que Nao Existe",
         "Não foi possível imprimir o documento na impressora Impressora Que Nao Existe."},
        {"total alterado à mão",
         {QStringLiteral("update MovCliente set TotalDoc=30.05")},
         "",
         "Não pode Imprimir este Documento porque a Assinatura não é Válida!"},
        {"documento sem linhas",
         {QStringLiteral("update MovCliente set TotalDoc=33.05"),
          QStringLiteral("delete from MovProduto")},
         "",
         "Documento Inexistente em movimentos de produtos"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        for (const QString& sql : c.sql)
            ASSERT_TRUE(conn_.exec(sql));
        mensagens_.limpar();
        QString pdf;
        EXPECT_FALSE(imprime(QString::fromLatin1(c.impressora), &pdf));
        EXPECT_TRUE(pdf.isEmpty());
        ASSERT_EQ(mensagens_.mensagens().size(), 1);
        EXPECT_TRUE(mensagens_.mensagens().first().texto.startsWith(QString::fromUtf8(c.mensagem)))
            << mensagens_.mensagens().first().texto.toStdString();
    }
    // Nothing was written where unnamed documents go.
    EXPECT_TRUE(QDir(definicoes_.pasta() + QStringLiteral("/Documentos"))
                    .entryList({QStringLiteral("*.pdf")})
                    .isEmpty());
}

}  // namespace
}  // namespace brasel::devices
