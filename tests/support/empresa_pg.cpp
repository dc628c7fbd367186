#include "support/empresa_pg.h"

#include "app/carrega_parametros.h"
#include "db/connections.h"
#include "db/demo/restaurante_demo.h"
#include "support/mensagens_gravadas.h"
#include "support/servidor_pg.h"

#include <QCoreApplication>

namespace brasel::testing {

EmpresaPg::EmpresaPg(QChar letra, bool demo) {
    const auto pg = servidorPg();
    if (!pg) return;
    texto_ = pg->servidor;
    servidor_ = db::ServerAddress::parse(texto_).value_or(db::ServerAddress{});
    admin_ = {pg->login, pg->password};
    empresa_ = QString(letra) + QStringLiteral("%1").arg(QCoreApplication::applicationPid() % 1000,
                                                         3, 10, QLatin1Char('0'));
    if (!db::schema::criarEmpresa(servidor_, admin_, empresa_, {}, &erro_)) return;
    criada_ = true;
    pronta_ = db::schema::abrirEmpresa(estado_.gConn, servidor_, admin_, empresa_, &erro_);
    estado_.gServidor = texto_;
    estado_.gEmpresa = empresa_;
    estado_.gLogin = admin_.login;
    estado_.gPassword = admin_.password;
    estado_.gAutenticacao = QStringLiteral("SQL");
    if (!pronta_ || !demo) return;
    pronta_ = db::demo::carregarRestauranteDemo(estado_.gConn, admin_.password, {}, &erro_);
    estado_.gLogin = QStringLiteral("SUPERVISOR");
    estado_.gUtilizador = QStringLiteral("01");
    MensagensGravadas mensagens;
    if (pronta_) app::CarregaParametros(estado_, mensagens, {});
}

EmpresaPg::~EmpresaPg() {
    for (db::Connection* c : {&estado_.gConn, &estado_.gConnAux, &estado_.gConnLocks})
        c->close();
    if (!criada_) return;
    db::Connection master;
    QString password = admin_.password;
    if (db::Abre_Connexao(master, texto_, QStringLiteral("Master"), admin_.login, password, {},
                          QStringLiteral("SQL"), 30, 10, true)) {
        master.exec(QStringLiteral("DROP DATABASE IF EXISTS %1 WITH (FORCE)")
                        .arg(db::nomeBaseDados(empresa_).toLower()));
    }
}

}  // namespace brasel::testing
