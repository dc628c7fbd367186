#include "cash/ui/frm_registo_de_caixa.h"

#include "common/number_text.h"
#include "common/ui/estilo_tactil.h"
#include "db/query_helpers.h"
#include "lookups/ui/campo_codigo_janela.h"
#include "pos/ui/frm_teclado.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QMessageBox>
#include <QPainter>
#include <QPrintDialog>
#include <QPrintPreviewDialog>
#include <QPrinter>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::cash {

namespace {

QPushButton* botao(const char* nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumSize(170, 64);
    return b;
}

// The report's page: the text lines one under another, a new page when one is full.
class PaginaRelatorio {
  public:
    PaginaRelatorio(QPrinter& impressora, QPainter& pintor)
        : impressora_(impressora),
          pintor_(pintor),
          area_(impressora.pageLayout().paintRectPixels(impressora.resolution())) {}

    int largura() const { return area_.width(); }

    // One line of texts in columns: (left edge, width, right-aligned) each.
    struct Campo {
        int x;
        int largura;
        bool direita;
        QString texto;
    };
    bool linha(const QFont& letra, const std::vector<Campo>& campos) {
        pintor_.setFont(letra);
        const int altura = QFontMetrics(letra, &impressora_).lineSpacing();
        if (y_ > 0 && y_ + altura > area_.height()) {
            if (!impressora_.newPage()) return false;
            y_ = 0;
        }
        for (const Campo& c : campos) {
            pintor_.drawText(QRect(c.x, y_, c.largura, altura),
                             (c.direita ? Qt::AlignRight : Qt::AlignLeft) | Qt::AlignVCenter,
                             c.texto);
        }
        y_ += altura;
        return true;
    }
    void traco() {
        const int meio = y_ + 4;
        pintor_.drawLine(0, meio, area_.width(), meio);
        y_ += 8;
    }
    void espaco(int pontos) { y_ += pontos; }

  private:
    QPrinter& impressora_;
    QPainter& pintor_;
    QRect area_;
    int y_ = 0;
};

}  // namespace

bool ImprimeRelatorioCaixa(QPrinter& impressora, const RelatorioCaixa& r, int casadec) {
    QPainter pintor;
    if (!pintor.begin(&impressora)) return false;
    PaginaRelatorio pagina(impressora, pintor);
    QFont titulo(QStringLiteral("Arial"), 14, QFont::Bold);
    QFont normal(QStringLiteral("Arial"), 10);
    QFont negrito(normal);
    negrito.setBold(true);

    // The methods take the first third; the five amounts share the rest.
    const int largura = pagina.largura();
    const int primeira = largura * 34 / 100;
    const int coluna = (largura - primeira) / 5;
    auto linhaDeValores = [&](const QString& metodo, std::initializer_list<QString> valores) {
        std::vector<PaginaRelatorio::Campo> campos{{0, primeira, false, metodo}};
        int x = primeira;
        for (const QString& v : valores) {
            campos.push_back({x, coluna, true, v});
            x += coluna;
        }
        return campos;
    };
    auto valor = [casadec](Currency v) { return NumeroParaTexto(v, casadec); };

    bool ok = pagina.linha(titulo, {{0, largura, false, r.titulo}}) &&
              pagina.linha(normal, {{0, largura, false, r.data}});
    pagina.espaco(12);
    ok = ok &&
         pagina.linha(negrito,
                      linhaDeValores(QStringLiteral("Formas de Pagamento"),
                                     {QStringLiteral("Recebimentos"), QStringLiteral("Pagamentos"),
                                      QStringLiteral("Saldo Caixa"), QStringLiteral("Registo"),
                                      QStringLiteral("Dif. Registo")}));
    pagina.traco();
    for (const LinhaRelatorioCaixa& l : r.linhas) {
        if (!ok) break;
        ok = pagina.linha(
            normal,
            linhaDeValores(l.descricao, {valor(l.recebimentos), valor(l.pagamentos), valor(l.saldo),
                                         valor(l.registo), valor(l.diferenca)}));
    }
    pagina.traco();
    // The balances stand under the till balance column.
    const int xSaldo = primeira + 2 * coluna;
    for (const auto& [texto, montante] :
         {std::pair{QStringLiteral("Saldo anterior"), r.saldoAnterior},
          std::pair{QStringLiteral("Saldo do Dia"), r.saldoDia},
          std::pair{QStringLiteral("Saldo Actual"), r.saldoActual}}) {
        if (!ok) break;
        ok = pagina.linha(negrito,
                          {{0, xSaldo, false, texto}, {xSaldo, coluna, true, valor(montante)}});
    }
    return pintor.end() && ok;
}

