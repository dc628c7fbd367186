// Access rights of windows and buttons: lazily created, never restricting the ways out or the
// supervisor, and the program right checked at login.
#include "app/acessos.h"
#include "db/query_helpers.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

using testing::EmpresaTeste;

const JanelaAcesso kJanela{QStringLiteral("frmRegistoDeCaixa"),
                           QStringLiteral("Registo de Caixa"),
                           {{QStringLiteral("cmdImprimir"), QStringLiteral("&Imprimir")},
                            {QStringLiteral("cmdFechar"), QStringLiteral("&Fechar")},
                            {QStringLiteral("cmdCancelar"), QStringLiteral("&Cancelar")},
                            {QStringLiteral("cmdVoltar"), QStringLiteral("Volta&r")},
                            {QStringLiteral("cmdSair"), QStringLiteral("&Sair")},
                            {QStringLiteral("cmdSim"), QStringLiteral("&Sim")},
                            {QStringLiteral("btnOutro"), QStringLiteral("Outro")},
                            {QStringLiteral("cmdGravar"), QStringLiteral("&Gravar")}}};

int contaLinhas(Estado& e, const QString& utilizador) {
    return e.gConn
        .firstRow(QStringLiteral("select count(*) from acessos where utilizador=?"), {utilizador})
        ->value(0)
        .toInt();
}

void recusa(Estado& e, const QString& utilizador, const QString& chave) {
    ASSERT_TRUE(
        e.gConn.exec(QStringLiteral("update acessos set value=0 where utilizador=? and chave=?"),
                     {utilizador, chave}));
}

TEST(Acessos, OnlyRestrictableButtonsGetRows) {
    EXPECT_TRUE(botaoRestringivel({QStringLiteral("cmdImprimir"), QStringLiteral("&Imprimir")}));
    EXPECT_TRUE(botaoRestringivel({QStringLiteral("CMDGravar"), QStringLiteral("Gravar")}));
    for (const auto& [nome, caption] : {std::pair{"cmdFechar", "&Fechar"},
                                        {"cmdX", "Cancelar"},
                                        {"cmdY", "&Voltar"},
                                        {"cmdZ", "Sai&r"},
                                        {"cmdSim", "&Sim"},
                                        {"cmdNao", "&Não"},
                                        {"btnOk", "Ok"}}) {
        EXPECT_FALSE(botaoRestringivel({QString::fromUtf8(nome), QString::fromUtf8(caption)}))
            << nome;
    }
}

TEST(Acessos, FirstOpeningCreatesGrantedRowsThenRefusalsApply) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    const QString u = QStringLiteral("02");
    ApagaTodososAcessos(e, u);
    ResultadoAcesso r = FormAcessos(e, kJanela, u);
    EXPECT_TRUE(r.permitido);
    EXPECT_EQ(contaLinhas(e, u), 3);  // the window, cmdImprimir and cmdGravar
    EXPECT_EQ(r.botoes.value(QStringLiteral("cmdImprimir")), true);
    EXPECT_FALSE(r.botoes.contains(QStringLiteral("cmdFechar")));
    const auto linha = e.gConn.firstRow(
        QStringLiteral(
            "select value, chave1, form, ctrl, caption, ctrlcap from acessos where chave=?"),
        {chaveBotao(chaveJanela(kJanela.nome), QStringLiteral("cmdImprimir"))});
    ASSERT_TRUE(linha);
    EXPECT_EQ(linha->value(0).toInt(), 1);
    EXPECT_EQ(linha->value(1).toString(), QStringLiteral("BraselfrmRegistoDeCaixa"));
    EXPECT_EQ(linha->value(5).toString(), QStringLiteral("Imprimir"));

    recusa(e, u, chaveBotao(chaveJanela(kJanela.nome), QStringLiteral("cmdImprimir")));
    r = FormAcessos(e, kJanela, u);
    EXPECT_TRUE(r.permitido);
    EXPECT_FALSE(r.botoes.value(QStringLiteral("cmdImprimir")));
    EXPECT_TRUE(r.botoes.value(QStringLiteral("cmdGravar")));
    EXPECT_EQ(contaLinhas(e, u), 3);  // nothing created twice

    recusa(e, u, chaveJanela(kJanela.nome));
    EXPECT_FALSE(FormAcessos(e, kJanela, u).permitido);
    // A suffix is a window right of its own.
    EXPECT_TRUE(FormAcessos(e, kJanela, u, QStringLiteral("2")).permitido);
}

TEST(Acessos, SupportAndSupervisorAlwaysPass) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    for (const QString& u : {QStringLiteral("00"), QStringLiteral("01")}) {
        ASSERT_TRUE(e.gConn.exec(
            QStringLiteral("insert into acessos (utilizador, chave, value) values (?,?,0)"),
            {u, chaveJanela(kJanela.nome)}));
        const ResultadoAcesso r = FormAcessos(e, kJanela, u);
        EXPECT_TRUE(r.permitido);
        EXPECT_TRUE(r.botoes.isEmpty());
        EXPECT_TRUE(acessoPrograma(e, u, {}));
    }
}

TEST(Acessos, ProgramRightEditorAndDeletion) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    const QString u = QStringLiteral("03");
    ApagaTodososAcessos(e, u);
    EXPECT_TRUE(acessoPrograma(e, u, [] { return QList<JanelaAcesso>{kJanela}; }));
    EXPECT_EQ(CheckUtilizApp(e, kPrograma, u), 1);
    EXPECT_EQ(contaLinhas(e, u), 4);

    QList<DireitoAcesso> direitos = lerDireitos(e, u);
    ASSERT_EQ(direitos.size(), 4);
    EXPECT_EQ(direitos[0].chave, kPrograma);  // ordered by key
    for (DireitoAcesso& d : direitos)
        d.valor = d.chave == kPrograma ? false : d.valor;
    EXPECT_TRUE(gravarDireitos(e, u, direitos));
    EXPECT_FALSE(acessoPrograma(e, u, [] { return QList<JanelaAcesso>{kJanela}; }));
    EXPECT_FALSE(gravarDireitos(e, QStringLiteral("00"), direitos));

    ApagaTodososAcessos(e, u);
    EXPECT_EQ(contaLinhas(e, u), 0);
    EXPECT_FALSE(CheckUtilizApp(e, kPrograma, u).has_value());
    FormAcessos(e, kJanela, QStringLiteral("02"));
    ApagaTodososAcessos(e, QStringLiteral("TODOS"));
    EXPECT_EQ(contaLinhas(e, QStringLiteral("02")), 0);
}

}  // namespace
}  // namespace brasel::app
