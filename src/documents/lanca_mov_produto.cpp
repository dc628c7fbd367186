#include "documents/lanca_mov_produto.h"

#include "app/registo_log.h"
#include "documents/custos_linha.h"
#include "documents/saldo_produto.h"
#include "pricing/leitura.h"

#include <QDate>

namespace brasel::documents {

namespace {

// The product columns the posting reads.
struct ProdutoLancamento {
    QString vendedorhabitual;
    bool ctrlexistencia = false;
    CustosProduto custos;
    int DiasDevolucao = 0;
    QString UnidadeVenda;
    bool loteObrigatorio = false;
};

std::optional<std::optional<ProdutoLancamento>> lerProduto(db::Connection& conn,
                                                           const QString& codigo) {
    auto rs = conn.exec(QStringLiteral("select vendedorhabitual, ctrlexistencia, precomediocusto, "
                                       "ultprecocompra, ultprecocusto, DiasDevolucao, "
                                       "UnidadeVenda, Lote from Produtos where Codigo=?"),
                        {codigo});
    if (!rs) return std::nullopt;
    if (!rs->next()) return std::optional<ProdutoLancamento>();
    ProdutoLancamento p;
    p.vendedorhabitual = rs->value(0).toString();
    p.ctrlexistencia = rs->value(1).toString().trimmed() == u"1";
    p.custos = {Currency::fromVariant(rs->value(2)), Currency::fromVariant(rs->value(3)),
                Currency::fromVariant(rs->value(4))};
    p.DiasDevolucao = rs->value(5).toInt();
    p.UnidadeVenda = rs->value(6).toString();
    p.loteObrigatorio = pricing::ligado(rs->value(7));
    return std::optional<ProdutoLancamento>(p);
}

// An exit (a sale, or the reversal of an entry) that is not an adjustment or a transfer.
bool saidaControlada(const db::ValoresMovPro& l) {
    const QString efeito = l.AfectaStk.trimmed().toUpper();
    return (efeito == u"S+" || efeito == u"E-") && !MovimentoInterno(l.Tipo, l.AfectaStk);
}

db::ChavesSaldo chavesDaLinha(const db::ValoresMovPro& l) {
    return {l.Codigo,      l.Armazem,    l.Localizacao, l.Lote,        l.Estacao,
            l.Sexo,        l.Referencia, l.Modelo,      l.Cor,         l.Tamanho,
            l.Comprimento, l.Fornece,    l.DataFabrico, l.DataValidade};
}

bool temEfeitoStock(const QString& afectaStk) {
    const QString efeito = afectaStk.trimmed().toUpper();
    return !efeito.isEmpty() && efeito != u"NA";
}

// Completes the line and checks it; the refusal, or Nenhuma when it may be posted.
RecusaLancamento prepara(app::Estado& estado, db::Connection& conn, db::ValoresMovPro& l) {
    const auto lido = lerProduto(conn, l.Codigo);
    if (!lido) return RecusaLancamento::Falhou;
    if (!*lido) return RecusaLancamento::ProdutoInexistente;
    const ProdutoLancamento& produto = **lido;

    if (l.Vendedor.trimmed().isEmpty()) l.Vendedor = produto.vendedorhabitual;
    if (produto.loteObrigatorio && temEfeitoStock(l.AfectaStk) && l.Lote.trimmed().isEmpty())
        return RecusaLancamento::SemLote;
    if (produto.ctrlexistencia && saidaControlada(l)) {
        const auto saldo = SaldoProduto_SP(estado, chavesDaLinha(l), &conn);
        if (!saldo) return RecusaLancamento::Falhou;
        if (*saldo <= Currency() || *saldo < l.QuantNormal) return RecusaLancamento::SemExistencia;
    }

    const auto param = LerParamCustos(conn);
    if (!param || !PreencheCustosLinha(estado, conn, *param, produto.custos, l))
        return RecusaLancamento::Falhou;
    const QDate data = QDate::fromString(l.Data, QStringLiteral("yyyy-MM-dd"));
    if (produto.DiasDevolucao > 0 && data.isValid())
        l.DataDevolucao =
            data.addDays(produto.DiasDevolucao).toString(QStringLiteral("yyyy-MM-dd"));
    if (l.Unidade.trimmed().isEmpty()) l.Unidade = produto.UnidadeVenda;
    l.DataSys.clear();
    l.Integrou = QStringLiteral("N");
    return RecusaLancamento::Nenhuma;
}

// The line's time (and its new barcode) once the row exists: the time is the server's, taken
// from the row's own DataSys.
bool completaLinha(db::Connection& conn, std::int64_t numRegisto, const QString& codigoBarras) {
    const QVariant num = QVariant::fromValue<qlonglong>(numRegisto);
    if (codigoBarras.isEmpty()) {
        return conn
            .exec(QStringLiteral(
                      "update MovProduto set Hora=substr(DataSys,12,8) where NumRegisto=?"),
                  {num})
            .has_value();
    }
    return conn
        .exec(QStringLiteral("update MovProduto set Hora=substr(DataSys,12,8), CodigoBarras=? "
                             "where NumRegisto=?"),
              {codigoBarras, num})
        .has_value();
}

}  // namespace

ResultadoLancamento LancaMovProduto(app::Estado& estado, db::ValoresMovPro& linha,
                                    const ExtrasLancamento& extras, db::Connection* conn) {
    db::Connection& c = estado.ligacao(conn);
    ResultadoLancamento resultado;
    pricing::TransacaoSeNecessaria transaccao(c);
    if (!transaccao.active()) return resultado;

    db::ValoresMovPro l = linha;
    try {
        resultado.recusa = prepara(estado, c, l);
    } catch (const CurrencyOverflow&) {
        resultado.recusa = RecusaLancamento::Falhou;
    }
    if (resultado.recusa != RecusaLancamento::Nenhuma) return resultado;

    const std::int64_t numRegisto = db::MeteNoMovPro(c, l);
    if (numRegisto < 1) {
        resultado.recusa = RecusaLancamento::Falhou;
        return resultado;
    }
    if (!completaLinha(c, numRegisto, extras.codigoBarras)) {
        // Inside the caller's transaction the row would otherwise stay until it ends.
        c.exec(QStringLiteral("delete from MovProduto where NumRegisto=?"),
               {QVariant::fromValue<qlonglong>(numRegisto)});
        resultado.recusa = RecusaLancamento::Falhou;
        return resultado;
    }
    if (!extras.textoLog.isEmpty()) {
        db::EntradaLog entrada;
        entrada.modulo = l.Aplic;
        entrada.accao = QStringLiteral("I");
        entrada.observa = extras.textoLog;
        entrada.descricao = l.Descricao;
        entrada.valor = l.ValorIliq;
        entrada.tipo = l.Tipo;
        entrada.numero = l.Numero;
        entrada.ano = l.Ano;
        entrada.produto = l.Codigo;
        entrada.terceiro = l.Terceiro;
        app::RegistaLogGeral(estado, entrada, &c);
    }
    if (!transaccao.commit()) {
        resultado.recusa = RecusaLancamento::Falhou;
        return resultado;
    }
    linha = l;
    resultado.NumRegisto = numRegisto;
    return resultado;
}

}  // namespace brasel::documents
