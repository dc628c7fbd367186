// Closing a tab into a signed sales document: the checks before anything is written, the
// number that skips every used one, the document and its cash movement, and failures that
// leave nothing of the document behind.
#include "devices/documento_pagina.h"
#include "documents/assinatura.h"
#include "pos/fecho_teste.h"
#include "pricing/insere_teste.h"
#include "support/aplicacao_gui.h"
#include "support/impressao_qt.h"
#include "support/texto_pdf.h"

#include <QDir>

#include <functional>

namespace brasel::pos {
namespace {

using pricing::teste::insere;
using pricing::teste::T;

class FechoTabTeste : public teste::FechoTeste {
  public:
    FechoTabTeste() {
        // The split over several payment methods has a test of its own.
        estado().gVariosPagaComo = false;
        m_.respostaFinal = true;
    }
    void pagaTudo(Currency entregou) {
        f_.pagamentoDado = teste::pagamentoNumerario(tab_.lista().totais.total, entregou);
    }
    void utilizador(const char* coluna, const QVariant& valor) {
        executa(QStringLiteral("update UtilConfGeral set %1=? where utilizador=?")
                    .arg(QLatin1String(coluna)),
                {valor, estado().gUtilizador});
    }
    QString cabecalho(const char* coluna) {
        return texto(QStringLiteral("select %1 from MovCliente").arg(QLatin1String(coluna)));
    }
};

TEST_F(FechoTabTeste, SemLinhasSeleccionadasRecusaSemPerguntar) {
    adiciona({"B001", "B002"});
    for (const auto& l : std::vector(tab_.lista().linhas))
        ASSERT_TRUE(tab_.marcarLinha(l.numRegisto, false));
    const Fecho r = FecharTab(tab_, f_);
    EXPECT_EQ(r.resultado, ResultadoFecho::Recusado);
    EXPECT_EQ(m_.textos(), QStringList{QStringLiteral("NÃO SELECCIONOU QUALQUER PRODUTO!")});
    EXPECT_TRUE(m_.perguntas().isEmpty());
    EXPECT_TRUE(f_.perguntas.isEmpty());
    nadaGravado(2, QStringLiteral("00000000"));
}

TEST_F(FechoTabTeste, FechoParcialDeixaORestoAbertoEMarcadoNaMesma) {
    adiciona({"B001", "B002", "B003"});
    const qint64 resto = tab_.lista().linhas.back().numRegisto;
    ASSERT_TRUE(tab_.marcarLinha(resto, false));
    const Currency total = tab_.lista().totais.total;
    ASSERT_GT(total, Currency{});
    pagaTudo(Currency(50));

    const Fecho r = FecharTab(tab_, f_);
    ASSERT_EQ(r.resultado, ResultadoFecho::Fechado) << m_.textos().join(u'|').toStdString();
    ASSERT_EQ(m_.mensagens().size(), 1);
    EXPECT_EQ(m_.mensagens()[0].texto, QStringLiteral("NÃO TEM OS PRODUTOS TODOS SELECCIONADOS!"));
    EXPECT_EQ(m_.mensagens()[0].titulo, QStringLiteral("A V I S O"));
    EXPECT_EQ(m_.perguntas(), QStringList{QStringLiteral("Confirma o Encerramento?")});
    EXPECT_EQ(r.documento->numero, QStringLiteral("00000001"));
    EXPECT_EQ(r.documento->total, total);
    EXPECT_TRUE(f_.perguntas.contains(QStringLiteral("troco Nº 00000001 ") +
                                      (Currency(50) - total).toPlainText()))
        << f_.perguntas.join(u'|').toStdString();

    // The header.
    EXPECT_EQ(cabecalhos(), 1);
    EXPECT_EQ(cabecalho("Tipo"), QStringLiteral("VD"));
    EXPECT_EQ(cabecalho("Numero"), QStringLiteral("00000001"));
    EXPECT_EQ(cabecalho("Ano"), ano_);
    EXPECT_EQ(cabecalho("Codigo"), QStringLiteral("M01"));
    EXPECT_EQ(cabecalho("Modulo"), QStringLiteral("FC"));
    EXPECT_EQ(cabecalho("Afecta"), QStringLiteral("S+"));
    EXPECT_EQ(cabecalho("PagaComo"), QStringLiteral("NU"));
    EXPECT_EQ(Currency::parse(cabecalho("TotalDoc")), total);
    EXPECT_EQ(Currency::parse(cabecalho("Entregou")), Currency(50));
    EXPECT_EQ(Currency::parse(cabecalho("saldodoc")), Currency{});
    EXPECT_EQ(cabecalho("HashControl"), QStringLiteral("1"));
    EXPECT_FALSE(cabecalho("Hash").isEmpty());
    EXPECT_FALSE(cabecalho("Hash_Quoril").isEmpty());
    EXPECT_EQ(cabecalho("CodigoMorada"), QStringLiteral("000"));
    // The first document of the year chains to nothing, and its signature checks out with the
    // public key alone.
    const auto assinado =
        documents::TextoAssinatura(cabecalho("Data"), cabecalho("DataSys"), QStringLiteral("VD"),
                                   QStringLiteral("00000001"), total, {});
    ASSERT_TRUE(assinado);
    if (const auto confere = testing::confereComOpenssl(*assinado, cabecalho("Hash"))) {
        EXPECT_TRUE(*confere) << assinado->toStdString();
    }

    // The lines: two closed and numbered with the header's time, the third open and ticked.
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Fechado='S' and "
                                    "Numero='00000001' and Ano=? and Hora=?"),
                     {ano_, cabecalho("DataSys").mid(11, 8)}),
              2);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Fechado='N' and "
                                    "Numero='' and SelecFecha=1 and NumRegisto=?"),
                     {resto}),
              1);
    ASSERT_EQ(tab_.mesa().codigo, QStringLiteral("M01"));
    ASSERT_EQ(tab_.lista().linhas.size(), 1u);
    EXPECT_TRUE(tab_.lista().linhas[0].seleccionada);
    EXPECT_TRUE(tab_.edicaoLivre);

    EXPECT_EQ(ultNumero(), QStringLiteral("00000001"));
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovCaixa where Tipo='VD' and "
                                    "Numero='00000001' and Afecta='R+' and PagaComo='NU' and "
                                    "ValorTotal=?"),
                     {total.toText()}),
              1);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from LogGeral where Modulo='FC' and "
                                    "Accao='N' and Numero='00000001'")),
              1);
}

