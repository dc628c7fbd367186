#include "cash/lanca_mov_caixa.h"

#include "app/registo_log.h"
#include "db/query_helpers.h"
#include "pricing/arredonda.h"
#include "pricing/cambio.h"
#include "pricing/leitura.h"

#include <QStringList>

#include <optional>

namespace brasel::cash {

namespace {

// One method's payment: the amount in the payment's currency and in the company's.
struct Pagamento {
    QString pagaComo;
    Currency valorCambio;
    Currency valor;
};

// The VAT groups of one row.
struct Grupos {
    std::array<Currency, 4> valor;
    std::array<Currency, 4> desconto;
    std::array<Currency, 4> valiva;
};

const QStringList& colunas() {
    static const QStringList nomes = [] {
        QStringList c{QStringLiteral("Caixa"),    QStringLiteral("Data"),
                      QStringLiteral("Afecta"),   QStringLiteral("Tipo"),
                      QStringLiteral("Numero"),   QStringLiteral("Ano"),
                      QStringLiteral("PagaComo"), QStringLiteral("Armazem")};
        for (const char* prefixo : {"valor", "desconto", "valiva", "tabiva", "taxiva"}) {
            for (int n = 1; n <= 4; ++n)
                c << QString::fromLatin1(prefixo) + QString::number(n);
        }
        c << QStringLiteral("ValorTotal") << QStringLiteral("Cambio") << QStringLiteral("ValCambio")
          << QStringLiteral("Observa") << QStringLiteral("NomeEntidade")
          << QStringLiteral("integrou") << QStringLiteral("Utilizador") << QStringLiteral("DataSys")
          << QStringLiteral("Hora");
        return c;
    }();
    return nomes;
}

QString instrucaoInsercao() {
    QStringList marcas;
    for (qsizetype i = 0; i < colunas().size(); ++i)
        marcas << QStringLiteral("?");
    return QStringLiteral("insert into MovCaixa (%1) values (%2)")
        .arg(colunas().join(QLatin1Char(',')), marcas.join(QLatin1Char(',')));
}

QString instrucaoReescrita() {
    return QStringLiteral("update MovCaixa set %1=? where NumRegisto=?")
        .arg(colunas().join(QStringLiteral("=?,")));
}

// An amount of the payment's currency in the company's, at the company's decimals.
Currency naMoedaDaEmpresa(app::Estado& estado, db::Connection& conn, Currency valor,
                          const QString& cambio) {
    const auto convertido =
        pricing::ConverteCambio_SEIS_Decimais(estado, valor, cambio, QStringLiteral("+"), &conn);
    if (!convertido) throw CurrencyOverflow();
    return pricing::ArredondaValor(convertido->paraValor(), estado.param.casadec,
                                   pricing::ArredondaProximo);
}

// A document paid by several methods shares each VAT amount among them in proportion to what
// each method paid, at the company's decimals; the last method takes what is left, so the rows
// of a document always add up to its groups exactly.
std::vector<Currency> reparte(Currency total, const std::vector<Pagamento>& pagamentos,
                              Currency soma, int casadec) {
    std::vector<Currency> partes;
    Currency atribuido;
    for (std::size_t i = 0; i + 1 < pagamentos.size(); ++i) {
        const Currency parte =
            soma.isZero()
                ? Currency()
                : pricing::ArredondaValor(Currency::mulDiv(total, pagamentos[i].valor, soma),
                                          casadec, pricing::ArredondaProximo);
        partes.push_back(parte);
        atribuido += parte;
    }
    partes.push_back(total - atribuido);
    return partes;
}

std::vector<Grupos> gruposPorPagamento(const Grupos& documento,
                                       const std::vector<Pagamento>& pagamentos, int casadec) {
    Currency soma;
    for (const Pagamento& p : pagamentos)
        soma += p.valor;
    std::vector<Grupos> grupos(pagamentos.size());
    for (std::size_t n = 0; n < 4; ++n) {
        const auto valor = reparte(documento.valor[n], pagamentos, soma, casadec);
        const auto desconto = reparte(documento.desconto[n], pagamentos, soma, casadec);
        const auto valiva = reparte(documento.valiva[n], pagamentos, soma, casadec);
        for (std::size_t i = 0; i < pagamentos.size(); ++i) {
            grupos[i].valor[n] = valor[i];
            grupos[i].desconto[n] = desconto[i];
            grupos[i].valiva[n] = valiva[i];
        }
    }
    return grupos;
}

// The methods to write: the split list's parts above zero, or the document's one method. A
// method named twice in the list is one row with both parts: the second would otherwise
// rewrite the first and lose its amount.
std::vector<Pagamento> pagamentosDoMovimento(app::Estado& estado, db::Connection& conn,
                                             const MovimentoCaixa& m,
                                             const std::vector<ParcialPagamento>* divisao) {
    std::vector<Pagamento> pagamentos;
    auto acrescenta = [&](const QString& pagaComo, Currency valor) {
        for (Pagamento& p : pagamentos) {
            if (p.pagaComo == pagaComo.trimmed()) {
                p.valorCambio += valor;
                return;
            }
        }
        pagamentos.push_back({pagaComo.trimmed(), valor, Currency()});
    };
    if (divisao == nullptr) {
        acrescenta(m.pagaComo, m.valorTotal);
    } else {
        for (const ParcialPagamento& p : *divisao) {
            if (p.valor > Currency()) acrescenta(p.pagaComo, p.valor);
        }
    }
    for (Pagamento& p : pagamentos)
        p.valor = naMoedaDaEmpresa(estado, conn, p.valorCambio, m.cambio);
    return pagamentos;
}

// A method marked Reembolso leaves its movements out of the till.
std::optional<bool> eReembolso(db::Connection& conn, const QString& pagaComo) {
    auto rs =
        conn.exec(QStringLiteral("select Reembolso from PagaComo where codigo=?"), {pagaComo});
    if (!rs) return std::nullopt;
    return rs->next() && pricing::ligado(rs->value(0));
}

// The row a document and method already has (0 none), or nullopt when it cannot be read.
std::optional<qlonglong> linhaExistente(db::Connection& conn, const QVariantList& chave) {
    auto rs = conn.exec(QStringLiteral("select NumRegisto from MovCaixa where Tipo=? and "
                                       "Numero=? and Ano=? and PagaComo=?"),
                        chave);
    if (!rs) return std::nullopt;
    return rs->next() ? rs->value(0).toLongLong() : 0;
}

bool escreve(app::Estado& estado, db::Connection& conn, const MovimentoCaixa& m, const Pagamento& p,
             const Grupos& g, const QDateTime& agora) {
    const auto reembolso = eReembolso(conn, p.pagaComo);
    if (!reembolso) return false;
    const QString ano = m.data.left(4);
    const QVariantList chave{pricing::textoSql(m.tipo), pricing::textoSql(m.numero), ano,
                             p.pagaComo};
    const auto existente = linhaExistente(conn, chave);
    if (!existente) return false;

    QVariantList v{pricing::textoSql(estado.gCaixa),
                   pricing::textoSql(m.data),
                   *reembolso ? QStringLiteral("NA") : m.afecta.trimmed().toUpper(),
                   chave[0],
                   chave[1],
                   ano,
                   p.pagaComo,
                   pricing::textoSql(estado.gArmazem)};
    for (const auto* montantes : {&g.valor, &g.desconto, &g.valiva}) {
        for (const Currency& c : *montantes)
            v << c.toText();
    }
    for (const QString& tabela : m.tabiva)
        v << pricing::textoSql(tabela);
    for (const double taxa : m.taxiva)
        v << taxa;
    const QString cambio =
        m.cambio.trimmed().isEmpty() ? estado.param.cambiodef.trimmed() : m.cambio.trimmed();
    v << p.valor.toText() << pricing::textoSql(cambio) << p.valorCambio.toText()
      << pricing::textoSql(m.observa) << pricing::textoSql(m.nomeEntidade) << QStringLiteral("N")
      << pricing::textoSql(estado.gUtilizador) << db::textoDataSys(agora)
      << agora.toString(QStringLiteral("HH:mm"));
    if (*existente > 0) {
        v << *existente;
        return conn.exec(instrucaoReescrita(), v).has_value();
    }
    return conn.exec(instrucaoInsercao(), v).has_value();
}

bool lanca(app::Estado& estado, db::Connection& conn, const MovimentoCaixa& m,
           const std::vector<ParcialPagamento>* divisao) {
    const std::vector<Pagamento> pagamentos = pagamentosDoMovimento(estado, conn, m, divisao);
    if (pagamentos.empty()) return true;
    Grupos documento;
    for (std::size_t n = 0; n < 4; ++n) {
        documento.valor[n] = naMoedaDaEmpresa(estado, conn, m.valor[n], m.cambio);
        documento.desconto[n] = naMoedaDaEmpresa(estado, conn, m.desconto[n], m.cambio);
        documento.valiva[n] = naMoedaDaEmpresa(estado, conn, m.valiva[n], m.cambio);
    }
    const std::vector<Grupos> grupos =
        gruposPorPagamento(documento, pagamentos, estado.param.casadec);
    const QDateTime agora = db::Get_DataSysServer(estado, &conn);
    Currency total;
    for (std::size_t i = 0; i < pagamentos.size(); ++i) {
        if (!escreve(estado, conn, m, pagamentos[i], grupos[i], agora)) return false;
        total += pagamentos[i].valor;
    }
    db::EntradaLog entrada;
    entrada.modulo = QStringLiteral("CA");
    entrada.accao = QStringLiteral("N");
    entrada.observa = m.observa;
    entrada.descricao = m.nomeEntidade;
    entrada.valor = total;
    entrada.tipo = m.tipo;
    entrada.numero = m.numero;
    entrada.ano = m.data.left(4);
    app::RegistaLogGeral(estado, entrada, &conn);
    return true;
}

}  // namespace

bool LancaMovCaixa(app::Estado& estado, db::Connection& conn, const MovimentoCaixa& movimento,
                   const std::vector<ParcialPagamento>* divisao) {
    if (movimento.afecta.trimmed().toUpper() == u"NA") return true;
    // Alone, the rows of one document are written together or not at all; inside a closing the
    // closing's own transaction decides.
    pricing::TransacaoSeNecessaria transaccao(conn);
    if (!transaccao.active()) return false;
    try {
        if (!lanca(estado, conn, movimento, divisao)) return false;
    } catch (const CurrencyOverflow&) {
        return false;
    }
    return transaccao.commit();
}

}  // namespace brasel::cash
