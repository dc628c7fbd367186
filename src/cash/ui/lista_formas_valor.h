#pragma once

#include "cash/registo_caixa.h"
#include "common/currency.h"
#include "pos/teclado.h"

#include <QHash>
#include <QString>
#include <QTableWidget>

#include <optional>
#include <vector>

namespace brasel::cash {

// The payment methods with an amount each (lvwFormas): the internal number (hidden), the code,
// the method and the amount, typed in its cell or asked on the keypad. Amounts are shown without
// grouping, so that a cell reads back as it was typed; an empty cell is zero.
class ListaFormasValor : public QTableWidget {
    Q_OBJECT
  public:
    enum Coluna { NumInterno, Codigo, Descricao, Valor };

    // `tituloValor` heads the amount column; amounts are shown with `casadec` decimals.
    ListaFormasValor(const QString& tituloValor, int casadec, QWidget* pai);

    // One row per method with its amount in `valores` (by code; zero when absent), the first
    // one selected.
    void preenche(const std::vector<FormaPagamento>& formas,
                  const QHash<QString, Currency>& valores = {});
    void mostraValor(int linha, Currency valor);
    // Asks the selected row's amount on the keypad under the method's name and shows it.
    void pedeValor(pos::PedeValor& teclado);

    // A row's amount; nullopt when what its cell holds is not a number.
    std::optional<Currency> valor(int linha) const;
    // The sum of the amounts; nullopt while one is not a number or when it overflows.
    std::optional<Currency> total() const;
    // Every row as {code, amount} in list order; nullopt when an amount is not a number.
    template <class Linha>
    std::optional<std::vector<Linha>> valores() const {
        std::vector<Linha> lista;
        for (int i = 0; i < rowCount(); ++i) {
            const auto v = valor(i);
            if (!v) return std::nullopt;
            lista.push_back({item(i, Codigo)->text(), *v});
        }
        return lista;
    }

  Q_SIGNALS:
    // An amount changed, typed in its cell or shown by the program.
    void valorAlterado();

  private:
    int casadec_;
};

}  // namespace brasel::cash
