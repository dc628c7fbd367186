#pragma once

#include "app/estado.h"
#include "db/procedimentos/mete_no_mov_pro.h"

#include <QString>

#include <cstdint>
#include <stdexcept>

namespace brasel::documents::teste {

inline Currency C(const char* texto) {
    return *Currency::parse(QString::fromLatin1(texto));
}

// A line of stock history as the back office would have posted it.
inline db::ValoresMovPro movimento(const char* produto, const char* afectaStk, const char* quant,
                                   const char* preco = "0", const char* armazem = "001",
                                   const char* data = "2026-01-10") {
    db::ValoresMovPro v;
    v.Codigo = QString::fromLatin1(produto);
    v.AfectaStk = QString::fromLatin1(afectaStk);
    v.QuantNormal = C(quant);
    v.Preco = C(preco);
    v.ValorIliq = v.QuantNormal * v.Preco;
    v.Armazem = QString::fromLatin1(armazem);
    v.Data = QString::fromLatin1(data);
    v.Ano = v.Data.left(4);
    v.Fechado = QStringLiteral("S");
    return v;
}

// Stores a line as it is, without the posting's checks; a failure stops the test loudly.
inline std::int64_t grava(app::Estado& estado, db::ValoresMovPro v) {
    const std::int64_t n = db::MeteNoMovPro(estado.gConn, v);
    if (n < 1) throw std::runtime_error(estado.gConn.lastError().toStdString());
    return n;
}

// An open sales line of table M01 as the order screen posts it.
inline db::ValoresMovPro linhaVenda(const char* produto, const char* quant,
                                    const char* preco = "1") {
    db::ValoresMovPro v = movimento(produto, "S+", quant, preco, "001", "2026-03-02");
    v.Tipo = QStringLiteral("VD");
    v.CliFor = QStringLiteral("C");
    v.Terceiro = QStringLiteral("M01");
    v.AfectaCli = QStringLiteral("S+");
    v.Aplic = QStringLiteral("FC");
    v.Utilizador = QStringLiteral("SUPERVISOR");
    v.Fechado = QStringLiteral("N");
    return v;
}

}  // namespace brasel::documents::teste
