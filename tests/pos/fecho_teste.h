#pragma once

// Shared by the closing tests: scripted answers to the closing's questions and the demo
// restaurant's tab of M01 under "VD" with a signing key.
#include "pos/adicionar_produto.h"
#include "pos/fecho_tab.h"
#include "pos/perguntas_fecho.h"
#include "pos/tab_teste.h"
#include "support/chave_teste.h"

#include <QDate>
#include <QStringList>

#include <optional>
#include <vector>

namespace brasel::pos::teste {

// Answers every question of the closing from a script; a question without an answer is
// cancelled.
class PerguntasFechoGravadas : public PerguntasFecho {
  public:
    QString utilizadorConfirmado = QStringLiteral("01");
    std::optional<cash::Pagamento> pagamentoDado;
    double descontoNoEcran = 0.0;  // applied through the screen's discount before answering
    std::optional<Currency> totalComDesconto;
    std::optional<DadosClienteDiverso> diverso;
    std::optional<std::vector<cash::ParcialPagamento>> divisao;
    devices::EscolhaImpressao escolha{devices::EscolhaImpressao::Nenhum, 0, false};
    bool supervisorAutoriza = false;
    QStringList perguntas;

    QString confirmaUtilizador() override {
        perguntas << QStringLiteral("utilizador");
        return utilizadorConfirmado;
    }
    std::optional<cash::Pagamento> pagamento(const QString&, Currency totalDoc,
                                             const AplicaDesconto& aplicaDesconto) override {
        perguntas << QStringLiteral("pagamento ") + totalDoc.toPlainText();
        if (descontoNoEcran > 0.0) totalComDesconto = aplicaDesconto(descontoNoEcran);
        return pagamentoDado;
    }
    void mostraTroco(const QString& documento, Currency, Currency, Currency troco) override {
        perguntas << QStringLiteral("troco ") + documento + QStringLiteral(" ") +
                         troco.toPlainText();
    }
    std::optional<DadosClienteDiverso> clienteDiverso(const DadosClienteDiverso&,
                                                      const QString& data) override {
        perguntas << QStringLiteral("diverso ") + data;
        return diverso;
    }
    std::optional<std::vector<cash::ParcialPagamento>> divisaoCaixa(
        Currency totalDoc, const QString& pagaComo) override {
        perguntas << QStringLiteral("divisao ") + totalDoc.toPlainText() + u' ' + pagaComo;
        return divisao;
    }
    devices::EscolhaImpressao escolhaImpressao(const QString& tipo) override {
        perguntas << QStringLiteral("impressao ") + tipo;
        return escolha;
    }
    bool autorizaSupervisor() override {
        perguntas << QStringLiteral("supervisor");
        return supervisorAutoriza;
    }
};

// A cash payment of `total` by "NU" with `entregou` handed over.
inline cash::Pagamento pagamentoNumerario(Currency total, Currency entregou) {
    cash::Pagamento p;
    p.pagaComo = QStringLiteral("NU");
    p.totalDoc = total;
    p.valorPagar = total;
    p.entregou = entregou;
    p.troco = entregou - total;
    return p;
}

class FechoTeste : public TabTeste {
  protected:
    FechoTeste() {
        testing::usaChaveTeste(estado());
        ano_ = QString::number(QDate::currentDate().year());
    }

    void adiciona(std::initializer_list<const char*> produtos) {
        for (const char* produto : produtos)
            ASSERT_GT(AdicionarProduto(tab_, p_, QString::fromLatin1(produto)), 0)
                << produto << m_.textos().join(u'|').toStdString();
    }
    void executa(const QString& sql, const QVariantList& valores = {}) {
        ASSERT_TRUE(estado().gConn.exec(sql, valores)) << estado().gConn.lastError().toStdString();
    }
    QString texto(const QString& sql, const QVariantList& valores = {}) {
        auto r = estado().gConn.firstRow(sql, valores);
        return r ? r->value(0).toString() : QStringLiteral("<nenhum>");
    }
    QString ultNumero(const char* tipo = "VD") {
        return texto(QStringLiteral("select UltNumero from TabTipoMov where codigo=?"),
                     {QString::fromLatin1(tipo)});
    }
    qint64 cabecalhos() { return contar(QStringLiteral("select count(*) from MovCliente")); }
    qint64 linhasAbertas() {
        return contar(
            QStringLiteral("select count(*) from MovProduto where Fechado='N' and Numero=''"));
    }
    qint64 linhasFechadas() {
        return contar(QStringLiteral("select count(*) from MovProduto where Fechado='S'"));
    }
    qint64 movimentosCaixa() { return contar(QStringLiteral("select count(*) from MovCaixa")); }

    // Nothing of a document may remain after a failed closing.
    void nadaGravado(qint64 linhasAntes, const QString& ultNumeroAntes) {
        EXPECT_EQ(cabecalhos(), 0);
        EXPECT_EQ(linhasFechadas(), 0);
        EXPECT_EQ(linhasAbertas(), linhasAntes);
        EXPECT_EQ(movimentosCaixa(), 0);
        EXPECT_EQ(ultNumero(), ultNumeroAntes);
        EXPECT_EQ(contar(QStringLiteral("select count(*) from ImpostosMovProduto where "
                                        "Numero<>''")),
                  0);
    }

    PerguntasFechoGravadas f_;
    QString ano_;
};

}  // namespace brasel::pos::teste
