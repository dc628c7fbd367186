#pragma once

// What the cash tests share: a document's cash movement, and its rows read
// back from MovCaixa.
#include "cash/lanca_mov_caixa.h"
#include "common/currency.h"
#include "db/connection.h"
#include "pricing/valores_teste.h"

#include <QString>

#include <map>

namespace brasel::cash::teste {

using pricing::teste::V;

// A cash sale of 12.30: 10.00 at 23% (VAT 2.30) in group 1, nothing in the others.
inline MovimentoCaixa vendaDinheiro(const QString& numero, const char* pagaComo = "NU") {
    MovimentoCaixa m;
    m.tipo = QStringLiteral("VD");
    m.numero = numero;
    m.data = QStringLiteral("2026-03-14");
    m.afecta = QStringLiteral("R+");
    m.pagaComo = QString::fromLatin1(pagaComo);
    m.valorTotal = V("12.30");
    m.valor[0] = V("10.00");
    m.valiva[0] = V("2.30");
    m.tabiva[0] = QStringLiteral("23");
    m.taxiva[0] = 23.0;
    m.observa = QStringLiteral("Facturação Rest");
    m.nomeEntidade = QStringLiteral("Mesa d'Ouro");
    return m;
}

// One MovCaixa row as the tests look at it.
struct LinhaCaixa {
    QString caixa;
    QString data;
    QString afecta;
    QString ano;
    QString armazem;
    Currency valor1;
    Currency desconto1;
    Currency valiva1;
    Currency valorTotal;
    QString cambio;
    Currency valCambio;
    QString nomeEntidade;
    QString integrou;
    QString hora;
};

// The rows of a document by payment method.
inline std::map<QString, LinhaCaixa> linhasCaixa(db::Connection& conn, const QString& tipo,
                                                 const QString& numero) {
    std::map<QString, LinhaCaixa> linhas;
    auto rs = conn.exec(
        QStringLiteral("select PagaComo, Caixa, Data, Afecta, Ano, Armazem, valor1, desconto1, "
                       "valiva1, ValorTotal, Cambio, ValCambio, NomeEntidade, integrou, Hora "
                       "from MovCaixa where Tipo=? and Numero=?"),
        {tipo, numero});
    while (rs && rs->next()) {
        linhas[rs->value(0).toString()] = {rs->value(1).toString(),
                                           rs->value(2).toString(),
                                           rs->value(3).toString(),
                                           rs->value(4).toString(),
                                           rs->value(5).toString(),
                                           Currency::fromVariant(rs->value(6)),
                                           Currency::fromVariant(rs->value(7)),
                                           Currency::fromVariant(rs->value(8)),
                                           Currency::fromVariant(rs->value(9)),
                                           rs->value(10).toString(),
                                           Currency::fromVariant(rs->value(11)),
                                           rs->value(12).toString(),
                                           rs->value(13).toString(),
                                           rs->value(14).toString()};
    }
    return linhas;
}

}  // namespace brasel::cash::teste
