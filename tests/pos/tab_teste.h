#pragma once

// Shared by the tab tests: scripted answers to the tab's questions and an open demo company with
// the tab of table M01 under the cash-sale type.
#include "pos/abertura_mesa.h"
#include "pos/perguntas_tab.h"
#include "pos/tab.h"
#include "pricing/valores_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/mensagens_gravadas.h"

#include <QList>
#include <QSqlQuery>
#include <QString>
#include <QVariant>

#include <gtest/gtest.h>

#include <deque>
#include <optional>

namespace brasel::pos::teste {

// Answers every question from a script; a question without an answer is cancelled.
class PerguntasGravadas : public PerguntasTab {
  public:
    bool password = true;
    std::deque<std::optional<Currency>> numeros;
    std::optional<QString> mesaEscolhida;
    std::optional<QString> tipoEscolhido;
    std::optional<LoteEscolhido> loteEscolhido;
    std::optional<ReferenciaEscolhida> referenciaEscolhida;
    PrecoQuant precoQuant;
    Currency peso;
    QStringList perguntas;

    bool passwordSupervisor() override {
        perguntas << QStringLiteral("password");
        return password;
    }
    std::optional<Currency> pedirValor(const QString& titulo) override {
        perguntas << titulo;
        if (numeros.empty()) return std::nullopt;
        const auto n = numeros.front();
        numeros.pop_front();
        return n;
    }
    std::optional<QString> pedirTexto(const QString& titulo, const QString&, bool) override {
        perguntas << titulo;
        return std::nullopt;
    }
    std::optional<QString> mesa() override {
        perguntas << QStringLiteral("mesa");
        return mesaEscolhida;
    }
    std::optional<QString> tipoMovimento() override {
        perguntas << QStringLiteral("tipo");
        return tipoEscolhido;
    }
    std::optional<LoteEscolhido> lote(const QString&, Currency jaLancado) override {
        perguntas << QStringLiteral("lote ") + jaLancado.toPlainText();
        return loteEscolhido;
    }
    std::optional<ReferenciaEscolhida> referencia(const QString&) override {
        perguntas << QStringLiteral("referencia");
        return referenciaEscolhida;
    }
    PrecoQuant pedir(const QString& codigo, const PropostaPrecoQuant&) override {
        perguntas << QStringLiteral("precoQuant ") + codigo;
        return precoQuant;
    }
    Currency pesa(Currency precoUnitario) override {
        perguntas << QStringLiteral("pesa ") + precoUnitario.toPlainText();
        return peso;
    }
};

// The demo restaurant with SUPERVISOR's tab of M01 under "VD" open and empty.
class TabTeste : public ::testing::Test {
  protected:
    TabTeste() : e_(true), tab_(e_.estado(), m_, linha_) {
        tab_.definirTipo(QStringLiteral("VD"));
        AbrirMesa(tab_, QStringLiteral("M01"));
    }

    app::Estado& estado() { return e_.estado(); }

    qint64 contar(const QString& sql, const QVariantList& valores = {}) {
        auto r = estado().gConn.firstRow(sql, valores);
        return r ? r->value(0).toLongLong() : -1;
    }
    qint64 linhasMovProduto() { return contar(QStringLiteral("select count(*) from MovProduto")); }
    qint64 pedidosCozinha() { return contar(QStringLiteral("select count(*) from HistoricoCopa")); }
    qint64 ligacoes() { return contar(QStringLiteral("select count(*) from MovProduto_Ligacoes")); }

    // A line of another user on `mesa` under "VD".
    void linhaDe(const char* loginTexto, const char* mesaTexto, const char* produtoTexto,
                 const char* ivaTexto) {
        const QString login = QString::fromLatin1(loginTexto);
        const QString mesa = QString::fromLatin1(mesaTexto);
        const QString produto = QString::fromLatin1(produtoTexto);
        const QString iva = QString::fromLatin1(ivaTexto);
        ASSERT_TRUE(estado().gConn.exec(
            QStringLiteral("insert into MovProduto (Codigo,Descricao,Tipo,Numero,CliFor,Terceiro,"
                           "Utilizador,Fechado,IvaTabela,QuantNormal,Preco,ValorIliq,SelecFecha,"
                           "Identifica) values (?,?,'VD','','C',?,?,'N',?,1,1,1,1,?)"),
            {produto, produto, mesa, login, iva, produto + login + mesa}));
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaTeste e_;
    testing::MensagensGravadas m_;
    devices::LinhaSerie linha_;
    PerguntasGravadas p_;
    Tab tab_;
};

}  // namespace brasel::pos::teste