// UltNumero against the headers already there: every used number of the year is skipped and
// the counter ends at the number issued.
struct Numeracao {
    const char* ultNumero;
    std::vector<const char*> usadosEsteAno;
    std::vector<const char*> usadosAnoAnterior;
    const char* esperado;
};

class NumeracaoTeste : public FechoTabTeste, public ::testing::WithParamInterface<Numeracao> {};

TEST_P(NumeracaoTeste, SaltaOsNumerosUsadosDoAno) {
    const Numeracao& c = GetParam();
    executa(QStringLiteral("update TabTipoMov set UltNumero=? where codigo='VD'"),
            {QString::fromLatin1(c.ultNumero)});
    const QString hoje = QDate::currentDate().toString(QStringLiteral("yyyy-MM-dd"));
    const QString anterior = QString::number(QDate::currentDate().year() - 1);
    for (const char* n : c.usadosEsteAno)
        insere(estado(), "MovCliente",
               {{"Tipo", T("VD")}, {"Numero", T(n)}, {"Ano", ano_}, {"Data", hoje}});
    for (const char* n : c.usadosAnoAnterior)
        insere(estado(), "MovCliente",
               {{"Tipo", T("VD")},
                {"Numero", T(n)},
                {"Ano", anterior},
                {"Data", anterior + QStringLiteral("-06-30")}});
    adiciona({"B001"});
    pagaTudo(Currency{});
    const Fecho r = FecharTab(tab_, f_);
    ASSERT_EQ(r.resultado, ResultadoFecho::Fechado) << m_.textos().join(u'|').toStdString();
    EXPECT_EQ(r.documento->numero, QString::fromLatin1(c.esperado));
    EXPECT_EQ(ultNumero(), QString::fromLatin1(c.esperado));
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Numero=?"),
                     {QString::fromLatin1(c.esperado)}),
              1);
}

