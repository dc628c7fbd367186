#include "pos/colunas_tab.h"

#include "common/number_text.h"

namespace brasel::pos {

namespace {

ColunaTab coluna(const char* titulo, int twips, bool direita = false) {
    return {QString::fromUtf8(titulo), twips, direita};
}

}  // namespace

std::vector<ColunaTab> ColunasTab(const app::Parametros& param, int larguraQty,
                                  int larguraDescricao, int larguraPreco) {
    std::vector<ColunaTab> c{coluna("NumReg", 300),
                             coluna("Produto", 0),
                             coluna("Qty.", larguraQty, true),
                             coluna("Descrição", larguraDescricao),
                             coluna("Preço", larguraPreco, true),
                             coluna("Iva %", 600, true),
                             coluna("Desc.1", 600, true),
                             coluna("Desc.2", 600, true),
                             coluna("Desc.3", 600, true),
                             coluna("Desc.G.", 600, true),
                             coluna("Iva.Tab.", 600),
                             coluna("Preço V.P.", 1200, true),
                             coluna("Valor Desc.", 1200, true),
                             coluna("Valor Iva", 1200, true),
                             coluna("Valor Linha", 1200, true),
                             coluna("Vend.", 600, true),
                             coluna("Unid.", 600),
                             coluna("Obs. Linha", 2000),
                             coluna("Val.Desc.Geral", 2000, true)};
    // estacao, sexo, referencia, modelo, cor, tamanho: dimensions 1 to 6.
    for (int i = 1; i <= 6; ++i)
        c.push_back({param.NomesDimensoes[static_cast<std::size_t>(i)], 500, false});
    for (ColunaTab resto :
         {coluna("Forn.", 1000), coluna("Preço Aplicado", 2000, true), coluna("Guia", 1000),
          coluna("Núm. Guia", 1000), coluna("Dt Guia", 1000), coluna("Núm. Enc.", 1000),
          coluna("Núm. Regi.", 1000), coluna("Lote", 1000), coluna("Dt Fabrico", 1000),
          coluna("Dt.Validade", 1000), coluna("Qty * Preço", 1500, true),
          coluna("Tx.IRS", 1000, true), coluna("Inc.IRS", 1000, true),
          coluna("Val. IRS", 1000, true), coluna("Out. Impostos (Sujeito a IVA)", 1000, true),
          coluna("IVA Out.Impostos", 1000, true),
          coluna("Out. Impostos (Não Sujeito a IVA)", 1000, true)})
        c.push_back(resto);
    return c;
}

QStringList TextosLinha(const pricing::LinhaLista& l, const app::Parametros& param,
                        bool precoAplicado) {
    const int dec = param.casadec;
    auto v = [dec](Currency valor) { return NumeroParaTexto(valor, dec); };
    auto p = [dec](double percentagem) { return NumeroParaTexto(percentagem, dec); };
    const QString preco =
        NumeroParaTexto(precoAplicado ? l.precoAplicado : l.preco, param.casadecpreco);
    QStringList t{QString::number(l.numRegisto),
                  l.produto,
                  NumeroParaTexto(l.quantidade, param.casadecquant),
                  l.descricao,
                  preco,
                  p(l.ivaTaxa),
                  p(l.desc1),
                  p(l.desc2),
                  p(l.desc3),
                  p(l.descGeral),
                  l.ivaTabela,
                  l.precoVP.toPlainText(),
                  v(l.valorDesconto),
                  v(l.valorIva),
                  v(l.valorLinha),
                  l.vendedor,
                  l.unidade,
                  l.obsLinha,
                  v(l.valDescGeral)};
    for (const QString& atributo : l.atributos)
        t << atributo;
    t << l.fornecedor << NumeroParaTexto(l.precoAplicado, param.casadecpreco) << l.tipoGuia
      << l.numGuia << l.dataGuia << l.numEncomenda << l.regiEncomenda << l.lote << l.dataFabrico
      << l.dataValidade << v(l.qtyPreco) << p(l.taxaIRS) << v(l.incidIRS) << v(l.valorIRS)
      << v(l.outImpostosSujeitos) << v(l.ivaOutImpostos) << v(l.outImpostosNaoSujeitos);
    return t;
}

}  // namespace brasel::pos
