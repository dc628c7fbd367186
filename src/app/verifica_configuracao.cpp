#include "app/verifica_configuracao.h"

#include "db/query_helpers.h"

namespace brasel::app {

namespace {

bool temLinhas(db::Connection& conn, const QString& sql, const QVariantList& valores = {}) {
    return db::primeiraLinha(conn, sql, valores).has_value();
}

QString mensagemUtilizador(const QString& codigo) {
    return QStringLiteral("Tem que Configurar o Utilizador -> ") + codigo + QStringLiteral(" !");
}

}  // namespace

bool VerificaConfiguracaoInicial(Estado& estado, MessagePort& mensagens) {
    db::Connection& conn = estado.gConn;
    auto falha = [&](const QString& texto, Icone icone = Icone::Informacao) {
        mensagens.mensagem(texto, icone);
        return false;
    };
    if (!temLinhas(conn, QStringLiteral("select 1 from localizacao limit 1"))) {
        return falha(QStringLiteral("Não tem Localizações definidas!"), Icone::Critico);
    }
    const Parametros& p = estado.param;
    if (p.cambiodef.trimmed().isEmpty())
        return falha(QStringLiteral("Não tem Câmbio de Moeda Nacional Definido!"));
    if (p.cambioeuro.trimmed().isEmpty())
        return falha(QStringLiteral("Não tem Câmbio de Moeda Europeia Definido!"));
    if (p.ano.trimmed().isEmpty()) return falha(QStringLiteral("Não tem o Ano Definido!"));
    if (p.mes.trimmed().isEmpty()) return falha(QStringLiteral("Não tem o Mês Definido!"));
    if (estado.gSimbolo.isEmpty()) return falha(QStringLiteral("Não tem o Simbolo Definido!"));
    if (estado.gArmazem.trimmed().isEmpty())
        return falha(QStringLiteral("Não tem o Armazém Definido!"));
    if (estado.gCaixa.trimmed().isEmpty())
        return falha(QStringLiteral("Não tem o Caixa Definido!"));
    if (!temLinhas(conn, QStringLiteral("select 1 from armazens limit 1"))) {
        return falha(QStringLiteral("Tem que definir os Armazens!"));
    }
    if (!temLinhas(conn, QStringLiteral("select 1 from utilconfgeral limit 1"))) {
        return falha(QStringLiteral("Tem que Configurar os Utilizadores!"));
    }
    const QString semConfiguracao = QStringLiteral(
        "select codigo from utilizador where codigo<>'00' and not exists "
        "(select 1 from utilconfgeral where utilconfgeral.utilizador=utilizador.codigo) "
        "order by codigo limit 1");
    if (estado.gUtilizador == QStringLiteral("01")) {
        if (const auto linha = db::primeiraLinha(conn, semConfiguracao)) {
            return falha(mensagemUtilizador(linha->value(0).toString()));
        }
    }
    if (!temLinhas(conn, QStringLiteral("select 1 from utilconfgeral where utilizador=?"),
                   {estado.gUtilizador})) {
        return falha(mensagemUtilizador(estado.gUtilizador));
    }
    return true;
}

}  // namespace brasel::app
