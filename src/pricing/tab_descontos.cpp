#include "pricing/tab_descontos.h"

#include "db/query_helpers.h"
#include "pricing/leitura.h"

#include <QSqlRecord>

#include <vector>

namespace brasel::pricing {

namespace {

// A text matched literally inside a LIKE pattern.
QString literalLike(const QString& texto) {
    QString r;
    for (const QChar c : texto) {
        if (c == u'\\' || c == u'%' || c == u'_') r += u'\\';
        r += c;
    }
    return r;
}

bool semLimite(const QString& hora) {
    const QString h = hora.trimmed();
    return h.isEmpty() || h == u"00:00";
}

bool dentroDoPrazo(const QSqlRecord& q, const QDateTime& agora) {
    const QString hoje = agora.date().toString(QStringLiteral("yyyy-MM-dd"));
    const QString hora = agora.time().toString(QStringLiteral("HH:mm"));
    const QString inicio = q.value(1).toString().trimmed();
    const QString fim = q.value(2).toString().trimmed();
    if (!inicio.isEmpty() && inicio > hoje) return false;
    if (!fim.isEmpty() && fim < hoje) return false;
    const QString horaIni = q.value(3).toString().trimmed();
    const QString horaFim = q.value(4).toString().trimmed();
    if (!semLimite(horaIni) && horaIni > hora) return false;
    if (!semLimite(horaFim) && horaFim < hora) return false;
    return true;
}

bool semDatas(const QSqlRecord& q) {
    return q.value(1).toString().trimmed().isEmpty() && q.value(2).toString().trimmed().isEmpty();
}

std::optional<DescontosLinha> descontosDe(db::Connection& c, const QString& sql,
                                          const QString& codigo) {
    const auto linha = db::primeiraLinha(c, sql, {codigo});
    if (!linha) return std::nullopt;
    return DescontosLinha{percentagem(linha->value(0)), percentagem(linha->value(1)),
                          percentagem(linha->value(2))};
}

AcordoDescontos decide(db::Connection& c, const QSqlRecord& q, const QString& cliente,
                       const QString& produto) {
    AcordoDescontos a;
    a.encontrado = true;
    a.tipo = q.value(6).toString().trimmed().toUpper();
    if (a.tipo == u"P" || a.tipo == u"T") {
        const Currency digitado = Currency::fromVariant(q.value(7));
        const int escalao = q.value(8).toInt();
        if (!digitado.isZero()) {
            a.preco = digitado;
        } else if (escalao >= 1 && escalao <= 7) {
            const auto linha = db::primeiraLinha(
                c, QStringLiteral("select PrecoVenda%1 from Produtos where Codigo=?").arg(escalao),
                {produto});
            a.escalao = escalao;
            a.preco = linha ? Currency::fromVariant(linha->value(0)) : Currency();
        }
    }
    if (a.tipo == u"D" || a.tipo == u"T") {
        std::optional<DescontosLinha> d;
        if (ligado(q.value(12))) {
            d = descontosDe(c,
                            QStringLiteral("select Desconto1,Desconto2,Desconto3 from Clientes "
                                           "where Codigo=?"),
                            cliente);
        } else if (ligado(q.value(13))) {
            d = descontosDe(c,
                            QStringLiteral("select DescontoVenda1,DescontoVenda2,DescontoVenda3 "
                                           "from Produtos where Codigo=?"),
                            produto);
        } else {
            d = DescontosLinha{percentagem(q.value(9)), percentagem(q.value(10)),
                               percentagem(q.value(11))};
        }
        a.descontos = d.value_or(DescontosLinha{});
        a.descontoValor = Currency::fromVariant(q.value(14));
    }
    return a;
}

}  // namespace

AcordoDescontos TabDescontos_Procura(app::Estado& estado, const QString& Cliente,
                                     const QString& Produto, const QString& Armazem,
                                     const QString& TipoMovimento, const QDateTime& agora,
                                     const SaldoProduto& saldo, db::Connection* conn) {
    db::Connection& c = estado.ligacao(conn);
    auto q = c.exec(
        QStringLiteral("select NumRegisto,DataInicial,DataFinal,HoraIni,HoraFim,ControloQuant,"
                       "PrecoDesc,PrecoDigit,PrecoPro,Desc1Digit,Desc2Digit,Desc3Digit,DescCli,"
                       "DescPro,DescontoValor from tabdescontos where cliente=? and produto=? and "
                       "armazem like ? escape '\\' and (Tipo='' or Tipo like ? escape '\\') "
                       "order by DataInicial desc, NumRegisto desc"),
        {Cliente, Produto, QStringLiteral("%") + literalLike(Armazem) + QStringLiteral(";%"),
         QStringLiteral("%") + literalLike(TipoMovimento) + QStringLiteral("%")});
    if (!q) return {};
    const bool vaziaPrimeiro =
        db::Select_Campo_str(estado, QStringLiteral("ParamGeral"),
                             QStringLiteral("TabDescontosMandaDataVazia"), {}, {}, {}, conn)
            .trimmed() == u"1";
    std::vector<QSqlRecord> acordos;
    while (q->next())
        acordos.push_back(q->record());
    const auto temStock = [&](const QSqlRecord& linha) {
        if (!ligado(linha.value(5))) return true;
        const auto s = saldo ? saldo(Produto, Armazem) : std::nullopt;
        return s.has_value() && *s > Currency();
    };
    // First pass: an undated agreement when the company wants those first; second: by date.
    for (int passo = vaziaPrimeiro ? 0 : 1; passo < 2; ++passo) {
        for (const QSqlRecord& a : acordos) {
            const bool candidato = passo == 0 ? semDatas(a) : dentroDoPrazo(a, agora);
            if (candidato && temStock(a)) return decide(c, a, Cliente, Produto);
        }
    }
    return {};
}

}  // namespace brasel::pricing
