#include "app/empresas.h"

#include "db/catalogo.h"
#include "db/connections.h"
#include "db/query_helpers.h"

namespace brasel::app {

namespace {

// Name, year and version of one company database, read over a connection of its own.
void lerDadosEmpresa(LinhaEmpresa& linha, const QString& nomeBase, const QString& servidor,
                     const QString& login, const QString& passwordCifrada) {
    db::Connection conn;
    QString password;
    if (!db::Abre_Connexao(conn, servidor, nomeBase, login, password, passwordCifrada,
                           linha.autenticacao, 30, 10)) {
        return;
    }
    if (const auto p = db::primeiraLinha(
            conn, QStringLiteral("select NomeEmpresa, Ano from ParamGeral limit 1"))) {
        linha.nome = p->value(0).toString().trimmed();
        linha.ano = p->value(1).toString().trimmed();
    }
    if (linha.nome.isEmpty()) {
        if (const auto a = db::primeiraLinha(
                conn,
                QStringLiteral("select linha1 from armazens where trim(coalesce(linha1,''))<>'' "
                               "order by codigo limit 1"))) {
            linha.nome = a->value(0).toString().trimmed();
        }
    }
    if (const auto v =
            db::primeiraLinha(conn, QStringLiteral("select Versao from Actualiza limit 1"))) {
        linha.versao = v->value(0).toString().trimmed();
    }
}

}  // namespace

QString Empresa_Validacoes::VerTamanhoDB(qint64 bytes) {
    return QString::number((bytes + 1024 * 1024 - 1) / (1024 * 1024)) + QStringLiteral(" Mb");
}

QList<LinhaEmpresa> Empresa_Validacoes::Carregar_Empresas_LVW(
    const QString& servidor, const QString& login, const QString& passwordCifrada,
    const QString& autenticacao, const QString& filtroNome, const QString& filtroAno) {
    QList<LinhaEmpresa> lista;
    db::Connection master;
    QString password;
    if (!db::Abre_Connexao(master, servidor, QStringLiteral("Master"), login, password,
                           passwordCifrada, autenticacao, 30, 10)) {
        return lista;
    }
    for (const QString& nomeBase : db::basesDadosEmpresa(master)) {
        LinhaEmpresa linha;
        linha.codigo = db::codigoEmpresa(nomeBase);
        linha.servidor = servidor;
        linha.login = login;
        linha.passwordCifrada = passwordCifrada;
        linha.autenticacao = autenticacao;
        const db::EstadoBaseDados estado = db::estadoBaseDados(master, nomeBase);
        linha.tamanho = VerTamanhoDB(estado.tamanhoBytes);
        if (estado.desligada) {
            linha.desligada = true;
            linha.nome = QStringLiteral("Desligada");
        } else {
            lerDadosEmpresa(linha, nomeBase, servidor, login, passwordCifrada);
            if (estado.soLeitura) {
                linha.soLeitura = true;
                linha.nome += QStringLiteral(" - (Só Leitura)");
            }
        }
        if (!filtroNome.isEmpty() && !linha.nome.contains(filtroNome, Qt::CaseInsensitive))
            continue;
        if (!filtroAno.isEmpty() && linha.ano != filtroAno) continue;
        lista.append(linha);
    }
    return lista;
}

}  // namespace brasel::app
