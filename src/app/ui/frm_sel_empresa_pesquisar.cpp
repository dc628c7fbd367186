#include "app/ui/frm_sel_empresa_pesquisar.h"

#include "app/seleccao_empresa.h"
#include "app/ui/lista_tactil.h"
#include "common/ui/estilo_tactil.h"
#include "lookups/ui/lista_colunas.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace brasel::app {

namespace {

const QString kColunasPesquisa =
    QStringLiteral("Código,900/Nome da Entidade,4800/Ano,700,C/Servidor,1500/");
constexpr int kPapelIndice = Qt::UserRole + 10;
constexpr int kColunaNome = 1;

}  // namespace

frmSelEmpresaPesquisar::frmSelEmpresaPesquisar(QList<LinhaEmpresa> linhas, QWidget* pai)
    : QDialog(pai),
      linhas_(std::move(linhas)),
      txtPesquisa_(new QLineEdit(this)),
      lvwResultado_(new QTreeWidget(this)) {
    setObjectName(QStringLiteral("frmSelEmpresaPesquisar"));
    setWindowTitle(QStringLiteral("Pesquisar Empresa"));
    resize(760, 520);

    txtPesquisa_->setObjectName(QStringLiteral("txtPesquisa"));
    txtPesquisa_->setMinimumHeight(48);
    txtPesquisa_->setPlaceholderText(QStringLiteral("Código ou nome da empresa"));
    lvwResultado_->setObjectName(QStringLiteral("lvwResultado"));
    lookups::Cria_lvwLISTA(lvwResultado_, kColunasPesquisa);
    preparaListaTactil(lvwResultado_, kColunaNome);

    auto* cmdOK = new QPushButton(QStringLiteral("&OK"), this);
    cmdOK->setObjectName(QStringLiteral("cmdOK"));
    auto* cmdCancelar = new QPushButton(QStringLiteral("&Cancelar"), this);
    cmdCancelar->setObjectName(QStringLiteral("cmdCancelar"));
    for (QPushButton* b : {cmdOK, cmdCancelar})
        b->setMinimumSize(150, 56);

    auto* procura = new QHBoxLayout;
    procura->addWidget(new QLabel(QStringLiteral("Pesquisar"), this));
    procura->addWidget(txtPesquisa_, 1);
    auto* botoes = new QHBoxLayout;
    botoes->addStretch();
    botoes->addWidget(cmdOK);
    botoes->addWidget(cmdCancelar);
    auto* layout = new QVBoxLayout(this);
    layout->addLayout(procura);
    layout->addWidget(lvwResultado_, 1);
    layout->addLayout(botoes);

    connect(txtPesquisa_, &QLineEdit::textChanged, this, &frmSelEmpresaPesquisar::procurar);
    connect(cmdOK, &QPushButton::clicked, this, &QDialog::accept);
    connect(cmdCancelar, &QPushButton::clicked, this, &QDialog::reject);
    connect(lvwResultado_, &QTreeWidget::itemActivated, this, &QDialog::accept);

    aplicaFonteTactil(this);
    procurar();
}

void frmSelEmpresaPesquisar::procurar() {
    lookups::Cria_lvwLISTA(lvwResultado_, kColunasPesquisa);
    for (const int i : procurarEmpresas(linhas_, txtPesquisa_->text())) {
        const LinhaEmpresa& e = linhas_[i];
        lookups::adicionaLinha(lvwResultado_, {e.codigo, e.nome, e.ano, e.servidor})
            ->setData(0, kPapelIndice, i);
    }
    ajustaColunasTactil(lvwResultado_, kColunaNome);
    if (lvwResultado_->topLevelItemCount() > 0)
        lvwResultado_->setCurrentItem(lvwResultado_->topLevelItem(0));
}

int frmSelEmpresaPesquisar::escolhida() const {
    const QTreeWidgetItem* item = lvwResultado_->currentItem();
    return item ? item->data(0, kPapelIndice).toInt() : -1;
}

}  // namespace brasel::app
