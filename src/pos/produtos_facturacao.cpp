#include "pos/produtos_facturacao.h"

#include "db/query_helpers.h"

#include <QSqlRecord>
#include <QVariant>

namespace brasel::pos {

namespace {

const QString kFiltroBloqueio = QStringLiteral(
    " and not exists (select 1 from UtilConfig_Div b where b.Utilizador=? and b.NomeForm=? "
    "and b.Chave=p.Codigo)");
const QString kFiltroConjunto = QStringLiteral(
    " and exists (select 1 from ProdutosFacturaREST f where f.Produto=p.Codigo and "
    "f.DataInicial<=? and f.DataFinal>=?)");

void mensagemErro(MessagePort& mensagens, const QString& texto) {
    mensagens.mensagem(texto, Icone::Critico, QStringLiteral("A T E N Ç Ã O !"));
}

}  // namespace

NivelProdutos nivelProdutos(const QString& nivelEmenta) {
    const QString nivel = nivelEmenta.trimmed().toUpper();
    if (nivel == u"TABFAMPRO") return {QStringLiteral("Familia"), QStringLiteral("TabFamPro")};
    if (nivel == u"TABSUBFAMPRO")
        return {QStringLiteral("Subfamilia"), QStringLiteral("TabSubFamPro")};
    return {QStringLiteral("Grupo"), QStringLiteral("TabGrupoPro")};
}

bool VerBloqueioUtilproduto(db::Connection& conn, const QString& utilizador,
                            const QString& produto) {
    return conn
        .firstRow(QStringLiteral("select Chave from UtilConfig_Div where Utilizador=? and "
                                 "NomeForm=? and Chave=?"),
                  {utilizador, QString::fromLatin1(kNomeBloqueioProdutos), produto})
        .has_value();
}

bool ProdutoNumConjuntoValido(db::Connection& conn, const QString& produto, const QString& dia) {
    return conn
        .firstRow(QStringLiteral("select NumRegisto from ProdutosFacturaREST where Produto=? and "
                                 "DataInicial<=? and DataFinal>=?"),
                  {produto, dia, dia})
        .has_value();
}

std::optional<QList<BotaoProduto>> ProdutosDosBotoes(db::Connection& conn,
                                                     const QString& nivelEmenta,
                                                     const QString& codigoNivel,
                                                     const QString& utilizador, const QString& dia,
                                                     bool soConjuntosValidos) {
    // The column name comes from the level, never from the caller's text.
    QString sql = QStringLiteral(
                      "select p.Codigo,p.Descricao,p.foto from Produtos p where "
                      "p.NumRegisto>0 and p.") +
                  nivelProdutos(nivelEmenta).coluna + QStringLiteral("=?") + kFiltroBloqueio;
    QVariantList valores{codigoNivel, utilizador, QString::fromLatin1(kNomeBloqueioProdutos)};
    if (soConjuntosValidos) {
        sql += kFiltroConjunto;
        valores << dia << dia;
    }
    sql += QStringLiteral(" order by p.Descricao");
    auto rs = conn.exec(sql, valores);
    if (!rs) return std::nullopt;
    QList<BotaoProduto> botoes;
    while (rs->next())
        botoes.append(
            {rs->value(0).toString(), rs->value(1).toString(), rs->value(2).toByteArray()});
    rs->finish();
    return botoes;
}

std::optional<QList<LinhaConjunto>> CarregarProdutosConjunto(db::Connection& conn,
                                                             const QString& nivelEmenta,
                                                             const QString& conjunto) {
    const NivelProdutos nivel = nivelProdutos(nivelEmenta);
    auto rs = conn.exec(
        QStringLiteral("select p.Codigo,p.Descricao,n.Descricao,f.NumRegisto,f.DataInicial,"
                       "f.DataFinal from Produtos p left join ") +
            nivel.tabela + QStringLiteral(" n on n.Codigo=p.") + nivel.coluna +
            QStringLiteral(" left join ProdutosFacturaREST f on f.Codigo=? and f.Produto=p.Codigo "
                           "order by p.") +
            nivel.coluna + QStringLiteral(",p.Descricao,p.Codigo"),
        {conjunto});
    if (!rs) return std::nullopt;
    QList<LinhaConjunto> linhas;
    while (rs->next()) {
        LinhaConjunto l;
        l.produto = rs->value(0).toString();
        l.descricao = rs->value(1).toString();
        l.nivel = rs->value(2).toString();
        l.marcado = !conjunto.isEmpty() && !rs->value(3).isNull();
        if (l.marcado) {
            l.dataInicial = rs->value(4).toString();
            l.dataFinal = rs->value(5).toString();
        }
        linhas.append(l);
    }
    rs->finish();
    return linhas;
}

std::optional<ConjuntoProdutos> LerConjunto(db::Connection& conn, const QString& codigo) {
    const auto r = conn.firstRow(
        QStringLiteral("select Descricao,DataInicial,DataFinal from ProdutosFacturaREST where "
                       "Codigo=? order by NumRegisto limit 1"),
        {codigo});
    if (!r) return std::nullopt;
    return ConjuntoProdutos{codigo, r->value(0).toString(), r->value(1).toString(),
                            r->value(2).toString()};
}

QString ProximoConjunto(db::Sessao& sessao) {
    return db::ProximoCodigoNumerico(sessao, QStringLiteral("ProdutosFacturaREST"),
                                     QStringLiteral("Codigo"));
}

bool GravarConjunto(db::Sessao& sessao, MessagePort& mensagens, const QString& utilizador,
                    const ConjuntoProdutos& c, const QStringList& marcados,
                    const QStringList& desmarcados) {
    if (c.codigo.trimmed().isEmpty() || c.descricao.trimmed().isEmpty() ||
        c.dataInicial.isEmpty() || c.dataFinal.isEmpty()) {
        mensagemErro(mensagens, QStringLiteral("Preencha o Código, a Descrição e as Datas!"));
        return false;
    }
    if (c.dataFinal < c.dataInicial) {
        mensagemErro(mensagens,
                     QStringLiteral("A Data Final não pode ser anterior à Data Inicial!"));
        return false;
    }
    db::Connection& conn = sessao.gConn;
    const QString agora = db::Get_DataSysServer_InsertIntoSQL(sessao, &conn);
    db::WriteTransaction t(conn);
    bool ok = t.active();
    for (const QString& produto : marcados) {
        if (!ok) break;
        const auto existe = conn.firstRow(
            QStringLiteral(
                "select NumRegisto from ProdutosFacturaREST where Codigo=? and Produto=?"),
            {c.codigo, produto});
        const QVariantList valores{c.descricao, c.dataInicial, c.dataFinal, utilizador,
                                   agora,       c.codigo,      produto};
        ok = conn.exec(existe ? QStringLiteral("update ProdutosFacturaREST set Descricao=?,"
                                               "DataInicial=?,DataFinal=?,Utilizador=?,DataSys=? "
                                               "where Codigo=? and Produto=?")
                              : QStringLiteral("insert into ProdutosFacturaREST (Descricao,"
                                               "DataInicial,DataFinal,Utilizador,DataSys,Codigo,"
                                               "Produto) values (?,?,?,?,?,?,?)"),
                       valores)
                 .has_value();
    }
    for (const QString& produto : desmarcados) {
        if (!ok) break;
        ok = conn.exec(
                     QStringLiteral("delete from ProdutosFacturaREST where Codigo=? and Produto=?"),
                     {c.codigo, produto})
                 .has_value();
    }
    if (ok) ok = t.commit();
    if (!ok) mensagemErro(mensagens, QStringLiteral("Erro ao gravar: ") + conn.lastError());
    return ok;
}

}  // namespace brasel::pos
