// The lookups on the demo restaurant: typed codes are validated against their table (with the
// user's situations, the caller's restriction and the reserved document types), the prefixes
// open the search on the right field, and database trouble is reported, not taken for a
// missing code.
#include "lookups/pesquisa_tabelas.h"

#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

namespace brasel::lookups {
namespace {

using testing::EmpresaTeste;
using testing::MensagensGravadas;

using Lookup = void (PesquisaTabelas::*)(CampoCodigo&, bool, const db::Condicao&);

// The search window of the tests: keeps each request, runs it on the company as the window
// would, and chooses the row it was told to (none: cancels).
class JanelaGravada : public JanelaPesquisa {
  public:
    explicit JanelaGravada(db::Sessao& sessao) : sessao_(sessao) {}

    std::optional<LinhaEscolhida> Pesquisa(const PedidoPesquisa& pedido) override {
        pedidos.push_back(pedido);
        linhas = executarPesquisa(sessao_.gConn, pedido, pedido.campo, pedido.chave, pedido.limite,
                                  nullptr)
                     .value_or(std::vector<QStringList>{});
        if (escolher < 0 || escolher >= static_cast<int>(linhas.size())) return std::nullopt;
        const QStringList& linha = linhas[static_cast<std::size_t>(escolher)];
        return LinhaEscolhida{linha.value(0), linha.value(1)};
    }

    int escolher = -1;
    std::vector<PedidoPesquisa> pedidos;
    std::vector<QStringList> linhas;

  private:
    db::Sessao& sessao_;
};

class Lookups : public ::testing::Test {
  protected:
    Lookups() : janela(empresa.estado()), pesquisa(empresa.estado(), mensagens, janela) {}

    void executar(const QString& sql, const QVariantList& valores = {}) {
        ASSERT_TRUE(estado().gConn.exec(sql, valores)) << estado().gConn.lastError().toStdString();
    }
    app::Estado& estado() { return empresa.estado(); }

    CampoCodigo validar(Lookup lookup, const QString& codigo, const db::Condicao& filtro = {}) {
        CampoCodigo campo{codigo, QStringLiteral("antiga")};
        (pesquisa.*lookup)(campo, false, filtro);
        return campo;
    }