frmRegistoDeCaixa::frmRegistoDeCaixa(app::Estado& estado, MessagePort& mensagens, QWidget* pai,
                                     lookups::JanelaPesquisa* janela, pos::PedeValor* teclado)
    : QDialog(pai),
      estado_(estado),
      mensagens_(mensagens),
      janelaPropria_(estado, this),
      pesquisaTabelas_(estado, mensagens, janela ? *janela : janelaPropria_),
      tecladoProprio_(teclado ? nullptr
                              : std::make_unique<pos::TecladoJanela>(mensagens, nullptr, this)),
      teclado_(teclado ? *teclado : *tecladoProprio_) {
    setObjectName(QStringLiteral("frmRegistoDeCaixa"));
    setWindowTitle(QStringLiteral("Registo de Caixa"));

    txtCaixa_ = new QLineEdit(estado_.gCaixa.trimmed(), this);
    txtCaixa_->setObjectName(QStringLiteral("txtCaixa"));
    txtCaixa_->setMinimumHeight(56);
    txtCaixa_->setMaximumWidth(160);
    lblCaixa_ = new QLabel(this);
    lblCaixa_->setObjectName(QStringLiteral("lblCaixa"));
    lblCaixa_->setFrameShape(QFrame::Panel);
    lblCaixa_->setFrameShadow(QFrame::Sunken);
    if (!caixa().isEmpty()) {
        lblCaixa_->setText(db::Select_Campo_str(estado_, QStringLiteral("Caixas"),
                                                QStringLiteral("Descricao"),
                                                QStringLiteral("Codigo"), caixa()));
    }
    auto* cmdPesquisa = botao("cmdPesquisa", QStringLiteral("..."), this);
    cmdPesquisa->setMinimumWidth(64);
    dtpData_ = new QDateEdit(db::Get_DataSysServer(estado_).date(), this);
    dtpData_->setObjectName(QStringLiteral("dtpData"));
    dtpData_->setDisplayFormat(QStringLiteral("dd-MM-yyyy"));
    dtpData_->setCalendarPopup(true);
    dtpData_->setMinimumHeight(56);

    lvwFormas_ = new ListaFormasValor(QStringLiteral("Valor"), estado_.param.casadec, this);
    connect(lvwFormas_, &ListaFormasValor::valorAlterado, this, [this] { CalculaTot(); });
    lblTotal_ = new QLabel(this);
    lblTotal_->setObjectName(QStringLiteral("lblTotal"));
    lblTotal_->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    lblTotal_->setFrameShape(QFrame::Panel);
    lblTotal_->setFrameShadow(QFrame::Sunken);

    auto* cmdValor = botao("cmdValor", QStringLiteral("&Valor..."), this);
    auto* cmdActualizar = botao("cmdActualizar", QStringLiteral("&Actualizar"), this);
    auto* cmdImprimir = botao("cmdImprimir", QStringLiteral("&Imprimir"), this);
    auto* cmdFechar = botao("cmdFechar", QStringLiteral("&Fechar"), this);
    connect(txtCaixa_, &QLineEdit::editingFinished, this, [this] {
        // Leaving the box empty chooses nothing; only the search button searches then.
        if (!txtCaixa_->isModified()) return;
        txtCaixa_->setModified(false);
        if (!caixa().isEmpty()) pesquisa(false);
        CarregarDados();
    });
    connect(cmdPesquisa, &QPushButton::clicked, this, [this] {
        pesquisa(true);
        CarregarDados();
    });
    connect(dtpData_, &QDateEdit::dateChanged, this, [this] { CarregarDados(); });
    connect(cmdValor, &QPushButton::clicked, this, [this] { lvwFormas_->pedeValor(teclado_); });
    connect(cmdActualizar, &QPushButton::clicked, this, [this] { actualizar(); });
    connect(cmdImprimir, &QPushButton::clicked, this, [this] { imprimir(); });
    connect(cmdFechar, &QPushButton::clicked, this, &QDialog::reject);

    auto* cabecalho = new QGridLayout;
    cabecalho->addWidget(new QLabel(QStringLiteral("Caixa"), this), 0, 0);
    cabecalho->addWidget(txtCaixa_, 0, 1);
    cabecalho->addWidget(cmdPesquisa, 0, 2);
    cabecalho->addWidget(lblCaixa_, 0, 3);
    cabecalho->addWidget(new QLabel(QStringLiteral("Data"), this), 1, 0);
    cabecalho->addWidget(dtpData_, 1, 1, 1, 2);
    cabecalho->setColumnStretch(3, 1);
    auto* total = new QHBoxLayout;
    total->addStretch();
    total->addWidget(new QLabel(QStringLiteral("Total"), this));
    total->addWidget(lblTotal_);
    lblTotal_->setMinimumWidth(200);
    auto* botoes = new QVBoxLayout;
    botoes->addWidget(cmdValor);
    botoes->addStretch();
    botoes->addWidget(cmdActualizar);
    botoes->addWidget(cmdImprimir);
    botoes->addWidget(cmdFechar);
    auto* lista = new QVBoxLayout;
    lista->addWidget(lvwFormas_, 1);
    lista->addLayout(total);
    auto* corpo = new QHBoxLayout;
    corpo->addLayout(lista, 1);
    corpo->addLayout(botoes);
    auto* layout = new QVBoxLayout(this);
    layout->addLayout(cabecalho);
    layout->addLayout(corpo, 1);
    aplicaFonteTactil(this);
    resize(960, 640);
}

