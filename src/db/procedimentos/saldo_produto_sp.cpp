#include "db/procedimentos/saldo_produto_sp.h"

#include <QStringList>

#include <utility>
#include <vector>

namespace brasel::db {

namespace {

const QStringList& entradas() {
    static const QStringList codigos{QStringLiteral("E+"), QStringLiteral("S-"),
                                     QStringLiteral("AC+"), QStringLiteral("TL+")};
    return codigos;
}

const QStringList& saidas() {
    static const QStringList codigos{QStringLiteral("S+"), QStringLiteral("E-"),
                                     QStringLiteral("AC-"), QStringLiteral("TL-")};
    return codigos;
}

QString listaSql(const QStringList& codigos) {
    return QStringLiteral("'") + codigos.join(QStringLiteral("','")) + QStringLiteral("'");
}

// A key the balance is filtered on: a column of MovProduto and the value asked for.
using Chave = std::pair<const char*, QString>;

// The balance of the lines of `produto` matching every key. The warehouse is not a plain filter:
// a transfer ("TRA") leaves Armazem and enters ArmazemDest, so it counts in both warehouses with
// opposite signs, and not at all when no warehouse is asked for.
std::optional<Currency> saldo(Connection& conn, const QString& produto, const QString& armazem,
                              const std::vector<Chave>& chaves) {
    QVariantList valores;
    QString efeito = QStringLiteral(
                         "CASE WHEN AfectaStk IN (%1) THEN QuantNormal "
                         "WHEN AfectaStk IN (%2) THEN -QuantNormal ELSE 0 END")
                         .arg(listaSql(entradas()), listaSql(saidas()));
    QString filtro = QStringLiteral("Codigo=?");
    if (!armazem.isEmpty()) {
        efeito = QStringLiteral(
                     "CASE WHEN Armazem=? THEN %1 ELSE 0 END"
                     " + CASE WHEN AfectaStk='TRA' AND ArmazemDest=? THEN QuantNormal ELSE 0 END"
                     " - CASE WHEN AfectaStk='TRA' AND Armazem=? THEN QuantNormal ELSE 0 END")
                     .arg(efeito);
        valores << armazem << armazem << armazem;
        filtro += QStringLiteral(" and (Armazem=? or ArmazemDest=?)");
    }
    valores << produto;
    if (!armazem.isEmpty()) valores << armazem << armazem;
    for (const auto& [coluna, valor] : chaves) {
        filtro += QStringLiteral(" and %1=?").arg(QString::fromLatin1(coluna));
        valores << valor;
    }
    const auto linha = conn.firstRow(
        QStringLiteral("select COALESCE(SUM(%1),0) from MovProduto where %2").arg(efeito, filtro),
        valores);
    if (!linha) return std::nullopt;
    try {
        return Currency::fromVariant(linha->value(0));
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
}

bool qualquer(const QString& valor) {
    return valor.isEmpty() || valor == u"%";
}

}  // namespace

int SinalStock(const QString& afectaStk) {
    const QString codigo = afectaStk.trimmed().toUpper();
    if (entradas().contains(codigo)) return 1;
    if (saidas().contains(codigo)) return -1;
    return 0;
}

std::optional<Currency> SaldoProduto(Connection& conn, const ChavesSaldo& c) {
    std::vector<Chave> chaves;
    const std::pair<const char*, const QString*> todas[] = {
        {"Localizacao", &c.Localizacao},
        {"Lote", &c.Lote},
        {"Estacao", &c.Estacao},
        {"Sexo", &c.Sexo},
        {"Referencia", &c.Referencia},
        {"Modelo", &c.Modelo},
        {"Cor", &c.Cor},
        {"Tamanho", &c.Tamanho},
        {"Comprimento", &c.Comprimento},
        {"Fornece", &c.Fornece},
    };
    for (const auto& [coluna, valor] : todas) {
        if (!qualquer(*valor)) chaves.emplace_back(coluna, *valor);
    }
    return saldo(conn, c.Produto, qualquer(c.Armazem) ? QString() : c.Armazem, chaves);
}

std::optional<Currency> SaldoProduto_Pro(Connection& conn, const QString& Produto) {
    return saldo(conn, Produto, {}, {});
}

std::optional<Currency> SaldoProduto_ProLote(Connection& conn, const QString& Produto,
                                             const QString& Lote) {
    return saldo(conn, Produto, {}, {{"Lote", Lote}});
}

std::optional<Currency> SaldoProduto_ProArm(Connection& conn, const QString& Produto,
                                            const QString& Armazem) {
    return saldo(conn, Produto, Armazem, {});
}

std::optional<Currency> SaldoProduto_ProArmLoc(Connection& conn, const QString& Produto,
                                               const QString& Armazem, const QString& Localizacao) {
    return saldo(conn, Produto, Armazem, {{"Localizacao", Localizacao}});
}

std::optional<Currency> SaldoProduto_ProArmLocLote(Connection& conn, const QString& Produto,
                                                   const QString& Armazem,
                                                   const QString& Localizacao,
                                                   const QString& Lote) {
    return saldo(conn, Produto, Armazem, {{"Localizacao", Localizacao}, {"Lote", Lote}});
}

std::optional<Currency> SaldoProduto_ProArmLocLote_DtFabricoValidade(
    Connection& conn, const QString& Produto, const QString& Armazem, const QString& Localizacao,
    const QString& Lote, const QString& DataFabrico, const QString& DataValidade) {
    return saldo(conn, Produto, Armazem,
                 {{"Localizacao", Localizacao},
                  {"Lote", Lote},
                  {"DataFabrico", DataFabrico},
                  {"DataValidade", DataValidade}});
}

}  // namespace brasel::db
