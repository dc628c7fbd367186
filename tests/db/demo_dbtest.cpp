// The demo restaurant: complete enough for every user to start working, coherent across its
// tables, and loaded all or nothing.
#include "app/carrega_parametros.h"
#include "app/verifica_configuracao.h"
#include "common/ediv.h"
#include "db/demo/restaurante_demo.h"
#include "db/schema/esquema.h"
#include "support/empresa_teste.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

namespace brasel::db::demo {
namespace {

qint64 conta(Connection& conn, const QString& sql, const QVariantList& valores = {}) {
    const auto linha = conn.firstRow(sql, valores);
    return linha ? linha->value(0).toLongLong() : -1;
}

QStringList coluna(Connection& conn, const QString& sql, const QVariantList& valores = {}) {
    QStringList valoresLidos;
    if (auto q = conn.exec(sql, valores)) {
        while (q->next())
            valoresLidos << q->value(0).toString();
    }
    return valoresLidos;
}

TEST(RestauranteDemo, EveryUserPassesTheStartUpChecks) {
    testing::EmpresaTeste empresa(true);
    app::Estado& estado = empresa.estado();
    for (const UtilizadorDemo& u : utilizadoresDemo()) {
        SCOPED_TRACE(u.codigo.toStdString());
        testing::MensagensGravadas mensagens;
        estado.gUtilizador = u.codigo;
        app::CarregaParametros(estado, mensagens, {});
        EXPECT_TRUE(app::VerificaConfiguracaoInicial(estado, mensagens))
            << mensagens.textos().join(QLatin1Char('\n')).toStdString();
        EXPECT_EQ(estado.gArmazem, QStringLiteral("001"));
        EXPECT_EQ(estado.gCaixa, QStringLiteral("01"));
        EXPECT_EQ(estado.gTipoFac, QStringLiteral("VD"));
        EXPECT_FALSE(estado.gLinhasCabecalho[0].isEmpty());
    }
    EXPECT_EQ(estado.param.casadec, 2);
    EXPECT_EQ(estado.param.casadecpreco, 3);
    EXPECT_EQ(estado.param.casadecquant, 3);
    EXPECT_EQ(estado.param.cambiodef, QStringLiteral("EUR"));
    EXPECT_EQ(estado.param.clidiversos, QStringLiteral("CF"));
    EXPECT_TRUE(schema::verificarEsquema(estado.gConn).isEmpty());
}

// Each row is a question whose answer must be the count given: a broken reference or a
// missing piece of the restaurant shows up as a wrong count.
TEST(RestauranteDemo, TablesMenuAndSettingsHangTogether) {
    testing::EmpresaTeste empresa(true);
    Connection& conn = empresa.estado().gConn;
    struct Caso {
        const char* pergunta;
        const char* sql;
        qint64 esperado;
    };
    const Caso casos[] = {
        {"mesas da sala", "select count(*) from Clientes where Descricao like 'Mesa %'", 20},
        {"mesas sem arredondamentos",
         "select count(*) from Clientes where decvalor<>2 or arrevalor<>1 or dectotalgeral<>2 or "
         "arretotalgeral<>1 or decivageral<>2",
         0},
        {"consumidor final",
         "select count(*) from Clientes c join ParamGeral p on "
         "c.Codigo=p.Clidiversos where c.Diversos=1",
         1},
        {"grupos", "select count(*) from TabGrupoPro", 3},
        {"produtos sem grupo ou família",
         "select count(*) from Produtos p where not exists (select 1 from TabGrupoPro g where "
         "g.CODIGO=p.Grupo) or not exists (select 1 from TabFamPro f where f.CODIGO=p.Familia)",
         0},
        {"bebidas para a cozinha", "select count(*) from Produtos where Grupo='01' and ImpCopa<>0",
         0},
        {"pratos fora da cozinha",
         "select count(*) from Produtos where Grupo='02' and ImpCopa=0 and "
         "Familia<>'021'",
         0},
        {"produtos pesados", "select count(*) from Produtos where Pesagem=1", 1},
        {"produtos com escalões em falta",
         "select count(*) from Produtos where PrecoVenda1<=0 or PrecoVenda2<=0 or PrecoVenda3<=0",
         0},
        {"produtos com taxa diferente do seu IVA",
         "select count(*) from Produtos p left join TabIva i on i.codigo=p.IvaTabVenda where "
         "i.codigo is null or i.Taxa<>p.IvaTaxaVenda",
         0},
        {"taxas de IVA 6, 13 e 23", "select count(*) from TabIva where Taxa in (6,13,23)", 3},
        {"IVA incluído", "select count(*) from TabIva where Incluido='1'", 1},
        {"tipos de venda assinados",
         "select count(*) from TabTipoMov where codigo in ('VD','FT','NC') and ControloHash<>0", 3},
        // The table bill is chosen among exactly these types (workstation setting TipoImprimeMesa).
        {"tipos para a consulta de mesa",
         "select count(*) from TabTipoMov where Modulo='FC' and AfectaCli='NA' and AfectaSTK='NA' "
         "and AfectaCaixa='NA' and AfectaBan='NA' and ControloHash<>0",
         1},
        {"formas de pagamento",
         "select count(*) from PagaComo where Descricao in ('Numerário','Multibanco','Cartão de "
         "Crédito','MB Way')",
         4},
        {"configurações com referências partidas",
         "select count(*) from UtilConfGeral u where not exists (select 1 from ImpTaloes i where "
         "i.Codigo=u.TipoImpTalao) or not exists (select 1 from TabDisplay d where "
         "d.Codigo=u.CodigoDisplay) or not exists (select 1 from armazens a where "
         "a.codigo=u.armazem) or not exists (select 1 from Caixas c where c.Codigo=u.caixa) or not "
         "exists (select 1 from TabTipoMov t where t.codigo=u.VendaPronto) or not exists (select 1 "
         "from TabTipoMov t where t.codigo=u.DVendaPronto)",
         0},
        {"impressoras ligadas por série",
         "select count(*) from UtilConfGeral where PortaTalao='COM' and UsaDisplay=1", 3},
        {"utilizadores configurados",
         "select count(*) from Utilizador u join UtilConfGeral c on c.utilizador=u.Codigo", 3},
        {"linhas de cabeçalho da loja",
         "select count(*) from armazens where linha1<>'' and linha2<>''", 1},
    };
    for (const Caso& c : casos) {
        EXPECT_EQ(conta(conn, QString::fromUtf8(c.sql)), c.esperado) << c.pergunta;
    }
    EXPECT_GE(conta(conn, QStringLiteral("select count(*) from Produtos")), 40);
}

// Printer and display codes are "+"-separated byte values: at most six, each 0 to 255.
TEST(RestauranteDemo, DeviceCodesAreValidByteLists) {
    testing::EmpresaTeste empresa(true);
    Connection& conn = empresa.estado().gConn;
    const QStringList codigos =
        coluna(conn, QStringLiteral("select abrircaixa from ImpTaloes union all select feednlines "
                                    "from ImpTaloes union all select small_on from ImpTaloes union "
                                    "all select corte from ImpTaloes union all select reset from "
                                    "ImpTaloes union all select setinternationalCHR from ImpTaloes "
                                    "union all select Limpa from TabDisplay union all select "
                                    "InitLinha1 from TabDisplay union all select FimLinha2 from "
                                    "TabDisplay"));
    ASSERT_EQ(codigos.size(), 9);
    for (const QString& codigo : codigos) {
        const QStringList campos = codigo.split(QLatin1Char('+'));
        EXPECT_LE(campos.size(), 6) << codigo.toStdString();
        for (const QString& campo : campos) {
            bool ok = false;
            const int byte = campo.toInt(&ok);
            EXPECT_TRUE(ok && byte >= 0 && byte <= 255) << codigo.toStdString();
        }
    }
}

// The table picker reads ClientesDiv in slots of 11 characters, the code being the first 10.
TEST(RestauranteDemo, UsersSeeExistingTablesAndKnowTheirPassword) {
    testing::EmpresaTeste empresa(true);
    Connection& conn = empresa.estado().gConn;
    const QStringList listas =
        coluna(conn, QStringLiteral("select ClientesDiv from UtilConfGeral order by utilizador"));
    const int esperadas[] = {24, 14, 14};
    ASSERT_EQ(listas.size(), 3);
    for (int u = 0; u < 3; ++u) {
        const QString& lista = listas[u];
        const int slots = qRound(lista.size() / 11.0);
        EXPECT_EQ(slots, esperadas[u]);
        for (int s = 0; s < slots; ++s) {
            const QString codigo = lista.mid(s * 11, 10).trimmed();
            EXPECT_EQ(conta(conn, QStringLiteral("select count(*) from Clientes where Codigo=?"),
                            {codigo}),
                      1)
                << codigo.toStdString();
        }
    }
    for (const UtilizadorDemo& u : utilizadoresDemo()) {
        const auto linha = conn.firstRow(
            QStringLiteral("select Login, Password from Utilizador where Codigo=?"), {u.codigo});
        ASSERT_TRUE(linha);
        EXPECT_EQ(linha->value(0).toString(), u.login);
        EXPECT_EQ(EDiv::Decrypt(linha->value(1).toString()), testing::EmpresaTeste::password());
    }
}

TEST(RestauranteDemo, RefusesACompanyThatAlreadyHasData) {
    testing::EmpresaTeste empresa(true);
    Connection& conn = empresa.estado().gConn;
    const qint64 produtos = conta(conn, QStringLiteral("select count(*) from Produtos"));
    QString erro;
    EXPECT_FALSE(carregarRestauranteDemo(conn, QStringLiteral("x"), {}, &erro));
    EXPECT_TRUE(erro.contains(QStringLiteral("vazia"))) << erro.toStdString();
    EXPECT_EQ(conta(conn, QStringLiteral("select count(*) from Produtos")), produtos);
}

TEST(RestauranteDemo, AFailedLoadLeavesTheCompanyEmpty) {
    testing::EmpresaTeste empresa;
    Connection& conn = empresa.estado().gConn;
    ASSERT_TRUE(conn.exec(QStringLiteral("drop table TabDisplay")));
    QString erro;
    EXPECT_FALSE(carregarRestauranteDemo(conn, QStringLiteral("x"), {}, &erro));
    EXPECT_TRUE(erro.contains(QStringLiteral("TabDisplay"))) << erro.toStdString();
    for (const char* tabela : {"Produtos", "Clientes", "Utilizador", "TabIva"}) {
        EXPECT_EQ(conta(conn, QStringLiteral("select count(*) from %1").arg(QLatin1String(tabela))),
                  0)
            << tabela;
    }
    EXPECT_EQ(conta(conn, QStringLiteral("select count(*) from ParamGeral where NomeEmpresa<>''")),
              0);
}

TEST(RestauranteDemo, ACompanyNameWithQuotesReachesTheHeading) {
    testing::EmpresaTeste empresa;
    Connection& conn = empresa.estado().gConn;
    const QString nome = QStringLiteral("Tasca d'Avó \"O Largo\"");
    QString erro;
    ASSERT_TRUE(carregarRestauranteDemo(conn, QStringLiteral("p'w"), nome, &erro))
        << erro.toStdString();
    EXPECT_EQ(coluna(conn, QStringLiteral("select NomeEmpresa from ParamGeral")),
              QStringList{nome});
    EXPECT_EQ(coluna(conn, QStringLiteral("select linha1 from armazens")), QStringList{nome});
    EXPECT_EQ(EDiv::Decrypt(coluna(conn, QStringLiteral("select Password from Utilizador where "
                                                        "Codigo='02'"))
                                .value(0)),
              QStringLiteral("p'w"));
}

}  // namespace
}  // namespace brasel::db::demo
