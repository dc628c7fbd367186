#include "pos/ui/a_pedidos.h"

#include "app/ui/lista_tactil.h"
#include "common/ui/estilo_tactil.h"
#include "common/ui/indicadores_tacteis.h"

#include <QHBoxLayout>
#include <QHeaderView>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::pos {

namespace {

// The product's description takes the spare width; the note is what a waiter edits.
constexpr int kColunaDescricao = 4;
constexpr int kColunaQuantidade = 5;
constexpr int kColunaObs = 6;

QPushButton* botao(const QString& nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(nome);
    b->setMinimumSize(170, 64);
    return b;
}

}  // namespace

APedidos::APedidos(app::Estado& estado, MessagePort& mensagens, cozinha::EditorTexto& editor,
                   QWidget* pai)
    : QDialog(pai),
      estado_(estado),
      pedidos_(estado, mensagens, editor),
      lista_(new QTreeWidget(this)) {
    setObjectName(QStringLiteral("APedidos"));
    setWindowTitle(QStringLiteral("Pedidos da Cozinha"));

    auto* layout = new QVBoxLayout(this);
    lista_->setObjectName(QStringLiteral("lvwPedidos"));
    lista_->setHeaderLabels({QStringLiteral("Registo"), QStringLiteral("Mesa"),
                             QStringLiteral("Descrição Mesa"), QStringLiteral("Produto"),
                             QStringLiteral("Descrição"), QStringLiteral("Quant."),
                             QStringLiteral("Obs."), QStringLiteral("Utilizador"),
                             QStringLiteral("Data/Hora"), QStringLiteral("Anulação")});
    lista_->setRootIsDecorated(false);
    lista_->setUniformRowHeights(true);
    lista_->setSelectionMode(QAbstractItemView::SingleSelection);
    lista_->headerItem()->setTextAlignment(kColunaQuantidade, Qt::AlignRight | Qt::AlignVCenter);
    lista_->header()->setStretchLastSection(false);
    app::preparaListaTactil(lista_, kColunaDescricao);
    layout->addWidget(lista_, 1);

    auto* botoes = new QHBoxLayout;
    QPushButton* cmdImprimir =
        botao(QStringLiteral("cmdImprimir"), QStringLiteral("&Imprimir"), this);
    QPushButton* cmdEliminar =
        botao(QStringLiteral("cmdEliminar"), QStringLiteral("&Eliminar"), this);
    QPushButton* cmdRefresh =
        botao(QStringLiteral("cmdRefresh"), QStringLiteral("&Actualizar"), this);
    QPushButton* cmdSair = botao(QStringLiteral("cmdSair"), QStringLiteral("&Sair"), this);
    for (QPushButton* b : {cmdImprimir, cmdEliminar, cmdRefresh})
        botoes->addWidget(b);
    botoes->addStretch();
    botoes->addWidget(cmdSair);
    layout->addLayout(botoes);

    connect(cmdImprimir, &QPushButton::clicked, this, &APedidos::imprimir);
    connect(cmdEliminar, &QPushButton::clicked, this, &APedidos::eliminar);
    connect(cmdRefresh, &QPushButton::clicked, this, &APedidos::refresh);
    connect(cmdSair, &QPushButton::clicked, this, &QDialog::accept);
    connect(lista_, &QTreeWidget::itemDoubleClicked, this,
            [this](QTreeWidgetItem* item) { editaObs(item); });

    aplicaFonteTactil(this);
    aplicaIndicadoresTacteis(this);
    aplicaCorFundo(this, estado_.gUtilizador);
    resize(1000, 700);
    refresh();
}

void APedidos::refresh() {
    lista_->clear();
    for (const cozinha::PedidoCopa& p : pedidos_.lista()) {
        QStringList colunas{QString::number(p.numRegisto)};
        colunas += cozinha::ColunasPedidosPorLibertar(p, estado_.param.casadecquant);
        auto* item = new QTreeWidgetItem(lista_, colunas);
        item->setData(0, Qt::UserRole, p.numRegisto);
        item->setFlags(item->flags() | Qt::ItemIsUserCheckable);
        item->setCheckState(0, Qt::Unchecked);
        item->setTextAlignment(kColunaQuantidade, Qt::AlignRight | Qt::AlignVCenter);
    }
    app::ajustaColunasTactil(lista_, kColunaDescricao);
}

QList<qint64> APedidos::marcados() const {
    QList<qint64> numeros;
    for (int i = 0; i < lista_->topLevelItemCount(); ++i) {
        const QTreeWidgetItem* item = lista_->topLevelItem(i);
        if (item->checkState(0) == Qt::Checked)
            numeros.append(item->data(0, Qt::UserRole).toLongLong());
    }
    return numeros;
}

void APedidos::imprimir() {
    pedidos_.liberta(marcados(), lista_->topLevelItemCount() == 0);
    refresh();
}

void APedidos::eliminar() {
    pedidos_.elimina(marcados());
    refresh();
}

void APedidos::editaObs(QTreeWidgetItem* item) {
    const auto obs =
        pedidos_.editaObs(item->data(0, Qt::UserRole).toLongLong(), item->text(kColunaObs));
    if (obs) item->setText(kColunaObs, *obs);
}

}  // namespace brasel::pos
