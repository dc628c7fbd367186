// Signing documents into the chain of their type and year, the notes printed on them, and the
// checks that keep a changed document from being printed, on an embedded company. Every
// signature made here is also checked with the openssl command line and the public key.
#include "db/query_helpers.h"
#include "documents/assinatura.h"
#include "documents/assinatura_teste.h"
#include "support/chave_teste.h"
#include "support/empresa_teste.h"
#include "support/mensagens_gravadas.h"

#include <QDir>
#include <QFile>

#include <gtest/gtest.h>

namespace brasel::documents {
namespace {

using teste::assinaEGrava;

const QString kNotaCertificado = QStringLiteral("Processado por Programa Certificado nº 0000/DGCI");
const QString kNotaCopia = QStringLiteral("Cópia do documento original");
const QString kNotaAntes2011 =
    QStringLiteral("Processado por Computador - Art.º 7 Dec. Lei 147/2003");
const QString kMensagemInvalida = QStringLiteral(
    "Não pode Imprimir este Documento porque a Assinatura não é Válida!\r\nPor favor contacte o "
    "seu administrador.");

class AssinaturaDb : public ::testing::Test {
  protected:
    void SetUp() override {
        testing::usaChaveTeste(e);
        teste::criaTipos(e.gConn);
        activaAntes2011(0);
    }
    void activaAntes2011(int valor) {
        ASSERT_TRUE(
            e.gConn.exec(QStringLiteral("update ParamGeral set ActivaHashAntes2011=?"), {valor}));
    }
    // The signature must be the key's signature of exactly `texto`, checked outside the program.
    void confere(const QString& texto, const QString& hash) {
        const auto ok = testing::confereComOpenssl(texto, hash);
        if (!ok) GTEST_SKIP() << "sem o programa openssl";
        EXPECT_TRUE(*ok) << texto.toStdString();
    }
    bool valida(const char* tipo, const char* numero, const char* ano, bool mostrar = true) {
        return ValidaAssinatura(e, mensagens, mostrar, QString::fromLatin1(tipo),
                                QString::fromLatin1(numero), QString::fromLatin1(ano));
    }
    bool executa(const char* sql) { return e.gConn.exec(QString::fromLatin1(sql)).has_value(); }

