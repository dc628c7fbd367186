#include "devices/linha_serie.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::devices {
namespace {

TEST(DefinicoesSerieTeste, TextoDasDefinicoes) {
    struct Caso {
        const char* texto;
        bool valido;
        qint32 baud = 0;
        QSerialPort::Parity paridade = QSerialPort::NoParity;
        QSerialPort::DataBits dados = QSerialPort::Data8;
        QSerialPort::StopBits paragem = QSerialPort::OneStop;
        double bits = 0;
    };
    const Caso casos[] = {
        {"9600,n,8,1", true, 9600, QSerialPort::NoParity, QSerialPort::Data8, QSerialPort::OneStop,
         10},
        {"9600,o,7,1", true, 9600, QSerialPort::OddParity, QSerialPort::Data7, QSerialPort::OneStop,
         10},
        {" 2400 , E , 7 , 2 ", true, 2400, QSerialPort::EvenParity, QSerialPort::Data7,
         QSerialPort::TwoStop, 11},
        {"4800,m,5,1.5", true, 4800, QSerialPort::MarkParity, QSerialPort::Data5,
         QSerialPort::OneAndHalfStop, 8.5},
        {"1200,s,6,1", true, 1200, QSerialPort::SpaceParity, QSerialPort::Data6,
         QSerialPort::OneStop, 9},
        {"9600,x,8,1", false},
        {"9600,n,9,1", false},
        {"9600,n,4,1", false},
        {"9600,n,8,3", false},
        {"0,n,8,1", false},
        {"-9600,n,8,1", false},
        {"rápido,n,8,1", false},
        {"9600,n,8", false},
        {"9600,n,8,1,1", false},
        {"", false},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.texto);
        const auto d = DefinicoesSerie::ler(QString::fromUtf8(c.texto));
        ASSERT_EQ(d.has_value(), c.valido);
        if (!d) continue;
        EXPECT_EQ(d->baud, c.baud);
        EXPECT_EQ(d->paridade, c.paridade);
        EXPECT_EQ(d->bitsDados, c.dados);
        EXPECT_EQ(d->bitsParagem, c.paragem);
        EXPECT_DOUBLE_EQ(d->bitsPorCaracter(), c.bits);
    }
}

TEST(LinhaSerieSemDispositivo, DefinicoesInvalidasNaoMudamAsAnteriores) {
    LinhaSerie linha;
    EXPECT_EQ(linha.Settings(), QStringLiteral("9600,n,8,1"));
    EXPECT_FALSE(linha.setSettings(QStringLiteral("9600,x,8,1")));
    EXPECT_EQ(linha.Settings(), QStringLiteral("9600,n,8,1"));
    EXPECT_TRUE(linha.setSettings(QStringLiteral("9600,o,7,1")));
    EXPECT_EQ(linha.Settings(), QStringLiteral("9600,o,7,1"));
    // Without a map, COM n is the system's n-th serial port.
    linha.setCommPort(2);
    EXPECT_EQ(linha.dispositivo(), QStringLiteral("/dev/ttyS1"));
}

}  // namespace
}  // namespace brasel::devices
