// Opening a table that other users hold lines on: the lines of another tax region than the
// user's tab stay where they are, listed with their reason beside those beyond four VAT tables;
// an older company gets the region column with every code in one region.
#include "db/schema/esquema.h"
#include "pos/tab_teste.h"
#include "pricing/insere_teste.h"
#include "support/impressao_qt.h"

namespace brasel::pos {
namespace {

using pricing::teste::insere;
using pricing::teste::T;

class AberturaMesaTeste : public teste::TabTeste {
  protected:
    void SetUp() override {
        // Two codes of the autonomous region "M" beside the demo's RD, IT and NO.
        insere(estado(), "TabIva", {{"codigo", T("RM")}, {"Taxa", T("4")}, {"Zona", T("M")}});
        insere(estado(), "TabIva", {{"codigo", T("IM")}, {"Taxa", T("9")}, {"Zona", T("M")}});
        insere(estado(), "TabIva", {{"codigo", T("Z4")}, {"Taxa", T("5")}});
        insere(estado(), "TabIva", {{"codigo", T("Z5")}, {"Taxa", T("7")}});
    }

    // Opens M01 again, agreeing to take the other users' lines; the warning it gave.
    QStringList abreEPassa() {
        m_.limpar();
        m_.responder({true});
        EXPECT_TRUE(AbrirMesa(tab_, QStringLiteral("M01")));
        return m_.textos();
    }
    qint64 linhasDe(const char* login) {
        return contar(QStringLiteral("select count(*) from MovProduto where Utilizador=?"),
                      {QString::fromLatin1(login)});
    }
};

TEST_F(AberturaMesaTeste, AsLinhasDeOutraZonaFicamComOSeuUtilizador) {
    // The tab is empty: the first line taken sets its region.
    linhaDe("ANA", "M01", "N1", "RM");
    linhaDe("ANA", "M01", "N2", "NO");
    linhaDe("ANA", "M01", "N3", "IM");
    linhaDe("ANA", "M01", "N4", "");
    EXPECT_EQ(abreEPassa(), QStringList{QStringLiteral("Não foi possível passar todos os "
                                                       "Produtos:\r\n(N2) -> IVA de Zonas "
                                                       "Diferentes")});
    EXPECT_EQ(tab_.lista().linhas.size(), 3u);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Codigo='N2' and "
                                    "Utilizador='ANA'")),
              1);
}

TEST_F(AberturaMesaTeste, CadaLinhaRecusadaComASuaRazao) {
    for (const char* iva : {"RD", "IT", "NO", "Z4"})
        linhaDe("SUPERVISOR", "M01", iva, iva);
    linhaDe("RUI", "M01", "N1", "Z5");  // a fifth table of the same region
    linhaDe("RUI", "M01", "N2", "RM");  // another region: that is what stops it
    linhaDe("RUI", "M01", "N3", "NO");
    EXPECT_EQ(abreEPassa(),
              QStringList{QStringLiteral("Não foi possível passar todos os Produtos:\r\n"
                                         "(N1) -> Atingido o Limite de quatro IVAS\r\n"
                                         "(N2) -> IVA de Zonas Diferentes")});
    EXPECT_EQ(linhasDe("RUI"), 2);
    EXPECT_EQ(linhasDe("SUPERVISOR"), 5);
}

TEST_F(AberturaMesaTeste, EmpresaAntigaRecebeAZonaComTodosOsCodigosNumaSo) {
    db::Connection& conn = estado().gConn;
    ASSERT_TRUE(conn.exec(QStringLiteral("alter table TabIva drop column Zona")));
    QStringList alteracoes;
    QString erro;
    ASSERT_TRUE(db::schema::actualizarEsquema(conn, &alteracoes, &erro)) << erro.toStdString();
    EXPECT_TRUE(alteracoes.contains(QStringLiteral("Coluna acrescentada: TabIva.Zona")));
    EXPECT_EQ(contar(QStringLiteral("select count(*) from TabIva where Zona<>''")), 0);
    EXPECT_GT(contar(QStringLiteral("select count(*) from TabIva")), 0);

    // One region: only the limit of four tables holds a line back.
    linhaDe("ANA", "M01", "N1", "RM");
    linhaDe("ANA", "M01", "N2", "NO");
    EXPECT_TRUE(abreEPassa().isEmpty());
    EXPECT_EQ(linhasDe("ANA"), 0);
}

}  // namespace
}  // namespace brasel::pos