INSTANTIATE_TEST_SUITE_P(
    Casos, NumeracaoTeste,
    ::testing::Values(Numeracao{"00000000", {}, {}, "00000001"},
                      Numeracao{"00000002", {"00000003", "00000004"}, {}, "00000005"},
                      Numeracao{"", {"00000001"}, {}, "00000002"},
                      Numeracao{"00000000", {}, {"00000001", "00000002"}, "00000001"},
                      Numeracao{"00000009", {}, {}, "00000010"}));

// A failure at any step after the lock leaves no header, no closed line, no cash row, no
// numbered tax and UltNumero as it was; the tab keeps its lines.
struct Falha {
    const char* caso;
    const char* gatilho;  // a trigger that makes one statement fail; none: no signing key
    const char* mensagem;
};

const Falha kFalhas[] = {
    {"sem chave de assinatura", nullptr, "\r\nNão foi possível Gerar a Assinatura."},
    {"linhas recusam fechar",
     "create trigger falha before update of Fechado on MovProduto "
     "begin select raise(abort, 'falha'); end",
     "Não foi possível Gravar o Documento."},
    {"caixa recusa o movimento",
     "create trigger falha before insert on MovCaixa begin select raise(abort, 'falha'); end",
     "Não foi possível Gravar o Documento."},
    {"contador recusa",
     "create trigger falha before update on TabTipoMov begin select raise(abort, 'falha'); end",
     "Não foi possível Gravar o Documento."},
    {"mesa recusa",
     "create trigger falha before update of JaImprimiuTalao on Clientes "
     "begin select raise(abort, 'falha'); end",
     "Não foi possível Gravar o Documento."},
};

class FalhaTeste : public FechoTabTeste, public ::testing::WithParamInterface<Falha> {};

TEST_P(FalhaTeste, NadaFicaDoDocumento) {
    adiciona({"B001", "B002"});
    pagaTudo(Currency{});
    if (GetParam().gatilho)
        executa(QString::fromLatin1(GetParam().gatilho));
    else
        estado().config.ficheiroChave = QStringLiteral("/nao/existe/chave.key");
    const Fecho r = FecharTab(tab_, f_);
    EXPECT_EQ(r.resultado, ResultadoFecho::Falhou);
    EXPECT_FALSE(r.documento);
    EXPECT_TRUE(m_.textos().contains(QString::fromUtf8(GetParam().mensagem)))
        << m_.textos().join(u'|').toStdString();
    nadaGravado(2, QStringLiteral("00000000"));
    EXPECT_EQ(tab_.lista().linhas.size(), 2u);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from LogGeral where Modulo='FC' and "
                                    "Accao='N'")),
              0);
}

INSTANTIATE_TEST_SUITE_P(Passos, FalhaTeste, ::testing::ValuesIn(kFalhas),
                         [](const ::testing::TestParamInfo<Falha>& i) {
                             return std::string("caso") + std::to_string(i.index);
                         });

// The walk-in customer: the typed data go into the header under the walk-in code; without a tax
// number the document is refused unless the user may post without one.
struct Diverso {
    int lancaSemContribuinte;
    const char* contribuinte;
    bool fecha;
};

class DiversoTeste : public FechoTabTeste, public ::testing::WithParamInterface<Diverso> {};

