// The company list of the configured servers and Company OK on embedded companies: what enters,
// what is refused with which message, and what is left open.
#include "app/definicoes_posto.h"
#include "app/importa_empresas.h"
#include "app/seleccao_empresa.h"
#include "common/ediv.h"
#include "common/settings_store.h"
#include "db/query_helpers.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <QDir>
#include <QFile>

#include <gtest/gtest.h>

#include <functional>

namespace brasel::app {
namespace {

using testing::DefinicoesTemporarias;
using testing::EmpresaTeste;
using testing::MensagensGravadas;

EntradaServidor servidorDe(const EmpresaTeste& empresa,
                           const QString& password = EmpresaTeste::password()) {
    EntradaServidor e;
    e.servidor = empresa.pasta();
    e.login = EmpresaTeste::login();
    e.definirPassword(password);
    e.tipoAutenticacao = QStringLiteral("SQL");
    return e;
}

void gravaServidores(std::initializer_list<std::pair<int, EntradaServidor>> entradas) {
    ListaServidores lista;
    for (const auto& [n, e] : entradas)
        lista[static_cast<std::size_t>(n - 1)] = e;
    ASSERT_TRUE(gravarServidores(lista));
}

class SeleccaoEmpresa : public ::testing::Test {
  protected:
    DefinicoesTemporarias definicoes;
    MensagensGravadas m;
};

TEST_F(SeleccaoEmpresa, ListsTheTwentyEntriesWithTheirFilters) {
    EmpresaTeste vigesima(true);
    EmpresaTeste depois(true);
    ASSERT_TRUE(vigesima.estado().gConn.exec(QStringLiteral("update ParamGeral set Ano='2031'")));
    // Unreachable servers contribute nothing; entry 21 is not part of the list.
    gravaServidores({{1, {QStringLiteral("/pasta/inexistente"), QStringLiteral("sa"), {}, {}}},
                     {20, servidorDe(vigesima)}});
    ASSERT_TRUE(SaveSetting(QStringLiteral("Montiva"), QStringLiteral("Autenticação"),
                            QStringLiteral("Servidor21"), depois.pasta()));

    const QList<LinhaEmpresa> todas = listarEmpresas({}, {}, {});
    ASSERT_EQ(todas.size(), 1);
    EXPECT_EQ(todas[0].codigo, QStringLiteral("0001"));
    EXPECT_EQ(todas[0].servidor, vigesima.pasta());
    EXPECT_EQ(todas[0].ano, QStringLiteral("2031"));
    EXPECT_FALSE(todas[0].nome.isEmpty());

    const std::tuple<const char*, const char*, int> filtros[] = {
        {"", "2031", 1}, {"", "2030", 0}, {"tasca", "", 1}, {"TASCA", "2031", 1}, {"nada", "", 0}};
    for (const auto& [nome, ano, linhas] : filtros) {
        EXPECT_EQ(listarEmpresas(QString::fromUtf8(nome), QString::fromUtf8(ano), {}).size(),
                  linhas)
            << nome << "/" << ano;
    }
}

TEST_F(SeleccaoEmpresa, FirstStartImportsTheOldListFromTheCommandLineFolder) {
    EmpresaTeste empresa(true);
    QTemporaryDir antiga;
    QFile csv(QDir(antiga.path()).filePath(kFicheiroEmpresasAntigo));
    ASSERT_TRUE(csv.open(QIODevice::WriteOnly));
    QString pwd = EDiv::Encrypt(EmpresaTeste::password());
    pwd.replace(QLatin1Char('"'), QStringLiteral("\"\""));
    csv.write((QStringLiteral("Server,UID,PWD\n") + empresa.pasta() + QStringLiteral(",") +
               EmpresaTeste::login() + QStringLiteral(",\"") + pwd + QStringLiteral("\"\n"))
                  .toUtf8());
    csv.close();

    EXPECT_TRUE(listarEmpresas({}, {}, {}).isEmpty());
    const QList<LinhaEmpresa> linhas = listarEmpresas({}, {}, antiga.path());
    ASSERT_EQ(linhas.size(), 1);
    EXPECT_EQ(lerServidores()[0].password(), EmpresaTeste::password());

    Estado estado;
    EXPECT_EQ(entrarEmpresa(estado, linhas[0], m), ResultadoEmpresa::Login);
}

TEST_F(SeleccaoEmpresa, CompanyOkFillsTheSessionAndOpensItsConnection) {
    EmpresaTeste empresa(true);
    gravaServidores({{1, servidorDe(empresa)}});
    const QList<LinhaEmpresa> linhas = listarEmpresas({}, {}, {});
    ASSERT_EQ(linhas.size(), 1);

    Estado estado;
    EXPECT_EQ(entrarEmpresa(estado, linhas[0], m), ResultadoEmpresa::Login);
    EXPECT_TRUE(m.mensagens().isEmpty()) << m.textos().join(QLatin1Char('|')).toStdString();
    EXPECT_EQ(estado.gEmpresa, QStringLiteral("0001"));
    EXPECT_EQ(estado.gNomeEmpresa, linhas[0].nome);
    EXPECT_EQ(estado.gServidor, empresa.pasta());
    EXPECT_EQ(estado.gLogin, EmpresaTeste::login());
    EXPECT_EQ(estado.gPassword, EmpresaTeste::password());
    EXPECT_EQ(estado.gAutenticacao, QStringLiteral("SQL"));
    ASSERT_TRUE(estado.gConn.isOpen());
    EXPECT_EQ(estado.gConn.params().tempoComando, 120);
    EXPECT_EQ(estado.gConn.params().tempoLigacao, 60);
}

TEST_F(SeleccaoEmpresa, RefusalsShowTheirMessageOnceAndLeaveNothingOpen) {
    using Prepara = std::function<void(EmpresaTeste&, LinhaEmpresa&)>;
    const auto sql = [](QStringList textos) -> Prepara {
        return [textos](EmpresaTeste& empresa, LinhaEmpresa&) {
            for (const QString& texto : textos)
                ASSERT_TRUE(empresa.estado().gConn.exec(texto)) << texto.toStdString();
        };
    };
    const QString naoConvertida =
        QStringLiteral("Não pode entrar nesta Empresa porque ainda não foi convertida!");
    const QString requer = QStringLiteral(
        "A Versão do Aplicativo Requer que seja efectuada a Actualização de Base de Dados!");
    const struct {
        const char* nome;
        Prepara prepara;
        QString mensagem;
    } casos[] = {
        {"não convertida", sql({QStringLiteral("update ParamGeral set ConverteuNVARCHAR=0")}),
         naoConvertida},
        {"conversão vazia", sql({QStringLiteral("update ParamGeral set ConverteuNVARCHAR=NULL")}),
         naoConvertida},
        // A refused version is said once, and the conversion is not asked about.
        {"sem versão",
         sql({QStringLiteral("update Actualiza set Versao=''"),
              QStringLiteral("update ParamGeral set ConverteuNVARCHAR=0")}),
         requer},
        {"password errada",
         [](EmpresaTeste&, LinhaEmpresa& linha) {
             EntradaServidor e;
             e.definirPassword(QStringLiteral("errada"));
             linha.passwordCifrada = e.passwordCifrada;
         },
         QStringLiteral("Não foi possível a ligação à Empresa 0001!")},
    };
    for (const auto& caso : casos) {
        EmpresaTeste empresa(true);
        gravaServidores({{1, servidorDe(empresa)}});
        QList<LinhaEmpresa> linhas = listarEmpresas({}, {}, {});
        ASSERT_EQ(linhas.size(), 1);
        caso.prepara(empresa, linhas[0]);
        Estado estado;
        MensagensGravadas mensagens;
        EXPECT_EQ(entrarEmpresa(estado, linhas[0], mensagens), ResultadoEmpresa::Ficar)
            << caso.nome;
        ASSERT_FALSE(mensagens.mensagens().isEmpty()) << caso.nome;
        EXPECT_EQ(mensagens.mensagens().first().texto, caso.mensagem) << caso.nome;
        EXPECT_EQ(mensagens.textos().filter(caso.mensagem).size(), 1) << caso.nome;
        EXPECT_EQ(mensagens.contem(naoConvertida), caso.mensagem == naoConvertida) << caso.nome;
        EXPECT_FALSE(estado.gConn.isOpen()) << caso.nome;
    }
}

}  // namespace
}  // namespace brasel::app