frmRegistoDeCaixa::~frmRegistoDeCaixa() = default;

void frmRegistoDeCaixa::showEvent(QShowEvent* evento) {
    QDialog::showEvent(evento);
    if (carregado_) return;
    carregado_ = true;
    CarregarDados();
}

QString frmRegistoDeCaixa::data() const {
    return dtpData_->date().toString(QStringLiteral("yyyy-MM-dd"));
}

bool frmRegistoDeCaixa::CarregarDados() {
    lvwFormas_->setRowCount(0);
    const auto formas = FormasPagamento(estado_.gConn);
    if (!formas || formas->empty()) {
        lblTotal_->clear();
        mensagens_.mensagem(QStringLiteral("Não existem Formas de Pagamento!"), Icone::Critico);
        return false;
    }
    const auto contado = CarregaRegistoCaixa(estado_.gConn, caixa(), data());
    lvwFormas_->preenche(*formas, contado.value_or(QHash<QString, Currency>{}));
    CalculaTot();
    return contado.has_value();
}

std::optional<Currency> frmRegistoDeCaixa::CalculaTot() {
    const auto total = lvwFormas_->total();
    if (total) lblTotal_->setText(NumeroParaTexto(*total, estado_.param.casadec));
    return total;
}

void frmRegistoDeCaixa::pesquisa(bool forcar) {
    lookups::pesquisaNoCampo(txtCaixa_, lblCaixa_,
                             [&](lookups::CampoCodigo& c) { pesquisaTabelas_.Caixas(c, forcar); });
}

void frmRegistoDeCaixa::actualizar() {
    const auto lista = lvwFormas_->valores<ContagemCaixa>();
    if (!lista) {
        mensagens_.mensagem(QStringLiteral("Valor Inválido!"), Icone::Critico);
        return;
    }
    if (GravaRegistoCaixa(estado_, mensagens_, caixa(), data(), *lista)) CarregarDados();
}

void frmRegistoDeCaixa::imprimir() {
    if (caixa().isEmpty()) {
        mensagens_.mensagem(QStringLiteral("Não definiu o Caixa!"), Icone::Critico);
        return;
    }
    const auto relatorio = CalculaRelatorioCaixa(estado_, caixa(), data());
    if (!relatorio) {
        mensagens_.mensagem(QStringLiteral("Não foi possível ler os Movimentos de Caixa!"),
                            Icone::Critico);
        return;
    }
    QMessageBox pergunta(QMessageBox::Question, windowTitle(), QStringLiteral("Tipo de Listagem?"),
                         QMessageBox::NoButton, this);
    QPushButton* ecran =
        pergunta.addButton(QStringLiteral("Para o Ecran"), QMessageBox::AcceptRole);
    ecran->setObjectName(QStringLiteral("cmdEcran"));
    QPushButton* impressora =
        pergunta.addButton(QStringLiteral("Para a Impressora"), QMessageBox::AcceptRole);
    impressora->setObjectName(QStringLiteral("cmdImpressora"));
    pergunta.addButton(QStringLiteral("Cancelar"), QMessageBox::RejectRole)
        ->setObjectName(QStringLiteral("cmdCancelar"));
    aplicaFonteTactil(&pergunta);
    pergunta.exec();

    QPrinter printer(QPrinter::HighResolution);
    printer.setDocName(relatorio->titulo);
    const int casadec = estado_.param.casadec;
    if (pergunta.clickedButton() == ecran) {
        QPrintPreviewDialog previsao(&printer, this);
        connect(&previsao, &QPrintPreviewDialog::paintRequested, this,
                [&](QPrinter* p) { ImprimeRelatorioCaixa(*p, *relatorio, casadec); });
        previsao.exec();
    } else if (pergunta.clickedButton() == impressora) {
        QPrintDialog dialogo(&printer, this);
        if (dialogo.exec() != QDialog::Accepted) return;
        if (!ImprimeRelatorioCaixa(printer, *relatorio, casadec)) {
            mensagens_.mensagem(QStringLiteral("Não foi possível imprimir o Registo de Caixa!"),
                                Icone::Critico);
        }
    }
}

}  // namespace brasel::cash
