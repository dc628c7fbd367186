// The number of a new document: the first one after UltNumero (and after the number proposed
// before the closing lock) that no header of the year holds; the counter is raised, never
// lowered.
#include "documents/numeracao.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

#include <vector>

namespace brasel::documents {
namespace {

struct Livre {
    const char* ultNumero;
    std::vector<const char*> usados;  // headers of type "NUM" in 2026
    const char* minimo;
    const char* ano;
    std::optional<QString> esperado;
};

const Livre kLivres[] = {
    {"00000000", {}, "", "2026", QStringLiteral("00000001")},
    {"00000003", {"00000004", "00000005", "00000007"}, "", "2026", QStringLiteral("00000006")},
    // The proposal taken before the lock went to another workstation meanwhile.
    {"00000003", {"00000004"}, "00000004", "2026", QStringLiteral("00000005")},
    {"00000003", {}, "00000009", "2026", QStringLiteral("00000009")},
    // A proposal behind the counter does not bring it down.
    {"00000012", {}, "00000002", "2026", QStringLiteral("00000013")},
    // Another year's documents do not count.
    {"00000000", {"00000001", "00000002"}, "", "2027", QStringLiteral("00000001")},
    {"", {"00000001"}, "", "2026", QStringLiteral("00000002")},
    {"ABC", {}, "", "2026", std::nullopt},
};

TEST(Numeracao, NumeroLivreSaltaOsUsadosDoAno) {
    testing::EmpresaTeste e;
    db::Connection& conn = e.estado().gConn;
    for (const Livre& c : kLivres) {
        conn.exec(QStringLiteral("delete from TabTipoMov where codigo='NUM'"));
        conn.exec(QStringLiteral("delete from MovCliente"));
        conn.exec(QStringLiteral("insert into TabTipoMov (codigo, UltNumero) values ('NUM', ?)"),
                  {QString::fromLatin1(c.ultNumero)});
        for (const char* n : c.usados)
            ASSERT_TRUE(conn.exec(QStringLiteral("insert into MovCliente (Tipo,Numero,Ano) "
                                                 "values ('NUM',?,'2026')"),
                                  {QString::fromLatin1(n)}));
        EXPECT_EQ(NumeroLivre(conn, QStringLiteral("MovCliente"), QStringLiteral("NUM"),
                              QString::fromLatin1(c.ano), QString::fromLatin1(c.minimo)),
                  c.esperado)
            << c.ultNumero << " " << c.minimo;
        // Only a proposal: the counter is untouched.
        EXPECT_EQ(conn.firstRow(QStringLiteral("select UltNumero from TabTipoMov where "
                                               "codigo='NUM'"))
                      ->value(0)
                      .toString(),
                  QString::fromLatin1(c.ultNumero));
    }
    EXPECT_EQ(NumeroLivre(conn, QStringLiteral("MovCliente"), QStringLiteral("NAOHA"),
                          QStringLiteral("2026")),
              std::nullopt);
}

TEST(Numeracao, ProximoNumTabTipoMovComContadorSemZeros) {
    testing::EmpresaTeste e;
    db::Connection& conn = e.estado().gConn;
    conn.exec(QStringLiteral("insert into TabTipoMov (codigo, UltNumero) values ('NUM', '7')"));
    EXPECT_EQ(ProximoNumTabTipoMov(conn, QStringLiteral("NUM")), QStringLiteral("00000008"));
    EXPECT_EQ(ProximoNumTabTipoMov(conn, QStringLiteral("NUM")), QStringLiteral("00000009"));
}

TEST(Numeracao, UltNumeroSobeNuncaDesce) {
    testing::EmpresaTeste e;
    db::Connection& conn = e.estado().gConn;
    struct Caso {
        const char* antes;
        const char* numero;
        const char* depois;
    };
    const Caso casos[] = {{"00000004", "00000005", "00000005"},
                          {"", "00000001", "00000001"},
                          {"00000020", "00000005", "00000020"},
                          {"7", "00000008", "00000008"}};
    for (const Caso& c : casos) {
        conn.exec(QStringLiteral("delete from TabTipoMov where codigo='NUM'"));
        conn.exec(QStringLiteral("insert into TabTipoMov (codigo, UltNumero) values ('NUM', ?)"),
                  {QString::fromLatin1(c.antes)});
        EXPECT_TRUE(GravaUltNumero(conn, QStringLiteral("NUM"), QString::fromLatin1(c.numero)));
        EXPECT_EQ(conn.firstRow(QStringLiteral("select UltNumero from TabTipoMov where "
                                               "codigo='NUM'"))
                      ->value(0)
                      .toString(),
                  QString::fromLatin1(c.depois))
            << c.antes;
    }
    EXPECT_FALSE(GravaUltNumero(conn, QStringLiteral("NAOHA"), QStringLiteral("00000001")));
}

}  // namespace
}  // namespace brasel::documents
