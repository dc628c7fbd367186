#pragma once

#include "app/estado.h"

#include <QString>
#include <QStringList>
#include <QVariant>

#include <stdexcept>
#include <utility>
#include <vector>

namespace brasel::pricing::teste {

using Colunas = std::vector<std::pair<const char*, QVariant>>;

// Inserts the row a test needs, with bound values; a failed insert stops the test loudly.
inline void insere(app::Estado& estado, const char* tabela, const Colunas& colunas) {
    QStringList nomes;
    QStringList marcas;
    QVariantList valores;
    for (const auto& [nome, valor] : colunas) {
        nomes << QString::fromLatin1(nome);
        marcas << QStringLiteral("?");
        valores << valor;
    }
    const QString sql = QStringLiteral("insert into %1 (%2) values (%3)")
                            .arg(QString::fromLatin1(tabela), nomes.join(u','), marcas.join(u','));
    if (!estado.gConn.exec(sql, valores)) {
        throw std::runtime_error(estado.gConn.lastError().toStdString());
    }
}

// The current user's UtilConfGeral row, replaced by the one given.
inline void configuraUtilizador(app::Estado& estado, Colunas colunas) {
    estado.gConn.exec(QStringLiteral("delete from UtilConfGeral where utilizador=?"),
                      {estado.gUtilizador});
    colunas.emplace_back("utilizador", estado.gUtilizador);
    insere(estado, "UtilConfGeral", colunas);
}

inline QString T(const char* texto) {
    return QString::fromUtf8(texto);
}

}  // namespace brasel::pricing::teste
