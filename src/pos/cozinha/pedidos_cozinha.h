#pragma once

#include "common/message_port.h"
#include "db/sessao.h"
#include "pos/cozinha/historico_copa.h"

#include <QList>
#include <QString>
#include <QStringList>
#include <QtGlobal>

#include <optional>

namespace brasel::pos::cozinha {

// Where a person types a note: the touch keyboard where there is one, a text box meanwhile,
// scripted answers in tests. nullopt when the person gave up.
class EditorTexto {
  public:
    virtual ~EditorTexto() = default;
    virtual std::optional<QString> editar(const QString& texto) = 0;
};

// The columns of the order list after NumRegisto, in the order the list shows them.
QStringList ColunasPedidosPorLibertar(const PedidoCopa& pedido, int casasQuantidade);

// What the order screen APedidos does with the waiting rows; each action returns whether it
// changed something, so the window knows to read the list again.
class PedidosCozinha {
  public:
    PedidosCozinha(db::Sessao& sessao, MessagePort& mensagens, EditorTexto& editor)
        : sessao_(sessao), mensagens_(mensagens), editor_(editor) {}

    // The waiting rows; an empty list when the database cannot be read.
    QList<PedidoCopa> lista();

    // Releases the checked rows for printing, after "Confirma a Impressão?". Nothing is asked
    // when the list is empty.
    bool liberta(const QList<qint64>& marcados, bool listaVazia);
    // Drops the checked rows, after "Confirma a Eliminação?".
    bool elimina(const QList<qint64>& marcados);
    // Edits the note of one row; the new note is returned once it is stored.
    std::optional<QString> editaObs(qint64 numRegisto, const QString& obs);

  private:
    db::Sessao& sessao_;
    MessagePort& mensagens_;
    EditorTexto& editor_;
};

}  // namespace brasel::pos::cozinha
