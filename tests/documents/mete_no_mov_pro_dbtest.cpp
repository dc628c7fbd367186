// The line-posting procedure on an embedded company: every one of its values lands in its own
// column, texts are stored as given, and each line gets a key no other line has.
#include "db/procedimentos/mete_no_mov_pro.h"
#include "documents/movimentos_teste.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"

#include <QRegularExpression>
#include <QSet>

#include <gtest/gtest.h>

namespace brasel::db {
namespace {

class MeteNoMovProEmpresa : public ::testing::Test {
  protected:
    testing::EmpresaTeste empresa_{true};
    app::Estado& e = empresa_.estado();

    QSqlRecord linha(std::int64_t n) {
        const auto r =
            e.gConn.firstRow(QStringLiteral("select * from MovProduto where NumRegisto=?"),
                             {QVariant::fromValue<qlonglong>(n)});
        EXPECT_TRUE(r.has_value());
        return r.value_or(QSqlRecord());
    }
};

// Each parameter gets a value of its own (texts the column's name, numbers its position), so a
// value bound to the wrong column shows up by name.
TEST_F(MeteNoMovProEmpresa, EveryParameterLandsInItsOwnColumn) {
    ValoresMovPro v;
    int posicao = 0;
    for (const CampoMovPro& c : camposMovPro()) {
        ++posicao;
        std::visit(
            [&](auto membro) {
                using T = std::decay_t<decltype(v.*membro)>;
                if constexpr (std::is_same_v<T, QString>) {
                    v.*membro = QString::fromLatin1(c.coluna);
                } else if constexpr (std::is_same_v<T, Currency>) {
                    v.*membro = Currency::fromRaw(posicao * 10000 + 25);
                } else {
                    v.*membro = static_cast<T>(posicao);
                }
            },
            c.campo);
    }
    ASSERT_EQ(camposMovPro().size(), 105u);
    const std::int64_t n = MeteNoMovPro(e.gConn, v);
    ASSERT_GT(n, 0) << e.gConn.lastError().toStdString();
    const QSqlRecord r = linha(n);
    for (const CampoMovPro& c : camposMovPro()) {
        const QString coluna = QString::fromLatin1(c.coluna);
        const QVariant guardado = r.value(coluna);
        const QVariant enviado = valorParaColuna(v, c);
        if (std::holds_alternative<Currency ValoresMovPro::*>(c.campo)) {
            EXPECT_EQ(Currency::fromVariant(guardado), Currency::fromVariant(enviado))
                << coluna.toStdString();
        } else if (std::holds_alternative<double ValoresMovPro::*>(c.campo)) {
            EXPECT_DOUBLE_EQ(guardado.toDouble(), enviado.toDouble()) << coluna.toStdString();
        } else {
            EXPECT_EQ(guardado.toString(), enviado.toString()) << coluna.toStdString();
        }
    }
}

TEST_F(MeteNoMovProEmpresa, TextsWithQuotesAndSqlAreStoredUnchanged) {
    ValoresMovPro v = documents::teste::linhaVenda("B001", "1");
    v.ObsLinha = QStringLiteral("sem gelo, 'bem' fresca\"; delete from MovProduto; --");
    v.Terceiro = QStringLiteral("M'01");
    v.Descricao = QString::fromUtf8("Água d'Ouro");
    const std::int64_t n = MeteNoMovPro(e.gConn, v);
    ASSERT_GT(n, 0) << e.gConn.lastError().toStdString();
    const QSqlRecord r = linha(n);
    EXPECT_EQ(r.value(QStringLiteral("ObsLinha")).toString(), v.ObsLinha);
    EXPECT_EQ(r.value(QStringLiteral("Terceiro")).toString(), v.Terceiro);
    EXPECT_EQ(r.value(QStringLiteral("Descricao")).toString(), v.Descricao);
}

TEST_F(MeteNoMovProEmpresa, EachLineGetsAKeyOfItsOwnAndAKeyInUseIsRefused) {
    QSet<QString> chaves;
    std::int64_t anterior = 0;
    for (int i = 0; i < 5; ++i) {
        ValoresMovPro v = documents::teste::linhaVenda("B001", "1");
        const std::int64_t n = MeteNoMovPro(e.gConn, v);
        ASSERT_GT(n, anterior);
        anterior = n;
        EXPECT_FALSE(v.Identifica.isEmpty());
        EXPECT_EQ(linha(n).value(QStringLiteral("Identifica")).toString(), v.Identifica);
        chaves.insert(v.Identifica);
    }
    EXPECT_EQ(chaves.size(), 5);

    ValoresMovPro repetida = documents::teste::linhaVenda("B002", "1");
    repetida.Identifica = *chaves.begin();
    EXPECT_LT(MeteNoMovPro(e.gConn, repetida), 1);
    EXPECT_EQ(repetida.Identifica, *chaves.begin());
    const auto contagem =
        e.gConn.firstRow(QStringLiteral("select count(*) from MovProduto where Codigo='B002'"));
    ASSERT_TRUE(contagem);
    EXPECT_EQ(contagem->value(0).toInt(), 0);
}

TEST_F(MeteNoMovProEmpresa, TheTimeStampIsTheServersUnlessOneIsGiven) {
    ValoresMovPro agora = documents::teste::linhaVenda("B001", "1");
    ValoresMovPro dada = agora;
    dada.DataSys = QStringLiteral("2020-05-06 07:08:09");
    const QString servidor =
        linha(MeteNoMovPro(e.gConn, agora)).value(QStringLiteral("DataSys")).toString();
    EXPECT_TRUE(QRegularExpression(QStringLiteral("^\\d{4}-\\d\\d-\\d\\d \\d\\d:\\d\\d:\\d\\d$"))
                    .match(servidor)
                    .hasMatch())
        << servidor.toStdString();
    EXPECT_EQ(linha(MeteNoMovPro(e.gConn, dada)).value(QStringLiteral("DataSys")).toString(),
              dada.DataSys);
}

}  // namespace
}  // namespace brasel::db
