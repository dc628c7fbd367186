#pragma once

// Shared by the receipt tests: a closed cash sale of the demo restaurant written straight into
// its tables (header, lines, payment, another tax), as a closing leaves it.
#include "db/demo/escritor.h"
#include "devices/definicao_impressora.h"
#include "devices/linha_serie.h"
#include "documents/assinatura.h"
#include "documents/chave_assinatura.h"
#include "impressora.h"
#include "support/aplicacao_gui.h"
#include "support/apoio_arranque.h"
#include "support/devsim_teste.h"
#include "support/empresa_teste.h"
#include "support/mensagens_gravadas.h"

#include <QString>

#include <memory>

#include <gtest/gtest.h>

namespace brasel::devices::teste {

struct OpcoesDocumento {
    QString tipo = QStringLiteral("VD");
    QString numero = QStringLiteral("00000007");
    QString ano = QStringLiteral("2026");
    QString entregou = QStringLiteral("50");
    QString observa = QStringLiteral("Mesa junto à janela\r\nSem pressa");
    QString nota = QStringLiteral("AbCd-Processado por Programa Certificado nº 0000/DGCI");
};

// Three lines: a dish at 13% with VAT added, a water and a wine (sold by the glass) at 23% with
// VAT inside their prices; 33.05 in all, paid in cash.
inline void escreveDocumento(db::Connection& conn, const OpcoesDocumento& o = {}) {
    ASSERT_TRUE(conn.exec(QStringLiteral("insert into OutUnidades (Codigo,descricao) select ?,? "
                                         "where not exists (select 1 from OutUnidades where "
                                         "Codigo=?)"),
                          {QStringLiteral("CP"), QStringLiteral("Copo"), QStringLiteral("CP")}));
    db::demo::Escritor e(conn);
    e.inserir(QStringLiteral("MovCliente"),
              {{QStringLiteral("Tipo"), o.tipo},
               {QStringLiteral("Numero"), o.numero},
               {QStringLiteral("Ano"), o.ano},
               {QStringLiteral("Data"), o.ano + QStringLiteral("-03-14")},
               {QStringLiteral("DataSys"), o.ano + QStringLiteral("-03-14 13:45:10")},
               {QStringLiteral("Codigo"), QStringLiteral("M01")},
               {QStringLiteral("Descricao"), QStringLiteral("Mesa 1 (João & Filhos)")},
               {QStringLiteral("Morada"), QStringLiteral("Rua da Prata, 5")},
               {QStringLiteral("Local"), QStringLiteral("Lisboa")},
               {QStringLiteral("CodPostal"), QStringLiteral("1100-148")},
               {QStringLiteral("Contribuinte"), QStringLiteral("123456789")},
               {QStringLiteral("Afecta"), QStringLiteral("S+")},
               {QStringLiteral("Modulo"), QStringLiteral("FC")},
               {QStringLiteral("Armazem"), QStringLiteral("001")},
               {QStringLiteral("Utilizador"), QStringLiteral("02")},
               {QStringLiteral("PagaComo"), QStringLiteral("NU")},
               {QStringLiteral("Valor"), QStringLiteral("29.31")},
               {QStringLiteral("Desconto"), QStringLiteral("0.40")},
               {QStringLiteral("IVA"), QStringLiteral("4.14")},
               {QStringLiteral("DescontoFinanceiro"), QStringLiteral("0")},
               {QStringLiteral("TotalDoc"), QStringLiteral("33.05")},
               {QStringLiteral("Entregou"), o.entregou},
               {QStringLiteral("Observa"), o.observa},
               {QStringLiteral("NotaCertificacao"), o.nota}});
    struct Linha {
        const char* descricao;
        const char* quant;
        const char* preco;
        const char* iliq;
        const char* desconto;
        const char* iva;
        const char* tabela;
        const char* taxa;
        const char* outUni;
        const char* outQuant;
        const char* hora;
    };
    const Linha linhas[] = {
        {"Bife à casa com batata frita", "2", "12.5", "25", "0", "3.25", "IT", "13", "", "0",
         "12:58:00"},
        {"Água 50cl", "1", "1.2", "1.2", "0", "0.22", "NO", "23", "", "0", "12:41:30"},
        {"Vinho tinto", "0.5", "8", "4", "0.4", "0.67", "NO", "23", "CP", "3", "13:02:00"},
    };
    for (const Linha& l : linhas) {
        e.inserir(QStringLiteral("MovProduto"),
                  {{QStringLiteral("Tipo"), o.tipo},
                   {QStringLiteral("Numero"), o.numero},
                   {QStringLiteral("Ano"), o.ano},
                   {QStringLiteral("CliFor"), QStringLiteral("C")},
                   {QStringLiteral("Terceiro"), QStringLiteral("M01")},
                   {QStringLiteral("Fechado"), QStringLiteral("S")},
                   {QStringLiteral("Descricao"), QString::fromUtf8(l.descricao)},
                   {QStringLiteral("QuantNormal"), QString::fromLatin1(l.quant)},
                   {QStringLiteral("Preco"), QString::fromLatin1(l.preco)},
                   {QStringLiteral("ValorIliq"), QString::fromLatin1(l.iliq)},
                   {QStringLiteral("TotalDesconto"), QString::fromLatin1(l.desconto)},
                   {QStringLiteral("ValorIva"), QString::fromLatin1(l.iva)},
                   {QStringLiteral("IvaTabela"), QString::fromLatin1(l.tabela)},
                   {QStringLiteral("IvaTaxa"), QString::fromLatin1(l.taxa)},
                   {QStringLiteral("OutUniCod"), QString::fromLatin1(l.outUni)},
                   {QStringLiteral("OutUniQuant"), QString::fromLatin1(l.outQuant)},
                   {QStringLiteral("DataSys"),
                    o.ano + QStringLiteral("-03-14 ") + QString::fromLatin1(l.hora)}});
    }
    e.inserir(QStringLiteral("MovCaixa"),
              {{QStringLiteral("Tipo"), o.tipo},
               {QStringLiteral("Numero"), o.numero},
               {QStringLiteral("Ano"), o.ano},
               {QStringLiteral("PagaComo"), QStringLiteral("NU")},
               {QStringLiteral("ValorTotal"), QStringLiteral("33.05")}});
    e.inserir(QStringLiteral("ImpostosMovTerceiro"),
              {{QStringLiteral("Tipo"), o.tipo},
               {QStringLiteral("Numero"), o.numero},
               {QStringLiteral("Ano"), o.ano},
               {QStringLiteral("CliFor"), QStringLiteral("C")},
               {QStringLiteral("Terceiro"), QStringLiteral("M01")},
               {QStringLiteral("CodigoImposto"), QStringLiteral("ECO")},
               {QStringLiteral("Imposto"), QStringLiteral("0.1")}});
    ASSERT_TRUE(e.ok()) << e.erro().toStdString();
}

// Signs the document as its closing did, with a key made for the test in `ficheiroChave`;
// its note comes back in `nota`.
inline void assinaDocumento(app::Estado& estado, const QString& ficheiroChave, QString& nota,
                            const OpcoesDocumento& o = {}) {
    estado.config.ficheiroChave = ficheiroChave;
    estado.config.numeroCertificado = QStringLiteral("9999");
    QString erro;
    ASSERT_TRUE(documents::GeraChave(ficheiroChave, &erro)) << erro.toStdString();
    documents::Assinatura assinatura;
    QString dataSys = o.ano + QStringLiteral("-03-14 13:45:10");
    ASSERT_TRUE(documents::AssinaDocumento(estado, estado.gConn, assinatura, dataSys, o.tipo,
                                           o.numero, o.ano + QStringLiteral("-03-14"),
                                           *Currency::parse(u"33.05")));
    ASSERT_TRUE(estado.gConn.exec(QStringLiteral("update MovCliente set Hash=?,HashControl=?,"
                                                 "NotaCertificacao=? where Tipo=? and Numero=? "
                                                 "and Ano=?"),
                                  {assinatura.hash, assinatura.assinou, assinatura.notaCertificacao,
                                   o.tipo, o.numero, o.ano}));
    nota = assinatura.notaCertificacao;
}

// Sets columns of user 01's UtilConfGeral row.
inline void configura(db::Connection& conn, const QString& coluna, const QVariant& valor) {
    ASSERT_TRUE(conn.exec(
        QStringLiteral("update UtilConfGeral set %1=? where utilizador='01'").arg(coluna), {valor}))
        << conn.lastError().toStdString();
}

// A small body line and a medium totals line as the printer transcribes them.
inline QString p(const QString& texto) {
    return QStringLiteral("[COR0][PEQUENO]") + texto.leftJustified(40, u' ') + u'\n';
}
inline QString m(const QString& texto) {
    return QStringLiteral("[COR0][MEDIO]") + texto.leftJustified(32, u' ') + u'\n';
}

// The demo company (settings of its own) with its ticket printer EP1 played on COM1.
class TalaoTeste : public ::testing::Test {
  protected:
    void SetUp() override { testing::aplicacaoGui(); }

    // A printer that has received nothing yet on COM1.
    void novaImpressora() {
        impressora_ = &devsim_.liga(1, std::make_shared<devsim::ImpressoraTalao>(codigos_));
    }

    // The transcript once `cortes` cuts (and the reset after the last) arrived.
    QString transcricao(int cortes) {
        EXPECT_TRUE(impressora_->espera(
            [&](const QByteArray& r) {
                return r.count(QByteArray("\x1d\x56\x42\x00", 4)) == cortes &&
                       r.endsWith("\x1b@\r");
            },
            3000));
        return impressora_->transcricao();
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaTeste empresa_{true};
    app::Estado& estado_ = empresa_.estado();
    db::Connection& conn_ = estado_.gConn;
    testing::MensagensGravadas mensagens_;
    testing::DevsimTeste devsim_;
    CodigosImpressora codigos_ = LerDefinicaoImpressora(conn_, QStringLiteral("EP1"))->codigos;
    devsim::ServidorDispositivo* impressora_ =
        &devsim_.liga(1, std::make_shared<devsim::ImpressoraTalao>(codigos_));
    LinhaSerie linha_{devsim_.mapa()};
};

}  // namespace brasel::devices::teste
