#include "cash/ui/frm_lanc_mov_caixa.h"

#include "cash/registo_caixa.h"
#include "common/number_text.h"
#include "common/ui/estilo_tactil.h"
#include "pos/ui/frm_teclado.h"

#include <QHBoxLayout>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::cash {

namespace {

QPushButton* botao(const char* nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumSize(180, 72);
    return b;
}

}  // namespace

frmLancMovCaixa::frmLancMovCaixa(app::Estado& estado, MessagePort& mensagens, QWidget* pai,
                                 pos::PedeValor* teclado)
    : QDialog(pai),
      estado_(estado),
      mensagens_(mensagens),
      tecladoProprio_(teclado ? nullptr
                              : std::make_unique<pos::TecladoJanela>(mensagens, nullptr, this)),
      teclado_(teclado ? *teclado : *tecladoProprio_) {
    setObjectName(QStringLiteral("frmLancMovCaixa"));
    setWindowTitle(QStringLiteral("Formas de Pagamento"));

    lvwFormas_ = new ListaFormasValor(QStringLiteral("Parcial"), estado_.param.casadec, this);
    connect(lvwFormas_, &ListaFormasValor::valorAlterado, this, [this] { CalculaTot(); });

    lblTotalDoc_ = new QLabel(this);
    lblTotalDoc_->setObjectName(QStringLiteral("lblTotalDoc"));
    lblTotalDoc_->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    lblResto_ = new QLabel(this);
    lblResto_->setObjectName(QStringLiteral("lblResto"));
    lblResto_->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    lblResto_->setFrameShape(QFrame::Panel);
    lblResto_->setFrameShadow(QFrame::Sunken);

    auto* cmdValor = botao("cmdValor", QStringLiteral("&Valor..."), this);
    auto* cmdTudo = botao("cmdTudo", QStringLiteral("&Tudo"), this);
    auto* cmdOK = botao("cmdOK", QStringLiteral("&OK"), this);
    auto* cmdCancelar = botao("cmdCancelar", QStringLiteral("&Cancelar"), this);
    connect(cmdValor, &QPushButton::clicked, this, [this] { lvwFormas_->pedeValor(teclado_); });
    connect(cmdTudo, &QPushButton::clicked, this, [this] { tudo(); });
    connect(cmdOK, &QPushButton::clicked, this, [this] { confirma(); });
    connect(cmdCancelar, &QPushButton::clicked, this, &QDialog::reject);

    auto* lado = new QVBoxLayout;
    lado->addWidget(new QLabel(QStringLiteral("Total do Documento"), this));
    lado->addWidget(lblTotalDoc_);
    lado->addWidget(new QLabel(QStringLiteral("Resto"), this));
    lado->addWidget(lblResto_);
    lado->addSpacing(16);
    lado->addWidget(cmdValor);
    lado->addWidget(cmdTudo);
    lado->addStretch();
    lado->addWidget(cmdOK);
    lado->addWidget(cmdCancelar);
    auto* layout = new QHBoxLayout(this);
    layout->addWidget(lvwFormas_, 1);
    layout->addLayout(lado);
    aplicaFonteTactil(this);
    resize(900, 560);
}

frmLancMovCaixa::~frmLancMovCaixa() = default;

std::optional<std::vector<ParcialPagamento>> frmLancMovCaixa::Carregar(Currency totalDoc,
                                                                       const QString& proposta) {
    totalDoc_ = totalDoc;
    resultado_.clear();
    const auto formas = FormasPagamento(estado_.gConn);
    if (!formas || formas->empty()) {
        mensagens_.mensagem(QStringLiteral("Processo Incompleto!"), Icone::Critico);
        return std::nullopt;
    }
    // A document paid by one method, as most are, needs only OK.
    QHash<QString, Currency> propostos;
    if (!proposta.isEmpty()) propostos.insert(proposta, totalDoc_);
    lvwFormas_->preenche(*formas, propostos);
    for (int i = 0; i < lvwFormas_->rowCount(); ++i)
        if (lvwFormas_->item(i, ListaFormasValor::Codigo)->text() == proposta)
            lvwFormas_->selectRow(i);
    lblTotalDoc_->setText(NumeroParaTexto(totalDoc_, estado_.param.casadec));
    CalculaTot();
    if (exec() != QDialog::Accepted) return std::nullopt;
    return resultado_;
}

std::optional<Currency> frmLancMovCaixa::CalculaTot() {
    const auto pago = lvwFormas_->total();
    if (!pago) return std::nullopt;
    try {
        const Currency resto = totalDoc_ - *pago;
        lblResto_->setText(NumeroParaTexto(resto, estado_.param.casadec));
        return resto;
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
}

void frmLancMovCaixa::tudo() {
    const int linha = lvwFormas_->currentRow();
    const auto resto = CalculaTot();
    if (linha < 0 || !resto) return;
    try {
        lvwFormas_->mostraValor(linha, *lvwFormas_->valor(linha) + *resto);
    } catch (const CurrencyOverflow&) {
        // A part that cannot take the remainder stays as it was.
    }
}

void frmLancMovCaixa::confirma() {
    const auto lista = lvwFormas_->valores<ParcialPagamento>();
    if (!lista) {
        mensagens_.mensagem(QStringLiteral("Valor Inválido!"), Icone::Critico);
        return;
    }
    const auto resto = CalculaTot();
    if (!resto || !resto->isZero()) {
        mensagens_.mensagem(QStringLiteral("Não Atribuiu o Valor Total do Documento!"),
                            Icone::Critico);
        return;
    }
    resultado_ = *lista;
    accept();
}

}  // namespace brasel::cash
