// Master data: shops, registers, currencies, parties, products, taxes, document types,
// price agreements and the small code tables the lookups search.
#include "db/schema/construtor.h"

namespace brasel::db::schema {

namespace {

// dec<valor>, arre<valor>, ... : a party's decimals and rounding mode for each kind of amount.
QList<Coluna> arredondamentosTerceiro() {
    QList<Coluna> colunas;
    for (const QString& sufixo : sufixosArredondamento()) {
        colunas.append({QStringLiteral("dec") + sufixo, Tipo::Inteiro, {}});
        colunas.append({QStringLiteral("arre") + sufixo, Tipo::Inteiro, {}});
    }
    return colunas;
}

Tabela clientes() {
    return Def("Clientes")
        .texto({"Codigo", "Descricao", "Morada", "Local", "codpost", "Pais", "Deferencia",
                "Contribuinte", "PagaComo"})
        .inteiro({"condpag"})
        .texto({"Cobrador", "Vendedor"})
        .inteiro({"Diversos"})
        .texto({"TipoCli"})
        .inteiro({"JaImprimiuTalao"})
        .imagem({"fotoNormal", "fotoCompleta"})
        .inteiro({"PrecoStock"})
        .montante({"Desconto1", "Desconto2", "Desconto3"})
        .texto({"DescontoTabelado"})
        .montante({"DescontoFinanceiroPERC", "DescontoPP", "TaxaAgravamento"})
        .inteiro({"FormulaIVA"})
        .texto({"Grupo", "Familia", "Subfamilia", "Impostos"})
        .colunas(arredondamentosTerceiro())
        .inteiro({"ClientePontos", "ControlaContaCorrente"})
        .montante({"PontosSomaValor", "ValorCarrespondenteSoma", "PontosSubtraiValor",
                   "ValorCarrespondenteSubtrai", "ValorMinimoPontos"})
        // Credit control, off by default: LimiteCredito 0 is no limit, ControlaVencidos 1 refuses
        // documents on account while the customer has overdue ones.
        .montante({"LimiteCredito"})
        .inteiro({"ControlaVencidos"})
        .unico({"Codigo"});
}

Tabela fornece() {
    return Def("Fornece")
        .texto(
            {"codigo", "Descricao", "PagaComo", "Morada", "Local", "codpost", "Pais", "Deferencia"})
        .inteiro({"condpag"})
        .texto({"Contribuinte"})
        .montante({"desconto1", "desconto2", "desconto3", "DescontoPP"})
        .texto({"Impostos"})
        .inteiro({"FormulaIVA", "FornecedorIRS"})
        .montante({"TaxaIRS_Integra"})
        .colunas(arredondamentosTerceiro())
        .unico({"codigo"});
}

Tabela produtos() {
    return Def("Produtos")
        .texto({"Codigo", "Descricao", "DescricaoAgeMar", "Situacao"})
        .imagem({"foto"})
        .texto({"Grupo", "Familia", "Subfamilia", "IvaTabVenda"})
        .montante({"IvaTaxaVenda", "IvaTaxaCompra"})
        .inteiro({"Medic"})
        .numeradas("PrecoVenda", 7, Tipo::Montante)
        .numeradas("DescontoVenda", 3, Tipo::Montante)
        .numeradas("DescontoCompra", 3, Tipo::Montante)
        .montante({"ultprecocompra", "ultprecocompraCIva", "ultprecocusto", "precomediocusto"})
        .texto({"DataUltCompra"})
        .inteiro({"DiasDevolucao"})
        .texto({"UnidadeVenda", "vendedorhabitual", "DescontoTabelado"})
        .inteiro({"ctrlexistencia"})
        // "1" at the order screen and "S" at the posting both mark a lot-controlled product.
        .texto({"Lote"})
        .inteiro({"Referencia", "Pesagem", "ImpCopa"})
        .montante({"portes"})
        .unico({"Codigo"})
        .indice({"Grupo"})
        .indice({"Familia"});
}

Tabela tabTipoMov() {
    return Def("TabTipoMov")
        // UltNumero holds the last number zero-filled to the width of document numbers.
        .texto({"codigo", "Descricao", "UltNumero", "Modulo", "AfectaCli", "AfectaFor", "AfectaSTK",
                "AfectaCaixa", "AfectaBan", "AfectaIVA"})
        .inteiro({"GuiaTransp", "ControloHash", "CopiaDocumentoOriginal"})
        .texto({"Autorizacao"})
        .inteiro({"abrecaixa", "Vias"})
        .texto({"ImpDoc"})
        .unico({"codigo"});
}

// The party's addresses beside its main one, listed by the address lookups.
Tabela moradas(const char* tabela, const char* terceiro) {
    return Def(tabela)
        .coluna(QString::fromLatin1(terceiro), Tipo::Texto)
        .texto({"Codigo", "Descricao", "Morada", "Local", "CodPostal"})
        .unico({terceiro, "Codigo"});
}

void acrescentaDescontos(QList<Tabela>& t) {
    t.append(Def("tabdescontos")
                 .texto({"cliente", "produto", "armazem", "Tipo", "DataInicial", "DataFinal",
                         "HoraIni", "HoraFim"})
                 .inteiro({"ControloQuant"})
                 .texto({"PrecoDesc"})
                 .montante({"PrecoDigit"})
                 .inteiro({"PrecoPro"})
                 .montante({"Desc1Digit", "Desc2Digit", "Desc3Digit"})
                 .inteiro({"DescCli", "DescPro"})
                 .texto({"Modelo"})
                 .montante({"DescontoValor"})
                 .indice({"cliente", "produto"}));
    t.append(Def("TabDescontosTabelados")
                 .texto({"Codigo"})
                 .montante({"Desconto1", "Desconto2", "Desconto3"})
                 .unico({"Codigo"}));
    t.append(Def("TabPatamaresDescontos")
                 .texto({"TipoPatamarCliente", "PatamarCliente", "CodigoDesconto", "TipoMovimento"})
                 .montante({"LimiteMinimoPreco", "LimiteMaximoPreco", "DescontoVenda1",
                            "DescontoVenda2", "DescontoVenda3"}));
    t.append(Def("TabDescontosFinanceiros")
                 .texto({"Cliente", "Produto"})
                 .montante({"DescontoFinanceiro"})
                 .unico({"Cliente", "Produto"}));
    t.append(Def("TabDescontosFinanceirosPatamares")
                 .texto({"GrupoCli", "FamiliaCli", "SubFamiliaCli", "GrupoPro", "FamiliaPro",
                         "SubFamiliaPro"})
                 .montante({"DescontoFinanceiro"}));
}

}  // namespace

void acrescentaMestres(QList<Tabela>& t) {
    t.append(
        Def("armazens")
            .texto({"codigo", "linha1", "linha2", "linha3", "linha4", "linha5", "linha6", "linha7"})
            .unico({"codigo"}));
    t.append(tabelaCodigoDescricao("Caixas"));
    t.append(Def("Cambios")
                 .texto({"codigo", "Abreviatura"})
                 .coluna(QStringLiteral("valor"), Tipo::Cambio)
                 .unico({"codigo"}));
    t.append(clientes());
    t.append(moradas("ClientesMoradas", "Cliente"));
    t.append(Def("ClientesTabIVA")
                 .texto({"Cliente", "TabIva", "TabIvaEquivalente"})
                 .unico({"Cliente", "TabIva"}));
    t.append(fornece());
    t.append(moradas("ForneceMoradas", "Fornecedor"));
    t.append(produtos());
    t.append(Def("ProdutosCodigosBarras")
                 .texto({"CodigoBarras", "ProdutoBase"})
                 .inteiro({"Interactividade", "ActivaPreco", "PrecoVenda"})
                 .montante({"PrecoDigitado"})
                 .inteiro({"ActivaQuantidade"})
                 .montante({"Quantidade"})
                 .unico({"CodigoBarras"}));
    t.append(Def("ProdutosEquivalentes")
                 .texto({"ProdutoBase", "ProdutoEquivalente"})
                 .inteiro({"Interactividade"}));
    t.append(Def("ProdutosFacturaREST")
                 .texto({"Codigo", "Produto", "Descricao", "DataInicial", "DataFinal", "Utilizador",
                         "DataSys"})
                 .unico({"Codigo", "Produto"}));
    t.append(Def("ProdutosImpostos")
                 .texto({"Produto", "Codigo"})
                 .montante({"ValorUnitario"})
                 .inteiro({"Incid_Iliquido", "Incid_Desconto"})
                 .montante({"Factor1", "Factor2", "Factor3"})
                 .inteiro({"ValorResulSujeitoIVA", "CalculaPrecoZero"})
                 .texto({"TabIva", "Processa", "Act_UPC"})
                 .numeradas("ConvertePV", 7, Tipo::Inteiro)
                 .unico({"Produto", "Codigo"}));
    t.append(Def("ProdutosOutrosDados")
                 .texto({"Produto", "Fornecedor", "RefProduto"})
                 .indice({"Fornecedor", "RefProduto"}));
    t.append(Def("Nomenclatura")
                 .texto({"ProdutoAcabado", "ProdutoPrima"})
                 .montante({"Quantidade"})
                 .texto({"armazem"})
                 .indice({"ProdutoAcabado"}));
    t.append(Def("OutUnidades").texto({"Codigo", "descricao"}).unico({"Codigo"}));
    t.append(Def("PagaComo")
                 .texto({"codigo", "Descricao"})
                 .imagem({"foto"})
                 .inteiro({"Reembolso"})
                 .unico({"codigo"}));
    // Zona: the tax region whose rates the code belongs to; one tab never mixes two regions.
    t.append(Def("TabIva")
                 .texto({"codigo"})
                 .montante({"Taxa"})
                 .inteiro({"Incluido"})
                 .montante({"TaxaInerente", "TaxaCustos"})
                 .texto({"Zona"})
                 .unico({"codigo"}));
    t.append(tabTipoMov());
    t.append(
        Def("TabSituacao").texto({"Codigo", "Descricao"}).inteiro({"Movimenta"}).unico({"Codigo"}));
    for (const char* nome :
         {"TabGrupoPro", "TabFamPro", "TabSubFamPro", "TabGrupoCli", "TabFamCli", "TabSubFamCli",
          "Localizacao", "TabPostal", "TabVendedor", "TabLotes", "HistoricoOBS", "Delegados",
          "TabEstacao", "TabSexo", "Referencias", "Modelos", "Cores", "Tamanhos", "Comprimentos"}) {
        t.append(tabelaCodigoDescricao(nome));
    }
    acrescentaDescontos(t);
}

}  // namespace brasel::db::schema
