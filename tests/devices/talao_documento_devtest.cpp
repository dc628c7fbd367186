#include "app/definicoes_posto.h"
#include "devices/talao_documento.h"
#include "devices/talao_teste.h"
#include "support/impressao_qt.h"
#include "support/texto_pdf.h"

#include <QDir>

#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace brasel::devices {
namespace {

using teste::m;
using teste::p;

const QString kTracos(40, u'-');
const QString kIguais(40, u'=');

class TalaoDocumentoTeste : public teste::TalaoTeste {
  protected:
    void SetUp() override {
        TalaoTeste::SetUp();
        teste::escreveDocumento(conn_);
        ASSERT_TRUE(
            conn_.exec(QStringLiteral("update armazens set linha1=?,linha2=?,linha3=?,"
                                      "linha4='',linha5='',linha6='',linha7='' "
                                      "where codigo='001'"),
                       {QStringLiteral("Tasca do Largo"), QStringLiteral("Largo do Chafariz, 12"),
                        QStringLiteral("1100-148 Lisboa")}));
        teste::configura(conn_, QStringLiteral("SaltaLinhas"), 2);
    }

    TalaoDocumento documento(int vias = 1) const {
        return {QStringLiteral("VD"),
                QStringLiteral("00000007"),
                QStringLiteral("2026"),
                false,
                vias,
                false};
    }
};

TEST_F(TalaoDocumentoTeste, TodosOsBlocosPelaOrdem) {
    ASSERT_TRUE(ImprimeTalaoSerie(estado_, mensagens_, linha_, documento()));
    EXPECT_TRUE(mensagens_.textos().isEmpty()) << mensagens_.textos().join(u'|').toStdString();
    const QString esperado =
        // The drawer opens before the receipt; the receipt sets the character set and resets.
        QStringLiteral("[GAVETA][CHARSET][RESET]") + p({}) + p(QStringLiteral("Tasca do Largo")) +
        p(QStringLiteral("Largo do Chafariz, 12")) + p(QStringLiteral("1100-148 Lisboa")) + p({}) +
        p({}) + p({}) + p({}) + p(kTracos) + p(QStringLiteral("Mesa 1 (João & Filhos)")) +
        p(QStringLiteral("Rua da Prata, 5")) + p(QStringLiteral("Lisboa")) +
        p(QStringLiteral("1100-148 Lisboa")) + p(QStringLiteral("Contribuinte : 123456789")) +
        p({}) + p(QStringLiteral("Venda a Dinheiro             Nº 00000007")) +
        p(QStringLiteral("14-03-2026 13:45   Empr.: ANA")) +
        p(QStringLiteral("Data/Hora de Abertura 12:41")) + p(kIguais) +
        p(QStringLiteral("Bife à casa com     2,000          28,25")) +
        p(QStringLiteral("Água 50cl           1,000           1,20")) +
        p(QStringLiteral("Vinho tinto         0,500           3,60")) +
        p(QStringLiteral("  3,000-> Copo")) + p(kIguais) +
        m(QStringLiteral("Total ECO                   0,10")) +
        p(QStringLiteral("Imposto n/ contemplado nas linhas atras")) +
        m(QStringLiteral("Total Iliq.                29,31")) +
        m(QStringLiteral("Total Desc.                 0,40")) +
        m(QStringLiteral("Total IVA                   4,14")) +
        m(QStringLiteral("Desc.Finac.                 0,00")) +
        m(QStringLiteral("Total Geral                33,05")) + p({}) +
        p(QStringLiteral("Pago por: (NU) Numerário           33,05")) +
        p(QStringLiteral("Entregou                           50,00")) +
        p(QStringLiteral("Troco                              16,95")) +
        p(QStringLiteral("IVA      Tx.     Valor Inc.    Valor IVA")) + p(kTracos) +
        p(QStringLiteral("IT        13          28,25         3,25")) +
        p(QStringLiteral("NO        23           4,80         0,89")) +
        p(QStringLiteral("AbCd-Processado por Programa Certificado")) +
        p(QStringLiteral(" nº 0000/DGCI")) + p(QStringLiteral("Obrigado pela sua visita!")) +
        p(QStringLiteral("Volte sempre.")) +
        QStringLiteral("[COR0][PEQUENO] \n[COR0][PEQUENO] \n[CORTE][RESET]");
    const QString recebido = transcricao(1);
    EXPECT_EQ(recebido, esperado);
    QFile amostra(QStringLiteral("/tmp/receipt-sample.txt"));
    if (amostra.open(QIODevice::WriteOnly | QIODevice::Truncate)) amostra.write(recebido.toUtf8());
}

TEST_F(TalaoDocumentoTeste, ViasETalaoDeCompra) {
    struct Caso {
        const char* nome;
        int vias;
        bool talaoCompra;
        int cortes;
    };
    const Caso casos[] = {
        {"sem vias só abre a gaveta", 0, false, 0},
        {"duas vias de talão de compra", 2, true, 2},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        novaImpressora();
        TalaoDocumento d = documento(c.vias);
        d.talaoCompra = c.talaoCompra;
        ASSERT_TRUE(ImprimeTalaoSerie(estado_, mensagens_, linha_, d));
        const QString t = transcricao(c.cortes);
        EXPECT_TRUE(t.startsWith(u"[GAVETA][CHARSET][RESET]")) << t.left(60).toStdString();
        EXPECT_EQ(t.count(QStringLiteral("Venda a Dinheiro")), c.vias);
        EXPECT_EQ(t.count(QStringLiteral(">>>>>>>>>>  TALAO DE COMPRA  <<<<<<<<<<<")),
                  c.talaoCompra ? c.vias : 0);
    }
}

TEST_F(TalaoDocumentoTeste, EntregouTrocoEModoObservacao) {
    ASSERT_TRUE(conn_.exec(QStringLiteral("update MovCliente set Entregou=0")));
    TalaoDocumento d = documento();
    d.observacao = true;
    ASSERT_TRUE(ImprimeTalaoSerie(estado_, mensagens_, linha_, d));
    const QString t = transcricao(1);
    // Nothing tendered recorded: the total was handed over, no change.
    EXPECT_TRUE(t.contains(p(QStringLiteral("Entregou                           33,05"))));
    EXPECT_TRUE(t.contains(p(QStringLiteral("Troco                               0,00"))));
    // The observation's lines stand where the document's lines were.
    EXPECT_TRUE(t.contains(p(kIguais) + p(QStringLiteral("Mesa junto à janela")) +
                           p(QStringLiteral("Sem pressa")) + p(kIguais)));
    EXPECT_FALSE(t.contains(QStringLiteral("Bife")));
}

TEST_F(TalaoDocumentoTeste, DefinicoesDoUtilizadorETipo) {
    struct Caso {
        const char* nome;
        const char* coluna;
        QVariant valor;
        const char* presente;
        const char* ausente;
    };
    const Caso casos[] = {
        {"sem totais parciais", "imptotal", 0, "Total Geral                33,05", "Total Iliq."},
        {"sem resumo do IVA", "impivas", 0, "Volte sempre.", "Valor Inc."},
        {"três casas decimais", "DecimaisImpTaloes", 3, "Total Geral               33,050",
         "33,05 "},
        {"decimais da empresa", "DecimaisImpTaloes", 0, "Total Geral                33,05",
         "33,050"},
        {"sem rodapé", "Obs1", QString(), "Volte sempre.", "Obrigado"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        testing::EmpresaTeste empresa(true);
        app::Estado& estado = empresa.estado();
        teste::escreveDocumento(estado.gConn);
        teste::configura(estado.gConn, QString::fromLatin1(c.coluna), c.valor);
        novaImpressora();
        ASSERT_TRUE(ImprimeTalaoSerie(estado, mensagens_, linha_, documento()));
        const QString t = transcricao(1);
        EXPECT_TRUE(t.contains(QString::fromUtf8(c.presente)));
        EXPECT_FALSE(t.contains(QString::fromUtf8(c.ausente)));
    }
}

TEST_F(TalaoDocumentoTeste, TipoSemGavetaNemTroco) {
    // An invoice: its type never opens the drawer and the customer account takes no change.
    teste::OpcoesDocumento o;
    o.tipo = QStringLiteral("FT");
    teste::escreveDocumento(conn_, o);
    TalaoDocumento d = documento();
    d.tipo = QStringLiteral("FT");
    ASSERT_TRUE(ImprimeTalaoSerie(estado_, mensagens_, linha_, d));
    const QString t = transcricao(1);
    EXPECT_TRUE(t.startsWith(u"[CHARSET][RESET]"));
    EXPECT_TRUE(t.contains(QStringLiteral("Factura")));
    EXPECT_FALSE(t.contains(QStringLiteral("[GAVETA]")));
    EXPECT_FALSE(t.contains(QStringLiteral("Entregou")));
}

TEST_F(TalaoDocumentoTeste, RecusasNaoEnviamNada) {
    struct Caso {
        const char* nome;
        const char* sql;
        TalaoDocumento documento;
        const char* mensagem;
    };
    const TalaoDocumento vd = documento();
    TalaoDocumento inexistente = vd;
    inexistente.numero = QStringLiteral("00000099");
    const Caso casos[] = {
        {"documento inexistente", "", inexistente, "Documento Inexistente"},
        {"sem linhas", "delete from MovProduto", vd,
         "Documento Inexistente em movimentos de produtos"},
        {"impressora não configurada", "update UtilConfGeral set TipoImpTalao='XX'", vd,
         "A T E N Ç Ã O !  Impressora de Talões não Configurada!"},
        {"utilizador sem POS", "delete from UtilConfGeral", vd,
         "Não tem o POS configurado para o utilizador 01"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        testing::EmpresaTeste empresa(true);
        app::Estado& estado = empresa.estado();
        teste::escreveDocumento(estado.gConn);
        if (qstrlen(c.sql) > 0) {
            ASSERT_TRUE(estado.gConn.exec(QString::fromLatin1(c.sql)));
        }
        mensagens_.limpar();
        EXPECT_FALSE(ImprimeTalaoSerie(estado, mensagens_, linha_, c.documento));
        ASSERT_EQ(mensagens_.mensagens().size(), 1);
        EXPECT_EQ(mensagens_.mensagens().first().texto, QString::fromUtf8(c.mensagem));
        EXPECT_EQ(mensagens_.mensagens().first().icone, Icone::Critico);
    }
    // Not even the drawer was opened.
    EXPECT_FALSE(impressora_->esperaBytes(1, 300));
}

TEST_F(TalaoDocumentoTeste, NaImpressoraDoSistemaEmPdf) {
    QTemporaryDir pasta;
    teste::configura(conn_, QStringLiteral("PortaTalao"), QStringLiteral("LPT"));
    teste::configura(conn_, QStringLiteral("Impressora"), pasta.path());
    ASSERT_TRUE(app::posto::TipoImprimeMesa.gravar(QStringLiteral("VD")));
    ASSERT_TRUE(ImprimeTalao(estado_, mensagens_, linha_, documento(2)));
    const QStringList pdfs = QDir(pasta.path()).entryList({QStringLiteral("*.pdf")});
    ASSERT_EQ(pdfs.size(), 2);
    const auto texto = testing::textoPdf(pasta.filePath(pdfs.first()));
    if (!texto) GTEST_SKIP() << "pdftotext em falta";
    for (const char* parte :
         {"Venda a Dinheiro               No 00000007", "14-03-2026 13:45   Empr.: ANA",
          "Data/Hora de Abertura 14-03-2026 12:41", "Produto           Quant.       Total IVA",
          "Bife à casa com    2,000       28,25 13%", "Total Geral                      33,05",
          "IVA       Tx.     Valor Inc.   Valor IVA", "NO         23           4,80        0,89",
          "Este documento não serve de Factura", "Troco                            16,95"}) {
        // The page's text is read back with its own spacing: words and their order count.
        EXPECT_TRUE(texto->simplified().contains(QString::fromUtf8(parte).simplified())) << parte;
    }
    // The drawer opened on the ticket printer's line all the same.
    EXPECT_TRUE(impressora_->espera(
        [](const QByteArray& r) { return r == QByteArray("\x1bp\x00\x19\xfa", 5); }, 2000));
}

}  // namespace
}  // namespace brasel::devices
