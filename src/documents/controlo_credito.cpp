#include "documents/controlo_credito.h"

#include <QSqlQuery>

namespace brasel::documents {

namespace {

const QString kFalhaLeitura = QStringLiteral("Não foi possível verificar o Crédito do Cliente!");

// The type's settings that decide the check; nullopt when they cannot be read.
struct TipoCredito {
    bool contaCorrente = false;  // goes on the customer's account
    bool autorizacao = false;
};

std::optional<TipoCredito> lerTipo(db::Connection& conn, const QString& tipo) {
    auto q = conn.exec(
        QStringLiteral("select AfectaCli,COALESCE(GuiaTransp,0),Autorizacao from TabTipoMov "
                       "where codigo=?"),
        {tipo});
    if (!q) return std::nullopt;
    TipoCredito t;
    if (!q->next()) return t;  // an unknown type posts nothing to the account
    t.contaCorrente = q->value(0).toString().trimmed() == u"D+" && q->value(1).toInt() != 1;
    t.autorizacao = q->value(2).toString().trimmed() == u"1";
    return t;
}

struct ClienteCredito {
    Currency limite;
    bool controlaVencidos = false;
};

std::optional<ClienteCredito> lerCliente(db::Connection& conn, const QString& cliente) {
    auto q = conn.exec(QStringLiteral("select COALESCE(LimiteCredito,0),COALESCE(ControlaVencidos,"
                                      "0) from Clientes where Codigo=?"),
                       {cliente});
    if (!q) return std::nullopt;
    ClienteCredito c;
    if (!q->next()) return c;  // no row, nothing set
    c.limite = Currency::fromVariant(q->value(0));
    c.controlaVencidos = q->value(1).toInt() == 1;
    return c;
}

// Whether the customer has a debit document left unpaid past its due date; a document without
// a due date is never overdue.
std::optional<bool> temVencidos(db::Connection& conn, const QString& cliente, const QDate& hoje) {
    auto q = conn.exec(QStringLiteral("select count(*) from MovCliente where Codigo=? and "
                                      "TRIM(Afecta)='D+' and saldodoc>0 and datavenc<>'' and "
                                      "datavenc<?"),
                       {cliente, hoje.toString(QStringLiteral("yyyy-MM-dd"))});
    if (!q || !q->next()) return std::nullopt;
    return q->value(0).toLongLong() > 0;
}

// The customer's open balance: debit documents add their balance, credit ones subtract it.
// Summed here, not in SQL, so every amount stays exact.
std::optional<Currency> saldo(db::Connection& conn, const QString& cliente) {
    auto q = conn.exec(QStringLiteral("select TRIM(Afecta),saldodoc from MovCliente where "
                                      "Codigo=? and TRIM(Afecta) in ('D+','C+') and saldodoc<>0"),
                       {cliente});
    if (!q) return std::nullopt;
    Currency total;
    while (q->next()) {
        const Currency valor = Currency::fromVariant(q->value(1));
        if (q->value(0).toString() == u"D+")
            total += valor;
        else
            total -= valor;
    }
    return total;
}

}  // namespace

std::optional<RecusaCredito> VerificaCreditoCliente(db::Connection& conn, const QString& cliente,
                                                    Currency totalDoc, const QString& tipo,
                                                    const QDate& hoje, int casasDecimais) {
    const RecusaCredito falha{kFalhaLeitura, false};
    const auto t = lerTipo(conn, tipo);
    if (!t) return falha;
    if (!t->contaCorrente) return std::nullopt;
    const auto c = lerCliente(conn, cliente);
    if (!c) return falha;

    if (c->controlaVencidos) {
        const auto vencidos = temVencidos(conn, cliente, hoje);
        if (!vencidos) return falha;
        if (*vencidos)
            return RecusaCredito{QStringLiteral("O Cliente tem Documentos Vencidos por Liquidar!"
                                                "\r\nNão pode Encerrar este Documento!"),
                                 false};
    }

    if (c->limite > Currency{}) {
        try {
            const auto s = saldo(conn, cliente);
            if (!s) return falha;
            if (*s + totalDoc > c->limite)
                return RecusaCredito{
                    QStringLiteral("O Cliente ultrapassa o Limite de Crédito!\r\nLimite: ") +
                        c->limite.toText(casasDecimais) + QStringLiteral("  Saldo: ") +
                        s->toText(casasDecimais) + QStringLiteral("  Documento: ") +
                        totalDoc.toText(casasDecimais),
                    t->autorizacao};
        } catch (const CurrencyOverflow&) {
            return falha;
        }
    }
    return std::nullopt;
}

}  // namespace brasel::documents
