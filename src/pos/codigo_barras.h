#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "common/message_port.h"
#include "db/sessao.h"

#include <QString>

#include <optional>

namespace brasel::pos {

// How the company's scale and price labels are cut (the label columns of ParamGeral).
struct ParamCodigoBarras {
    // Fixed cut: code, then quantity digits.
    bool controlespecifico = false;
    int corte1 = 0;
    int corte2 = 0;
    int DIVISAO = 0;
    // Prefix labels: two characters, code, then price or quantity digits.
    bool controlOficial = false;
    QString Prefixo1Preco, Prefixo2Preco;
    int PrefixoPrecoCorte1 = 0;
    int PrefixoPrecoCorte2 = 0;
    int PrefixoPrecoDivisor = 0;
    QString Prefixo1Quant, Prefixo2Quant;
    int PrefixoQuantCorte1 = 0;
    int PrefixoQuantCorte2 = 0;
    int PrefixoQuantDivisor = 0;
    bool zerarproduto = false;
};

// The label settings of the company; nullopt when ParamGeral has no row or cannot be read.
std::optional<ParamCodigoBarras> LerParamCodigoBarras(db::Connection& conn);

// What a label carries: the product code, a value text ("1.25") and its kind: "Q" quantity,
// "P" price, "" none. `valido` is false when the value digits are not a number or a divisor is
// 0: such a label must not be used, since its digits would be taken as a plain quantity.
struct LeituraCodigo {
    QString produto;
    QString valor;
    QString tipo;
    bool valido = true;
};

LeituraCodigo LerCodigoBarras(const ParamCodigoBarras& param, const QString& codigo);
// The same with the company's settings; with no settings every output stays empty.
LeituraCodigo LerCodigoBarras(db::Connection& conn, const QString& codigo);

// A typed product code as the company writes its codes: with `zerarproduto` on, a number that
// is not a product code itself stands for the product whose code is that number filled with
// leading zeros (the shortest such code). Other texts come back trimmed.
QString Zerar_Produto_str(db::Connection& conn, const QString& codigo, bool zerarproduto);

// A typed code turned into a product code: a supplier's reference (when asked for), the
// company's conversion procedure, a product code, a registered barcode. A code that matches
// nothing comes back unchanged; adding it is then refused.
QString ConverteCodigo(db::Connection& conn, const QString& fornecedor, const QString& codigo,
                       bool usaFornecedor);

// The question of the order screen's code box.
inline constexpr const char* kPerguntaCodigo = "Digite o Código";
inline constexpr const char* kTituloPerguntaCodigo = "Recolha do Código do Produto";

// What the code box of the order screen hands to AdicionarProduto.
struct ProdutoLido {
    QString produto;      // the product code to add
    QString texto;        // the code as entered: registered barcodes may ask price and quantity
    Currency quantidade;  // pending quantity, 0 = none
    std::optional<Currency> preco;  // pending price, present when set (0 included)
    QString precario;               // the screen's price tier after the read
};

// The code typed or scanned in the order screen's code box. nullopt when there is nothing to add:
// a blank code, or a label that cannot be read (after its message).
std::optional<ProdutoLido> cmdImputCodigoBarras(app::Estado& estado, MessagePort& mensagens,
                                                const QString& codigo, const QString& precario);

}  // namespace brasel::pos