    EmpresaTeste empresa{true};
    MensagensGravadas mensagens;
    JanelaGravada janela;
    PesquisaTabelas pesquisa;
};

TEST_F(Lookups, DemoCodesAreValidatedDirectly) {
    const QString armazem = estado()
                                .gConn.firstRow(QStringLiteral("select linha1 from armazens"))
                                .value_or(QSqlRecord())
                                .value(0)
                                .toString();
    const struct {
        Lookup lookup;
        const char* codigo;
        QString descricao;
        const char* mensagem;
    } casos[] = {
        {&PesquisaTabelas::Produtos, "B001", QStringLiteral("Água mineral 0,5 L"),
         "Produto Inexistente ou não pode ser movimentado nesta Opção"},
        {&PesquisaTabelas::Clientes, "M01", QStringLiteral("Mesa 1"),
         "Cliente Inexistente ou não pode Movimentar nesta Opção!"},
        {&PesquisaTabelas::TipoMov, "VD", QStringLiteral("Venda a Dinheiro"),
         "Tipo de Movimento Inexistente ou não pertence a estas condições"},
        {&PesquisaTabelas::Caixas, "01", QStringLiteral("Caixa principal"), "Caixa Inexistente"},
        {&PesquisaTabelas::Impressoras_Taloes, "EP1",
         QStringLiteral("Impressora de talões ESC/POS 80 mm"), "Impressora de Talões Inexistente"},
        {&PesquisaTabelas::Utilizadores, "02", QStringLiteral("ANA"), "Utilizador Inexistente"},
        {&PesquisaTabelas::Cambios, "USD", QStringLiteral("US$"), "Câmbio Inexistente"},
        {&PesquisaTabelas::PagaComo, "MB", QStringLiteral("Multibanco"),
         "Forma de Pagamento Inexistente"},
        {&PesquisaTabelas::Armazens, "001", armazem, "Armazém Inexistente"},
        {&PesquisaTabelas::Vendedores, "03", QStringLiteral("Rui Fonseca"), "Vendedor Inexistente"},
        {&PesquisaTabelas::TabPostal, "1100-148", QStringLiteral("Lisboa"),
         "Código Postal Inexistente "},
        {&PesquisaTabelas::Localizacoes, "COZ", QStringLiteral("Cozinha"),
         "Localização Inexistente"},
    };
    for (const auto& caso : casos) {
        SCOPED_TRACE(caso.codigo);
        mensagens.limpar();
        const CampoCodigo bom = validar(caso.lookup, QString::fromUtf8(caso.codigo));
        EXPECT_EQ(bom.codigo, QString::fromUtf8(caso.codigo));
        EXPECT_EQ(bom.descricao, caso.descricao);
        EXPECT_TRUE(mensagens.mensagens().isEmpty());

        const CampoCodigo mau = validar(caso.lookup, QStringLiteral("x'9"));
        EXPECT_TRUE(mau.codigo.isEmpty());
        EXPECT_TRUE(mau.descricao.isEmpty());
        ASSERT_EQ(mensagens.mensagens().size(), 1);
        EXPECT_EQ(mensagens.mensagens()[0].texto, QString::fromUtf8(caso.mensagem));
        EXPECT_EQ(mensagens.mensagens()[0].icone, Icone::Critico);
    }
    EXPECT_TRUE(janela.pedidos.empty());
}

TEST_F(Lookups, EveryMasterTableValidatesItsCodes) {
    // Tables the demo leaves empty get a row here; the code holds a quote on purpose.
    const struct {
        Lookup lookup;
        Mestre mestre;
    } casos[] = {
        {&PesquisaTabelas::Documentos, Mestre::Documentos},
        {&PesquisaTabelas::Fornecedores, Mestre::Fornecedores},
        {&PesquisaTabelas::ClientesMoradas_LISTA, Mestre::ClientesMoradas},
        {&PesquisaTabelas::FornecedoresMoradas_LISTA, Mestre::FornecedoresMoradas},
        {&PesquisaTabelas::OutUnidades, Mestre::OutUnidades},
        {&PesquisaTabelas::LotesTabela, Mestre::LotesTabela},
        {&PesquisaTabelas::Estacao_Referencias, Mestre::Estacao},
        {&PesquisaTabelas::Sexo_Referencias, Mestre::Sexo},
        {&PesquisaTabelas::Referencia_Referencias, Mestre::Referencia},
        {&PesquisaTabelas::Modelo_Referencias, Mestre::Modelo},
        {&PesquisaTabelas::Cor_Referencias, Mestre::Cor},
        {&PesquisaTabelas::Tamanho_Referencias, Mestre::Tamanho},
        {&PesquisaTabelas::Comprimento_Referencias, Mestre::Comprimento},
        {&PesquisaTabelas::Delegados, Mestre::Delegados},
        {&PesquisaTabelas::Produtos_FacturaREST, Mestre::ProdutosFacturaREST},
    };
    const QString codigo = QStringLiteral("Z'1");
    for (const auto& caso : casos) {
        const DefinicaoPesquisa& d = definicao(caso.mestre);
        SCOPED_TRACE(d.tabela.toStdString());
        const auto coluna = [](const QString& qualificada) { return qualificada.section(u'.', 1); };
        executar(QStringLiteral("insert into ") + d.tabela + u'(' + coluna(d.codigo) + u',' +
                     coluna(d.descricao) + QStringLiteral(") values (?,?)"),
                 {codigo, QStringLiteral("Descrição d'") + d.tabela});
        mensagens.limpar();
        const CampoCodigo bom = validar(caso.lookup, codigo);
        EXPECT_EQ(bom.descricao, QStringLiteral("Descrição d'") + d.tabela);
        EXPECT_TRUE(mensagens.mensagens().isEmpty());

        const CampoCodigo mau = validar(caso.lookup, QStringLiteral("Z'2"));
        EXPECT_TRUE(mau.codigo.isEmpty() && mau.descricao.isEmpty());
        const QStringList esperadas =
            d.mensagem.isEmpty() ? QStringList{} : QStringList{d.mensagem};
        EXPECT_EQ(mensagens.textos(), esperadas);
    }
}

TEST_F(Lookups, PrefixesOpenTheSearchOnTheirField) {
    executar(QStringLiteral("insert into Produtos (Codigo, Descricao, Situacao) values (?,?,?)"),
             {QStringLiteral("B901"), QStringLiteral("AGUA das Pedras"), QStringLiteral("A")});
    executar(QStringLiteral("insert into Produtos (Codigo, Descricao, Situacao) values (?,?,?)"),
             {QStringLiteral("B902"), QStringLiteral("Sumo de agua de coco"), QStringLiteral("A")});
    janela.escolher = 0;
    CampoCodigo campo{QStringLiteral("\\agua"), {}};
    pesquisa.Produtos(campo);
    ASSERT_EQ(janela.pedidos.size(), 1u);
    EXPECT_EQ(janela.pedidos[0].campo, 1);
    EXPECT_EQ(janela.pedidos[0].chave, QStringLiteral("agua"));
    ASSERT_EQ(janela.linhas.size(), 1u);  // begins with agua, in any case
    EXPECT_EQ(campo.codigo, QStringLiteral("B901"));
    EXPECT_EQ(campo.descricao, QStringLiteral("AGUA das Pedras"));

    campo = {QStringLiteral("/b00"), {}};
    pesquisa.Produtos(campo);
    EXPECT_EQ(janela.pedidos.back().campo, 0);
    EXPECT_EQ(janela.linhas.size(), 9u);  // B001 .. B009
    EXPECT_EQ(campo.codigo, QStringLiteral("B001"));

    // "*" inside the key: descriptions like "cer%pre%".
    janela.escolher = -1;
    campo = {QStringLiteral("\\cer*pre"), QStringLiteral("antes")};
    pesquisa.Produtos(campo);
    ASSERT_EQ(janela.linhas.size(), 1u);
    EXPECT_EQ(janela.linhas[0].value(1), QStringLiteral("Cerveja preta"));
    // Cancelled: the field is left as it was.
    EXPECT_EQ(campo.codigo, QStringLiteral("\\cer*pre"));
    EXPECT_EQ(campo.descricao, QStringLiteral("antes"));
    // "|" belongs to the equivalents and is not a prefix here: the text is a code.
    campo = {QStringLiteral("|B001"), {}};
    pesquisa.Produtos(campo);
    EXPECT_EQ(janela.pedidos.size(), 3u);
    EXPECT_TRUE(mensagens.contem(QStringLiteral("Produto Inexistente")));
}

TEST_F(Lookups, EmptyOrForcedOpensTheWindowWithTheRowLimit) {
    executar(QStringLiteral("update ParamGeral set registosVisualizar=3"));
    estado().param.registosVisualizar = 3;
    janela.escolher = 1;
    CampoCodigo campo{QStringLiteral("01"), QStringLiteral("Supervisor")};
    pesquisa.Utilizadores(campo, true);
    ASSERT_EQ(janela.pedidos.size(), 1u);
    EXPECT_EQ(janela.pedidos[0].limite, QStringLiteral("3"));
    EXPECT_TRUE(janela.pedidos[0].chave.isEmpty());
    EXPECT_EQ(campo.codigo, QStringLiteral("02"));
    EXPECT_EQ(campo.descricao, QStringLiteral("ANA"));

    campo = {};
    pesquisa.Clientes(campo);
    EXPECT_EQ(janela.linhas.size(), 3u);
    EXPECT_FALSE(campo.codigo.isEmpty());
}

TEST_F(Lookups, SituationsTheUserMayNotSeeAreRefused) {
    executar(QStringLiteral("update Produtos set Situacao='I' where Codigo='B002'"));
    executar(QStringLiteral("insert into UtilConfig_Div (Utilizador, NomeForm, Chave) values "
                            "(?, 'SituacoesPesquisa', ?)"),
             {estado().gUtilizador, QStringLiteral("A")});
    EXPECT_EQ(validar(&PesquisaTabelas::Produtos, QStringLiteral("B001")).descricao,
              QStringLiteral("Água mineral 0,5 L"));
    const CampoCodigo recusado = validar(&PesquisaTabelas::Produtos, QStringLiteral("B002"));
    EXPECT_TRUE(recusado.codigo.isEmpty() && recusado.descricao.isEmpty());
    EXPECT_EQ(
        mensagens.textos(),
        QStringList{QStringLiteral("Produto Inexistente ou não pode ser movimentado nesta Opção")});

    // The search leaves it out as well.
    CampoCodigo campo{QStringLiteral("/B00"), {}};
    pesquisa.Produtos(campo);
    EXPECT_EQ(janela.linhas.size(), 8u);
    for (const QStringList& linha : janela.linhas)
        EXPECT_NE(linha.value(0), QStringLiteral("B002"));

    // Another user without rows sees every situation; tables without the column are not
    // filtered.
    EXPECT_TRUE(
        filtroSituacoes(estado(), QStringLiteral("02"), QStringLiteral("Produtos")).sql.isEmpty());
    EXPECT_TRUE(
        filtroSituacoes(estado(), estado().gUtilizador, QStringLiteral("Clientes")).sql.isEmpty());
    executar(QStringLiteral("insert into UtilConfig_Div (Utilizador, NomeForm, Chave) values "
                            "(?, 'SituacoesPesquisa', ?)"),
             {estado().gUtilizador, QStringLiteral("I")});
    const db::Condicao duas =
        filtroSituacoes(estado(), estado().gUtilizador, QStringLiteral("Produtos"));
    EXPECT_EQ(duas.sql, QStringLiteral(" and (Produtos.Situacao=? or Produtos.Situacao=?) "));
    EXPECT_EQ(duas.valores, (QVariantList{QStringLiteral("A"), QStringLiteral("I")}));
}

TEST_F(Lookups, DocumentTypesFollowTheCallerAndTheReservedTypes) {
    const db::Condicao caixa{QStringLiteral("and TabTipoMov.Modulo=?"), {QStringLiteral("CA")}};
    EXPECT_EQ(validar(&PesquisaTabelas::TipoMov, QStringLiteral("TX+"), caixa).descricao,
              QStringLiteral("Transferência de Caixa (Entrada)"));
    EXPECT_TRUE(validar(&PesquisaTabelas::TipoMov, QStringLiteral("VD"), caixa).codigo.isEmpty());
    EXPECT_EQ(mensagens.textos().size(), 1);

    executar(QStringLiteral("update ParamGeral set TipoSICaiD=?, TipoSICliC=?, TipoSIPro=''"),
             {QStringLiteral("TX-"), QStringLiteral("NC")});
    mensagens.limpar();
    for (const char* reservado : {"TX-", "NC"}) {
        EXPECT_TRUE(
            validar(&PesquisaTabelas::TipoMov, QString::fromLatin1(reservado)).codigo.isEmpty());
    }
    EXPECT_EQ(mensagens.textos().size(), 2);
    EXPECT_EQ(validar(&PesquisaTabelas::TipoMov, QStringLiteral("FT")).descricao,
              QStringLiteral("Factura"));

    CampoCodigo campo;
    pesquisa.TipoMov(campo);
    QStringList listados;
    for (const QStringList& linha : janela.linhas)
        listados << linha.value(0);
    EXPECT_EQ(listados,
              (QStringList{QStringLiteral("CM"), QStringLiteral("DV"), QStringLiteral("FT"),
                           QStringLiteral("TX+"), QStringLiteral("VD")}));
    EXPECT_EQ(janela.linhas[0].size(), 8);  // code, description, last number, module, effects
}

TEST_F(Lookups, ButtonSetsAreListedOnce) {
    for (const char* produto : {"B001", "B002", "B003"}) {
        executar(QStringLiteral("insert into ProdutosFacturaREST (Codigo, Produto, Descricao) "
                                "values ('ALM', ?, 'Almoço')"),
                 {QString::fromLatin1(produto)});
    }
    CampoCodigo campo;
    pesquisa.Produtos_FacturaREST(campo);
    ASSERT_EQ(janela.linhas.size(), 1u);
    EXPECT_EQ(janela.linhas[0], (QStringList{QStringLiteral("ALM"), QStringLiteral("Almoço")}));
}

TEST_F(Lookups, NotesAreChosenByTheirText) {
    janela.escolher = 0;
    EXPECT_EQ(pesquisa.Observacoes_str(QStringLiteral("sem g")), QStringLiteral("Sem gelo"));
    EXPECT_EQ(janela.linhas.size(), 2u);  // "Sem gelo", "Sem glúten"
    janela.escolher = -1;
    EXPECT_EQ(pesquisa.Observacoes_str(), QString());
}

TEST_F(Lookups, DatabaseTroubleIsNotAMissingCode) {
    DefinicaoPesquisa semTabela = definicao(Mestre::Caixas);
    semTabela.tabela = QStringLiteral("CaixasAntigas");
    semTabela.codigo = QStringLiteral("CaixasAntigas.Codigo");
    semTabela.descricao = QStringLiteral("CaixasAntigas.Descricao");
    CampoCodigo campo{QStringLiteral("01"), QStringLiteral("x")};
    pesquisa.pesquisar(semTabela, campo, false, {});
    EXPECT_EQ(mensagens.textos(),
              QStringList{QStringLiteral("Tabela Inexistente ou Base de Dados")});
    EXPECT_TRUE(campo.codigo.isEmpty() && campo.descricao.isEmpty());

    DefinicaoPesquisa semColuna = definicao(Mestre::Caixas);
    semColuna.descricao = QStringLiteral("Caixas.Nome");
    campo = {QStringLiteral("01"), {}};
    mensagens.limpar();
    pesquisa.pesquisar(semColuna, campo, false, {});
    EXPECT_EQ(mensagens.textos(),
              QStringList{QStringLiteral("Campo Inexistente na Tabela Caixas")});

    estado().gConn.close();
    campo = {QStringLiteral("01"), {}};
    mensagens.limpar();
    pesquisa.Caixas(campo);
    EXPECT_EQ(mensagens.textos(),
              QStringList{QStringLiteral(
                  "Falha na Ligação ao Servidor ou não pode abrir mais Ligações na Transacção")});
    EXPECT_TRUE(campo.codigo.isEmpty());
}

}  // namespace
}  // namespace brasel::lookups
