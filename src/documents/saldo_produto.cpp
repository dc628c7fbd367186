#include "documents/saldo_produto.h"

namespace brasel::documents {

namespace {

bool dado(const QString& valor) {
    return !valor.trimmed().isEmpty() && valor != u"%";
}

}  // namespace

ProcedimentoSaldo EscolheProcedimentoSaldo(const db::ChavesSaldo& c) {
    for (const QString* atributo : {&c.Estacao, &c.Sexo, &c.Referencia, &c.Modelo, &c.Cor,
                                    &c.Tamanho, &c.Comprimento, &c.Fornece}) {
        if (dado(*atributo)) return ProcedimentoSaldo::SaldoProduto;
    }
    const bool armazem = dado(c.Armazem);
    const bool localizacao = dado(c.Localizacao);
    const bool lote = dado(c.Lote);
    if (armazem && localizacao && lote) {
        return dado(c.DataFabrico) && dado(c.DataValidade)
                   ? ProcedimentoSaldo::ProArmLocLote_DtFabricoValidade
                   : ProcedimentoSaldo::ProArmLocLote;
    }
    if (armazem && localizacao) return ProcedimentoSaldo::ProArmLoc;
    if (armazem && !lote) return ProcedimentoSaldo::ProArm;
    if (lote && !armazem && !localizacao) return ProcedimentoSaldo::ProLote;
    if (!armazem && !localizacao && !lote) return ProcedimentoSaldo::Pro;
    // A lot in a warehouse without a location, or a location without a warehouse: no narrower
    // procedure takes these keys, and dropping one would give another product's balance.
    return ProcedimentoSaldo::SaldoProduto;
}

std::optional<Currency> SaldoProduto_SP(db::Sessao& sessao, const db::ChavesSaldo& c,
                                        db::Connection* conn) {
    db::Connection& ligacao = sessao.ligacao(conn);
    switch (EscolheProcedimentoSaldo(c)) {
        case ProcedimentoSaldo::SaldoProduto:
            return db::SaldoProduto(ligacao, c);
        case ProcedimentoSaldo::Pro:
            return db::SaldoProduto_Pro(ligacao, c.Produto);
        case ProcedimentoSaldo::ProLote:
            return db::SaldoProduto_ProLote(ligacao, c.Produto, c.Lote);
        case ProcedimentoSaldo::ProArm:
            return db::SaldoProduto_ProArm(ligacao, c.Produto, c.Armazem);
        case ProcedimentoSaldo::ProArmLoc:
            return db::SaldoProduto_ProArmLoc(ligacao, c.Produto, c.Armazem, c.Localizacao);
        case ProcedimentoSaldo::ProArmLocLote:
            return db::SaldoProduto_ProArmLocLote(ligacao, c.Produto, c.Armazem, c.Localizacao,
                                                  c.Lote);
        case ProcedimentoSaldo::ProArmLocLote_DtFabricoValidade:
            return db::SaldoProduto_ProArmLocLote_DtFabricoValidade(ligacao, c.Produto, c.Armazem,
                                                                    c.Localizacao, c.Lote,
                                                                    c.DataFabrico, c.DataValidade);
    }
    return std::nullopt;
}

}  // namespace brasel::documents
