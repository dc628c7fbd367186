// The customer's checks before a document on account is closed: the credit limit against the
// open balance plus the document, and the overdue documents; neither checks cash sales nor
// transport documents, and a failed read refuses.
#include "documents/controlo_credito.h"
#include "support/empresa_teste.h"

#include <gtest/gtest.h>

#include <vector>

namespace brasel::documents {
namespace {

enum class Esperado { Aceita, Limite, Vencidos };

struct Doc {
    const char* cliente;
    const char* afecta;
    const char* saldo;
    const char* datavenc;
};

struct Caso {
    const char* nome;
    const char* tipo;
    const char* limite;
    int controlaVencidos;
    std::vector<Doc> docs;
    const char* total;
    Esperado esperado;
    bool autorizavel = false;
};

// Today is 2026-06-15 throughout.
const Caso kCasos[] = {
    {"sem limite", "FT", "0", 0, {{"C1", "D+", "1000", "2026-07-01"}}, "500", Esperado::Aceita},
    {"abaixo", "FT", "100", 0, {{"C1", "D+", "40", "2026-07-01"}}, "59.99", Esperado::Aceita},
    {"no limite", "FT", "100", 0, {{"C1", "D+", "40", "2026-07-01"}}, "60", Esperado::Aceita},
    {"acima",
     "FT",
     "100",
     0,
     {{"C1", "D+", "40", "2026-07-01"}},
     "60.0001",
     Esperado::Limite,
     true},
    {"acima sem autorizacao", "FA", "100", 0, {}, "100.01", Esperado::Limite, false},
    {"credito desconta",
     "FT",
     "100",
     0,
     {{"C1", "D+", "80", "2026-07-01"}, {"C1", "C+", "30", ""}},
     "50",
     Esperado::Aceita},
    {"credito insuficiente",
     "FT",
     "100",
     0,
     {{"C1", "D+", "80", "2026-07-01"}, {"C1", "C+", "29.99", ""}},
     "50",
     Esperado::Limite,
     true},
    {"saldo de outro cliente",
     "FT",
     "100",
     0,
     {{"C2", "D+", "1000", "2026-07-01"}},
     "100",
     Esperado::Aceita},
    {"documento sem efeito na conta",
     "FT",
     "100",
     0,
     {{"C1", "S+", "1000", "2026-07-01"}},
     "100",
     Esperado::Aceita},
    {"vencido", "FT", "0", 1, {{"C1", "D+", "10", "2026-06-14"}}, "1", Esperado::Vencidos, false},
    // Overdue documents stop the closing before the limit is looked at, and are never authorised.
    {"vencido e acima",
     "FT",
     "5",
     1,
     {{"C1", "D+", "10", "2026-06-14"}},
     "1",
     Esperado::Vencidos,
     false},
    {"vence hoje", "FT", "0", 1, {{"C1", "D+", "10", "2026-06-15"}}, "1", Esperado::Aceita},
    {"vencido pago", "FT", "0", 1, {{"C1", "D+", "0", "2026-01-01"}}, "1", Esperado::Aceita},
    {"vencido sem controlo",
     "FT",
     "0",
     0,
     {{"C1", "D+", "10", "2026-01-01"}},
     "1",
     Esperado::Aceita},
    {"credito antigo", "FT", "0", 1, {{"C1", "C+", "10", "2026-01-01"}}, "1", Esperado::Aceita},
    {"sem data de vencimento", "FT", "0", 1, {{"C1", "D+", "10", ""}}, "1", Esperado::Aceita},
    {"vencido de outro cliente",
     "FT",
     "0",
     1,
     {{"C2", "D+", "10", "2026-01-01"}},
     "1",
     Esperado::Aceita},
    {"venda a dinheiro", "VD", "1", 1, {{"C1", "D+", "10", "2026-01-01"}}, "100", Esperado::Aceita},
    {"guia de transporte",
     "GT",
     "1",
     1,
     {{"C1", "D+", "10", "2026-01-01"}},
     "100",
     Esperado::Aceita},
};

class ControloCredito : public ::testing::Test {
  protected:
    ControloCredito() {
        struct Tipo {
            const char* codigo;
            const char* afectaCli;
            int guia;
            const char* autorizacao;
        };
        for (const Tipo& t : {Tipo{"FT", "D+", 0, "1"}, Tipo{"FA", "D+ ", 0, ""},
                              Tipo{"VD", "S+", 0, "1"}, Tipo{"GT", "D+", 1, "1"}})
            executa(QStringLiteral("insert into TabTipoMov (codigo,AfectaCli,GuiaTransp,"
                                   "Autorizacao) values (?,?,?,?)"),
                    {QString::fromLatin1(t.codigo), QString::fromLatin1(t.afectaCli), t.guia,
                     QString::fromLatin1(t.autorizacao)});
        for (const char* c : {"C1", "C2"})
            executa(QStringLiteral("insert into Clientes (Codigo,Descricao) values (?,?)"),
                    {QString::fromLatin1(c), QString::fromLatin1(c)});
    }

