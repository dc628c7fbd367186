// The tables of a user's ClientesDiv: slots of 11 characters, the last without its separator.
#include "pos/mesas.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::pos {
namespace {

TEST(MesasDoUtilizador, SlotsDeOnzeCaracteres) {
    struct Caso {
        const char* clientesDiv;
        const char* mesas;  // "|" between them
    };
    const Caso casos[] = {
        {"", ""},
        // 21 characters: two codes and the one separator between them.
        {"M01       ;M02       ", "M01|M02"},
        // 25 characters: still two; what follows the 22nd is ignored.
        {"M01       ;M02       ;M03", "M01|M02"},
        {"M01       ;M02       ;M03       ", "M01|M02|M03"},
        // A lone code shorter than half a slot is no slot at all.
        {"M01", ""},
        {"M'01      ", "M'01"},
        {"          ;M02       ", "M02"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.clientesDiv);
        EXPECT_EQ(MesasDoUtilizador(QString::fromLatin1(c.clientesDiv)),
                  QString::fromLatin1(c.mesas).split(u'|', Qt::SkipEmptyParts));
    }
}

}  // namespace
}  // namespace brasel::pos