TEST_P(DiversoTeste, ContribuinteObrigatorioSalvoConfiguracao) {
    const Diverso& c = GetParam();
    utilizador("LancaSemContribuinte", c.lancaSemContribuinte);
    ASSERT_TRUE(AbrirMesa(tab_, estado().param.clidiversos));
    adiciona({"B001"});
    pagaTudo(Currency{});
    DadosClienteDiverso d;
    d.contribuinte = QString::fromLatin1(c.contribuinte);
    d.nome = QStringLiteral("Maria d'Almeida");
    d.morada = QStringLiteral("Rua Nova, 3");
    d.local = QStringLiteral("Lisboa");
    d.codPostal = QStringLiteral("1100-148");
    d.pais = QStringLiteral("PT");
    f_.diverso = d;
    const Fecho r = FecharTab(tab_, f_);
    if (!c.fecha) {
        EXPECT_EQ(r.resultado, ResultadoFecho::Recusado);
        ASSERT_FALSE(m_.mensagens().isEmpty());
        EXPECT_EQ(m_.mensagens().back().texto,
                  QStringLiteral("     Não Definiu o Número de Contribuinte!     \r\n\r\n"
                                 "(Campo de Preenchimento Obrigatório)"));
        EXPECT_EQ(m_.mensagens().back().titulo, QStringLiteral("ATENÇÃO"));
        nadaGravado(1, QStringLiteral("00000000"));
        return;
    }
    ASSERT_EQ(r.resultado, ResultadoFecho::Fechado) << m_.textos().join(u'|').toStdString();
    EXPECT_EQ(cabecalho("Codigo"), estado().param.clidiversos);
    EXPECT_EQ(cabecalho("Descricao"), d.nome);
    EXPECT_EQ(cabecalho("Contribuinte"), d.contribuinte);
    EXPECT_EQ(cabecalho("Morada"), d.morada);
    EXPECT_EQ(cabecalho("CodPostal"), d.codPostal);
}

INSTANTIATE_TEST_SUITE_P(Casos, DiversoTeste,
                         ::testing::Values(Diverso{0, "", false}, Diverso{0, "123456789", true},
                                           Diverso{1, "", true}));

TEST_F(FechoTabTeste, PagamentoAbandonadoNadaGravaELimpaODesconto) {
    adiciona({"B001", "B002"});
    const Currency total = tab_.lista().totais.total;
    f_.pagamentoDado.reset();
    f_.descontoNoEcran = 10.0;
    const Fecho r = FecharTab(tab_, f_);
    EXPECT_EQ(r.resultado, ResultadoFecho::Cancelado);
    ASSERT_TRUE(f_.totalComDesconto);
    EXPECT_LT(*f_.totalComDesconto, total);
    EXPECT_EQ(tab_.lista().totais.total, total);
    for (const auto& l : tab_.lista().linhas)
        EXPECT_EQ(l.valDescGeral, Currency{});
    nadaGravado(2, QStringLiteral("00000000"));
}

TEST_F(FechoTabTeste, DescontoDoEcranDePagamentoEntraNoDocumento) {
    adiciona({"B001", "B002"});
    const Currency total = tab_.lista().totais.total;
    f_.descontoNoEcran = 10.0;
    pagaTudo(Currency{});
    const Fecho r = FecharTab(tab_, f_);
    ASSERT_EQ(r.resultado, ResultadoFecho::Fechado) << m_.textos().join(u'|').toStdString();
    ASSERT_TRUE(f_.totalComDesconto);
    EXPECT_LT(r.documento->total, total);
    EXPECT_EQ(r.documento->total, *f_.totalComDesconto);
    EXPECT_EQ(Currency::parse(cabecalho("TotalDoc")), *f_.totalComDesconto);
    // No amount handed over: the document total stands for it.
    EXPECT_EQ(Currency::parse(cabecalho("Entregou")), *f_.totalComDesconto);
    EXPECT_GT(contar(QStringLiteral("select count(*) from MovProduto where Fechado='S' and "
                                    "ValDescontoGeral>0")),
              0);
}

