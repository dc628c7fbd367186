#pragma once

#include "common/currency.h"
#include "db/connection.h"

#include <QString>
#include <QVariant>

#include <cstdint>
#include <variant>
#include <vector>

namespace brasel::db {

// The 105 values of the line-posting procedure, one per MovProduto column of the same name.
// Callers fill them by name; what a field does not say stays empty or zero.
struct ValoresMovPro {
    QString Codigo;
    QString Descricao;
    QString Tipo;
    QString Numero;
    QString Ano;
    QString Data;  // "yyyy-mm-dd"
    Currency Preco;
    Currency QuantNormal;
    double QuantConvert = 0.0;  // a unit-conversion factor, not an amount
    Currency Cubicagem1;
    Currency Cubicagem2;
    Currency Cubicagem3;
    Currency QuantCubicagem;
    QString IvaTabela;
    Currency IvaTaxa;
    Currency ValorIva;
    Currency DescontoPer1;
    Currency DescontoPer2;
    Currency DescontoPer3;
    Currency DescontoPerGeral;
    Currency ValDescontoGeral;
    Currency ValDesconto1;
    Currency ValDesconto2;
    Currency ValDesconto3;
    Currency TotalDesconto;
    Currency ValDespesa;
    Currency DespesaPer;
    Currency ValorIliq;
    QString PVPAplicado;
    Currency PrecoAplicado;
    Currency PMCusto;
    Currency UPCompra;
    Currency UPCusto;
    Currency Portes;
    QString Terceiro;
    QString CliFor;
    QString Unidade;
    QString Vendedor;
    Currency ComissaoPer;
    QString Armazem;
    QString ArmazemDest;
    QString AfectaCli;
    QString AfectaFor;
    QString AfectaStk;
    QString Caixa;
    QString Aplic;
    QString TipoEncomenda;
    QString NumEncomenda;
    std::int64_t RegiEncomenda = 0;
    QString TipoGuia;
    QString NumGuia;
    QString DataGuia;
    QString Estacao;
    QString Sexo;
    QString Referencia;
    QString Modelo;
    QString Cor;
    QString Tamanho;
    QString Comprimento;
    QString Fornece;
    QString ObsLinha;
    QString Chave;
    QString ContaContab;
    QString Fechado = QStringLiteral("N");
    QString ProdDiversos;
    QString Localizacao;
    QString OutUniCod;
    Currency OutUniQuant;
    QString ImpTrans;
    QString Cambio;
    Currency ValCambio;
    int Sinal = 0;
    QString VendedorFixo;
    QString Utilizador;
    QString DataSys;  // "yyyy-mm-dd HH:MM:SS"; empty = the server's time at the insert
    QString Lote;
    QString DataValidade;
    QString DataFabrico;
    QString Integrou = QStringLiteral("N");
    Currency TaxaIRS;
    Currency IncidIRS;
    Currency ValorIRS;
    QString NumControlo;
    QString Rotura;
    int SelecFecha = 0;
    int Ordem_EDI = 0;
    QString DataDevolucao;
    QString Identifica;  // empty = a new unique key is made and written back here
    Currency Paletes;
    Currency Pecas;
    int Bonus = 0;
    QString DocPublicidade;
    QString DocAssinatura;
    QString NumOrdemAssiPub;
    QString Travine;
    Currency CalculoFacturaDesconto;
    QString Promocao;
    QString ArmazemTemporario;
    Currency ArmazemTemporario_QtyChecked;
    QString Referencia_Troca;
    Currency Armazem_PMCusto;
    Currency Armazem_UPCompra;
    Currency Armazem_UPCusto;
    Currency IvaCustos_Taxa;
    Currency IvaCustos_Valor;
};

// One parameter of the procedure: its column and the field that holds its value.
struct CampoMovPro {
    const char* coluna;
    std::variant<QString ValoresMovPro::*, Currency ValoresMovPro::*, int ValoresMovPro::*,
                 std::int64_t ValoresMovPro::*, double ValoresMovPro::*>
        campo;
};

// The parameters in the procedure's order (@Codigo .. @IvaCustos_Valor).
const std::vector<CampoMovPro>& camposMovPro();

// The value a field binds to its column: texts never null, amounts as decimal text.
QVariant valorParaColuna(const ValoresMovPro& valores, const CampoMovPro& campo);

// The company's line-posting procedure: inserts one MovProduto row with the given values on the
// caller's connection (inside its transaction, when one is open) and returns the new row's
// NumRegisto; below 1 means nothing was written (the error stays in conn.lastError()). An empty
// Identifica is given a new unique key, written back into `valores`; a key already used by
// another line is refused by the database.
std::int64_t MeteNoMovPro(Connection& conn, ValoresMovPro& valores);

}  // namespace brasel::db
