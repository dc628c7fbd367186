#include "pricing/leitura.h"

#include "common/number_text.h"

namespace brasel::pricing {

QString tabelaTerceiro(const QString& tipoTerceiro) {
    const QString tipo = tipoTerceiro.trimmed().toUpper();
    if (tipo == u"C") return QStringLiteral("Clientes");
    if (tipo == u"F") return QStringLiteral("Fornece");
    return {};
}

double percentagem(const QVariant& valor) {
    if (valor.isNull() || !valor.isValid()) return 0.0;
    if (valor.typeId() == QMetaType::QString) return TextoParaNumero(valor.toString());
    return valor.toDouble();
}

QString textoSql(const QString& texto) {
    return texto.isNull() ? QStringLiteral("") : texto;
}

bool ligado(const QVariant& valor) {
    const QString texto = valor.toString().trimmed();
    return texto == u"1" || texto.compare(u"S", Qt::CaseInsensitive) == 0;
}

TransacaoSeNecessaria::TransacaoSeNecessaria(db::Connection& conn) {
    if (!conn.inTransaction()) propria_.emplace(conn);
}

bool TransacaoSeNecessaria::active() const {
    return !propria_ || propria_->active();
}

bool TransacaoSeNecessaria::commit() {
    return !propria_ || propria_->commit();
}

}  // namespace brasel::pricing
