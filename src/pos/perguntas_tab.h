#pragma once

#include "common/currency.h"
#include "devices/balanca.h"
#include "pos/preco_quant.h"
#include "pos/teclado.h"

#include <QString>

#include <array>
#include <optional>

namespace brasel::pos {

// A lot chosen for a lot-controlled product, with its dates.
struct LoteEscolhido {
    QString lote;
    QString dataFabrico;
    QString dataValidade;
};

// The reference attributes chosen for a reference-managed product, with its supplier.
struct ReferenciaEscolhida {
    std::array<QString, 7>
        atributos;  // estacao, sexo, referencia, modelo, cor, tamanho, comprimento
    QString fornecedor;
};

// Everything the tab asks a person in the middle of its work: the order screen answers with its
// dialogs (keypad and keyboard, pickers, the barcode interaction form, the scale), the tests with
// scripted answers. nullopt is a question left without an answer (cancelled).
class PerguntasTab : public PedeValor,
                     public PedeTexto,
                     public JanelaPrecoQuant,
                     public devices::PortaBalanca {
  public:
    virtual ~PerguntasTab() = default;

    // The supervisor's password before a stored line is deleted or changed; false when it was
    // not given.
    virtual bool passwordSupervisor() = 0;
    // The table picker: the chosen table's code.
    virtual std::optional<QString> mesa() = 0;
    // The movement type picker: the chosen type's code.
    virtual std::optional<QString> tipoMovimento() = 0;
    // The lot of a lot-controlled product, knowing what the tab already holds of it.
    virtual std::optional<LoteEscolhido> lote(const QString& produto, Currency jaLancado) = 0;
    // The reference attributes and supplier of a reference-managed product.
    virtual std::optional<ReferenciaEscolhida> referencia(const QString& produto) = 0;
};

}  // namespace brasel::pos
