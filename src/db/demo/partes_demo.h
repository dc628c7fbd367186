#pragma once

#include "db/demo/escritor.h"

namespace brasel::db::demo {

// The pieces of the demo restaurant, each written through the same writer.
void escreveEmenta(Escritor& escritor);                            // VAT, groups, menu, barcodes
void escreveSala(Escritor& escritor, const QString& nomeEmpresa);  // shop, tables, till
void escreveDocumentos(Escritor& escritor);                        // document types

// The codes the pieces share.
inline const QString kArmazem = QStringLiteral("001");
inline const QString kCaixa = QStringLiteral("01");
inline const QString kConsumidorFinal = QStringLiteral("CF");
inline const QString kVendaDinheiro = QStringLiteral("VD");
inline const QString kFactura = QStringLiteral("FT");
inline const QString kDevolucaoDinheiro = QStringLiteral("DV");
inline const QString kNotaCredito = QStringLiteral("NC");
inline const QString kConsultaMesa = QStringLiteral("CM");

// Table codes of the dining room ("M01".."M20") and the terrace ("E01".."E04").
QStringList mesasSala();
QStringList mesasEsplanada();

}  // namespace brasel::db::demo
