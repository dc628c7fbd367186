// brasel-admin: creates, upgrades, fills with the demo restaurant and checks company databases.
#include "admin/argumentos.h"
#include "admin/comandos.h"
#include "admin/consola.h"

#include <QCoreApplication>

int main(int argc, char* argv[]) {
    QCoreApplication app(argc, argv);
    brasel::admin::Consola consola;
    QString erro;
    const auto pedido = brasel::admin::lerPedido(app.arguments().mid(1), &erro);
    if (!pedido) {
        consola.erros << erro << Qt::endl
                      << QStringLiteral("Use brasel-admin --help para ver os comandos.")
                      << Qt::endl;
        return brasel::admin::kUtilizacao;
    }
    return brasel::admin::executar(*pedido, consola);
}
