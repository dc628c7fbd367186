#include "lookups/definicoes_pesquisa.h"

#include <array>

namespace brasel::lookups {

namespace {

constexpr std::size_t kMestres = static_cast<std::size_t>(Mestre::ProdutosFacturaREST) + 1;

QString t(const char* texto) {
    return QString::fromUtf8(texto);
}

// The shape most master tables share: a code, a description, searched on both.
DefinicaoPesquisa codigoDescricao(const char* tabela, const char* mensagem, const char* titulo,
                                  const char* colunaCodigo = "Codigo",
                                  const char* colunaDescricao = "Descricao",
                                  const char* tituloDescricao = "Descrição") {
    DefinicaoPesquisa d;
    d.tabela = t(tabela);
    d.codigo = d.tabela + u'.' + t(colunaCodigo);
    d.descricao = d.tabela + u'.' + t(colunaDescricao);
    d.campos = {{d.codigo, t("Código")}, {d.descricao, t(tituloDescricao)}};
    d.colunas = t("Código,1500/") + t(tituloDescricao) + t(",4500/");
    d.seleccao = u' ' + d.codigo + u',' + d.descricao + t(" from ") + d.tabela + u' ';
    d.ordem = t(" Order by ") + d.codigo;
    d.mensagem = t(mensagem);
    d.titulo = t(titulo);
    return d;
}

// A party (customer or supplier) with its tax number and town beside the name.
DefinicaoPesquisa terceiro(const char* tabela, const char* colunaCodigo, const char* mensagem,
                           const char* titulo) {
    DefinicaoPesquisa d =
        codigoDescricao(tabela, mensagem, titulo, colunaCodigo, "Descricao", "Nome");
    const QString contribuinte = d.tabela + t(".Contribuinte");
    const QString local = d.tabela + t(".Local");
    d.campos.push_back({contribuinte, t("Contribuinte")});
    d.campos.push_back({local, t("Localidade")});
    d.colunas = t("Código,1500/Nome,4000/Contribuinte,1500/Localidade,2200/");
    d.seleccao = u' ' + d.codigo + u',' + d.descricao + u',' + contribuinte + u',' + local +
                 t(" from ") + d.tabela + u' ';
    return d;
}

// The other addresses of a party; the caller's filter names the party.
DefinicaoPesquisa moradas(const char* tabela, const char* titulo) {
    DefinicaoPesquisa d = codigoDescricao(tabela, "Morada Inexistente", titulo);
    const QString morada = d.tabela + t(".Morada");
    const QString local = d.tabela + t(".Local");
    d.campos.push_back({morada, t("Morada")});
    d.colunas = t("Código,1000/Descrição,2500/Morada,3500/Localidade,2000/");
    d.seleccao = u' ' + d.codigo + u',' + d.descricao + u',' + morada + u',' + local + t(" from ") +
                 d.tabela + u' ';
    return d;
}

DefinicaoPesquisa produtos() {
    DefinicaoPesquisa d =
        codigoDescricao("Produtos", "Produto Inexistente ou não pode ser movimentado nesta Opção",
                        "Pesquisa de Produtos");
    d.campos.push_back({t("Produtos.Situacao"), t("Situação")});
    d.campos.push_back({t("Produtos.DescricaoAgeMar"), t("Descrição Extra (A.M.)")});
    d.colunas = t("Código,1800/Descrição,3600/Sit.,800,C/Descrição Extra,2000/");
    d.seleccao =
        t(" Produtos.Codigo,Produtos.Descricao,Produtos.Situacao,Produtos.DescricaoAgeMar "
          "from Produtos ");
    return d;
}

DefinicaoPesquisa tipoMov() {
    DefinicaoPesquisa d = codigoDescricao(
        "TabTipoMov", "Tipo de Movimento Inexistente ou não pertence a estas condições",
        "Pesquisa de Tipos de Movimento", "codigo");
    d.campos.push_back({t("TabTipoMov.Modulo"), t("Módulo")});
    d.colunas =
        t("Código,1000/Descrição,4000/Últ. Número,1500,D/Módulo,1100,C/Clientes,1100,C/"
          "Fornec.,1100,C/Stock,1000,C/Caixa,1000,C/");
    d.seleccao =
        t(" TabTipoMov.codigo,TabTipoMov.Descricao,TabTipoMov.UltNumero,"
          "TabTipoMov.Modulo,TabTipoMov.AfectaCli,TabTipoMov.AfectaFor,"
          "TabTipoMov.AfectaSTK,TabTipoMov.AfectaCaixa from TabTipoMov ");
    return d;
}

DefinicaoPesquisa cambios() {
    DefinicaoPesquisa d = codigoDescricao("Cambios", "Câmbio Inexistente", "Pesquisa de Câmbios",
                                          "codigo", "Abreviatura", "Abreviatura");
    d.colunas = t("Código,1200/Abreviatura,1500/Câmbio,1600,D,VALOR/");
    d.seleccao = t(" Cambios.codigo,Cambios.Abreviatura,Cambios.valor from Cambios ");
    return d;
}

// Sets of products with a button on the order screen: one row per product, listed once a set.
DefinicaoPesquisa produtosFacturaREST() {
    DefinicaoPesquisa d =
        codigoDescricao("ProdutosFacturaREST", "Registo Inexistente", "Pesquisa de Registos");
    d.seleccao =
        t(" Distinct ProdutosFacturaREST.Codigo,ProdutosFacturaREST.Descricao "
          "from ProdutosFacturaREST ");
    return d;
}

std::array<DefinicaoPesquisa, kMestres> construir() {
    std::array<DefinicaoPesquisa, kMestres> d;
    const auto em = [&d](Mestre m) -> DefinicaoPesquisa& { return d[static_cast<std::size_t>(m)]; };
    em(Mestre::Documentos) = codigoDescricao("PDocumentos", "", "Pesquisa de Documentos");
    em(Mestre::Cambios) = cambios();
    em(Mestre::Produtos) = produtos();
    em(Mestre::Clientes) =
        terceiro("Clientes", "Codigo", "Cliente Inexistente ou não pode Movimentar nesta Opção!",
                 "Pesquisa de Clientes");
    em(Mestre::Fornecedores) = terceiro(
        "Fornece", "codigo", "Fornecedor Inexistente ou não pode Movimentar nestas Condições!",
        "Pesquisa de Fornecedores");
    em(Mestre::ClientesMoradas) = moradas("ClientesMoradas", "Moradas do Cliente");
    em(Mestre::FornecedoresMoradas) = moradas("ForneceMoradas", "Moradas do Fornecedor");
    em(Mestre::TipoMov) = tipoMov();
    em(Mestre::PagaComo) = codigoDescricao("PagaComo", "Forma de Pagamento Inexistente",
                                           "Pesquisa de Formas de Pagamento", "codigo");
    em(Mestre::Vendedores) =
        codigoDescricao("TabVendedor", "Vendedor Inexistente", "Pesquisa de Vendedores");
    em(Mestre::TabPostal) =
        codigoDescricao("TabPostal", "Código Postal Inexistente ", "Pesquisa de Códigos Postais");
    em(Mestre::OutUnidades) = codigoDescricao("OutUnidades", "Outra Unidade Inexistente",
                                              "Pesquisa de Outras Unidades", "Codigo", "descricao");
    em(Mestre::Observacoes) = codigoDescricao("HistoricoOBS", "", "Pesquisa de Observações",
                                              "Codigo", "Descricao", "Observação");
    em(Mestre::Armazens) = codigoDescricao("armazens", "Armazém Inexistente",
                                           "Pesquisa de Armazéns", "codigo", "linha1");
    em(Mestre::Localizacoes) =
        codigoDescricao("Localizacao", "Localização Inexistente", "Pesquisa de Localizações");
    em(Mestre::LotesTabela) =
        codigoDescricao("TabLotes", "Lote Inexistente (Produtos)", "Pesquisa de Lotes");
    em(Mestre::Utilizadores) =
        codigoDescricao("Utilizador", "Utilizador Inexistente", "Pesquisa de Utilizadores",
                        "Codigo", "Login", "Login");
    em(Mestre::Estacao) =
        codigoDescricao("TabEstacao", "Estação Inexistente", "Pesquisa de Estações");
    em(Mestre::Sexo) = codigoDescricao("TabSexo", "Sexo Inexistente", "Pesquisa de Sexos");
    em(Mestre::Referencia) =
        codigoDescricao("Referencias", "Referência Inexistente", "Pesquisa de Referências");
    em(Mestre::Modelo) = codigoDescricao("Modelos", "Modelo Inexistente", "Pesquisa de Modelos");
    em(Mestre::Cor) = codigoDescricao("Cores", "Cor Inexistente", "Pesquisa de Cores");
    em(Mestre::Tamanho) =
        codigoDescricao("Tamanhos", "Tamanho Inexistente", "Pesquisa de Tamanhos");
    em(Mestre::Comprimento) =
        codigoDescricao("Comprimentos", "Comprimento Inexistente", "Pesquisa de Comprimentos");
    em(Mestre::Caixas) = codigoDescricao("Caixas", "Caixa Inexistente", "Pesquisa de Caixas");
    em(Mestre::ImpressorasTaloes) = codigoDescricao("ImpTaloes", "Impressora de Talões Inexistente",
                                                    "Pesquisa de Impressoras de Talões");
    em(Mestre::Delegados) =
        codigoDescricao("Delegados", "Delegado Inexistente", "Pesquisa de Delegados");
    em(Mestre::ProdutosFacturaREST) = produtosFacturaREST();
    return d;
}

}  // namespace

const DefinicaoPesquisa& definicao(Mestre mestre) {
    static const std::array<DefinicaoPesquisa, kMestres> definicoes = construir();
    return definicoes[static_cast<std::size_t>(mestre)];
}

}  // namespace brasel::lookups
