#include "pos/imprime_doc_aberto.h"

#include "app/bloqueios.h"
#include "app/definicoes_posto.h"
#include "devices/talao_documento.h"
#include "documents/fecha_documentos_abertos.h"
#include "pricing/leitura.h"

#include <QDate>
#include <QHash>
#include <QSqlField>
#include <QSqlRecord>
#include <QStringList>
#include <QUuid>

#include <vector>

namespace brasel::pos {

namespace {

QString textoSemTipo() {
    return QStringLiteral(
        "Não tem o Tipo de Movimento previsto para este processo!\r\n"
        "Favor de alterar as Configurações e definir o Tipo de Movimento para o efeito.\r\n"
        "Nota: O referido Tipo de Movimento tem que ser criado no Montiva com as seguintes "
        "definições:\r\n"
        "  - Módulo -> FC;\r\n"
        "  - Afectação em Clientes -> NA;\r\n"
        "  - Afectação em Stocks -> NA;\r\n"
        "  - Afectação em Caixa -> NA;\r\n"
        "  - Afectação em Bancos -> NA;");
}

QString novaIdentifica() {
    return QUuid::createUuid().toString(QUuid::WithBraces).toUpper();
}

// Copies the rows of `tabela` that `condicao` selects, with some columns replaced by values.
// The column names come from the database's own description of the table.
bool copiaRegistos(db::Connection& conn, const QString& tabela,
                   const QHash<QString, QVariant>& substitutos, const QString& condicao,
                   const QVariantList& valoresCondicao) {
    const QSqlRecord colunas = conn.database().record(tabela);
    if (colunas.isEmpty()) return false;
    QStringList nomes;
    QStringList origem;
    QVariantList valores;
    for (int i = 0; i < colunas.count(); ++i) {
        const QString nome = colunas.fieldName(i);
        const QString chave = nome.toLower();
        if (chave == u"numregisto") continue;
        nomes << nome;
        if (substitutos.contains(chave)) {
            origem << QStringLiteral("?");
            valores << substitutos.value(chave);
        } else {
            origem << nome;
        }
    }
    valores.append(valoresCondicao);
    return conn
        .exec(QStringLiteral("insert into ") + tabela + QStringLiteral(" (") +
                  nomes.join(QLatin1Char(',')) + QStringLiteral(") select ") +
                  origem.join(QLatin1Char(',')) + QStringLiteral(" from ") + tabela +
                  QStringLiteral(" where ") + condicao,
              valores)
        .has_value();
}

struct LinhaConta {
    qint64 numRegisto = 0;
    QString identifica;
};

// The copies of the open lines under the bill's type, with the type's own effects.
bool copiaLinhas(Tab& tab, db::Connection& conn, const QString& tipo) {
    const auto efeitos = conn.firstRow(
        QStringLiteral("select AfectaCli,AfectaSTK from TabTipoMov where codigo=?"), {tipo});
    if (!efeitos) return false;
    auto q = conn.exec(QStringLiteral("select NumRegisto,Identifica from MovProduto where "
                                      "CliFor='C' and Terceiro=? and Numero='' and Fechado='N' "
                                      "and Utilizador=? order by NumRegisto"),
                       {tab.mesa().codigo, pricing::textoSql(tab.utilizador())});
    if (!q) return false;
    std::vector<LinhaConta> linhas;
    while (q->next())
        linhas.push_back({q->value(0).toLongLong(), q->value(1).toString()});
    q->finish();
    if (linhas.empty()) return false;
    for (const LinhaConta& l : linhas) {
        const QString identifica = novaIdentifica();
        const QHash<QString, QVariant> linha{
            {QStringLiteral("tipo"), tipo},
            {QStringLiteral("identifica"), identifica},
            {QStringLiteral("identificarelacionado"), pricing::textoSql(l.identifica)},
            {QStringLiteral("afectacli"), efeitos->value(0).toString()},
            {QStringLiteral("afectastk"), efeitos->value(1).toString()},
            {QStringLiteral("selecfecha"), 0}};
        if (!copiaRegistos(conn, QStringLiteral("MovProduto"), linha,
                           QStringLiteral("NumRegisto=?"),
                           {QVariant::fromValue<qlonglong>(l.numRegisto)}))
            return false;
        if (l.identifica.isEmpty()) continue;
        const QHash<QString, QVariant> impostos{{QStringLiteral("tipo"), tipo},
                                                {QStringLiteral("identifica"), identifica}};
        if (!copiaRegistos(conn, QStringLiteral("ImpostosMovProduto"), impostos,
                           QStringLiteral("Identifica=? and Numero=''"), {l.identifica}))
            return false;
    }
    return true;
}

}  // namespace

std::optional<QString> ImprimeDocAberto(Tab& tab) {
    app::Estado& estado = tab.estado();
    MessagePort& m = tab.mensagens();
    const QString tipo = app::posto::TipoImprimeMesa.ler().trimmed();
    if (tipo.isEmpty()) {
        m.mensagem(textoSemTipo(), Icone::Critico);
        return std::nullopt;
    }
    const auto hash = estado.gConn.firstRow(
        QStringLiteral("select COALESCE(ControloHash,0) from TabTipoMov where codigo=?"), {tipo});
    if (!hash || hash->value(0).toInt() == 0) {
        m.mensagem(QStringLiteral("O Tipo de Movimento ") + tipo +
                       QStringLiteral(" não está configurado para gerar Assinatura."),
                   Icone::Critico);
        return std::nullopt;
    }
    if (tab.mesa().codigo.isEmpty() || tab.lista().linhas.empty() ||
        !m.confirmar(QStringLiteral("Confirma a Impressão do Talão (M)?")))
        return std::nullopt;

    db::Connection& conn = estado.gConn;
    QString numero;
    {
        db::WriteTransaction transaccao(conn);
        if (transaccao.active() && app::BloqueiaDocumentos(conn) && copiaLinhas(tab, conn, tipo))
            numero = documents::FechaDocumentosAbertos(
                estado, m, conn,
                {u'C', tab.mesa().codigo, tipo, pricing::textoSql(tab.utilizador()), {}});
        if (numero.isEmpty() ||
            !conn.exec(QStringLiteral("update Clientes set JaImprimiuTalao=1 where Codigo=?"),
                       {tab.mesa().codigo}) ||
            !transaccao.commit()) {
            m.mensagem(QStringLiteral("Não foi possível efectuar o Processo.\r\n"
                                      "Favor de tentar novamente ou contacte o seu administrador"),
                       Icone::Informacao);
            return std::nullopt;
        }
    }
    tab.edicaoLivre = false;
    const QString ano = QString::number(QDate::currentDate().year());
    devices::ImprimeTalao(estado, m, tab.linhaSerie(), {tipo, numero, ano, false, 1, false});
    return numero;
}

}  // namespace brasel::pos
