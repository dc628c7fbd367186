#include "db/sessao.h"

namespace brasel::db {

QString nomeBaseDados(const QString& empresa) {
    return QStringLiteral("Vendrola") + empresa;
}

QString codigoEmpresa(const QString& nomeBaseDados) {
    if (nomeBaseDados.size() != 12 ||
        !nomeBaseDados.startsWith(QStringLiteral("Vendrola"), Qt::CaseInsensitive)) {
        return {};
    }
    return nomeBaseDados.mid(8);
}

}  // namespace brasel::db
