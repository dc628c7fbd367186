#include "cash/ui/frm_troco.h"

#include "common/number_text.h"
#include "common/ui/estilo_tactil.h"
#include "lookups/pesquisa_tabelas.h"
#include "lookups/ui/w_pesquisa_nova.h"

#include <QAbstractButton>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QPixmap>
#include <QPushButton>
#include <QScrollArea>
#include <QVBoxLayout>

namespace brasel::cash {

namespace {

constexpr int kColunasFormas = 2;
constexpr int kCasasPercentagem = 2;

QPushButton* botao(const char* nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumSize(190, 60);
    b->setAutoDefault(false);
    return b;
}

// A figure read from a step away: large, right-aligned, not typed into (the keypad changes it).
QLineEdit* valor(const char* nome, int pontos, QWidget* pai) {
    auto* c = new QLineEdit(pai);
    c->setObjectName(QString::fromLatin1(nome));
    c->setReadOnly(true);
    c->setFocusPolicy(Qt::NoFocus);
    c->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    c->setMinimumHeight(pontos * 2 + 14);
    QFont f = c->font();
    f.setPointSize(pontos);
    f.setBold(true);
    c->setFont(f);
    return c;
}

QLabel* rotulo(const QString& texto, QWidget* pai) {
    auto* l = new QLabel(texto, pai);
    l->setAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    return l;
}

}  // namespace

frmTroco::frmTroco(app::Estado& estado, MessagePort& mensagens, pos::PedeValor& teclado,
                   QWidget* pai)
    : QDialog(pai), estado_(estado), mensagens_(mensagens), teclado_(teclado) {
    setObjectName(QStringLiteral("frmTroco"));
    setWindowTitle(QStringLiteral("Pagamento"));
    auto* layout = new QVBoxLayout(this);
    auto* corpo = new QHBoxLayout;
    corpo->addWidget(criaValores(), 3);
    corpo->addWidget(criaFormas(), 2);
    layout->addLayout(corpo, 1);

    auto* rodape = new QHBoxLayout;
    rodape->addWidget(rotulo(QStringLiteral("Observações"), this));
    txtObserva_ = new QLineEdit(this);
    txtObserva_->setObjectName(QStringLiteral("txtObserva"));
    txtObserva_->setMinimumHeight(52);
    rodape->addWidget(txtObserva_, 1);
    auto* cmdFechaDiv = botao("cmdFechaDiv", QStringLiteral("C&onfirmar"), this);
    auto* cmdCancelar = botao("cmdCancelar", QStringLiteral("&Cancelar"), this);
    rodape->addWidget(cmdFechaDiv);
    rodape->addWidget(cmdCancelar);
    layout->addLayout(rodape);
    connect(cmdFechaDiv, &QPushButton::clicked, this, &frmTroco::fechaDiv);
    connect(cmdCancelar, &QPushButton::clicked, this, &QDialog::reject);

    aplicaFonteTactil(this);
    aplicaCorFundo(this, estado_.gUtilizador);
    // The change is what the cashier reads out: the largest figure, in the order screen's
    // colours for its total.
    evalTroco_->setStyleSheet(
        QStringLiteral("color: #f8f8f2; background: #1d3557; font-size: 34pt; font-weight: bold;"));
    // Confirming and the chosen method stand out; a style sheet drops the inherited font, so it
    // names the size the touch font has.
    const QString tamanho = QString::number(font().pointSize());
    findChild<QPushButton*>(QStringLiteral("cmdFechaDiv"))
        ->setStyleSheet(QStringLiteral("QPushButton { background-color: #2e7d32; color: white; "
                                       "font-weight: bold; font-size: %1pt; }")
                            .arg(tamanho));
    lvwPagaComo_->setStyleSheet(
        QStringLiteral("QWidget#lvwPagaComo { background: transparent; }"
                       "QPushButton { font-weight: bold; font-size: %1pt; }"
                       "QPushButton:checked { background-color: #f4b183; color: black; "
                       "border: 3px solid #1d3557; }")
            .arg(tamanho));
    resize(1000, 700);
}

frmTroco::~frmTroco() = default;

QWidget* frmTroco::criaValores() {
    auto* painel = new QWidget(this);
    auto* g = new QGridLayout(painel);
    evalTotalDoc_ = valor("evalTotalDoc", 24, painel);
    evalDescontoPer_ = valor("evalDescontoPer", 20, painel);
    evalValor_Pagar_ = valor("evalValor_Pagar", 24, painel);
    evalDesconto_ = valor("evalDesconto", 20, painel);
    evalEntregou_ = valor("evalEntregou", 24, painel);
    evalTroco_ = valor("evalTroco", 34, painel);
    auto* cmdDescontoPer = botao("cmdDescontoPer", QStringLiteral("Desconto %"), painel);
    auto* cmdAltTotalDoc = botao("cmdAltTotalDoc", QStringLiteral("Valor a Pagar"), painel);
    auto* cmdAltEntregou = botao("cmdAltEntregou", QStringLiteral("Entregou"), painel);
    auto* cmdCambio = botao("cmdCambio", QStringLiteral("Moeda"), painel);

    txtCambio_ = new QLineEdit(painel);
    txtCambio_->setObjectName(QStringLiteral("txtCambio"));
    txtCambio_->setReadOnly(true);
    txtCambio_->setFocusPolicy(Qt::NoFocus);
    txtCambio_->setMaximumWidth(110);
    txtCambio_->setMinimumHeight(52);
    lblCambio_ = rotulo(QString(), painel);
    lblCambio_->setObjectName(QStringLiteral("lblCambio"));
    auto* moeda = new QHBoxLayout;
    moeda->addWidget(txtCambio_);
    moeda->addWidget(lblCambio_, 1);

    int linha = 0;
    g->addWidget(rotulo(QStringLiteral("Total do Documento"), painel), linha, 0);
    g->addWidget(evalTotalDoc_, linha++, 1);
    g->addWidget(cmdDescontoPer, linha, 0);
    g->addWidget(evalDescontoPer_, linha++, 1);
    g->addWidget(cmdAltTotalDoc, linha, 0);
    g->addWidget(evalValor_Pagar_, linha++, 1);
    g->addWidget(rotulo(QStringLiteral("Desconto"), painel), linha, 0);
    g->addWidget(evalDesconto_, linha++, 1);
    g->addWidget(cmdCambio, linha, 0);
    g->addLayout(moeda, linha++, 1);
    g->addWidget(cmdAltEntregou, linha, 0);
    g->addWidget(evalEntregou_, linha++, 1);
    g->addWidget(rotulo(QStringLiteral("Troco"), painel), linha, 0);
    g->addWidget(evalTroco_, linha++, 1);
    g->setRowStretch(linha, 1);
    g->setColumnStretch(1, 1);

    connect(cmdDescontoPer, &QPushButton::clicked, this, &frmTroco::descontoPer);
    connect(cmdAltTotalDoc, &QPushButton::clicked, this, &frmTroco::altTotalDoc);
    connect(cmdAltEntregou, &QPushButton::clicked, this, &frmTroco::altEntregou);
    connect(cmdCambio, &QPushButton::clicked, this, &frmTroco::cambio);
    return painel;
}

QWidget* frmTroco::criaFormas() {
    auto* painel = new QWidget(this);
    auto* l = new QVBoxLayout(painel);
    l->setContentsMargins(0, 0, 0, 0);
    l->addWidget(rotulo(QStringLiteral("Forma de Pagamento"), painel));
    auto* escolhida = new QHBoxLayout;
    txtPagaComo_ = new QLineEdit(painel);
    txtPagaComo_->setObjectName(QStringLiteral("txtPagaComo"));
    txtPagaComo_->setReadOnly(true);
    txtPagaComo_->setFocusPolicy(Qt::NoFocus);
    txtPagaComo_->setMaximumWidth(90);
    txtPagaComo_->setMinimumHeight(52);
    lblPagaComo_ = rotulo(QString(), painel);
    lblPagaComo_->setObjectName(QStringLiteral("lblPagaComo"));
    escolhida->addWidget(txtPagaComo_);
    escolhida->addWidget(lblPagaComo_, 1);
    l->addLayout(escolhida);

    auto* rolo = new QScrollArea(painel);
    rolo->setWidgetResizable(true);
    rolo->setFrameShape(QFrame::NoFrame);
    rolo->viewport()->setAutoFillBackground(false);
    lvwPagaComo_ = new QWidget;
    lvwPagaComo_->setObjectName(QStringLiteral("lvwPagaComo"));
    new QGridLayout(lvwPagaComo_);
    rolo->setWidget(lvwPagaComo_);
    l->addWidget(rolo, 1);
    formas_ = new QButtonGroup(this);
    formas_->setExclusive(true);
    connect(formas_, &QButtonGroup::buttonClicked, this, [this](QAbstractButton* b) {
        troco_->EscolhePagaComo(b->property("codigo").toString());
        mostra();
    });
    return painel;
}

std::optional<Pagamento> frmTroco::Abrir(
    const QString& cliente, Currency totalDoc,
    std::function<std::optional<Currency>(double)> aplicaDesconto) {
    troco_ = std::make_unique<Troco>(estado_, mensagens_, totalDoc, std::move(aplicaDesconto));
    pagamento_.reset();
    txtObserva_->clear();
    CarregarFPagamento(cliente);
    mostra();
    if (exec() != QDialog::Accepted) return std::nullopt;
    return pagamento_;
}

void frmTroco::CarregarFPagamento(const QString& cliente) {
    auto* grelha = static_cast<QGridLayout*>(lvwPagaComo_->layout());
    while (QLayoutItem* item = grelha->takeAt(0)) {
        delete item->widget();
        delete item;
    }
    int i = 0;
    for (const BotaoPagaComo& f : troco_->CarregarFPagamento(cliente)) {
        auto* b = new QPushButton(f.descricao, lvwPagaComo_);
        b->setObjectName(QStringLiteral("cmdPagaComo_") + f.codigo);
        b->setProperty("codigo", f.codigo);
        b->setCheckable(true);
        b->setMinimumSize(170, 84);
        b->setAutoDefault(false);
        QPixmap foto;
        if (!f.foto.isEmpty() && foto.loadFromData(f.foto)) {
            b->setIcon(foto);
            b->setIconSize(QSize(56, 56));
        }
        formas_->addButton(b);
        grelha->addWidget(b, i / kColunasFormas, i % kColunasFormas);
        ++i;
    }
    grelha->setRowStretch(grelha->rowCount(), 1);
}

void frmTroco::mostra() {
    const int casas = estado_.param.casadec;
    evalTotalDoc_->setText(NumeroParaTexto(troco_->evalTotalDoc(), casas));
    evalDescontoPer_->setText(NumeroParaTexto(troco_->evalDescontoPer(), kCasasPercentagem));
    evalValor_Pagar_->setText(NumeroParaTexto(troco_->evalValor_Pagar(), casas));
    evalDesconto_->setText(NumeroParaTexto(troco_->evalDesconto(), casas));
    evalEntregou_->setText(NumeroParaTexto(troco_->evalEntregou(), casas));
    evalTroco_->setText(NumeroParaTexto(troco_->evalTroco(), casas));
    txtPagaComo_->setText(troco_->txtPagaComo());
    lblPagaComo_->setText(troco_->lblPagaComo());
    txtCambio_->setText(troco_->txtCambio());
    lblCambio_->setText(troco_->lblCambio());
    for (QAbstractButton* b : formas_->buttons()) {
        if (b->property("codigo").toString() == troco_->txtPagaComo()) b->setChecked(true);
    }
}

void frmTroco::altEntregou() {
    if (const auto v = teclado_.pedirValor(QStringLiteral("Valor Entregue"))) {
        troco_->AlteraEntregou(*v);
        mostra();
    }
}

void frmTroco::altTotalDoc() {
    if (const auto v = teclado_.pedirValor(QStringLiteral("Valor a Pagar"))) {
        troco_->AlteraValorPagar(*v);
        mostra();
    }
}

void frmTroco::descontoPer() {
    if (const auto v = teclado_.pedirValor(QStringLiteral("Desconto %"))) {
        troco_->AlteraDescontoPer(v->toDouble());
        mostra();
    }
}

void frmTroco::cambio() {
    lookups::PesquisaEmJanela janela(estado_, this);
    lookups::PesquisaTabelas pesquisa(estado_, mensagens_, janela);
    lookups::CampoCodigo campo{troco_->txtCambio(), troco_->lblCambio()};
    pesquisa.Cambios(campo, true);
    troco_->AlteraCambio(campo.codigo);
    mostra();
}

void frmTroco::fechaDiv() {
    troco_->AlteraObserva(txtObserva_->text());
    pagamento_ = troco_->Confirmar();
    mostra();
    if (!pagamento_) {
        if (!formas_->buttons().isEmpty()) formas_->buttons().constFirst()->setFocus();
        return;
    }
    accept();
}

}  // namespace brasel::cash
