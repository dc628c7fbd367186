#include "admin/assinaturas.h"

#include "admin/comandos.h"
#include "common/currency.h"
#include "documents/assinatura.h"

namespace brasel::admin {

namespace {

struct Cabecalhos {
    const char* tabela;
    const char* prefixo;  // how a chain of the table is named in the report
};
constexpr Cabecalhos kCabecalhos[] = {
    {"MovCliente", "Tipo"},
    {"MovFornece", "Fornecedores, tipo"},
};

}  // namespace

std::optional<ResultadoCadeias> verificarCadeias(db::Connection& conn,
                                                 const documents::ChaveRsa& chave) {
    ResultadoCadeias r;
    for (const Cabecalhos& c : kCabecalhos) {
        auto q = conn.exec(QStringLiteral("select Tipo, Ano, Numero, COALESCE(Data,''), "
                                          "COALESCE(DataSys,''), TotalDoc, COALESCE(Hash,''), "
                                          "COALESCE(HashControl,0) from ") +
                           QString::fromLatin1(c.tabela) +
                           QStringLiteral(" order by Tipo, Ano, Numero"));
        if (!q) return std::nullopt;
        QString tipo;
        QString ano;
        QString anterior;
        bool quebrada = false;
        bool primeira = true;
        while (q->next()) {
            const QString t = q->value(0).toString();
            const QString a = q->value(1).toString();
            if (primeira || t != tipo || a != ano) {
                primeira = false;
                tipo = t;
                ano = a;
                anterior.clear();
                quebrada = false;
                ++r.cadeias;
            }
            const QString numero = q->value(2).toString();
            const QString hash = q->value(6).toString();
            if (!quebrada && (q->value(7).toInt() == 1 || !hash.isEmpty())) {
                ++r.documentos;
                const auto texto = documents::TextoAssinatura(
                    q->value(3).toString(), q->value(4).toString(), tipo, numero,
                    Currency::fromVariant(q->value(5)), anterior);
                if (!texto || !chave.confere(*texto, hash)) {
                    quebrada = true;
                    r.quebras << QStringLiteral("%1 %2 %3: documento %4 não confere")
                                     .arg(QString::fromUtf8(c.prefixo), tipo, ano, numero);
                }
            }
            anterior = hash;
        }
    }
    return r;
}

int gerarChave(const Pedido& pedido, Consola& consola) {
    const QString ficheiro = pedido.opcao(QStringLiteral("file"));
    QString erro;
    if (!documents::GeraChave(ficheiro, &erro)) {
        consola.erros << erro << Qt::endl;
        return kFalha;
    }
    consola.saida
        << QStringLiteral("Chave de assinatura gerada em %1 (só o dono a pode ler).").arg(ficheiro)
        << Qt::endl
        << QStringLiteral("Chave pública em %1.").arg(documents::ficheiroPemPublico(ficheiro))
        << Qt::endl;
    return kSucesso;
}

int verificarAssinaturas(const Pedido& pedido, const db::ServerAddress& servidor,
                         const db::schema::Credenciais& credenciais, const QString& empresa,
                         Consola& consola) {
    const bool publica = pedido.tem(QStringLiteral("public"));
    if (publica == pedido.tem(QStringLiteral("key"))) {
        consola.erros << QStringLiteral(
                             "Indique a chave pública (--public) ou o ficheiro da "
                             "chave (--key), um só.")
                      << Qt::endl;
        return kUtilizacao;
    }
    const QString ficheiro =
        pedido.opcao(publica ? QStringLiteral("public") : QStringLiteral("key"));
    const auto chave = publica ? documents::ChaveRsa::doPemPublico(ficheiro)
                               : documents::ChaveRsa::doFicheiro(ficheiro);
    if (!chave) {
        consola.erros << QStringLiteral("Não foi possível ler a chave %1.").arg(ficheiro)
                      << Qt::endl;
        return kUtilizacao;
    }
    db::Connection conn;
    QString erro;
    if (!db::schema::abrirEmpresa(conn, servidor, credenciais, empresa, &erro)) {
        consola.erros << erro << Qt::endl;
        return kUtilizacao;
    }
    const auto r = verificarCadeias(conn, *chave);
    if (!r) {
        consola.erros << QStringLiteral("Não foi possível ler os documentos: ") << conn.lastError()
                      << Qt::endl;
        return kUtilizacao;
    }
    for (const QString& q : r->quebras)
        consola.erros << q << Qt::endl;
    if (!r->quebras.isEmpty()) {
        consola.erros << QStringLiteral("Empresa %1: %2 de %3 cadeias de assinaturas quebradas.")
                             .arg(empresa)
                             .arg(r->quebras.size())
                             .arg(r->cadeias)
                      << Qt::endl;
        return kFalha;
    }
    consola.saida << QStringLiteral("Empresa %1: %2 documentos assinados conferem, em %3 cadeias.")
                         .arg(empresa)
                         .arg(r->documentos)
                         .arg(r->cadeias)
                  << Qt::endl;
    return kSucesso;
}

}  // namespace brasel::admin
