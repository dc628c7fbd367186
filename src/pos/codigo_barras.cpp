#include "pos/codigo_barras.h"

#include "db/procedimentos/converte_codigo_produto.h"
#include "db/query_helpers.h"

#include <QSqlRecord>
#include <QVariant>

namespace brasel::pos {

namespace {

constexpr int kTamanhoProduto = 15;

int inteiro(const QSqlRecord& r, const char* campo) {
    return r.value(QString::fromLatin1(campo)).toInt();
}

QString texto(const QSqlRecord& r, const char* campo) {
    return r.value(QString::fromLatin1(campo)).toString();
}

// Mid(s, inicio, tamanho) counting from 1: at most `tamanho` characters; nothing past the end.
QString mid(const QString& s, int inicio, int tamanho) {
    if (inicio < 1 || tamanho <= 0 || inicio > s.size()) return {};
    return s.mid(inicio - 1, tamanho);
}

// The digits of a label divided by its divisor, as text; nullopt for a divisor of 0 or digits
// that are not a number. No digits at all read as 0.
std::optional<QString> divide(const QString& digitos, int divisor) {
    if (divisor == 0) return std::nullopt;
    qint64 n = 0;
    if (!digitos.isEmpty()) {
        for (QChar c : digitos)
            if (!c.isDigit() || c.unicode() > 127) return std::nullopt;
        bool ok = false;
        n = digitos.toLongLong(&ok);
        if (!ok) return std::nullopt;
    }
    try {
        return Currency::mulDiv(Currency::fromUnits(n), Currency(1), Currency(divisor))
            .toPlainText();
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
}

bool prefixoIgual(const QString& s, const QString& p1, const QString& p2) {
    const QString inicio = s.left(2).toUpper();
    return inicio == p1.toUpper() || inicio == p2.toUpper();
}

// Cuts one prefix label: the code after the two prefix characters, then the value digits.
bool cortaPrefixo(const QString& s, int corte1, int corte2, int divisor, const char* tipo,
                  LeituraCodigo& l) {
    l.produto = mid(s, 3, corte1);
    const auto valor = divide(mid(s, corte1 + 3, corte2), divisor);
    if (!valor) return false;
    l.valor = *valor;
    l.tipo = QString::fromLatin1(tipo);
    return true;
}

std::optional<Currency> precoDoPrecario(db::Connection& conn, const QString& produto,
                                        const QString& precario) {
    bool ok = false;
    const int n = precario.toInt(&ok);
    if (!ok || n < 1 || n > 7) return std::nullopt;
    const auto r = conn.firstRow(
        QStringLiteral("select PrecoVenda1,PrecoVenda2,PrecoVenda3,PrecoVenda4,PrecoVenda5,"
                       "PrecoVenda6,PrecoVenda7 from Produtos where Codigo=?"),
        {produto});
    if (!r) return std::nullopt;
    return Currency::fromVariant(r->value(n - 1));
}

}  // namespace

std::optional<ParamCodigoBarras> LerParamCodigoBarras(db::Connection& conn) {
    const auto r = conn.firstRow(QStringLiteral("select * from ParamGeral"));
    if (!r) return std::nullopt;
    ParamCodigoBarras p;
    p.controlespecifico = inteiro(*r, "controlespecifico") == 1;
    p.corte1 = inteiro(*r, "corte1");
    p.corte2 = inteiro(*r, "corte2");
    p.DIVISAO = inteiro(*r, "DIVISAO");
    p.controlOficial = inteiro(*r, "controlOficial") == 1;
    p.Prefixo1Preco = texto(*r, "Prefixo1Preco");
    p.Prefixo2Preco = texto(*r, "Prefixo2Preco");
    p.PrefixoPrecoCorte1 = inteiro(*r, "PrefixoPrecoCorte1");
    p.PrefixoPrecoCorte2 = inteiro(*r, "PrefixoPrecoCorte2");
    p.PrefixoPrecoDivisor = inteiro(*r, "PrefixoPrecoDivisor");
    p.Prefixo1Quant = texto(*r, "Prefixo1Quant");
    p.Prefixo2Quant = texto(*r, "Prefixo2Quant");
    p.PrefixoQuantCorte1 = inteiro(*r, "PrefixoQuantCorte1");
    p.PrefixoQuantCorte2 = inteiro(*r, "PrefixoQuantCorte2");
    p.PrefixoQuantDivisor = inteiro(*r, "PrefixoQuantDivisor");
    p.zerarproduto = inteiro(*r, "zerarproduto") == 1;
    return p;
}

LeituraCodigo LerCodigoBarras(const ParamCodigoBarras& p, const QString& s) {
    LeituraCodigo l;
    if (p.controlespecifico) {
        l.produto = mid(s, 1, p.corte1);
        const auto valor = divide(mid(s, p.corte1 + 1, p.corte2), p.DIVISAO);
        if (!valor) {
            l.valido = false;
            return l;
        }
        l.valor = *valor;
        l.tipo = QStringLiteral("Q");
    }
    if (p.controlOficial) {
        // A label of neither kind is a code as it stands; value and kind stay as they were.
        if (prefixoIgual(s, p.Prefixo1Preco, p.Prefixo2Preco)) {
            l.valido = cortaPrefixo(s, p.PrefixoPrecoCorte1, p.PrefixoPrecoCorte2,
                                    p.PrefixoPrecoDivisor, "P", l);
            if (!l.valido) return l;
        } else {
            l.produto = s;
        }
        if (prefixoIgual(s, p.Prefixo1Quant, p.Prefixo2Quant))
            l.valido = cortaPrefixo(s, p.PrefixoQuantCorte1, p.PrefixoQuantCorte2,
                                    p.PrefixoQuantDivisor, "Q", l);
    }
    return l;
}

LeituraCodigo LerCodigoBarras(db::Connection& conn, const QString& codigo) {
    const auto param = LerParamCodigoBarras(conn);
    if (!param) return {};
    return LerCodigoBarras(*param, codigo);
}

QString Zerar_Produto_str(db::Connection& conn, const QString& codigo, bool zerarproduto) {
    const QString limpo = codigo.trimmed();
    if (!zerarproduto || limpo.isEmpty() || limpo.size() >= kTamanhoProduto) return limpo;
    for (QChar c : limpo)
        if (!c.isDigit() || c.unicode() > 127) return limpo;
    if (conn.firstRow(QStringLiteral("select Codigo from Produtos where Codigo=?"), {limpo}))
        return limpo;
    QVariantList cheios;
    QStringList marcas;
    for (int tamanho = limpo.size() + 1; tamanho <= kTamanhoProduto; ++tamanho) {
        cheios << limpo.rightJustified(tamanho, u'0');
        marcas << QStringLiteral("?");
    }
    const auto r =
        conn.firstRow(QStringLiteral("select Codigo from Produtos where Codigo in (") +
                          marcas.join(u',') + QStringLiteral(") order by length(Codigo) limit 1"),
                      cheios);
    return r ? r->value(0).toString() : limpo;
}

QString ConverteCodigo(db::Connection& conn, const QString& fornecedor, const QString& codigo,
                       bool usaFornecedor) {
    QString produto = codigo;
    if (usaFornecedor && !fornecedor.isEmpty()) {
        const auto r = conn.firstRow(
            QStringLiteral(
                "select Produto from ProdutosOutrosDados where Fornecedor=? and RefProduto=?"),
            {fornecedor, codigo});
        if (r)
            produto = r->value(0).toString();
        else
            db::ConverteCodigoProduto(conn, produto);
    }
    if (conn.firstRow(QStringLiteral("select Codigo from Produtos where Codigo=?"), {produto}))
        return produto;
    const auto base = conn.firstRow(
        QStringLiteral("select ProdutoBase from ProdutosCodigosBarras where CodigoBarras=?"),
        {produto});
    return base ? base->value(0).toString() : produto;
}

std::optional<ProdutoLido> cmdImputCodigoBarras(app::Estado& estado, MessagePort& mensagens,
                                                const QString& codigo, const QString& precario) {
    ProdutoLido lido;
    lido.texto = codigo.trimmed();
    lido.precario = precario;
    if (lido.texto.isEmpty()) return std::nullopt;
    db::Connection& conn = estado.gConn;
    const ParamCodigoBarras param = LerParamCodigoBarras(conn).value_or(ParamCodigoBarras{});
    if (!param.controlespecifico && !param.controlOficial) {
        lido.produto = ConverteCodigo(
            conn, {}, Zerar_Produto_str(conn, lido.texto, param.zerarproduto), false);
        return lido;
    }
    const LeituraCodigo l = LerCodigoBarras(param, lido.texto);
    if (!l.valido) {
        mensagens.mensagem(QStringLiteral("Código de Barras Inválido!") + u'\n' + lido.texto,
                           Icone::Critico);
        return std::nullopt;
    }
    lido.produto = l.produto;
    lido.quantidade = Currency(1);
    const Currency valor = Currency::parse(l.valor).value_or(Currency{});
    if (l.tipo == u"Q") lido.quantidade = valor;
    if (l.tipo == u"P") lido.preco = valor;
    if (lido.quantidade.isZero()) lido.quantidade = Currency(1);
    if (lido.precario.isEmpty()) lido.precario = QStringLiteral("1");
    if (l.tipo == u"P") {
        // The label's amount becomes units of the product's price, so the line is worth the
        // amount; a product without a price keeps the amount as the price of one unit.
        const auto unitario = precoDoPrecario(conn, lido.produto, lido.precario);
        if (unitario && *unitario > Currency{}) {
            try {
                lido.quantidade = Currency::mulDiv(valor, Currency(1), *unitario);
                lido.preco = *unitario;
            } catch (const CurrencyOverflow&) {
                mensagens.mensagem(
                    QStringLiteral("Código de Barras Inválido!") + u'\n' + lido.texto,
                    Icone::Critico);
                return std::nullopt;
            }
        }
    }
    return lido;
}

}  // namespace brasel::pos
