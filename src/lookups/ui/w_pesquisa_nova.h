#pragma once

#include "db/sessao.h"
#include "lookups/pesquisa.h"

#include <QDialog>
#include <QPointer>

#include <optional>

class QComboBox;
class QLabel;
class QLineEdit;
class QTreeWidget;

namespace brasel::lookups {

// The one search window of the lookups: a field chosen among the request's captions, a key that
// the chosen field must begin with ("*" stands for anything), the number of rows to list, and
// the list. A row is chosen with a double touch or Seleccionar; Cancelar chooses nothing. It
// searches as it opens, with the key it was given.
class WPesquisaNOVA : public QDialog {
    Q_OBJECT

  public:
    WPesquisaNOVA(db::Sessao& sessao, PedidoPesquisa pedido, QWidget* pai = nullptr);

    // Shows the request modally; the chosen row's code and description.
    static std::optional<LinhaEscolhida> Pesquisa(db::Sessao& sessao, const PedidoPesquisa& pedido,
                                                  QWidget* pai = nullptr);

    // The current row's first and second column, when there is one.
    std::optional<LinhaEscolhida> escolhida() const;

    // Runs the search with what the boxes hold.
    void pesquisar();

  private:
    void seleccionar();

    db::Sessao& sessao_;
    PedidoPesquisa pedido_;
    QComboBox* cmbCampo_;
    QLineEdit* txtChave_;
    QLineEdit* txtLimite_;
    QTreeWidget* lvwPesquisa_;
    QLabel* lblRegistos_;
};

// The search port of the windows: each request opens WPesquisaNOVA over `pai`.
class PesquisaEmJanela : public JanelaPesquisa {
  public:
    PesquisaEmJanela(db::Sessao& sessao, QWidget* pai) : sessao_(sessao), pai_(pai) {}
    std::optional<LinhaEscolhida> Pesquisa(const PedidoPesquisa& pedido) override;

  private:
    db::Sessao& sessao_;
    QPointer<QWidget> pai_;
};

}  // namespace brasel::lookups
