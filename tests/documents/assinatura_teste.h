#pragma once

// What the signature tests share on either engine: the document types, a document signed and
// stored as the closing stores it, and the reading back of a stored header.
#include "app/estado.h"
#include "documents/assinatura.h"

#include <QString>

#include <gtest/gtest.h>

namespace brasel::documents::teste {

// FR1 signed with the sequence check, FS signed without it, NS not signed, CP copies (signed
// type), CN copies of an unsigned type, VF a supplier type.
inline void criaTipos(db::Connection& conn) {
    struct Tipo {
        const char* codigo;
        int controlo;
        int copia;
        const char* modulo;
    };
    const Tipo tipos[] = {{"FR1", 1, 0, "FC"}, {"FS", 2, 0, "FC"}, {"NS", 0, 0, "FC"},
                          {"CP", 1, 1, "FC"},  {"CN", 0, 1, "FC"}, {"VF", 2, 0, "FF"}};
    for (const Tipo& t : tipos) {
        ASSERT_TRUE(conn.exec(
            QStringLiteral("insert into TabTipoMov (codigo, Descricao, UltNumero, "
                           "Modulo, ControloHash, CopiaDocumentoOriginal) "
                           "values (?,?,?,?,?,?)"),
            {QString::fromLatin1(t.codigo), QStringLiteral("Tipo d'teste"),
             QStringLiteral("00000000"), QString::fromLatin1(t.modulo), t.controlo, t.copia}))
            << conn.lastError().toStdString();
    }
}

struct Documento {
    bool ok = false;
    Assinatura assinatura;
    QString dataSys;
};

// Signs a document as the closing does, and stores its header when signed (or left unsigned).
inline Documento assinaEGrava(app::Estado& e, db::Connection& conn, const QString& tipo,
                              const QString& numero, const QString& data, const QString& total,
                              QChar terceiro = u'C', const QString& dataSys = {}) {
    Documento d;
    d.dataSys = dataSys.isEmpty() ? data + QStringLiteral(" 10:00:00") : dataSys;
    d.ok = AssinaDocumento(e, conn, d.assinatura, d.dataSys, tipo, numero, data,
                           *Currency::parse(total), terceiro);
    if (!d.ok) return d;
    const QString tabela =
        terceiro == u'F' ? QStringLiteral("MovFornece") : QStringLiteral("MovCliente");
    EXPECT_TRUE(conn.exec(QStringLiteral("insert into ") + tabela +
                              QStringLiteral(" (Tipo, Numero, Ano, Data, DataSys, TotalDoc, Hash, "
                                             "HashControl, NotaCertificacao, Modulo) "
                                             "values (?,?,?,?,?,?,?,?,?,?)"),
                          {tipo, numero, data.left(4), data, d.dataSys, total, d.assinatura.hash,
                           d.assinatura.assinou, d.assinatura.notaCertificacao,
                           terceiro == u'F' ? QStringLiteral("FF") : QStringLiteral("FC")}))
        << conn.lastError().toStdString();
    return d;
}

}  // namespace brasel::documents::teste
