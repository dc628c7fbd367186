#pragma once

#include "common/currency.h"
#include "db/connection.h"

#include <QString>

#include <optional>

namespace brasel::pos {

// What a registered barcode with interaction proposes: which fields are offered and their
// starting values.
struct PropostaPrecoQuant {
    bool comPreco = false;
    bool comQuantidade = false;
    Currency preco;
    Currency quantidade;
};

// What the person gave; a field not offered stays empty.
struct PrecoQuant {
    std::optional<Currency> preco;
    std::optional<Currency> quantidade;
};

// The interaction form of registered barcodes: shows the proposal for `codigo` and gives back
// the fields as confirmed.
class JanelaPrecoQuant {
  public:
    virtual ~JanelaPrecoQuant() = default;
    virtual PrecoQuant pedir(const QString& codigo, const PropostaPrecoQuant& proposta) = 0;
};

// The proposal of a registered barcode that asks for price or quantity; nullopt when the code
// is no such barcode (or the database cannot be read).
std::optional<PropostaPrecoQuant> PropostaDoCodigo(db::Connection& conn, const QString& codigo);

// Run by AdicionarProduto on every add with the code as entered: nothing given unless the code
// is a registered barcode with interaction, whose form is then shown.
PrecoQuant AbrirPrecoQuant(db::Connection& conn, JanelaPrecoQuant& janela, const QString& codigo);

}  // namespace brasel::pos
