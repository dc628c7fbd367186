#include "cash/troco.h"

#include "db/query_helpers.h"
#include "pricing/arredonda.h"
#include "pricing/cambio.h"

#include <utility>

namespace brasel::cash {

Troco::Troco(app::Estado& estado, MessagePort& mensagens, Currency totalDoc,
             AplicaDesconto aplicaDesconto)
    : estado_(estado),
      mensagens_(mensagens),
      aplicaDesconto_(std::move(aplicaDesconto)),
      totalDoc_(totalDoc),
      // Charging the whole total until told otherwise: the change of a first tendered amount
      // is then right at once.
      valorPagar_(totalDoc),
      txtCambio_(estado.param.cambiodef.trimmed()) {
    lblCambio_ = abreviatura(txtCambio_);
}

std::vector<BotaoPagaComo> Troco::CarregarFPagamento(const QString& cliente) {
    if (txtPagaComo_.trimmed().isEmpty()) {
        EscolhePagaComo(db::Select_Campo_str(estado_, QStringLiteral("Clientes"),
                                             QStringLiteral("PagaComo"), QStringLiteral("Codigo"),
                                             cliente));
    }
    std::vector<BotaoPagaComo> formas;
    auto q = estado_.gConn.exec(
        QStringLiteral("select codigo,Descricao,foto from PagaComo order by Descricao"));
    while (q && q->next()) {
        formas.push_back(
            {q->value(0).toString(), q->value(1).toString(), q->value(2).toByteArray()});
    }
    return formas;
}

void Troco::EscolhePagaComo(const QString& codigo) {
    const QString chave = codigo.trimmed();
    if (chave.isEmpty()) return;
    const auto linha = estado_.gConn.firstRow(
        QStringLiteral("select codigo,Descricao from PagaComo where codigo=?"), {chave});
    if (!linha) return;
    txtPagaComo_ = linha->value(0).toString();
    lblPagaComo_ = linha->value(1).toString();
}

void Troco::AlteraEntregou(Currency valor) {
    const Currency anterior = entregou_;
    entregou_ = valor;
    if (!recalcula()) entregou_ = anterior;
}

void Troco::AlteraValorPagar(Currency valor) {
    if (valor < Currency{}) return;
    if (descontoPer_ != 0.0) {
        const auto total = aplicaDesconto_(0.0);
        if (!total) return;
        totalDoc_ = *total;
        descontoPer_ = 0.0;
    }
    valorPagar_ = valor > totalDoc_ ? totalDoc_ : valor;
    recalcula();
}

void Troco::AlteraDescontoPer(double percentagem) {
    // A percent outside 0..100 is no discount: 100 would give the document away, and a
    // negative one would raise its prices.
    if (!(percentagem >= 0.0 && percentagem < 100.0)) percentagem = 0.0;
    const auto total = aplicaDesconto_(percentagem);
    if (!total) return;
    descontoPer_ = percentagem;
    totalDoc_ = *total;
    valorPagar_ = *total;
    recalcula();
}

void Troco::AlteraCambio(const QString& codigo) {
    QString cambio = codigo.trimmed();
    if (cambio.isEmpty()) cambio = estado_.param.cambiodef.trimmed();
    if (cambio.compare(txtCambio_, Qt::CaseInsensitive) == 0) return;
    txtCambio_ = cambio;
    lblCambio_ = abreviatura(cambio);
    entregou_ = Currency{};
    entregouConvertido_ = Currency{};
    troco_ = Currency{};
}

std::optional<Pagamento> Troco::Confirmar() {
    if (txtPagaComo_.trimmed().isEmpty()) {
        mensagens_.mensagem(QStringLiteral("Não definiu a Forma de Pagamento"), Icone::Critico);
        return std::nullopt;
    }
    if (valorPagar_.isZero()) valorPagar_ = totalDoc_;
    if (!recalcula()) return std::nullopt;
    if (entregouConvertido_ < valorPagar_) {
        // Nothing tendered: the customer handed over the amount charged, in the company's money.
        txtCambio_ = estado_.param.cambiodef.trimmed();
        lblCambio_ = abreviatura(txtCambio_);
        entregou_ = valorPagar_;
        entregouConvertido_ = valorPagar_;
        troco_ = Currency{};
    }
    Pagamento p;
    p.pagaComo = txtPagaComo_;
    p.totalDoc = totalDoc_;
    p.valorPagar = valorPagar_;
    p.descontoPer = descontoPer_;
    p.desconto = desconto_;
    p.entregou = entregouConvertido_;
    p.troco = troco_;
    p.cambio = txtCambio_;
    p.entregouNoCambio = entregou_;
    p.observa = txtObserva_;
    return p;
}

std::optional<Currency> Troco::convertido(Currency valor, const QString& cambio) {
    const auto seis =
        pricing::ConverteCambio_SEIS_Decimais(estado_, valor, cambio, QStringLiteral("+"));
    if (!seis) return std::nullopt;
    try {
        return pricing::ArredondaValor(seis->paraValor(), estado_.param.casadec,
                                       pricing::ArredondaProximo);
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
}

bool Troco::recalcula() {
    const auto valor = convertido(entregou_, txtCambio_);
    if (!valor) return false;
    const Currency devido = aCobrar();
    try {
        const Currency desconto = totalDoc_ - devido;
        const bool curto = entregou_ <= Currency{} || *valor < devido;
        const Currency troco = curto ? Currency{} : *valor - devido;
        desconto_ = desconto;
        troco_ = troco;
        if (curto) entregou_ = Currency{};
        entregouConvertido_ = curto ? Currency{} : *valor;
    } catch (const CurrencyOverflow&) {
        return false;
    }
    return true;
}

QString Troco::abreviatura(const QString& cambio) {
    return db::Select_Campo_str(estado_, QStringLiteral("Cambios"), QStringLiteral("Abreviatura"),
                                QStringLiteral("codigo"), cambio);
}

}  // namespace brasel::cash
