#include "cash/ui/frm_troco_espera.h"

#include "common/number_text.h"
#include "common/ui/estilo_tactil.h"

#include <QGridLayout>
#include <QPushButton>
#include <QVBoxLayout>

#include <utility>

namespace brasel::cash {

namespace {

QLabel* figura(const char* nome, int pontos, QWidget* pai) {
    auto* l = new QLabel(pai);
    l->setObjectName(QString::fromLatin1(nome));
    l->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    QFont f = l->font();
    f.setPointSize(pontos);
    f.setBold(true);
    l->setFont(f);
    return l;
}

}  // namespace

frmTrocoEspera::frmTrocoEspera(app::Estado& estado, QWidget* pai) : QDialog(pai), estado_(estado) {
    setObjectName(QStringLiteral("frmTrocoEspera"));
    setWindowTitle(QStringLiteral("Troco"));
    setModal(false);
    auto* layout = new QVBoxLayout(this);
    lblDocumento_ = new QLabel(this);
    lblDocumento_->setObjectName(QStringLiteral("lblDocumento"));
    lblDocumento_->setAlignment(Qt::AlignCenter);
    QFont fonteDocumento = lblDocumento_->font();
    fonteDocumento.setPointSize(18);
    lblDocumento_->setFont(fonteDocumento);
    layout->addWidget(lblDocumento_);

    auto* g = new QGridLayout;
    lblTotalDoc_ = figura("lblTotalDoc", 28, this);
    lblEntregou_ = figura("lblEntregou", 28, this);
    lblTroco_ = figura("lblTroco", 40, this);
    int linha = 0;
    for (auto [titulo, figuraDe] :
         {std::pair{"Total", lblTotalDoc_}, std::pair{"Entregou", lblEntregou_},
          std::pair{"Troco", lblTroco_}}) {
        auto* rotulo = new QLabel(QString::fromLatin1(titulo), this);
        QFont f = rotulo->font();
        f.setPointSize(20);
        rotulo->setFont(f);
        g->addWidget(rotulo, linha, 0);
        g->addWidget(figuraDe, linha++, 1);
    }
    g->setColumnStretch(1, 1);
    layout->addLayout(g, 1);

    // The closing closes the screen when the next tab is taken; the cashier may close it first.
    auto* cmdFechar = new QPushButton(QStringLiteral("&Fechar"), this);
    cmdFechar->setObjectName(QStringLiteral("cmdFechar"));
    cmdFechar->setMinimumSize(190, 60);
    cmdFechar->setAutoDefault(false);
    layout->addWidget(cmdFechar, 0, Qt::AlignRight);
    connect(cmdFechar, &QPushButton::clicked, this, &QDialog::close);

    aplicaFonteTactil(this);
    aplicaCorFundo(this, estado_.gUtilizador);
    lblTroco_->setStyleSheet(
        QStringLiteral("color: #f8f8f2; background: #1d3557; padding: 6px; font-size: 40pt;"));
    resize(640, 480);
}

void frmTrocoEspera::Abrir(const QString& documento, const QString& modo, Currency total,
                           Currency entregou, Currency troco) {
    if (modo.trimmed().compare(QLatin1String("FECHAR"), Qt::CaseInsensitive) == 0) {
        close();
        return;
    }
    if (modo.trimmed().compare(QLatin1String("ABRIR"), Qt::CaseInsensitive) != 0) return;
    const int casas = estado_.param.casadec;
    lblDocumento_->setText(documento);
    lblTotalDoc_->setText(NumeroParaTexto(total, casas));
    lblEntregou_->setText(NumeroParaTexto(entregou, casas));
    lblTroco_->setText(NumeroParaTexto(troco, casas));
    show();
    raise();
}

}  // namespace brasel::cash
