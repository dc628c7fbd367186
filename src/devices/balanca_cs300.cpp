#include "devices/balanca_cs300.h"

#include "devices/caracteres_controlo.h"

#include <array>
#include <utility>

namespace brasel::devices {

namespace {

using namespace controlo;

// An amount written with `decimais` decimals and no point, left-filled with zeros to `largura`.
std::optional<QByteArray> campoNumerico(Currency valor, int decimais, int largura) {
    if (valor < Currency()) return std::nullopt;
    QByteArray digitos = valor.toText(decimais).toLatin1();
    digitos.replace('.', QByteArray());
    // The whole part of a value below one is a zero the field does not need.
    while (digitos.size() > 1 && digitos.startsWith('0'))
        digitos.remove(0, 1);
    if (digitos.size() > largura) return std::nullopt;
    return digitos.rightJustified(largura, '0');
}

bool soDigitos(const QByteArray& texto) {
    for (char c : texto) {
        if (c < '0' || c > '9') return false;
    }
    return true;
}

// The amount in columns `inicio` (counted from 1) onwards: `inteiros` whole digits then
// `decimais` decimal digits; nothing when the reply is shorter or they are not all digits.
std::optional<Currency> decimal(const QByteArray& resposta, int inicio, int inteiros,
                                int decimais) {
    const QByteArray parte = resposta.mid(inicio - 1, inteiros + decimais);
    if (parte.size() != inteiros + decimais || !soDigitos(parte)) return std::nullopt;
    return Currency::parse(QString::fromLatin1(parte.left(inteiros) + '.' + parte.mid(inteiros)));
}

// An acknowledgement is one byte; a reading or a status ends with ETX.
bool respostaCompleta(const QByteArray& r) {
    return !r.isEmpty() && (r.at(0) == ACK || r.at(0) == NAK || r.contains(ETX));
}

}  // namespace

std::optional<QByteArray> campoPrecoCS300(Currency preco) {
    return campoNumerico(preco, 2, 6);
}

std::optional<QByteArray> campoTaraCS300(Currency tara) {
    return campoNumerico(tara, 3, 4);
}

PedidoCS300 pedidoPrecoCS300(Currency precoUnitario, Currency tara) {
    const auto preco = campoPrecoCS300(precoUnitario);
    if (!preco) return {{}, *textoEstadoCS300("11")};
    if (tara <= Currency()) {
        return {EOT + (STX + QByteArrayLiteral("01")) + ESC + *preco + ESC + ETX, {}};
    }
    const auto campoTara = campoTaraCS300(tara);
    if (!campoTara) return {{}, *textoEstadoCS300("12")};
    return {EOT + (STX + QByteArrayLiteral("03")) + ESC + *preco + ESC + *campoTara + ETX, {}};
}

std::optional<LeituraCS300> leituraCS300(const QByteArray& resposta) {
    if (!resposta.startsWith(STX)) return std::nullopt;
    const auto peso = decimal(resposta, 7, 2, 3);
    const auto pvp = decimal(resposta, 20, 4, 2);
    if (!peso || !pvp) return std::nullopt;
    return LeituraCS300{*peso, *pvp};
}

std::optional<QString> textoEstadoCS300(const QByteArray& estado) {
    static const std::array<std::pair<const char*, const char*>, 14> textos{{
        {"", "Erro de comunicação com a balança"},
        {"00", ""},
        {"01", "Erro geral na balança"},
        {"02", "Erro de Paridade, our excesso de caracteres permitidos"},
        {"10", "Reconhecimento de número de registo errado"},
        {"11", "Preço de base inválido"},
        {"12", "Não foi recebida nenhuma tara válida"},
        {"13", "Não foi recebido nenhum texto válido"},
        {"20", "Balança instável"},
        {"21", "Desde a última pesagem não se verificou nenhum movimento"},
        {"22", "Ainda não existe nenhum cálculo de preço"},
        {"30", "A balança encontra-se no alcance mínimo de pesagem"},
        {"31", "Balança abaixo do zero ou com indicação negativa de peso"},
        {"32", "Balança em sobrecarga (além do alcança máximo permitido)"},
    }};
    for (const auto& [codigo, texto] : textos) {
        if (estado == codigo) return QString::fromUtf8(texto);
    }
    return std::nullopt;
}

bool clsCS300::Pesagem(Currency precoUnitario, Currency tara, double segundos) {
    const PedidoCS300 pedido = pedidoPrecoCS300(precoUnitario, tara);
    if (pedido.bytes.isEmpty()) {
        erro_ = pedido.erro;
        return false;
    }
    if (pergunta(pedido.bytes, segundos, respostaCompleta) != QByteArray(1, ACK)) {
        consultaEstado(segundos);
        return false;
    }
    const QByteArray resposta = pergunta(QByteArray() + EOT + ENQ, segundos, respostaCompleta);
    const auto leitura = leituraCS300(resposta);
    // A refusal, a silence or a garbled reading: the scale's status says why.
    if (!leitura) {
        consultaEstado(segundos);
        return false;
    }
    peso_ = leitura->peso;
    pvp_ = leitura->pvp;
    return true;
}

void clsCS300::consultaEstado(double segundos) {
    const QByteArray resposta =
        pergunta(EOT + (STX + QByteArrayLiteral("08")) + ETX, segundos, respostaCompleta);
    const auto texto = textoEstadoCS300(resposta.mid(4, 2));
    if (texto) erro_ = *texto;
}

}  // namespace brasel::devices
