#include "db/catalogo.h"

#include "db/query_helpers.h"
#include "db/sessao.h"

#include <QDir>
#include <QFileInfo>

namespace brasel::db {

QStringList basesDadosEmpresa(Connection& master) {
    QStringList nomes;
    if (!master.isOpen()) return nomes;
    if (master.engine() == Engine::Sqlite) {
        const QDir pasta(master.params().server.folder);
        for (const QFileInfo& f : pasta.entryInfoList({QStringLiteral("Vendrola*.sqlite")},
                                                      QDir::Files, QDir::Name | QDir::IgnoreCase)) {
            const QString nome = f.completeBaseName();
            if (!codigoEmpresa(nome).isEmpty())
                nomes << QStringLiteral("Vendrola") + codigoEmpresa(nome);
        }
        return nomes;
    }
    auto q = master.exec(master.dialect().companyDatabasesQuery());
    while (q && q->next()) {
        const QString codigo = codigoEmpresa(q->value(0).toString());
        if (!codigo.isEmpty()) nomes << QStringLiteral("Vendrola") + codigo.toUpper();
    }
    return nomes;
}

EstadoBaseDados estadoBaseDados(Connection& master, const QString& nomeBaseDados) {
    EstadoBaseDados estado;
    if (master.engine() == Engine::Sqlite) {
        const QFileInfo f(sqliteFilePath(master.params().server.folder, nomeBaseDados));
        estado.desligada = !f.exists() || !f.isReadable();
        estado.soLeitura = !estado.desligada && !f.isWritable();
        estado.tamanhoBytes = f.size();
        return estado;
    }
    const QString fisico = master.dialect().physicalDatabaseName(nomeBaseDados);
    const auto linha = primeiraLinha(
        master,
        QStringLiteral("select not datallowconn, pg_database_size(datname), exists (select 1 from "
                       "pg_db_role_setting s where s.setdatabase=d.oid and s.setrole=0 and "
                       "'default_transaction_read_only=on'=any(s.setconfig)) from pg_database d "
                       "where datname=?"),
        {fisico});
    if (!linha) {
        estado.desligada = true;
        return estado;
    }
    estado.desligada = linha->value(0).toBool();
    estado.tamanhoBytes = linha->value(1).toLongLong();
    estado.soLeitura = linha->value(2).toBool();
    return estado;
}

}  // namespace brasel::db
