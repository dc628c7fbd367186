#include "lookups/colunas_lista.h"

#include "common/number_text.h"

#include <QStringList>

#include <cmath>
#include <cstdint>

namespace brasel::lookups {

namespace {

Alinhamento lerAlinhamento(QStringView letra) {
    const QString l = letra.trimmed().toString().toUpper();
    if (l == u"D") return Alinhamento::Direita;
    if (l == u"C") return Alinhamento::Centro;
    return Alinhamento::Esquerda;
}

TipoColuna lerTipo(QStringView tipo) {
    const QString t = tipo.trimmed().toString().toUpper();
    if (t == u"DATA") return TipoColuna::Data;
    if (t == u"VALOR") return TipoColuna::Valor;
    return TipoColuna::Texto;
}

bool soDigitos(QStringView texto) {
    if (texto.isEmpty()) return false;
    for (const QChar c : texto) {
        if (!c.isDigit()) return false;
    }
    return true;
}

}  // namespace

std::vector<ColunaLista> lerColunasLista(const QString& formato) {
    std::vector<ColunaLista> colunas;
    if (formato.trimmed().isEmpty()) return colunas;
    QString texto = formato;
    if (!texto.endsWith(u'/')) texto += u'/';
    // Every entry ends with its "/": what follows the last one is nothing.
    const QStringList entradas = texto.split(u'/');
    for (qsizetype i = 0; i + 1 < entradas.size(); ++i) {
        if (static_cast<int>(colunas.size()) == kMaxColunasLista) break;
        const QStringList partes = entradas[i].split(u',');
        ColunaLista coluna;
        coluna.titulo = partes.value(0);
        coluna.larguraTwips = partes.value(1).trimmed().toInt();
        if (partes.size() > 2) coluna.alinhamento = lerAlinhamento(partes[2]);
        if (partes.size() > 3) coluna.tipo = lerTipo(partes[3]);
        colunas.push_back(coluna);
    }
    return colunas;
}

int twipsParaPixeis(int twips, double dpi) {
    return static_cast<int>(std::lround(twips * dpi / kTwipsPorPolegada));
}

QString chaveOrdenacaoData(QStringView texto) {
    const QStringView t = texto.trimmed();
    if (t.size() < 10) return {};
    const QStringView data = t.left(10);
    const QStringView resto = t.mid(10);
    const auto separador = [](QChar c) { return c == u'-' || c == u'/'; };
    QStringView ano, mes, dia;
    if (separador(data[4]) && separador(data[7])) {
        ano = data.mid(0, 4);
        mes = data.mid(5, 2);
        dia = data.mid(8, 2);
    } else if (separador(data[2]) && separador(data[5])) {
        dia = data.mid(0, 2);
        mes = data.mid(3, 2);
        ano = data.mid(6, 4);
    } else {
        return {};
    }
    if (!soDigitos(ano) || !soDigitos(mes) || !soDigitos(dia)) return {};
    if (!resto.isEmpty() && resto.front() != u' ' && resto.front() != u'T') return {};
    QString chave = ano.toString() + u'-' + mes.toString() + u'-' + dia.toString();
    if (!resto.isEmpty()) chave += u' ' + resto.mid(1).trimmed().toString();
    return chave;
}

QString chaveOrdenacaoValor(QStringView texto) {
    const auto valor = TextoParaValor(texto);
    if (!valor) return {};
    // Offset binary: the most negative amount becomes 0, so the unsigned figures, written with
    // the same number of digits, compare as text in the order of the amounts.
    const auto deslocado = static_cast<std::uint64_t>(valor->raw()) ^ (std::uint64_t{1} << 63);
    return QStringLiteral("%1").arg(static_cast<qulonglong>(deslocado), 20, 10, QChar(u'0'));
}

QString chaveOrdenacao(TipoColuna tipo, QStringView texto) {
    switch (tipo) {
        case TipoColuna::Data:
            return chaveOrdenacaoData(texto);
        case TipoColuna::Valor:
            return chaveOrdenacaoValor(texto);
        case TipoColuna::Texto:
            break;
    }
    return texto.toString();
}

}  // namespace brasel::lookups
