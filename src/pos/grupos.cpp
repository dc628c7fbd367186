#include "pos/grupos.h"

#include "pos/produtos_facturacao.h"
#include "pricing/leitura.h"

namespace brasel::pos {

std::vector<GrupoEmenta> CarregarGrupos(app::Estado& estado, const QString& nivel) {
    std::vector<GrupoEmenta> grupos;
    auto q = estado.gConn.exec(QStringLiteral("select Codigo,Descricao from ") +
                               nivelProdutos(nivel).tabela + QStringLiteral(" order by Descricao"));
    while (q && q->next())
        grupos.push_back({q->value(0).toString(), q->value(1).toString()});
    return grupos;
}

QString DescricaoGrupo(app::Estado& estado, const QString& nivel, const QString& codigo) {
    const auto r =
        estado.gConn.firstRow(QStringLiteral("select Descricao from ") +
                                  nivelProdutos(nivel).tabela + QStringLiteral(" where Codigo=?"),
                              {pricing::textoSql(codigo)});
    return r ? r->value(0).toString() : QString();
}

}  // namespace brasel::pos
