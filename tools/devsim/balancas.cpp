#include "balancas.h"

#include "common/currency.h"
#include "devices/caracteres_controlo.h"

#include <QMutexLocker>

namespace devsim {

namespace {

using namespace brasel::devices::controlo;

// A decimal option in thousandths (kilograms to grams) or hundredths (euros to cents).
std::optional<int> decimal(const QString& texto, int divisor) {
    const auto valor = brasel::Currency::parse(texto.trimmed());
    if (!valor) return std::nullopt;
    const qint64 unidades = valor->raw() / divisor;
    if (unidades < -99'999'999 || unidades > 99'999'999) return std::nullopt;
    return static_cast<int>(unidades);
}

QByteArray digitos(qint64 valor, int largura) {
    return QByteArray::number(valor).rightJustified(largura, '0');
}

bool soDigitos(const QByteArray& texto) {
    for (char c : texto) {
        if (c < '0' || c > '9') return false;
    }
    return !texto.isEmpty();
}

}  // namespace

std::optional<SituacaoBalanca> SituacaoBalanca::deOpcoes(const QString& opcoes) {
    SituacaoBalanca s;
    for (const QString& opcao : opcoes.split(QLatin1Char(','), Qt::SkipEmptyParts)) {
        const QString chave = opcao.section(QLatin1Char('='), 0, 0).trimmed();
        const QString valor = opcao.section(QLatin1Char('='), 1);
        if (chave == QLatin1String("peso")) {
            const auto g = decimal(valor, 10);
            if (!g) return std::nullopt;
            s.pesoGramas = *g;
        } else if (chave == QLatin1String("preco")) {
            s.precoCentimos = decimal(valor, 100);
            if (!s.precoCentimos) return std::nullopt;
        } else if (chave == QLatin1String("instavel")) {
            s.instavel = true;
        } else if (chave == QLatin1String("sobrecarga")) {
            s.sobrecarga = true;
        } else if (chave == QLatin1String("recusa")) {
            s.recusa = true;
        } else if (chave == QLatin1String("silencio")) {
            s.silencio = true;
        } else {
            return std::nullopt;
        }
    }
    return s;
}

QString legivel(const QByteArray& bytes) {
    static const char* const nomes[32] = {"NUL", "SOH", "STX", "ETX", "EOT", "ENQ", "ACK", "BEL",
                                          "BS",  "HT",  "LF",  "VT",  "FF",  "CR",  "SO",  "SI",
                                          "DLE", "DC1", "DC2", "DC3", "DC4", "NAK", "SYN", "ETB",
                                          "CAN", "EM",  "SUB", "ESC", "FS",  "GS",  "RS",  "US"};
    QString texto;
    for (char c : bytes) {
        const auto b = static_cast<unsigned char>(c);
        if (b < 32) {
            texto += QLatin1Char('[') + QLatin1String(nomes[b]) + QLatin1Char(']');
        } else if (b >= 127) {
            texto += QStringLiteral("[%1]").arg(b);
        } else {
            texto += QLatin1Char(c);
        }
    }
    return texto;
}

QString BalancaSimulada::transcricao() const {
    QMutexLocker trinco(&mutex_);
    return transcricao_.join(QLatin1Char('\n'));
}

void BalancaSimulada::defineSituacao(const SituacaoBalanca& situacao) {
    QMutexLocker trinco(&mutex_);
    situacao_ = situacao;
}

QList<QByteArray> BalancaSimulada::pedidos() const {
    QMutexLocker trinco(&mutex_);
    return pedidos_;
}

void BalancaSimulada::regista(const QByteArray& pedido) {
    pedidos_.append(pedido);
    transcricao_.append(QStringLiteral("-> ") + legivel(pedido));
}

void BalancaSimulada::respondeRegistando(const QByteArray& resposta) {
    if (resposta.isEmpty()) return;
    transcricao_.append(QStringLiteral("<- ") + legivel(resposta));
    responde(resposta);
}

void BalancaCS300::recebe(const QByteArray& bytes) {
    QMutexLocker trinco(&mutex_);
    pendente_ += bytes;
    for (;;) {
        const qsizetype inicio = pendente_.indexOf(EOT);
        if (inicio < 0) {
            pendente_.clear();  // nothing before an EOT is a frame
            return;
        }
        pendente_.remove(0, inicio);
        if (pendente_.size() < 2) return;
        qsizetype fim = -1;
        if (pendente_.at(1) == ENQ) {
            fim = 2;
        } else if (pendente_.at(1) == STX) {
            const qsizetype etx = pendente_.indexOf(ETX);
            if (etx < 0) return;
            fim = etx + 1;
        } else {
            pendente_.remove(0, 1);
            continue;
        }
        const QByteArray pedido = pendente_.left(fim);
        pendente_.remove(0, fim);
        regista(pedido);
        const QByteArray resposta = trataPedido(pedido);
        if (!situacao_.silencio) respondeRegistando(resposta);
    }
}

QByteArray BalancaCS300::trataPedido(const QByteArray& pedido) {
    if (pedido.at(1) == ENQ) return trataLeitura();
    const QByteArray corpo = pedido.mid(2, pedido.size() - 3);
    const QByteArray registo = corpo.left(2);
    if (registo == "01" || registo == "03") return trataRegistoPreco(corpo);
    if (corpo == "08") return STX + QByteArrayLiteral("09") + ESC + estado_ + ETX;
    estado_ = "02";
    return QByteArray(1, NAK);
}

QByteArray BalancaCS300::trataRegistoPreco(const QByteArray& corpo) {
    if (situacao_.recusa) {
        estado_ = "11";
        return QByteArray(1, NAK);
    }
    const QList<QByteArray> campos = corpo.split(ESC);
    const bool comTara = corpo.startsWith("03");
    const bool valido = comTara
                            ? campos.size() == 4 && campos[3].size() == 4 && soDigitos(campos[3])
                            : campos.size() == 3 && campos[2].isEmpty();
    if (!valido || campos[1].size() != 6 || !soDigitos(campos[1])) {
        estado_ = "02";
        return QByteArray(1, NAK);
    }
    precoUnitarioCentimos_ = campos[1].toInt();
    taraGramas_ = comTara ? campos[3].toInt() : 0;
    estado_ = "00";
    return QByteArray(1, ACK);
}

QByteArray BalancaCS300::trataLeitura() {
    const int liquido = situacao_.pesoGramas - taraGramas_;
    QByteArray novoEstado;
    if (!precoUnitarioCentimos_) {
        novoEstado = "22";
    } else if (situacao_.instavel) {
        novoEstado = "20";
    } else if (situacao_.sobrecarga || liquido > 99'999) {
        novoEstado = "32";
    } else if (liquido < 0) {
        novoEstado = "31";
    }
    if (!novoEstado.isEmpty()) {
        estado_ = novoEstado;
        return QByteArray(1, NAK);
    }
    // Grams times cents per kilogram gives thousandths of a cent; the scale rounds half up.
    const qint64 preco =
        situacao_.precoCentimos.value_or((qint64{liquido} * *precoUnitarioCentimos_ + 500) / 1000);
    if (preco > 999'999) {
        estado_ = "32";
        return QByteArray(1, NAK);
    }
    estado_ = "00";
    return STX + QByteArrayLiteral("02") + ESC + '3' + ESC + digitos(liquido, 5) + ESC +
           digitos(*precoUnitarioCentimos_, 6) + ESC + digitos(preco, 6) + ETX;
}

void IndicadorD70::recebe(const QByteArray& bytes) {
    QMutexLocker trinco(&mutex_);
    pendente_ += bytes;
    for (qsizetype fim = pendente_.indexOf(CR); fim >= 0; fim = pendente_.indexOf(CR)) {
        const QByteArray comando = pendente_.left(fim + 1);
        pendente_.remove(0, fim + 1);
        regista(comando);
        if (!situacao_.silencio) respondeRegistando(trataComando(comando.trimmed()));
    }
}

QByteArray IndicadorD70::estado() const {
    if (situacao_.instavel) return "2100";
    if (situacao_.sobrecarga) return "2500";
    if (situacao_.pesoGramas == 0) return "B300";
    return "0000";
}

QByteArray IndicadorD70::trataComando(const QByteArray& comando) const {
    if (situacao_.recusa) return QByteArrayLiteral("??\r");
    if (comando == "EX") return QByteArrayLiteral("0000\r");
    if (comando == "XZ") return estado() + CR;
    if (comando != "Xn") return QByteArrayLiteral("??\r");
    const int g = situacao_.pesoGramas;
    const QByteArray kg = (g < 0 ? QByteArrayLiteral("-") : QByteArray()) +
                          QByteArray::number(std::abs(g) / 1000) + '.' +
                          digitos(std::abs(g) % 1000, 3);
    return '$' + kg.rightJustified(9, ' ') + QByteArrayLiteral(" kg").leftJustified(14, ' ') +
           estado() + CR;
}

}  // namespace devsim
