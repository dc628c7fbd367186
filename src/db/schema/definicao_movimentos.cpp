// Movements: document lines, headers, cash, the kitchen queue, other taxes and the
// accounting integration.
#include "db/schema/construtor.h"

namespace brasel::db::schema {

namespace {

// The columns of a document line, shared by the guide history, whose lines the tax engine
// reads as it reads MovProduto's.
Def linhasDocumento(const char* nome) {
    return Def(nome)
        .texto({"Codigo", "Descricao", "Tipo", "Numero", "Ano", "Data"})
        .montante({"Preco", "QuantNormal"})
        .coluna(QStringLiteral("QuantConvert"), Tipo::Quantidade10)
        .montante({"Cubicagem1", "Cubicagem2", "Cubicagem3", "QuantCubicagem"})
        .texto({"IvaTabela"})
        .montante({"IvaTaxa", "ValorIva", "DescontoPer1", "DescontoPer2", "DescontoPer3",
                   "DescontoPerGeral", "ValDescontoGeral", "ValDesconto1", "ValDesconto2",
                   "ValDesconto3", "TotalDesconto", "ValDespesa", "DespesaPer", "ValorIliq"})
        // The price tier the line was sold at.
        .texto({"PVPAplicado"})
        .montante({"PrecoAplicado", "PMCusto", "UPCompra", "UPCusto", "Portes"})
        .texto({"Terceiro", "CliFor", "Unidade", "Vendedor"})
        .montante({"ComissaoPer"})
        // Caixa: the register, or the type's cash effect while a tab's type is changed.
        .texto({"Armazem", "ArmazemDest", "AfectaCli", "AfectaFor", "AfectaStk", "Caixa", "Aplic",
                "TipoEncomenda", "NumEncomenda"})
        .coluna(QStringLiteral("RegiEncomenda"), Tipo::Inteiro64)
        .texto({"TipoGuia", "NumGuia", "DataGuia", "Estacao", "Sexo", "Referencia", "Modelo", "Cor",
                "Tamanho", "Comprimento", "Fornece", "ObsLinha", "Chave", "ContaContab", "Fechado",
                "ProdDiversos", "Localizacao", "OutUniCod"})
        .montante({"OutUniQuant"})
        .texto({"ImpTrans", "Cambio"})
        .montante({"ValCambio"})
        .inteiro({"Sinal"})
        // Utilizador: the login of the user who owns the tab.
        .texto({"VendedorFixo", "Utilizador", "DataSys", "Lote", "DataValidade", "DataFabrico",
                "Integrou"})
        .montante({"TaxaIRS", "IncidIRS", "ValorIRS"})
        .texto({"NumControlo", "Rotura"})
        .inteiro({"SelecFecha", "Ordem_EDI"})
        .texto({"DataDevolucao", "Identifica"})
        .montante({"Paletes", "Pecas"})
        .inteiro({"Bonus"})
        .texto({"DocPublicidade", "DocAssinatura", "NumOrdemAssiPub", "Travine"})
        // Summed and subtracted as an amount by the average-cost formulas.
        .montante({"CalculoFacturaDesconto"})
        .texto({"Promocao", "ArmazemTemporario"})
        .montante({"ArmazemTemporario_QtyChecked"})
        .texto({"Referencia_Troca"})
        .montante({"Armazem_PMCusto", "Armazem_UPCompra", "Armazem_UPCusto", "IvaCustos_Taxa",
                   "IvaCustos_Valor"})
        .texto({"Hora", "CodigoBarras", "IdentificaRelacionado"})
        .montante({"QtyBase"})
        .texto({"NumOrdemGuias"});
}

// A sales (or purchase) document header; (Tipo, Numero, Ano) names one document only.
Tabela cabecalhoDocumento(const char* nome) {
    return Def(nome)
        .texto({"Codigo", "Descricao", "Morada", "Local", "CodPostal", "Pais", "Deferencia",
                "Contribuinte", "Data", "Afecta", "Modulo", "Tipo", "Numero", "Ano", "Vendedor"})
        .montante({"comissaoper"})
        .texto({"PagaComo"})
        .inteiro({"condpag"})
        .texto({"datavenc"})
        .numeradas("Valor", 4, Tipo::Montante)
        .numeradas("Desconto", 4, Tipo::Montante)
        .numeradas("ValIva", 4, Tipo::Montante)
        .numeradas("TabIva", 4, Tipo::Texto)
        .numeradas("TaxIva", 4, Tipo::Montante)
        .numeradas("IvaIntra", 4, Tipo::Montante)
        .montante({"Valor", "Desconto", "IVA", "DescFinVal", "DescFinPer", "DescontoFinanceiroPerc",
                   "DescontoFinanceiro", "TotalDoc", "saldodoc", "IncidIRS", "ValorIRS"})
        // Cambio: the company's currency code (ParamGeral.cambiodef).
        .texto({"observaext", "Observa", "Carga", "Descarga", "Armazem", "integrou", "Cambio"})
        .montante({"ValCambio"})
        .texto({"Matricula"})
        .montante({"Entregou"})
        .texto({"Caixa", "Utilizador", "Cobrador", "CodigoMorada"})
        .montante({"Juro", "ImpSelo", "DescontoPP"})
        .texto({"DataSys", "Hash"})
        .inteiro({"HashControl"})
        .texto({"NotaCertificacao", "Hash_Quoril", "VersaoApp"})
        .montante({"Portes"})
        .unico({"Tipo", "Numero", "Ano"})
        .indice({"Codigo"});
}

Tabela movCaixa() {
    return Def("MovCaixa")
        .texto({"Caixa", "Data", "Afecta", "Tipo", "Numero", "Ano", "PagaComo", "Armazem"})
        .numeradas("valor", 4, Tipo::Montante)
        .numeradas("desconto", 4, Tipo::Montante)
        .numeradas("valiva", 4, Tipo::Montante)
        .numeradas("tabiva", 4, Tipo::Texto)
        .numeradas("taxiva", 4, Tipo::Montante)
        .montante({"ValorTotal"})
        .texto({"Cambio"})
        .montante({"ValCambio"})
        .texto({"Observa", "NomeEntidade", "integrou", "Utilizador", "DataSys"})
        // Old rows without a time are mended from DataSys by the cash journal.
        .coluna(QStringLiteral("Hora"), Tipo::Texto, "NULL")
        .unico({"Tipo", "Numero", "Ano", "PagaComo"})
        .indice({"Data", "Caixa"});
}

Tabela impostosMovTerceiro() {
    return Def("ImpostosMovTerceiro")
        .texto({"Tipo", "Numero", "Ano", "CliFor", "Terceiro", "CodigoImposto"})
        .montante({"Incidencia", "Imposto", "ValorIVA"})
        .numeradas("TabIVA", 4, Tipo::Texto)
        .numeradas("TaxaIVA", 4, Tipo::Montante)
        .numeradas("IncidIVA", 4, Tipo::Montante)
        .numeradas("ValIVA", 4, Tipo::Montante)
        .texto({"Utilizador", "DataSys"})
        .indice({"Tipo", "Numero", "Ano"});
}

}  // namespace

void acrescentaMovimentos(QList<Tabela>& t) {
    t.append(linhasDocumento("MovProduto")
                 .unico({"Identifica"}, "Identifica<>''")
                 .indice({"Terceiro", "CliFor", "Numero", "Fechado"})
                 .indice({"Tipo", "Numero", "Ano"})
                 .indice({"Codigo", "Data"})
                 .indice({"Codigo", "Localizacao"})
                 .indice({"Data"}));
    t.append(linhasDocumento("HistoricoGuias").indice({"Identifica"}));
    t.append(Def("ProdutosPacksHistorico")
                 .texto({"Tipo", "numero", "Ano", "CliFor", "Terceiro", "Produto", "Identifica"})
                 .montante({"Quantidade"})
                 .indice({"Identifica"}));
    t.append(Def("MovProduto_Ligacoes")
                 .texto({"Origem_Tipo", "Origem_Numero", "Origem_Data", "Origem_Identifica",
                         "Destino_Tipo", "Destino_Numero", "Destino_Data", "Destino_Identifica"})
                 .montante({"Quantidade"})
                 .indice({"Destino_Identifica"}));
    t.append(cabecalhoDocumento("MovCliente"));
    t.append(cabecalhoDocumento("MovFornece"));
    t.append(movCaixa());
    t.append(Def("RegistoCaixa")
                 .texto({"Caixa", "Data", "PagaComo"})
                 .montante({"Valor"})
                 .texto({"Utilizador", "DataSys"})
                 .unico({"Caixa", "Data", "PagaComo"}));
    // Utilizador: the login of the user who ordered.
    t.append(Def("HistoricoCopa")
                 .texto({"Produto", "Descricao"})
                 .montante({"Quantidade"})
                 .texto({"Cliente", "ObsLinha"})
                 .inteiro({"PodeImprimir"})
                 .texto({"Utilizador", "DataSys", "ANULACAO"})
                 .indice({"PodeImprimir"}));
    t.append(Def("ImpostosMovProduto")
                 .texto({"Tipo", "Numero", "Ano", "CliFor", "Terceiro", "Produto", "Codigo",
                         "Identifica", "CodigoImposto"})
                 .montante({"Incidencia", "Imposto", "ValorIVA", "TaxaIVA"})
                 .texto({"TabIVA", "IvaTabela", "Processa", "Act_UPC", "Utilizador", "DataSys"})
                 .indice({"Identifica"}));
    t.append(impostosMovTerceiro());
    t.append(Def("IntegraDiario")
                 .texto({"contacp", "contasp", "Tipo", "numero", "descricao"})
                 .montante({"valor"})
                 .texto({"afecta", "data", "diario", "ccusto", "codiva"})
                 .montante({"valiva", "taxaIva", "valRecap"})
                 .inteiro({"sinalRecap", "sinal", "Integracao"})
                 .texto({"dataIntegracao"})
                 .inteiro({"Reflete"})
                 .texto({"ligacao", "ObservaDoc", "Raminho", "Utilizador", "DataSys"}));
}

}  // namespace brasel::db::schema
