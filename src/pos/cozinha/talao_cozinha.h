#pragma once

#include "common/currency.h"
#include "pos/cozinha/historico_copa.h"

#include <QList>
#include <QString>
#include <QStringList>

namespace brasel::pos::cozinha {

// The text of kitchen and bar tickets, built apart from any printer so that it can be checked
// line by line.

enum class TamanhoLetra { Pequeno, Medio };

struct LinhaTalao {
    QString texto;
    TamanhoLetra tamanho = TamanhoLetra::Pequeno;

    friend bool operator==(const LinhaTalao&, const LinhaTalao&) = default;
};

// What one kitchen row prints. On the rows that follow the first of a ticket the table, the
// time and the waiter are empty, so only their product and note lines print.
struct ItemTalaoCozinha {
    QString produto;
    QString descricao;
    Currency quantidade;
    QString mesa;
    QString empregado;  // the waiter's user code
    QString dataHora;
    QString obs;
    bool linhasExtra = false;  // three more blank lines ahead (the first row of a ticket)
    bool anulacao = false;
};

// Rows of the queue that print together: consecutive rows of one table and the same kind
// (order or cancellation), in the order given.
QList<QList<PedidoCopa>> AgrupaTaloes(const QList<PedidoCopa>& pedidos);

// The item of row `indice` of a ticket; `empregado` is the waiter's code, printed on the first.
ItemTalaoCozinha ItemDoTalao(const QList<PedidoCopa>& talao, qsizetype indice,
                             const QString& empregado);

// The lines of a kitchen row on the serial printer: the note cut at 29 characters, and the
// cancellation frame closed after the row.
QList<LinhaTalao> LinhasTalaoCozinhaSerie(const ItemTalaoCozinha& item);

// The same row on a page printer: the note split into at most five lines, and no closing line.
QStringList LinhasTalaoCozinhaWindows(const ItemTalaoCozinha& item);

// The lines of a bar ticket (one line of a tab); the feed, cut and reset follow them.
QStringList LinhasTalaoBar(const QString& mesa, Currency quantidade, const QString& descricao,
                           bool linhasExtra);

}  // namespace brasel::pos::cozinha
