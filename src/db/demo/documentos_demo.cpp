// The demo restaurant's document types: the sales documents, signed into their chains, the table
// bill printed from an open tab, and the pair that moves money between registers.
#include "db/demo/partes_demo.h"

namespace brasel::db::demo {

namespace {

struct TipoDocumento {
    const char* codigo;
    const char* descricao;
    const char* modulo;
    const char* afectaCli;
    const char* afectaStk;
    const char* afectaCaixa;
    int controloHash;
    int abreCaixa;
    int vias;
};

constexpr TipoDocumento kTipos[] = {
    {"VD", "Venda a Dinheiro", "FC", "S+", "S+", "R+", 1, 1, 1},
    {"FT", "Factura", "FC", "D+", "S+", "NA", 1, 0, 2},
    {"DV", "Devolução a Dinheiro", "FC", "S-", "S-", "R-", 1, 1, 1},
    {"NC", "Nota de Crédito", "FC", "C+", "S-", "NA", 1, 0, 2},
    // The table bill: no effect on the account, stock, till or bank.
    {"CM", "Consulta de Mesa", "FC", "NA", "NA", "NA", 1, 0, 1},
    {"TX-", "Transferência de Caixa (Saída)", "CA", "NA", "NA", "P+", 0, 0, 1},
    {"TX+", "Transferência de Caixa (Entrada)", "CA", "NA", "NA", "R+", 0, 0, 1},
};

}  // namespace

void escreveDocumentos(Escritor& e) {
    for (const TipoDocumento& t : kTipos) {
        e.inserir(QStringLiteral("TabTipoMov"),
                  {{QStringLiteral("codigo"), QString::fromUtf8(t.codigo)},
                   {QStringLiteral("Descricao"), QString::fromUtf8(t.descricao)},
                   {QStringLiteral("UltNumero"), QStringLiteral("00000000")},
                   {QStringLiteral("Modulo"), QString::fromUtf8(t.modulo)},
                   {QStringLiteral("AfectaCli"), QString::fromUtf8(t.afectaCli)},
                   {QStringLiteral("AfectaFor"), QStringLiteral("NA")},
                   {QStringLiteral("AfectaSTK"), QString::fromUtf8(t.afectaStk)},
                   {QStringLiteral("AfectaCaixa"), QString::fromUtf8(t.afectaCaixa)},
                   {QStringLiteral("AfectaBan"), QStringLiteral("NA")},
                   {QStringLiteral("GuiaTransp"), 0},
                   {QStringLiteral("ControloHash"), t.controloHash},
                   {QStringLiteral("CopiaDocumentoOriginal"), 0},
                   {QStringLiteral("abrecaixa"), t.abreCaixa},
                   {QStringLiteral("Vias"), t.vias}});
    }
}

}  // namespace brasel::db::demo