// The questions that stop the closing with nothing written: the confirmation, the user's
// identity, the receipt button's question, the split over payment methods.
struct Paragem {
    const char* caso;
    std::function<void(FechoTabTeste&, testing::MensagensGravadas&, teste::PerguntasFechoGravadas&,
                       app::Estado&)>
        prepara;
    bool comTalao;
};

const Paragem kParagens[] = {
    {"não confirma", [](auto&, auto& m, auto&, auto&) { m.responder({false}); }, false},
    {"identidade por confirmar",
     [](auto& t, auto&, auto& f, auto&) {
         t.utilizador("ConfirmacaoEncerramento", QStringLiteral("CL;FC"));
         f.utilizadorConfirmado.clear();
     },
     false},
    {"talão sem fechar", [](auto&, auto& m, auto&, auto&) { m.responder({false}); }, true},
    {"divisão abandonada",
     [](auto&, auto&, auto& f, auto& e) {
         e.gVariosPagaComo = true;
         f.divisao.reset();
     },
     false},
};

class ParagemTeste : public FechoTabTeste, public ::testing::WithParamInterface<Paragem> {};

TEST_P(ParagemTeste, NadaGravado) {
    adiciona({"B001", "B002"});
    pagaTudo(Currency{});
    GetParam().prepara(*this, m_, f_, estado());
    const Fecho r = GetParam().comTalao ? FecharComTalao(tab_, f_) : FecharTab(tab_, f_);
    EXPECT_EQ(r.resultado, ResultadoFecho::Cancelado);
    nadaGravado(2, QStringLiteral("00000000"));
    EXPECT_EQ(tab_.lista().linhas.size(), 2u);
}

INSTANTIATE_TEST_SUITE_P(Perguntas, ParagemTeste, ::testing::ValuesIn(kParagens),
                         [](const ::testing::TestParamInfo<Paragem>& i) {
                             return std::string("caso") + std::to_string(i.index);
                         });

TEST_F(FechoTabTeste, DivisaoPorFormasDePagamentoEscreveUmMovimentoPorForma) {
    estado().gVariosPagaComo = true;
    adiciona({"B001", "B002"});
    const Currency total = tab_.lista().totais.total;
    const Currency parte(1);
    pagaTudo(Currency{});
    f_.divisao = std::vector<cash::ParcialPagamento>{{QStringLiteral("NU"), parte},
                                                     {QStringLiteral("MB"), total - parte},
                                                     {QStringLiteral("CC"), Currency{}}};
    const Fecho r = FecharComTalao(tab_, f_);
    ASSERT_EQ(r.resultado, ResultadoFecho::Fechado) << m_.textos().join(u'|').toStdString();
    EXPECT_TRUE(m_.perguntas().contains(QStringLiteral("Fecha Documento ?")));
    EXPECT_EQ(movimentosCaixa(), 2);
    EXPECT_EQ(Currency::parse(texto(QStringLiteral("select sum(ValorTotal) from MovCaixa"))),
              total);
}

TEST_F(FechoTabTeste, UtilizadorSemTalaoRecebeODocumentoEmPaginaA4) {
    testing::aplicacaoGui();
    utilizador("Impressora", QStringLiteral("A"));
    adiciona({"B001"});
    pagaTudo(Currency{});
    f_.escolha = {devices::EscolhaImpressao::Contabilistico, 1, false};
    ASSERT_EQ(FecharTab(tab_, f_).resultado, ResultadoFecho::Fechado)
        << m_.textos().join(u'|').toStdString();
    EXPECT_TRUE(f_.perguntas.contains(QStringLiteral("impressao VD")));
    const QStringList pdfs =
        QDir(devices::PastaDocumentosPdf()).entryList({QStringLiteral("*.pdf")}, QDir::Files);
    ASSERT_EQ(pdfs.size(), 1) << m_.textos().join(u'|').toStdString();
    const auto texto =
        testing::textoPdf(QDir(devices::PastaDocumentosPdf()).filePath(pdfs.first()));
    if (!texto) GTEST_SKIP() << "pdftotext em falta";
    EXPECT_TRUE(texto->contains(QStringLiteral("00000001"))) << texto->toStdString();
}

