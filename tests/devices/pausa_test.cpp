#include "devices/pausa.h"
#include "support/aplicacao_gui.h"

#include <QElapsedTimer>
#include <QTimer>

#include <gtest/gtest.h>

#include <ctime>

namespace brasel::devices {
namespace {

// The printing pause waits a second while the message loop goes on (the kitchen poll may run),
// and the processor is left alone meanwhile.
TEST(PausaTeste, UmSegundoSemOcuparOProcessador) {
    testing::aplicacaoGui();
    bool temporizadorCorreu = false;
    QTimer::singleShot(100, [&] { temporizadorCorreu = true; });
    QElapsedTimer relogio;
    relogio.start();
    const std::clock_t cpuAntes = std::clock();
    Pausa(1);
    const double cpuSegundos = static_cast<double>(std::clock() - cpuAntes) / CLOCKS_PER_SEC;
    EXPECT_GE(relogio.elapsed(), 1000);
    EXPECT_LT(relogio.elapsed(), 1500);
    EXPECT_LT(cpuSegundos, 0.2);
    EXPECT_TRUE(temporizadorCorreu);
}

TEST(PausaTeste, ZeroOuNegativoNaoEspera) {
    QElapsedTimer relogio;
    relogio.start();
    Pausa(0);
    Pausa(-5);
    EXPECT_LT(relogio.elapsed(), 100);
}

}  // namespace
}  // namespace brasel::devices
