#include "lookups/pesquisa.h"

#include <QSqlRecord>

namespace brasel::lookups {

namespace {

const QString kDistinct = QStringLiteral("distinct");

}  // namespace

QString colunaIdentidade(const QString& tabela) {
    return tabela.compare(u"PDocumentos", Qt::CaseInsensitive) == 0 ? QStringLiteral("Record")
                                                                    : QStringLiteral("NumRegisto");
}

int limiteLinhas(const QString& texto) {
    bool ok = false;
    const int n = texto.trimmed().toInt(&ok);
    return ok && n > 0 ? n : kLimiteSemNumero;
}

QString padraoChave(const QString& chave) {
    QString padrao = chave;
    padrao.replace(u'*', u'%');
    return padrao + u'%';
}

Consulta construirConsulta(const PedidoPesquisa& pedido, int campo, const QString& chave,
                           const QString& limite) {
    Consulta consulta;
    QString seleccao = pedido.seleccao.trimmed();
    const bool distinta =
        seleccao.startsWith(kDistinct, Qt::CaseInsensitive) &&
        (seleccao.size() == kDistinct.size() || seleccao[kDistinct.size()].isSpace());
    if (distinta) seleccao = seleccao.mid(kDistinct.size()).trimmed();
    consulta.sql = QStringLiteral("select ") +
                   (distinta ? QStringLiteral("distinct ") : QString()) + seleccao +
                   QStringLiteral(" where ") + pedido.tabela + u'.' +
                   colunaIdentidade(pedido.tabela) + QStringLiteral(">0 ") + pedido.filtro.sql;
    consulta.valores = pedido.filtro.valores;
    if (!chave.isEmpty() && campo >= 0 && campo < static_cast<int>(pedido.campos.size())) {
        // Both engines compare the lowered texts, so the key finds "Água" and "água" alike
        // wherever the engine lowers accented letters.
        consulta.sql += QStringLiteral(" and lower(cast(") +
                        pedido.campos[static_cast<std::size_t>(campo)].coluna +
                        QStringLiteral(" as text)) like lower(?) ");
        consulta.valores << padraoChave(chave);
    }
    consulta.sql += u' ' + pedido.ordem.trimmed() + QStringLiteral(" limit ?");
    consulta.valores << limiteLinhas(limite);
    return consulta;
}

std::optional<std::vector<QStringList>> executarPesquisa(db::Connection& conn,
                                                         const PedidoPesquisa& pedido, int campo,
                                                         const QString& chave,
                                                         const QString& limite, QString* erro) {
    const Consulta consulta = construirConsulta(pedido, campo, chave, limite);
    auto resultado = conn.exec(consulta.sql, consulta.valores);
    if (!resultado) {
        if (erro) *erro = conn.lastError();
        return std::nullopt;
    }
    std::vector<QStringList> linhas;
    while (resultado->next()) {
        const QSqlRecord registo = resultado->record();
        QStringList textos;
        textos.reserve(registo.count());
        for (int i = 0; i < registo.count(); ++i)
            textos << (registo.isNull(i) ? QString() : registo.value(i).toString());
        linhas.push_back(std::move(textos));
    }
    return linhas;
}

db::Condicao filtroSituacoes(db::Sessao& sessao, const QString& utilizador, const QString& tabela) {
    db::Condicao filtro;
    if (!db::Existe_Coluna_bln(sessao, nullptr, tabela, QStringLiteral("Situacao"))) return filtro;
    auto linhas =
        sessao.gConn.exec(QStringLiteral("select Chave from UtilConfig_Div where Utilizador=? and "
                                         "NomeForm='SituacoesPesquisa' order by Chave"),
                          {utilizador});
    if (!linhas) return filtro;
    QStringList termos;
    while (linhas->next()) {
        termos << tabela + QStringLiteral(".Situacao=?");
        filtro.valores << linhas->value(0).toString();
    }
    if (!termos.isEmpty())
        filtro.sql =
            QStringLiteral(" and (") + termos.join(QStringLiteral(" or ")) + QStringLiteral(") ");
    return filtro;
}

QString mensagemErroBaseDados(const QString& erro, const QString& tabela) {
    const QString texto = erro.toLower();
    if (texto.contains(u"no such column") ||
        (texto.contains(u"column") && texto.contains(u"does not exist")))
        return QStringLiteral("Campo Inexistente na Tabela ") + tabela;
    if (texto.contains(u"no such table") ||
        (texto.contains(u"relation") && texto.contains(u"does not exist")))
        return QStringLiteral("Tabela Inexistente ou Base de Dados");
    return QStringLiteral(
        "Falha na Ligação ao Servidor ou não pode abrir mais Ligações na Transacção");
}

}  // namespace brasel::lookups
