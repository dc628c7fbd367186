#include "cash/registo_caixa.h"

#include "db/query_helpers.h"
#include "pricing/leitura.h"

#include <QDate>

#include <map>

namespace brasel::cash {

namespace {

const QString kFormatoData = QStringLiteral("yyyy-MM-dd");

// The four till effects of one method over a period.
struct Efeitos {
    Currency recebimentos;  // R+ less R-
    Currency pagamentos;    // P+ less P-
};

// The movements of a register by method, on the date (`comparacao` "=") or before it ("<").
std::optional<std::map<QString, Efeitos>> efeitosPorMetodo(db::Connection& conn,
                                                           const QString& caixa,
                                                           const QString& data,
                                                           const QString& comparacao) {
    auto rs = conn.exec(QStringLiteral("select PagaComo, Afecta, SUM(ValorTotal) from MovCaixa "
                                       "where Caixa=? and Data%1? group by PagaComo, Afecta")
                            .arg(comparacao),
                        {caixa, data});
    if (!rs) return std::nullopt;
    std::map<QString, Efeitos> efeitos;
    while (rs->next()) {
        const QString afecta = rs->value(1).toString().trimmed().toUpper();
        const Currency soma = Currency::fromVariant(rs->value(2));
        Efeitos& e = efeitos[rs->value(0).toString().trimmed()];
        if (afecta == u"R+") {
            e.recebimentos += soma;
        } else if (afecta == u"R-") {
            e.recebimentos -= soma;
        } else if (afecta == u"P+") {
            e.pagamentos += soma;
        } else if (afecta == u"P-") {
            e.pagamentos -= soma;
        }
    }
    return efeitos;
}

Currency saldoTotal(const std::map<QString, Efeitos>& efeitos) {
    Currency saldo;
    for (const auto& [metodo, e] : efeitos)
        saldo += e.recebimentos - e.pagamentos;
    return saldo;
}

bool dataValida(const QString& data) {
    return QDate::fromString(data.trimmed(), kFormatoData).isValid();
}

}  // namespace

std::optional<std::vector<FormaPagamento>> FormasPagamento(db::Connection& conn) {
    auto rs = conn.exec(
        QStringLiteral("select NumRegisto, codigo, Descricao from PagaComo order by Descricao"));
    if (!rs) return std::nullopt;
    std::vector<FormaPagamento> formas;
    while (rs->next()) {
        formas.push_back({rs->value(0).toLongLong(), rs->value(1).toString().trimmed(),
                          rs->value(2).toString()});
    }
    return formas;
}

bool GravaRegistoCaixa(app::Estado& estado, MessagePort& mensagens, const QString& caixa,
                       const QString& data, const std::vector<ContagemCaixa>& contagem) {
    if (caixa.trimmed().isEmpty()) {
        mensagens.mensagem(QStringLiteral("Não definiu o Caixa!"), Icone::Critico);
        return false;
    }
    if (!dataValida(data)) {
        mensagens.mensagem(QStringLiteral("Não definiu a Data!"), Icone::Critico);
        return false;
    }
    db::Connection& conn = estado.gConn;
    const QString dataSys = db::Get_DataSysServer_InsertIntoSQL(estado, &conn);
    db::WriteTransaction transaccao(conn);
    bool gravado = transaccao.active() &&
                   conn.exec(QStringLiteral("delete from RegistoCaixa where Data=? and Caixa=?"),
                             {data.trimmed(), caixa.trimmed()})
                       .has_value();
    for (const ContagemCaixa& c : contagem) {
        if (!gravado) break;
        gravado = conn.exec(QStringLiteral("insert into RegistoCaixa (Caixa, Data, PagaComo, "
                                           "Valor, Utilizador, DataSys) values (?,?,?,?,?,?)"),
                            {caixa.trimmed(), data.trimmed(), c.pagaComo.trimmed(),
                             c.valor.toText(), pricing::textoSql(estado.gUtilizador), dataSys})
                      .has_value();
    }
    if (gravado) gravado = transaccao.commit();
    if (!gravado) {
        mensagens.mensagem(QStringLiteral("Não foi possível gravar o Registo de Caixa!") +
                               QStringLiteral("\r\n") + conn.lastError(),
                           Icone::Critico);
    }
    return gravado;
}

std::optional<QHash<QString, Currency>> CarregaRegistoCaixa(db::Connection& conn,
                                                            const QString& caixa,
                                                            const QString& data) {
    auto rs = conn.exec(
        QStringLiteral("select PagaComo, Valor from RegistoCaixa where Data=? and Caixa=?"),
        {data.trimmed(), caixa.trimmed()});
    if (!rs) return std::nullopt;
    QHash<QString, Currency> valores;
    while (rs->next())
        valores[rs->value(0).toString().trimmed()] += Currency::fromVariant(rs->value(1));
    return valores;
}

namespace {

std::optional<RelatorioCaixa> relatorio(app::Estado& estado, const QString& caixa,
                                        const QString& data) {
    db::Connection& conn = estado.gConn;
    const QString codigo = caixa.trimmed();
    const QString dia = data.trimmed();
    auto formas = FormasPagamento(conn);
    const auto doDia = efeitosPorMetodo(conn, codigo, dia, QStringLiteral("="));
    const auto anteriores = efeitosPorMetodo(conn, codigo, dia, QStringLiteral("<"));
    const auto registo = CarregaRegistoCaixa(conn, codigo, dia);
    if (!formas || !doDia || !anteriores || !registo) return std::nullopt;

    // Movements and counts of a method no longer listed still belong to the till.
    auto listado = [&formas](const QString& metodo) {
        for (const FormaPagamento& f : *formas) {
            if (f.codigo == metodo) return true;
        }
        return false;
    };
    for (const auto& [metodo, e] : *doDia) {
        if (!listado(metodo)) formas->push_back({0, metodo, metodo});
    }
    for (auto it = registo->cbegin(); it != registo->cend(); ++it) {
        if (!listado(it.key())) formas->push_back({0, it.key(), it.key()});
    }

    RelatorioCaixa r;
    const QString descricao =
        db::Select_Campo_str(estado, QStringLiteral("Caixas"), QStringLiteral("Descricao"),
                             QStringLiteral("Codigo"), codigo, {}, &conn);
    r.titulo = QStringLiteral("Diário do Caixa - %1 (%2)").arg(descricao.trimmed(), codigo);
    r.data = QStringLiteral("Data: ") +
             QDate::fromString(dia, kFormatoData).toString(QStringLiteral("dd-MM-yyyy"));
    for (const FormaPagamento& f : *formas) {
        LinhaRelatorioCaixa l;
        l.pagaComo = f.codigo;
        l.descricao = f.descricao;
        if (const auto e = doDia->find(f.codigo); e != doDia->end()) {
            l.recebimentos = e->second.recebimentos;
            l.pagamentos = e->second.pagamentos;
        }
        l.saldo = l.recebimentos - l.pagamentos;
        l.registo = registo->value(f.codigo);
        l.diferenca = l.registo - l.saldo;
        r.saldoDia += l.saldo;
        r.linhas.push_back(l);
    }
    r.saldoAnterior = saldoTotal(*anteriores);
    r.saldoActual = r.saldoAnterior + r.saldoDia;
    return r;
}

}  // namespace

std::optional<RelatorioCaixa> CalculaRelatorioCaixa(app::Estado& estado, const QString& caixa,
                                                    const QString& data) {
    try {
        return relatorio(estado, caixa, data);
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
}

}  // namespace brasel::cash
