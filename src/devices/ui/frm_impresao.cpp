#include "devices/ui/frm_impresao.h"

#include "common/ui/estilo_tactil.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::devices {

namespace {

QPushButton* botao(const char* nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumSize(260, 90);
    b->setAutoDefault(false);
    return b;
}

}  // namespace

frmImpresao::frmImpresao(app::Estado& estado, MessagePort& mensagens, LinhaSerie& linha,
                         QWidget* pai)
    : QDialog(pai), estado_(estado), mensagens_(mensagens), linha_(linha) {
    setObjectName(QStringLiteral("frmImpresao"));
    setWindowTitle(QStringLiteral("Impressão do Talão"));

    auto* cmdTalaoNormal = botao("cmdTalaoNormal", QStringLiteral("Talão de &Compra"), this);
    auto* cmdTalaoContab =
        botao("cmdTalaoContab", QStringLiteral("&Documento Contabilístico"), this);
    auto* cmdNao = botao("cmdNao", QStringLiteral("&Não Imprimir"), this);
    auto* cmdAbrirCaixa = botao("cmdAbrirCaixa", QStringLiteral("Abrir &Gaveta"), this);
    chkImpObservacao_ =
        new QCheckBox(QStringLiteral("Imprimir a observação em vez das linhas"), this);
    chkImpObservacao_->setObjectName(QStringLiteral("chkImpObservacao"));
    chkImpObservacao_->setMinimumHeight(48);

    txtVias_ = new QSpinBox(this);
    txtVias_->setObjectName(QStringLiteral("txtVias"));
    txtVias_->setRange(0, 99);
    txtVias_->setValue(1);
    txtVias_->setMinimumSize(120, 64);
    txtVias_->setAlignment(Qt::AlignCenter);
    // Large steps for a finger instead of the spin box's own arrows, too small to touch.
    txtVias_->setButtonSymbols(QAbstractSpinBox::NoButtons);
    auto* cmdMenos = botao("cmdMenosVias", QStringLiteral("−"), this);
    auto* cmdMais = botao("cmdMaisVias", QStringLiteral("+"), this);
    for (QPushButton* b : {cmdMenos, cmdMais})
        b->setMinimumSize(90, 64);

    auto* vias = new QHBoxLayout;
    vias->addWidget(new QLabel(QStringLiteral("Vias:"), this));
    vias->addWidget(cmdMenos);
    vias->addWidget(txtVias_);
    vias->addWidget(cmdMais);
    vias->addStretch();

    auto* grelha = new QGridLayout;
    grelha->addWidget(cmdTalaoNormal, 0, 0);
    grelha->addWidget(cmdTalaoContab, 0, 1);
    grelha->addWidget(chkImpObservacao_, 1, 1);
    grelha->addWidget(cmdAbrirCaixa, 2, 0);
    grelha->addWidget(cmdNao, 2, 1);

    auto* layout = new QVBoxLayout(this);
    layout->addLayout(vias);
    layout->addLayout(grelha);

    connect(cmdMenos, &QPushButton::clicked, txtVias_, &QSpinBox::stepDown);
    connect(cmdMais, &QPushButton::clicked, txtVias_, &QSpinBox::stepUp);
    connect(cmdNao, &QPushButton::clicked, this, [this] { escolhe(EscolhaImpressao::Nenhum); });
    connect(cmdTalaoNormal, &QPushButton::clicked, this,
            [this] { escolhe(EscolhaImpressao::TalaoCompra); });
    connect(cmdTalaoContab, &QPushButton::clicked, this,
            [this] { escolhe(EscolhaImpressao::Contabilistico); });
    connect(cmdAbrirCaixa, &QPushButton::clicked, this,
            [this] { AbreGavetaTalao(estado_, linha_, QString(), true); });

    aplicaFonteTactil(this);
    aplicaCorFundo(this, estado.gUtilizador);
    resize(640, 420);
}

void frmImpresao::escolhe(int escolha) {
    escolha_.escolha = escolha;
    escolha_.vias = txtVias_->value();
    escolha_.observacao =
        escolha == EscolhaImpressao::Contabilistico && chkImpObservacao_->isChecked();
    accept();
}

Currency frmImpresao::Abrir(const QString& tipoDocumento) {
    const auto vias = CarregarVias(estado_.gConn, mensagens_, estado_.gUtilizador, tipoDocumento);
    if (!vias) return Currency();
    txtVias_->setValue(*vias);
    chkImpObservacao_->setChecked(false);
    escolha_ = EscolhaImpressao{};
    if (exec() != QDialog::Accepted) return Currency();
    return EmpacotaEscolha(escolha_);
}

}  // namespace brasel::devices
