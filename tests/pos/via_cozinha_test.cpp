// Which way this workstation prints the kitchen's tickets: its own kitchen setting first, the
// user's ticket printer when that setting is empty.
#include "pos/cozinha/polling_cozinha.h"

#include <gtest/gtest.h>

namespace brasel::pos::cozinha {
namespace {

TEST(EscolheViaCozinha, TheWorkstationSettingDecidesBeforeTheUsersPrinter) {
    struct Caso {
        const char* cozinha;
        const char* talao;
        ViaCozinha via;
    } casos[] = {
        {"", "COM", ViaCozinha::Serie},      {"", "LPT", ViaCozinha::Windows},
        {"", " lpt ", ViaCozinha::Windows},  {"", "", ViaCozinha::Nenhuma},
        {"", "PAR", ViaCozinha::Nenhuma},  // the user's column knows no "PAR"
        {"COM", "LPT", ViaCozinha::Serie},   {"PAR", "COM", ViaCozinha::Windows},
        {"LPT", "COM", ViaCozinha::Nenhuma},  // nor the workstation's "LPT"
        {"  ", "COM", ViaCozinha::Serie},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(std::string(c.cozinha) + "/" + c.talao);
        EXPECT_EQ(EscolheViaCozinha(QString::fromUtf8(c.cozinha), QString::fromUtf8(c.talao)),
                  c.via);
    }
}

}  // namespace
}  // namespace brasel::pos::cozinha