// After a whole tab is closed the screen proposes the walk-in customer or clears the table.
struct Proximo {
    int mostraCliDiverso;
    bool diverso;
};

class ProximoTeste : public FechoTabTeste, public ::testing::WithParamInterface<Proximo> {};

TEST_P(ProximoTeste, MesaSeguinte) {
    utilizador("MostraCliDiverso", GetParam().mostraCliDiverso);
    adiciona({"B001"});
    tab_.edicaoLivre = false;
    pagaTudo(Currency{});
    ASSERT_EQ(FecharTab(tab_, f_).resultado, ResultadoFecho::Fechado);
    EXPECT_EQ(tab_.mesa().codigo, GetParam().diverso ? estado().param.clidiversos : QString());
    EXPECT_TRUE(tab_.lista().linhas.empty());
    EXPECT_TRUE(tab_.edicaoLivre);
    EXPECT_EQ(tab_.tipo().codigo, QStringLiteral("VD"));
}

INSTANTIATE_TEST_SUITE_P(Casos, ProximoTeste,
                         ::testing::Values(Proximo{1, true}, Proximo{0, false}));

// An invoice beyond the table's credit limit: refused without the supervisor, leaving nothing
// behind, and closed once the supervisor lets it through.
TEST_F(FechoTabTeste, LimiteDeCreditoSoPassaComOSupervisor) {
    executa(QStringLiteral("update TabTipoMov set Autorizacao='1' where codigo='FT'"));
    executa(QStringLiteral("update Clientes set LimiteCredito=? where Codigo='M01'"),
            {QStringLiteral("100")});
    executa(QStringLiteral("insert into MovCliente (Codigo,Tipo,Numero,Ano,Afecta,saldodoc,"
                           "datavenc) values ('M01','FT','00000099','2025','D+',?,'2999-01-01')"),
            {QStringLiteral("100")});
    ASSERT_TRUE(tab_.definirTipo(QStringLiteral("FT")));
    ASSERT_TRUE(AbrirMesa(tab_, QStringLiteral("M01")));
    adiciona({"B001", "B002"});
    const auto documentosFT = [this] {
        return contar(QStringLiteral("select count(*) from MovCliente where Tipo='FT' and "
                                     "Ano=?"),
                      {ano_});
    };

    EXPECT_EQ(FecharTab(tab_, f_).resultado, ResultadoFecho::Recusado);
    ASSERT_EQ(m_.textos().size(), 1);
    EXPECT_TRUE(m_.textos().front().startsWith(u"O Cliente ultrapassa o Limite de Crédito!"))
        << m_.textos().front().toStdString();
    EXPECT_EQ(f_.perguntas, QStringList{QStringLiteral("supervisor")});
    EXPECT_EQ(documentosFT(), 0);
    EXPECT_EQ(linhasFechadas(), 0);
    EXPECT_EQ(linhasAbertas(), 2);
    EXPECT_EQ(ultNumero("FT"), QStringLiteral("00000000"));

    f_.supervisorAutoriza = true;
    const Fecho r = FecharTab(tab_, f_);
    EXPECT_EQ(r.resultado, ResultadoFecho::Fechado) << m_.textos().join(u'|').toStdString();
    EXPECT_EQ(documentosFT(), 1);
    EXPECT_EQ(linhasFechadas(), 2);
}

}  // namespace
}  // namespace brasel::pos
