#include "app/definicoes_posto.h"
#include "common/cls_encripta.h"
#include "common/settings_store.h"
#include "support/apoio_arranque.h"

#include <QDate>
#include <QDir>
#include <QFile>

#include <gtest/gtest.h>

#include <functional>

namespace brasel::app {
namespace {

const QString kBrasel = QStringLiteral("Brasel");
const QString kMontiva = QStringLiteral("Montiva");
const QString kAutenticacao = QStringLiteral("Autenticação");

QString bruto(const char* seccao, const QString& chave) {
    return GetSetting(kBrasel, QString::fromUtf8(seccao), chave, QStringLiteral("<nada>"));
}

TEST(DefinicoesPosto, OmissoesDeUmPostoNovo) {
    testing::DefinicoesTemporarias pasta;
    struct Caso {
        const DefTexto& def;
        const char* omissao;
    };
    const Caso textos[] = {
        {posto::ConfigRest_CAIXA, ""},
        {posto::ConfigRest_Font, "Arial"},
        {posto::ConfigRest_BotaoIMG, ""},
        {posto::ConfigRest_ImpTalaoCozinha, ""},
        {posto::ConfigRest_ImpTalaoCozinhaPorta, ""},
        {posto::ConfigRest_ImpTalaoCozinhaNome, ""},
        {posto::ConfigRest_ImpTalaoBar, ""},
        {posto::ConfigRest_ImpTalaoBarPorta, ""},
        {posto::ConfigRest_CaixaDinheiro, ""},
        {posto::TipoImprimeMesa, ""},
        {posto::Divisao_Obs, ""},
        {posto::ME_Empresa, ""},
        {posto::NomeUtilizador, ""},
    };
    for (const Caso& c : textos) {
        SCOPED_TRACE(c.def.chave().toStdString());
        EXPECT_EQ(c.def.ler(), QString::fromUtf8(c.omissao));
    }
    for (const DefFlag* f :
         {&posto::ConfigRest_PrecoIncBrowse, &posto::ConfigRest_PedePWD,
          &posto::ConfigRest_DesactivaPassword, &posto::ConfigRest_ActivaProdutosFacturaREST,
          &posto::ConfigRest_LimpaDocAposFechaDoc}) {
        SCOPED_TRACE(f->chave().toStdString());
        EXPECT_FALSE(f->ler());
    }
    EXPECT_EQ(posto::ConfigRest_TempoImpTalaoCozinha.ler(), 30);
    EXPECT_EQ(posto::NivelEmenta.ler(), QStringLiteral("TABGRUPOPRO"));
    EXPECT_EQ(posto::JanBackColor.ler(QStringLiteral("01")), QColor(64, 64, 64));
    EXPECT_EQ(posto::ME_Ano.ler(), QString::number(QDate::currentDate().year()));
    const QRect desenho(10, 20, 800, 600);
    EXPECT_EQ(posto::JanPro.ler(desenho), desenho);
    EXPECT_EQ(posto::JanProTamQTY.ler(900), 900);
    // Reading defaults writes nothing.
    EXPECT_TRUE(QDir(pasta.pasta()).entryList(QDir::Files).isEmpty());
}

// Windows, logic and other programs of the suite find each value under its exact section and
// key: a write through the accessor must land there.
TEST(DefinicoesPosto, CadaChaveNaSuaSeccao) {
    testing::DefinicoesTemporarias pasta;
    struct Caso {
        std::function<bool()> gravar;
        const char* seccao;
        const char* chave;
        const char* valor;
    };
    const Caso casos[] = {
        {[] { return posto::ConfigRest_CAIXA.gravar(QStringLiteral("C2")); }, "Brasel",
         "ConfigRest_CAIXA", "C2"},
        {[] { return posto::ConfigRest_PedePWD.gravar(true); }, "Brasel", "ConfigRest_PedePWD",
         "1"},
        {[] { return posto::ConfigRest_LimpaDocAposFechaDoc.gravar(false); }, "Brasel",
         "ConfigRest_LimpaDocAposFechaDoc", "0"},
        {[] { return posto::ConfigRest_TempoImpTalaoCozinha.gravar(45); }, "Brasel",
         "ConfigRest_TempoImpTalaoCozinha", "45"},
        {[] { return posto::NivelEmenta.gravar(QStringLiteral("tabfampro")); }, "Brasel",
         "NivelEmenta", "TABFAMPRO"},
        {[] { return posto::JanBackColor.gravar(QStringLiteral("07"), QColor(255, 0, 16)); },
         "Brasel", "JanBackColor07", "FF0010"},
        {[] { return posto::JanPro.gravar(QRect(1, 2, 3, 4)); }, "Brasel", "JanProH", "4"},
        {[] { return posto::JanUtilizadorT.gravar(-5); }, "Brasel", "JanUtilizadorT", "-5"},
        {[] { return posto::ME_Ano.gravar(QStringLiteral("2009")); }, "Config", "ME_Ano", "2009"},
        {[] { return posto::ME_Empresa.gravar(QStringLiteral("Rest")); }, "Config", "ME_Empresa",
         "Rest"},
        {[] { return posto::NomeUtilizador.gravar(QStringLiteral("ANA")); }, "Config",
         "NomeUtilizador", "ANA"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.chave);
        ASSERT_TRUE(c.gravar());
        EXPECT_EQ(bruto(c.seccao, QString::fromUtf8(c.chave)), QString::fromUtf8(c.valor));
    }
    EXPECT_FALSE(QFile::exists(QDir(pasta.pasta()).filePath(QStringLiteral("Montiva.ini"))));
}

TEST(DefinicoesPosto, ValoresGuardadosALer) {
    testing::DefinicoesTemporarias pasta;
    const auto guardar = [](const char* chave, const QString& valor) {
        ASSERT_TRUE(SaveSetting(kBrasel, kBrasel, QString::fromUtf8(chave), valor));
    };
    struct CasoFlag {
        const char* guardado;
        bool ligado;
    };
    // The check boxes store "1" and "0"; anything else is off.
    for (const CasoFlag& c : {CasoFlag{"1", true}, CasoFlag{" 1 ", true}, CasoFlag{"0", false},
                              CasoFlag{"", false}, CasoFlag{"-1", false}, CasoFlag{"sim", false}}) {
        SCOPED_TRACE(c.guardado);
        guardar("ConfigRest_PrecoIncBrowse", QString::fromUtf8(c.guardado));
        EXPECT_EQ(posto::ConfigRest_PrecoIncBrowse.ler(), c.ligado);
    }
    struct CasoTempo {
        const char* guardado;
        int segundos;
    };
    // Zero would poll the kitchen queue without pause; too large overflows the timer.
    for (const CasoTempo& c : {CasoTempo{"45", 45}, CasoTempo{" 5 ", 5}, CasoTempo{"1", 1},
                               CasoTempo{"86400", 86400}, CasoTempo{"0", 30}, CasoTempo{"-10", 30},
                               CasoTempo{"86401", 30}, CasoTempo{"3000000", 30},
                               CasoTempo{"abc", 30}, CasoTempo{"", 30}, CasoTempo{"4.5", 30}}) {
        SCOPED_TRACE(c.guardado);
        guardar("ConfigRest_TempoImpTalaoCozinha", QString::fromUtf8(c.guardado));
        EXPECT_EQ(posto::ConfigRest_TempoImpTalaoCozinha.ler(), c.segundos);
    }
    guardar("ConfigRest_Font", QStringLiteral("Liberation Sans"));
    EXPECT_EQ(posto::ConfigRest_Font.ler(), QStringLiteral("Liberation Sans"));
    // A workstation cash register of spaces is kept as typed: the loading trims it.
    guardar("ConfigRest_CAIXA", QStringLiteral("   "));
    EXPECT_EQ(posto::ConfigRest_CAIXA.ler(), QStringLiteral("   "));
}

// The level names the table the menu buttons are read from, so only the three tables may come
// back, whatever the file holds.
TEST(DefinicoesPosto, NivelEmentaSoDaAsTresTabelas) {
    testing::DefinicoesTemporarias pasta;
    struct Caso {
        const char* guardado;
        const char* lido;
    };
    const Caso casos[] = {
        {"", "TABGRUPOPRO"},
        {"   ", "TABGRUPOPRO"},
        {"TABGRUPOPRO", "TABGRUPOPRO"},
        {"TABFAMPRO", "TABFAMPRO"},
        {" tabsubfampro ", "TABSUBFAMPRO"},
        {"Produtos", "TABGRUPOPRO"},
        {"TABFAMPRO; delete from Produtos", "TABGRUPOPRO"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.guardado);
        ASSERT_TRUE(SaveSetting(kBrasel, kBrasel, QStringLiteral("NivelEmenta"),
                                QString::fromUtf8(c.guardado)));
        EXPECT_EQ(posto::NivelEmenta.ler(), QString::fromUtf8(c.lido));
    }
    ASSERT_TRUE(posto::NivelEmenta.gravar(QStringLiteral("TABFAMPRO")));
    EXPECT_FALSE(posto::NivelEmenta.gravar(QStringLiteral("Clientes")));
    EXPECT_EQ(posto::NivelEmenta.ler(), QStringLiteral("TABFAMPRO"));
}

TEST(DefinicoesPosto, CorDeFundoPorUtilizador) {
    testing::DefinicoesTemporarias pasta;
    ASSERT_TRUE(posto::JanBackColor.gravar(QStringLiteral("02"), QColor(0, 128, 255)));
    EXPECT_EQ(posto::JanBackColor.ler(QStringLiteral("02")), QColor(0, 128, 255));
    EXPECT_EQ(posto::JanBackColor.ler(QStringLiteral("03")), QColor(64, 64, 64));
    struct Caso {
        const char* guardado;
        QColor cor;
    };
    const Caso casos[] = {
        {"#00FF00", QColor(0, 255, 0)},  {"ff", QColor(0, 0, 255)}, {"verde", QColor(64, 64, 64)},
        {"1000000", QColor(64, 64, 64)}, {"", QColor(64, 64, 64)},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.guardado);
        ASSERT_TRUE(SaveSetting(kBrasel, kBrasel, QStringLiteral("JanBackColor04"),
                                QString::fromUtf8(c.guardado)));
        EXPECT_EQ(posto::JanBackColor.ler(QStringLiteral("04")), c.cor);
    }
}

TEST(DefinicoesPosto, GeometriaDasJanelas) {
    testing::DefinicoesTemporarias pasta;
    const QRect desenho(0, 0, 1024, 768);
    ASSERT_TRUE(posto::JanCliente.gravar(QRect(-20, 15, 640, 480)));
    EXPECT_EQ(posto::JanCliente.ler(desenho), QRect(-20, 15, 640, 480));
    EXPECT_EQ(posto::JanGrupoPro.ler(desenho), desenho);

    // A window saved with no size would open invisible: it gets its design size back.
    ASSERT_TRUE(posto::JanPro.gravar(QRect(5, 6, 0, 300)));
    EXPECT_EQ(posto::JanPro.ler(desenho), QRect(5, 6, 1024, 768));
    ASSERT_TRUE(SaveSetting(kBrasel, kBrasel, QStringLiteral("JanProL"), QStringLiteral("x")));
    ASSERT_TRUE(SaveSetting(kBrasel, kBrasel, QStringLiteral("JanProW"), QStringLiteral("700")));
    EXPECT_EQ(posto::JanPro.ler(desenho), QRect(0, 6, 700, 300));
}

TEST(DefinicoesPosto, AnoDaSeleccaoVazioFicaVazio) {
    testing::DefinicoesTemporarias pasta;
    ASSERT_TRUE(posto::ME_Ano.gravar(QString()));
    EXPECT_EQ(posto::ME_Ano.ler(), QString());
}

void guardarEntrada(int n, const QString& servidor, const QString& login,
                    const QString& passwordCifrada, const QString& tipo) {
    const auto guardar = [n](const char* nome, const QString& valor) {
        ASSERT_TRUE(SaveSetting(kMontiva, kAutenticacao,
                                QString::fromUtf8(nome) + QString::number(n), valor));
    };
    guardar("Servidor", servidor);
    guardar("Login", login);
    guardar("Password", passwordCifrada);
    guardar("TipoAutenticacao", tipo);
}

TEST(ListaServidores, VinteEntradasEAVinteEUmaIgnorada) {
    testing::DefinicoesTemporarias pasta;
    const QString chave = clsEncripta::chaveEmpresas();
    for (int n = 1; n <= 21; ++n) {
        guardarEntrada(n, QStringLiteral("S%1").arg(n), QStringLiteral("L%1").arg(n),
                       clsEncripta::Encripta(0, chave, QStringLiteral("P%1").arg(n)),
                       QStringLiteral("SQL"));
    }
    const ListaServidores lista = lerServidores();
    for (int n = 1; n <= kEntradasServidor; ++n) {
        SCOPED_TRACE(n);
        const EntradaServidor& e = lista[static_cast<std::size_t>(n - 1)];
        EXPECT_EQ(e.servidor, QStringLiteral("S%1").arg(n));
        EXPECT_EQ(e.login, QStringLiteral("L%1").arg(n));
        EXPECT_EQ(e.password(), QStringLiteral("P%1").arg(n));
        EXPECT_TRUE(e.emUso());
    }
    for (const EntradaServidor& e : lista)
        EXPECT_NE(e.servidor, QStringLiteral("S21"));
}

TEST(ListaServidores, EntradasEmUsoEAutenticacao) {
    testing::DefinicoesTemporarias pasta;
    guardarEntrada(1, QStringLiteral("/srv/dados"), QStringLiteral("sa"), QString(),
                   QStringLiteral("Win"));
    guardarEntrada(2, QStringLiteral("   "), QStringLiteral("x"), QString(), QStringLiteral("SQL"));
    guardarEntrada(3, QStringLiteral("postgresql://h"), QStringLiteral("y"),
                   QStringLiteral("NAOCIFRADO"), QString());
    const ListaServidores lista = lerServidores();
    EXPECT_TRUE(lista[0].emUso());
    EXPECT_EQ(lista[0].tipoAutenticacao, QStringLiteral("WIN"));
    EXPECT_EQ(lista[0].password(), QString());
    EXPECT_FALSE(lista[1].emUso());
    EXPECT_TRUE(lista[2].emUso());
    EXPECT_EQ(lista[2].tipoAutenticacao, QStringLiteral("SQL"));
    EXPECT_EQ(lista[2].password(), QString());  // damaged by hand: no password, no crash
    EXPECT_FALSE(lista[3].emUso());
}

TEST(ListaServidores, GravarELerALista) {
    testing::DefinicoesTemporarias pasta;
    ListaServidores lista;
    lista[0] = {QStringLiteral("/srv/a"), QStringLiteral("ana"), {}, QStringLiteral("SQL")};
    lista[0].definirPassword(QStringLiteral("segredo ç"));
    lista[19] = {
        QStringLiteral("postgresql://b:5433"), QStringLiteral("rui"), {}, QStringLiteral("WIN")};
    ASSERT_TRUE(gravarServidores(lista));

    // The password is never stored in plain text.
    EXPECT_EQ(GetSetting(kMontiva, kAutenticacao, QStringLiteral("Password1")),
              lista[0].passwordCifrada);
    EXPECT_NE(lista[0].passwordCifrada, QStringLiteral("segredo ç"));
    EXPECT_FALSE(QFile::exists(QDir(pasta.pasta()).filePath(QStringLiteral("Brasel.ini"))));

    const ListaServidores lida = lerServidores();
    EXPECT_EQ(lida[0].servidor, QStringLiteral("/srv/a"));
    EXPECT_EQ(lida[0].password(), QStringLiteral("segredo ç"));
    EXPECT_EQ(lida[19].servidor, QStringLiteral("postgresql://b:5433"));
    EXPECT_EQ(lida[19].tipoAutenticacao, QStringLiteral("WIN"));
    int emUso = 0;
    for (const EntradaServidor& e : lida)
        emUso += e.emUso() ? 1 : 0;
    EXPECT_EQ(emUso, 2);
}

}  // namespace
}  // namespace brasel::app