    db::Connection& conn() { return e_.estado().gConn; }
    void executa(const QString& sql, const QVariantList& valores) {
        ASSERT_TRUE(conn().exec(sql, valores)) << conn().lastError().toStdString();
    }
    std::optional<RecusaCredito> verifica(const char* tipo, const char* total) {
        return VerificaCreditoCliente(conn(), QStringLiteral("C1"),
                                      *Currency::parse(QString::fromLatin1(total)),
                                      QString::fromLatin1(tipo), QDate(2026, 6, 15));
    }

    testing::EmpresaTeste e_;
};

TEST_F(ControloCredito, LimiteEVencidosSoNosDocumentosAConta) {
    int numero = 0;
    for (const Caso& c : kCasos) {
        SCOPED_TRACE(c.nome);
        executa(QStringLiteral("delete from MovCliente"), {});
        executa(QStringLiteral("update Clientes set LimiteCredito=?,ControlaVencidos=? where "
                               "Codigo='C1'"),
                {QString::fromLatin1(c.limite), c.controlaVencidos});
        for (const Doc& d : c.docs)
            executa(QStringLiteral("insert into MovCliente (Codigo,Tipo,Numero,Ano,Afecta,saldodoc,"
                                   "datavenc) values (?,'FT',?,'2026',?,?,?)"),
                    {QString::fromLatin1(d.cliente), QString::number(++numero),
                     QString::fromLatin1(d.afecta), QString::fromLatin1(d.saldo),
                     QString::fromLatin1(d.datavenc)});
        const auto r = verifica(c.tipo, c.total);
        switch (c.esperado) {
            case Esperado::Aceita:
                EXPECT_FALSE(r) << r->texto.toStdString();
                break;
            case Esperado::Limite:
                ASSERT_TRUE(r);
                EXPECT_TRUE(r->texto.startsWith(u"O Cliente ultrapassa o Limite de Crédito!"))
                    << r->texto.toStdString();
                EXPECT_EQ(r->autorizavel, c.autorizavel);
                break;
            case Esperado::Vencidos:
                ASSERT_TRUE(r);
                EXPECT_EQ(r->texto, QStringLiteral("O Cliente tem Documentos Vencidos por "
                                                   "Liquidar!\r\nNão pode Encerrar este "
                                                   "Documento!"));
                EXPECT_FALSE(r->autorizavel);
                break;
        }
    }
}

TEST_F(ControloCredito, MensagemDoLimiteDizOsValores) {
    executa(QStringLiteral("update Clientes set LimiteCredito=? where Codigo='C1'"),
            {QStringLiteral("250")});
    executa(QStringLiteral("insert into MovCliente (Codigo,Tipo,Numero,Ano,Afecta,saldodoc,"
                           "datavenc) values ('C1','FT','1','2026','D+',?,'2026-07-01')"),
            {QStringLiteral("200.5")});
    const auto r = verifica("FT", "49.75");
    ASSERT_TRUE(r);
    EXPECT_EQ(r->texto, QStringLiteral("O Cliente ultrapassa o Limite de Crédito!\r\n"
                                       "Limite: 250.00  Saldo: 200.50  Documento: 49.75"));
}

TEST_F(ControloCredito, LeituraFalhadaRecusa) {
    conn().close();
    const auto r = verifica("FT", "1");
    ASSERT_TRUE(r);
    EXPECT_EQ(r->texto, QStringLiteral("Não foi possível verificar o Crédito do Cliente!"));
    EXPECT_FALSE(r->autorizavel);
}

}  // namespace
}  // namespace brasel::documents
