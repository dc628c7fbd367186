// Loyalty points: cards, earning rules, settings and the points history.
#include "db/schema/construtor.h"

namespace brasel::db::schema {

namespace {

// An earning rule: which line amounts make the incidence and how many points they give.
Def& regraPontos(Def& def) {
    return def.inteiro({"ValorIliq", "ValorDesc", "ValorIVA"})
        .montante({"PontosSomaQty", "PontosSubtraiQty", "PontosSomaValor", "PontosSubtraiValor",
                   "ValorCarrespondenteSoma", "ValorCarrespondenteSubtrai"});
}

Tabela pontosConfig() {
    // No row means "no settings": the point totals are then left unrounded.
    Def def("PontosConfig");
    def.inteiro({"PermiteAlterarCliente"})
        .texto({"ProdutoDesconto"})
        .inteiro({"PedeConfirmacaoLancamentos", "ControlaDataValidade", "Arrendodamento"})
        .montante({"ValorMinimoPontos"});
    for (int i = 1; i <= 5; ++i) {
        def.coluna(QStringLiteral("LimiteMinimo%1").arg(i), Tipo::Montante)
            .coluna(QStringLiteral("LimiteMaximo%1").arg(i), Tipo::Montante)
            .coluna(QStringLiteral("Desconto%1").arg(i), Tipo::Montante);
    }
    return regraPontos(def);
}

Tabela pontosClienteProduto() {
    Def def("PontosClienteProduto");
    def.texto(
        {"Cliente", "Produto", "Armazem", "DataInicial", "DataFinal", "HoraInicial", "HoraFinal"});
    return regraPontos(def).indice({"Cliente", "Produto"});
}

}  // namespace

void acrescentaPontos(QList<Tabela>& t) {
    t.append(pontosConfig());
    t.append(pontosClienteProduto());
    t.append(Def("PontosTiposCartoes")
                 .texto({"Codigo", "Descricao", "Periodicidade"})
                 .unico({"Codigo"}));
    t.append(Def("PontosCartoes")
                 .texto({"Cliente", "NumCartao", "TipoCartao", "Situacao", "DataValidadeInicial",
                         "DataValidadeFinal"})
                 .indice({"Cliente"})
                 .indice({"NumCartao"}));
    t.append(Def("PontosTiposClientes")
                 .texto({"Cliente", "TipoSoma", "TipoSubtrai", "TipoDevolve"})
                 .inteiro({"TipoControlo"})
                 .indice({"Cliente"}));
    t.append(Def("PontosHistorico")
                 .texto({"Terceiro", "CliFor", "NumCartao", "Tipo", "Numero", "Data", "Afecta"})
                 .montante({"ValorIncid", "Pontos"})
                 .inteiro({"LancManual"})
                 .texto({"Observa", "Identifica", "Utilizador", "DataSys"})
                 .indice({"Terceiro", "NumCartao"}));
    t.append(Def("PontosHistoricoProdutos")
                 .texto({"CliFor", "Terceiro", "NumCartao", "Tipo", "Numero", "Data", "Afecta",
                         "Produto"})
                 .montante({"ValorIncid", "Pontos"})
                 .indice({"Terceiro", "NumCartao"}));
    t.append(Def("PontosCreditos")
                 .texto({"CliFor", "Terceiro", "Data", "Tipo", "Numero", "NumCartao"})
                 .montante({"Pontos", "Credito"})
                 .texto({"Afecta", "Identifica", "Utilizador", "DataSys"})
                 .indice({"Terceiro"}));
}

}  // namespace brasel::db::schema
