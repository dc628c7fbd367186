// The lookups on a PostgreSQL company, where like is case-sensitive and every bound value has to
// find its type: keys, limits, situations and reserved types behave as on the embedded engine.
#include "db/connections.h"
#include "db/schema/servidor.h"
#include "lookups/pesquisa_tabelas.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"
#include "support/servidor_pg.h"

#include <QCoreApplication>

#include <gtest/gtest.h>

namespace brasel::lookups {
namespace {

// Answers every search with its rows and chooses none.
class JanelaQueListar : public JanelaPesquisa {
  public:
    explicit JanelaQueListar(db::Sessao& sessao) : sessao_(sessao) {}
    std::optional<LinhaEscolhida> Pesquisa(const PedidoPesquisa& pedido) override {
        linhas = executarPesquisa(sessao_.gConn, pedido, pedido.campo, pedido.chave, pedido.limite,
                                  nullptr)
                     .value_or(std::vector<QStringList>{});
        return std::nullopt;
    }
    std::vector<QStringList> linhas;

  private:
    db::Sessao& sessao_;
};

class LookupsPg : public ::testing::Test {
  protected:
    void SetUp() override {
        const auto pg = testing::servidorPg();
        if (!pg) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
        texto = pg->servidor;
        servidor = db::ServerAddress::parse(texto).value_or(db::ServerAddress{});
        admin = {pg->login, pg->password};
        empresa = QStringLiteral("P%1").arg(QCoreApplication::applicationPid() % 1000, 3, 10,
                                            QLatin1Char('0'));
        QString erro;
        ASSERT_TRUE(db::schema::criarEmpresa(servidor, admin, empresa, {}, &erro))
            << erro.toStdString();
        criada = true;
        ASSERT_TRUE(db::schema::abrirEmpresa(estado.gConn, servidor, admin, empresa, &erro))
            << erro.toStdString();
        estado.gUtilizador = QStringLiteral("01");
        executar(
            QStringLiteral("insert into Produtos (Codigo, Descricao, Situacao) values "
                           "('A1','Água Mineral','A'),('A2','AGUARDENTE velha','A'),"
                           "('A3','aguapé','I'),('Q1','Vinho d''Ouro','A')"));
    }

    void TearDown() override {
        estado.gConn.close();
        if (!criada) return;
        db::Connection master;
        QString password = admin.password;
        if (db::Abre_Connexao(master, texto, QStringLiteral("Master"), admin.login, password, {},
                              QStringLiteral("SQL"), 30, 10, true)) {
            master.exec(QStringLiteral("DROP DATABASE IF EXISTS %1 WITH (FORCE)")
                            .arg(db::nomeBaseDados(empresa).toLower()));
        }
    }

    void executar(const QString& sql, const QVariantList& valores = {}) {
        ASSERT_TRUE(estado.gConn.exec(sql, valores)) << estado.gConn.lastError().toStdString();
    }

    QString texto;
    db::ServerAddress servidor;
    db::schema::Credenciais admin;
    QString empresa;
    bool criada = false;
    app::Estado estado;
    testing::MensagensGravadas mensagens;
};

TEST_F(LookupsPg, KeysIgnoreCaseAndAreBound) {
    JanelaQueListar janela(estado);
    PesquisaTabelas pesquisa(estado, mensagens, janela);
    CampoCodigo campo{QStringLiteral("\\agua"), {}};
    pesquisa.Produtos(campo);
    ASSERT_EQ(janela.linhas.size(), 2u);  // AGUARDENTE and aguapé; not Água
    EXPECT_EQ(janela.linhas[0].value(0), QStringLiteral("A2"));

    campo = {QStringLiteral("\\*D'OU"), {}};
    pesquisa.Produtos(campo);
    ASSERT_EQ(janela.linhas.size(), 1u);
    EXPECT_EQ(janela.linhas[0].value(1), QStringLiteral("Vinho d'Ouro"));
}

TEST_F(LookupsPg, SituationsReservedTypesAndDistinctSets) {
    JanelaQueListar janela(estado);
    PesquisaTabelas pesquisa(estado, mensagens, janela);
    executar(
        QStringLiteral("insert into UtilConfig_Div (Utilizador, NomeForm, Chave) values "
                       "('01','SituacoesPesquisa','A')"));
    CampoCodigo campo{QStringLiteral("A3"), {}};
    pesquisa.Produtos(campo);
    EXPECT_TRUE(campo.codigo.isEmpty());
    campo = {QStringLiteral("A1"), {}};
    pesquisa.Produtos(campo);
    EXPECT_EQ(campo.descricao, QStringLiteral("Água Mineral"));

    executar(
        QStringLiteral("insert into TabTipoMov (codigo, Descricao) values "
                       "('VD','Venda a Dinheiro'),('SI','Saldo Inicial')"));
    executar(QStringLiteral("update ParamGeral set TipoSICliD='SI'"));
    campo = {QStringLiteral("SI"), {}};
    pesquisa.TipoMov(campo);
    EXPECT_TRUE(campo.codigo.isEmpty());
    campo = {};
    pesquisa.TipoMov(campo);
    ASSERT_EQ(janela.linhas.size(), 1u);
    EXPECT_EQ(janela.linhas[0].value(0), QStringLiteral("VD"));

    executar(
        QStringLiteral("insert into ProdutosFacturaREST (Codigo, Produto, Descricao) values "
                       "('J','A1','Jantar'),('J','A2','Jantar')"));
    pesquisa.Produtos_FacturaREST(campo);
    EXPECT_EQ(janela.linhas.size(), 1u);
    EXPECT_EQ(mensagens.textos().size(), 2);
}

TEST_F(LookupsPg, EngineErrorsBecomeTheirMessages) {
    JanelaQueListar janela(estado);
    PesquisaTabelas pesquisa(estado, mensagens, janela);
    DefinicaoPesquisa d = definicao(Mestre::Caixas);
    d.descricao = QStringLiteral("Caixas.Nome");
    CampoCodigo campo{QStringLiteral("01"), {}};
    pesquisa.pesquisar(d, campo, false, {});
    d = definicao(Mestre::Caixas);
    d.tabela = QStringLiteral("CaixasAntigas");
    d.codigo = QStringLiteral("CaixasAntigas.Codigo");
    d.descricao = QStringLiteral("CaixasAntigas.Descricao");
    campo = {QStringLiteral("01"), {}};
    pesquisa.pesquisar(d, campo, false, {});
    EXPECT_EQ(mensagens.textos(),
              (QStringList{QStringLiteral("Campo Inexistente na Tabela Caixas"),
                           QStringLiteral("Tabela Inexistente ou Base de Dados")}));
}

}  // namespace
}  // namespace brasel::lookups
