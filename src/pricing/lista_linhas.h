#pragma once

#include "common/currency.h"

#include <QString>

#include <array>
#include <cstdint>
#include <vector>

namespace brasel::pricing {

// One row of the order screen's line list: one member per column, in the list's order, holding
// the value the column shows. Amounts are amounts and percentages are doubles; the screen turns
// them into text with NumeroParaTexto.
struct LinhaLista {
    bool seleccionada = false;         // the check box (SelecFecha)
    std::int64_t numRegisto = 0;       // "NumReg"
    QString produto;                   // "Produto" (hidden)
    Currency quantidade;               // "Qty."
    QString descricao;                 // "Descrição"
    Currency preco;                    // "Preço"
    double ivaTaxa = 0.0;              // "Iva %"
    double desc1 = 0.0;                // "Desc.1"
    double desc2 = 0.0;                // "Desc.2"
    double desc3 = 0.0;                // "Desc.3"
    double descGeral = 0.0;            // "Desc.G."
    QString ivaTabela;                 // "Iva.Tab."
    Currency precoVP;                  // "Preço V.P."
    Currency valorDesconto;            // "Valor Desc."
    Currency valorIva;                 // "Valor Iva"
    Currency valorLinha;               // "Valor Linha"
    QString vendedor;                  // "Vend."
    QString unidade;                   // "Unid."
    QString obsLinha;                  // "Obs. Linha"
    Currency valDescGeral;             // "Val.Desc.Geral"
    std::array<QString, 6> atributos;  // estacao, sexo, referencia, modelo, cor, tamanho
    QString fornecedor;                // "Forn."
    Currency precoAplicado;            // "Preço Aplicado"
    QString tipoGuia;                  // "Guia"
    QString numGuia;                   // "Núm. Guia"
    QString dataGuia;                  // "Dt Guia"
    QString numEncomenda;              // "Núm. Enc."
    QString regiEncomenda;             // "Núm. Regi."
    QString lote;                      // "Lote"
    QString dataFabrico;               // "Dt Fabrico"
    QString dataValidade;              // "Dt.Validade"
    Currency qtyPreco;                 // "Qty * Preço"
    double taxaIRS = 0.0;              // "Tx.IRS"
    Currency incidIRS;                 // "Inc.IRS"
    Currency valorIRS;                 // "Val. IRS"
    Currency outImpostosSujeitos;      // "Out. Impostos (Sujeito a IVA)"
    Currency ivaOutImpostos;           // "IVA Out.Impostos"
    Currency outImpostosNaoSujeitos;   // "Out. Impostos (Não Sujeito a IVA)"
};

// One of the document's four VAT slots; empty while no code holds it.
struct SlotIva {
    QString tabIva;
    double taxa = 0.0;
    Currency incidencia;
    Currency desconto;
    Currency iva;

    bool vazio() const { return tabIva.isEmpty(); }
};

// The tab's totals as the screen shows them under the list.
struct TotaisDocumento {
    Currency mercadoria;   // kind 7
    Currency desconto;     // kind 8
    Currency iva;          // kind 9
    Currency naoSujeitos;  // other taxes not subject to VAT
    Currency incidIRS;
    Currency valorIRS;
    Currency total;  // kind 10, less the financial discount
    std::array<SlotIva, 4> slots;
    double descontoFinanceiroPerc = 0.0;
    Currency descontoFinanceiro;
};

// The order screen's list and totals: what the document arithmetic reads and writes.
struct ListaLinhas {
    std::vector<LinhaLista> linhas;
    TotaisDocumento totais;
};

}  // namespace brasel::pricing
