#include "pos/produtos_cozinha.h"

#include <QVariant>

namespace brasel::pos {

namespace {

QString ordem(const QString& nivelEmenta) {
    const QString nivel = nivelEmenta.trimmed().toUpper();
    if (nivel == u"TABGRUPOPRO") return QStringLiteral(" order by Grupo,Descricao");
    if (nivel == u"TABFAMPRO") return QStringLiteral(" order by Familia,Descricao");
    if (nivel == u"TABSUBFAMPRO") return QStringLiteral(" order by Subfamilia,Descricao");
    return QStringLiteral(" order by Descricao");
}

}  // namespace

std::optional<QList<FlagCozinha>> CarregarFlagsCozinha(db::Connection& conn,
                                                       const QString& nivelEmenta) {
    auto rs = conn.exec(QStringLiteral("select Codigo,Descricao,ImpCopa from Produtos") +
                        ordem(nivelEmenta));
    if (!rs) return std::nullopt;
    QList<FlagCozinha> flags;
    while (rs->next())
        flags.append({rs->value(0).toString(), rs->value(1).toString(), rs->value(2).toInt() == 1});
    rs->finish();
    return flags;
}

bool GravarFlagsCozinha(db::Connection& conn, const QList<FlagCozinha>& flags) {
    db::WriteTransaction t(conn);
    if (!t.active()) return false;
    for (const FlagCozinha& f : flags) {
        if (!conn.exec(QStringLiteral("update Produtos set ImpCopa=? where Codigo=?"),
                       {f.cozinha ? 1 : 0, f.codigo}))
            return false;
    }
    return t.commit();
}

}  // namespace brasel::pos