    testing::EmpresaTeste empresa_;
    app::Estado& e = empresa_.estado();
    testing::MensagensGravadas mensagens;
};

TEST_F(AssinaturaDb, EachDocumentChainsToThePreviousOfItsTypeAndYear) {
    db::WriteTransaction t(e.gConn);
    const auto d1 = assinaEGrava(e, e.gConn, QStringLiteral("FR1"), QStringLiteral("00000001"),
                                 QStringLiteral("2026-03-01"), QStringLiteral("1234.5"));
    ASSERT_TRUE(d1.ok);
    EXPECT_EQ(d1.dataSys, QStringLiteral("2026-03-01T10:00:00"));
    EXPECT_EQ(d1.assinatura.assinou, 1);
    const QString& h1 = d1.assinatura.hash;
    ASSERT_EQ(h1.size(), 172);
    EXPECT_EQ(d1.assinatura.notaCertificacao,
              QString(h1[0]) + h1[10] + h1[20] + h1[30] + u'-' + kNotaCertificado);
    // The first of a year chains to nothing; a thousand is written without a separator.
    confere(QStringLiteral("2026-03-01;2026-03-01T10:00:00;FR1 2026/00000001;1234.50;"), h1);

    // Another type in between does not enter this chain.
    ASSERT_TRUE(assinaEGrava(e, e.gConn, QStringLiteral("FS"), QStringLiteral("00000001"),
                             QStringLiteral("2026-03-02"), QStringLiteral("5"))
                    .ok);
    const auto d2 = assinaEGrava(e, e.gConn, QStringLiteral("FR1"), QStringLiteral("00000002"),
                                 QStringLiteral("2026-03-02"), QStringLiteral("25.8"), u'C',
                                 QStringLiteral("2026-03-02T13:45:10"));
    ASSERT_TRUE(d2.ok);
    confere(QStringLiteral("2026-03-02;2026-03-02T13:45:10;FR1 2026/00000002;25.80;") + h1,
            d2.assinatura.hash);

    // A new year starts a new chain.
    const auto d3 = assinaEGrava(e, e.gConn, QStringLiteral("FR1"), QStringLiteral("00000001"),
                                 QStringLiteral("2027-01-02"), QStringLiteral("7"));
    ASSERT_TRUE(d3.ok);
    confere(QStringLiteral("2027-01-02;2027-01-02T10:00:00;FR1 2027/00000001;7.00;"),
            d3.assinatura.hash);
    ASSERT_TRUE(t.commit());

    for (const char* n : {"00000001", "00000002"}) {
        EXPECT_TRUE(VerificaAssinatura(e, e.gConn, QStringLiteral("FR1"), QString::fromLatin1(n),
                                       QStringLiteral("2026")))
            << n;
    }
    EXPECT_FALSE(VerificaAssinatura(e, e.gConn, QStringLiteral("FR1"), QStringLiteral("00000009"),
                                    QStringLiteral("2026")));
}

TEST_F(AssinaturaDb, ThePreviousDocumentIsTheHighestLowerNumberInTextOrder) {
    // Numbers are zero-filled: "00000010" follows "00000009", and a document without a
    // signature passes on an empty one.
    ASSERT_TRUE(
        executa("insert into MovCliente (Tipo, Numero, Ano, Data, Hash) values "
                "('FS','00000009','2026','2026-01-09','nove'), "
                "('FS','00000010','2026','2026-01-10','dez'), "
                "('FS','00000003','2026','2026-01-03','tres'), "
                "('FS','00000012','2026','2026-01-12',NULL), "
                "('FS','00000011','2025','2025-01-11','outro ano'), "
                "('FR1','00000011','2026','2026-01-11','outro tipo')"));
    struct Caso {
        const char* numero;
        const char* anterior;
    };
    const Caso casos[] = {
        {"00000011", "dez"}, {"00000004", "tres"}, {"00000013", ""}, {"00000001", ""}};
    for (const Caso& c : casos) {
        const auto d = assinaEGrava(e, e.gConn, QStringLiteral("FS"), QString::fromLatin1(c.numero),
                                    QStringLiteral("2026-02-01"), QStringLiteral("1"));
        ASSERT_TRUE(d.ok) << c.numero;
        confere(QStringLiteral("2026-02-01;2026-02-01T10:00:00;FS 2026/") +
                    QString::fromLatin1(c.numero) + QStringLiteral(";1.00;") +
                    QString::fromLatin1(c.anterior),
                d.assinatura.hash);
    }
}

TEST_F(AssinaturaDb, UnsignedDocumentsGetTheirNotes) {
    struct Caso {
        const char* tipo;
        const char* data;
        int activaAntes2011;
        QString nota;
    };
    const Caso casos[] = {
        {"NS", "2026-05-01", 0, kNotaCertificado}, {"CN", "2026-05-01", 0, kNotaCopia},
        {"CP", "2026-05-01", 0, kNotaCopia},       {"FR1", "2010-12-31", 0, kNotaAntes2011},
        {"NS", "2010-12-31", 1, kNotaAntes2011},   {"CN", "2010-12-31", 0, kNotaAntes2011},
    };
    int n = 0;
    for (const Caso& c : casos) {
        activaAntes2011(c.activaAntes2011);
        const auto d = assinaEGrava(e, e.gConn, QString::fromLatin1(c.tipo),
                                    QStringLiteral("0000000") + QString::number(++n),
                                    QString::fromLatin1(c.data), QStringLiteral("10"));
        EXPECT_TRUE(d.ok) << c.tipo << " " << c.data;
        EXPECT_EQ(d.assinatura.notaCertificacao, c.nota) << c.tipo << " " << c.data;
        EXPECT_EQ(d.assinatura.hash, QString()) << c.tipo << " " << c.data;
        EXPECT_EQ(d.assinatura.assinou, 0) << c.tipo << " " << c.data;
    }

    // Signing documents dated before 2011 can be switched on.
    activaAntes2011(1);
    const auto antigo = assinaEGrava(e, e.gConn, QStringLiteral("FS"), QStringLiteral("00000001"),
                                     QStringLiteral("2010-12-31"), QStringLiteral("3"));
    ASSERT_TRUE(antigo.ok);
    EXPECT_EQ(antigo.assinatura.assinou, 1);
    confere(QStringLiteral("2010-12-31;2010-12-31T10:00:00;FS 2010/00000001;3.00;"),
            antigo.assinatura.hash);
}

TEST_F(AssinaturaDb, ACopyNeedsNoKeyButASignedDocumentFailsWithoutOne) {
    const QString malformada = QDir(empresa_.pasta()).filePath(QStringLiteral("mal.key"));
    QFile f(malformada);
    ASSERT_TRUE(f.open(QIODevice::WriteOnly));
    f.write("AQAB\nAQAB\n");
    f.close();
    for (const QString& chave : {QString(), QStringLiteral("/não/existe.key"), malformada}) {
        e.config.ficheiroChave = chave;
        const auto copia =
            assinaEGrava(e, e.gConn, QStringLiteral("CP"), QStringLiteral("00000001"),
                         QStringLiteral("2026-05-01"), QStringLiteral("1"));
        EXPECT_TRUE(copia.ok) << chave.toStdString();
        ASSERT_TRUE(executa("delete from MovCliente"));
        const auto d = assinaEGrava(e, e.gConn, QStringLiteral("FR1"), QStringLiteral("00000001"),
                                    QStringLiteral("2026-05-01"), QStringLiteral("1"));
        EXPECT_FALSE(d.ok) << chave.toStdString();
        EXPECT_TRUE(d.assinatura.hash.isEmpty());
    }
}

TEST_F(AssinaturaDb, ASequenceCheckedTypeRefusesADocumentBeforeALaterOne) {
    ASSERT_TRUE(
        executa("insert into MovCliente (Tipo, Numero, Ano, Data) values "
                "('FR1','00000005','2026','2026-03-10'), "
                "('FS','00000005','2026','2026-03-10'), "
                "('FR1','00000009','2025','2025-12-31')"));
    ASSERT_TRUE(
        executa("insert into MovFornece (Tipo, Numero, Ano, Data) values "
                "('VF','00000005','2026','2026-03-10')"));
    struct Caso {
        const char* tipo;
        const char* numero;
        const char* data;
        bool emSequencia;
    };
    const Caso casos[] = {
        {"FR1", "00000004", "2026-03-11", false},  // a higher number exists
        {"FR1", "00000006", "2026-03-09", false},  // a later date exists
        {"FR1", "00000006", "2026-03-10", true},   // same day, next number
        {"FR1", "00000001", "2027-01-01", true},   // another year
        {"VF", "00000004", "2026-03-11", false},   // a supplier type looks at its own table
        {"VF", "00000006", "2026-03-11", true},   {"FS", "00000004", "2026-03-11", false},
    };
    for (const Caso& c : casos) {
        EXPECT_EQ(VerificaSequencia(e.gConn, QString::fromLatin1(c.tipo),
                                    QString::fromLatin1(c.numero), QString::fromLatin1(c.data)),
                  c.emSequencia)
            << c.tipo << " " << c.numero << " " << c.data;
    }

    // Only ControloHash 1 stops the signature; any other non-zero value signs regardless.
    Assinatura a;
    QString dataSys = QStringLiteral("2026-03-11 09:00:00");
    EXPECT_FALSE(AssinaDocumento(e, e.gConn, a, dataSys, QStringLiteral("FR1"),
                                 QStringLiteral("00000004"), QStringLiteral("2026-03-11"),
                                 Currency(1)));
    EXPECT_EQ(a.notaCertificacao, QStringLiteral("Existem movimentos com o Número ou Data Superior "
                                                 "para o Tipo de Movimento FR1!"));
    EXPECT_TRUE(a.hash.isEmpty());
    EXPECT_EQ(a.assinou, 0);
    EXPECT_TRUE(AssinaDocumento(e, e.gConn, a, dataSys, QStringLiteral("FS"),
                                QStringLiteral("00000004"), QStringLiteral("2026-03-11"),
                                Currency(1)));
    EXPECT_EQ(a.assinou, 1);
}

TEST_F(AssinaturaDb, SupplierDocumentsChainInTheirOwnTable) {
    ASSERT_TRUE(
        executa("insert into MovCliente (Tipo, Numero, Ano, Data, Hash) values "
                "('VF','00000001','2026','2026-01-01','do cliente')"));
    const auto f1 = assinaEGrava(e, e.gConn, QStringLiteral("VF"), QStringLiteral("00000001"),
                                 QStringLiteral("2026-04-01"), QStringLiteral("2"), u'F');
    ASSERT_TRUE(f1.ok);
    confere(QStringLiteral("2026-04-01;2026-04-01T10:00:00;VF 2026/00000001;2.00;"),
            f1.assinatura.hash);
    const auto f2 = assinaEGrava(e, e.gConn, QStringLiteral("VF"), QStringLiteral("00000002"),
                                 QStringLiteral("2026-04-01"), QStringLiteral("3"), u'F');
    ASSERT_TRUE(f2.ok);
    confere(QStringLiteral("2026-04-01;2026-04-01T10:00:00;VF 2026/00000002;3.00;") +
                f1.assinatura.hash,
            f2.assinatura.hash);
    EXPECT_TRUE(VerificaAssinatura(e, e.gConn, QStringLiteral("VF"), QStringLiteral("00000002"),
                                   QStringLiteral("2026"), u'F'));
}

TEST_F(AssinaturaDb, AChangedDocumentCannotBePrinted) {
    for (const char* n : {"00000001", "00000002", "00000003"}) {
        ASSERT_TRUE(assinaEGrava(e, e.gConn, QStringLiteral("FR1"), QString::fromLatin1(n),
                                 QStringLiteral("2026-06-01"), QStringLiteral("100"))
                        .ok);
    }
    ASSERT_TRUE(assinaEGrava(e, e.gConn, QStringLiteral("CP"), QStringLiteral("00000001"),
                             QStringLiteral("2026-06-01"), QStringLiteral("9"))
                    .ok);
    for (const char* n : {"00000001", "00000002", "00000003"})
        EXPECT_TRUE(valida("FR1", n, "2026")) << n;
    // Nothing to check: a copy, an unsigned type, an unknown document, an empty key.
    EXPECT_TRUE(valida("CP", "00000001", "2026"));
    EXPECT_TRUE(valida("NS", "00000001", "2026"));
    EXPECT_TRUE(valida("FR1", "00000099", "2026"));
    EXPECT_TRUE(valida("", "00000001", "2026"));
    EXPECT_TRUE(mensagens.mensagens().isEmpty());

    // The total of the second changed by hand: it is refused; the next one signed its
    // signature, not its total.
    ASSERT_TRUE(
        executa("update MovCliente set TotalDoc=1000 where Tipo='FR1' and Numero='00000002'"));
    EXPECT_TRUE(valida("FR1", "00000001", "2026"));
    EXPECT_FALSE(valida("FR1", "00000002", "2026"));
    ASSERT_EQ(mensagens.mensagens().size(), 1);
    EXPECT_EQ(mensagens.mensagens()[0].texto, kMensagemInvalida);
    EXPECT_EQ(mensagens.mensagens()[0].icone, Icone::Exclamacao);
    EXPECT_FALSE(valida("FR1", "00000002", "2026", false));
    EXPECT_EQ(mensagens.mensagens().size(), 1);
    EXPECT_TRUE(valida("FR1", "00000003", "2026"));

    // Putting the total back makes it printable again; a changed signature breaks its successor.
    ASSERT_TRUE(
        executa("update MovCliente set TotalDoc=100 where Tipo='FR1' and Numero='00000002'"));
    EXPECT_TRUE(valida("FR1", "00000002", "2026"));
    ASSERT_TRUE(
        executa("update MovCliente set Hash='AAAA' || Hash where Tipo='FR1' and "
                "Numero='00000002'"));
    EXPECT_FALSE(valida("FR1", "00000002", "2026"));
    EXPECT_FALSE(valida("FR1", "00000003", "2026"));

    // Without the key nothing can be shown to be sound.
    e.config.ficheiroChave.clear();
    EXPECT_FALSE(valida("FR1", "00000001", "2026"));
}

TEST_F(AssinaturaDb, TheWholeHeaderIsSignedIntoHashQuoril) {
    ASSERT_TRUE(e.gConn.exec(
        QStringLiteral("insert into MovCliente (Tipo, Numero, Ano, Data, Codigo, Descricao, "
                       "Contribuinte, Morada, Local, Afecta, Modulo, Utilizador, Armazem, "
                       "Matricula, NotaCertificacao, VersaoApp, TabIva1, TaxIva1, Valor1, "
                       "ValIva1, Portes, DescFinPer, Juro, Valor, IVA, TotalDoc) "
                       "values (?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?)"),
        {QStringLiteral("FR1"),
         QStringLiteral("00000007"),
         QStringLiteral("2026"),
         QStringLiteral("2026-07-01"),
         QStringLiteral("C1"),
         QStringLiteral("Zé d'Ouro; Lda"),
         QStringLiteral("123456789"),
         QVariant(),
         QStringLiteral("Porto"),
         QStringLiteral("S+"),
         QStringLiteral("FC"),
         QStringLiteral("01"),
         QStringLiteral("A1"),
         QVariant(),
         QStringLiteral("abcd-nota"),
         QStringLiteral("1.0.0"),
         QStringLiteral("NOR"),
         QStringLiteral("23"),
         QStringLiteral("10"),
         QStringLiteral("2.3"),
         QVariant(),
         QVariant(),
         QVariant(),
         QStringLiteral("10"),
         QStringLiteral("2.3"),
         QStringLiteral("12.3")}));
    const QString esperado = QStringLiteral(
        "FR1;00000007;2026-07-01;2026;C1;Zé d'Ouro; Lda;123456789;;Porto;;;S+;FC;01;A1;;;;"
        "abcd-nota;1.0.0;NOR;;;;23.0000;0.0000;0.0000;0.0000;10.0000;0.0000;0.0000;0.0000;"
        "0.0000;0.0000;0.0000;0.0000;2.3000;0.0000;0.0000;0.0000;0.0000;0.0000;0.0000;;0.0000;"
        "0.0000;0.0000;0.0000;0.0000;0.0000;10.0000;2.3000;0.0000;12.3000;");
    const auto semGravar = AssinaConteudo(e, e.gConn, false, QStringLiteral("FR1"),
                                          QStringLiteral("00000007"), QStringLiteral("2026"));
    ASSERT_TRUE(semGravar);
    confere(esperado, *semGravar);
    const auto lido = [&] {
        return db::primeiraLinha(e.gConn,
                                 QStringLiteral("select COALESCE(Hash_Quoril,'') from MovCliente "
                                                "where Numero='00000007'"))
            ->value(0)
            .toString();
    };
    EXPECT_EQ(lido(), QString());
    const auto gravada = AssinaConteudo(e, e.gConn, true, QStringLiteral("FR1"),
                                        QStringLiteral("00000007"), QStringLiteral("2026"));
    ASSERT_TRUE(gravada);
    EXPECT_EQ(*gravada, *semGravar);
    EXPECT_EQ(lido(), *gravada);

    EXPECT_FALSE(AssinaConteudo(e, e.gConn, true, QStringLiteral("FR1"), QStringLiteral("00000008"),
                                QStringLiteral("2026")));
    ASSERT_TRUE(executa("update MovCliente set Hash_Quoril=''"));
    e.config.ficheiroChave.clear();
    EXPECT_FALSE(AssinaConteudo(e, e.gConn, true, QStringLiteral("FR1"), QStringLiteral("00000007"),
                                QStringLiteral("2026")));
    EXPECT_EQ(lido(), QString());
}

}  // namespace
}  // namespace brasel::documents
