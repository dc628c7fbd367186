#include "db/demo/escritor.h"

#include <QStringList>

namespace brasel::db::demo {

void Escritor::executar(const QString& sql, const QVariantList& valores) {
    if (!ok()) return;
    if (!conn_.exec(sql, valores))
        erro_ = conn_.lastError() + QStringLiteral(" [") + sql + QLatin1Char(']');
}

void Escritor::inserir(const QString& tabela, const Campos& campos) {
    QStringList colunas;
    QStringList marcas;
    QVariantList valores;
    for (const auto& [coluna, valor] : campos) {
        colunas << coluna;
        marcas << QStringLiteral("?");
        valores << valor;
    }
    executar(QStringLiteral("insert into %1 (%2) values (%3)")
                 .arg(tabela, colunas.join(QLatin1Char(',')), marcas.join(QLatin1Char(','))),
             valores);
}

void Escritor::actualizar(const QString& tabela, const Campos& campos) {
    QStringList atribuicoes;
    QVariantList valores;
    for (const auto& [coluna, valor] : campos) {
        atribuicoes << coluna + QStringLiteral("=?");
        valores << valor;
    }
    executar(QStringLiteral("update %1 set %2").arg(tabela, atribuicoes.join(QLatin1Char(','))),
             valores);
}

}  // namespace brasel::db::demo
