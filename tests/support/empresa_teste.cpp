#include "support/empresa_teste.h"

#include "app/carrega_parametros.h"
#include "db/connections.h"
#include "db/demo/restaurante_demo.h"
#include "db/master_logins.h"
#include "db/query_helpers.h"
#include "db/schema/esquema.h"
#include "db/sessao.h"
#include "support/mensagens_gravadas.h"

#include <QDir>
#include <QFile>

#include <memory>
#include <stdexcept>

namespace brasel::testing {

namespace {

const QString kEmpresa = QStringLiteral("0001");

[[noreturn]] void falha(const QString& texto) {
    throw std::runtime_error(texto.toStdString());
}

// Builds the model company once: logins, schema and, for the demo, the restaurant.
std::unique_ptr<QTemporaryDir> construirModelo(bool demo) {
    auto pasta = std::make_unique<QTemporaryDir>();
    if (!pasta->isValid()) falha(QStringLiteral("Sem pasta temporária para a empresa de teste"));
    db::MasterLogins logins(pasta->path());
    QString erro;
    QStringList nomes{EmpresaTeste::login()};
    if (demo) {
        for (const auto& u : db::demo::utilizadoresDemo())
            nomes << u.login;
    }
    for (const QString& nome : nomes) {
        if (!logins.criar(nome, EmpresaTeste::password(), nome == EmpresaTeste::login(), &erro)) {
            falha(erro);
        }
    }
    db::Connection conn;
    db::ConnectionParams params;
    params.server = *db::ServerAddress::parse(pasta->path());
    params.baseDados = db::nomeBaseDados(kEmpresa);
    params.login = EmpresaTeste::login();
    params.password = EmpresaTeste::password();
    params.autenticacao = QStringLiteral("SQL");
    params.criar = true;
    if (!conn.open(params)) falha(conn.lastError());
    if (!db::schema::actualizarEsquema(conn, nullptr, &erro)) falha(erro);
    if (demo && !db::demo::carregarRestauranteDemo(conn, EmpresaTeste::password(), {}, &erro)) {
        falha(erro);
    }
    conn.close();
    return pasta;
}

const QTemporaryDir& modelo(bool demo) {
    static std::unique_ptr<QTemporaryDir> simples;
    static std::unique_ptr<QTemporaryDir> comDemo;
    std::unique_ptr<QTemporaryDir>& m = demo ? comDemo : simples;
    if (!m) m = construirModelo(demo);
    return *m;
}

}  // namespace

EmpresaTeste::EmpresaTeste(bool demo) {
    if (!pasta_.isValid()) falha(QStringLiteral("Sem pasta temporária para a empresa de teste"));
    const QDir origem(modelo(demo).path());
    for (const QString& ficheiro : origem.entryList(QDir::Files)) {
        if (!QFile::copy(origem.filePath(ficheiro), QDir(pasta_.path()).filePath(ficheiro))) {
            falha(QStringLiteral("Não foi possível copiar ") + ficheiro);
        }
    }
    estado_.gEmpresa = kEmpresa;
    estado_.gServidor = pasta_.path();
    estado_.gLogin = login();
    estado_.gPassword = password();
    estado_.gAutenticacao = QStringLiteral("SQL");
    estado_.gUtilizador = QStringLiteral("01");
    if (!db::Abre_Connexao_Local(estado_, estado_.gConn, 0, 60, true)) {
        falha(estado_.gConn.lastError());
    }
    MensagensGravadas mensagens;
    app::CarregaParametros(estado_, mensagens, {});
    estado_.gNomeEmpresa = db::Select_Campo_str(estado_, QStringLiteral("ParamGeral"),
                                                QStringLiteral("NomeEmpresa"), {}, {});
}

EmpresaTeste::~EmpresaTeste() {
    for (db::Connection* conn :
         {&estado_.gConn, &estado_.gConnAux, &estado_.gConnLocks, &estado_.gConnContab}) {
        conn->close();
    }
}

}  // namespace brasel::testing
