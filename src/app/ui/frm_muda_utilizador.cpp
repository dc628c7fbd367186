#include "app/ui/frm_muda_utilizador.h"

#include "app/definicoes_posto.h"
#include "app/ui/frm_muda_utilizador_password.h"
#include "common/ui/estilo_tactil.h"
#include "lookups/ui/lista_colunas.h"

#include <QHBoxLayout>
#include <QHeaderView>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::app {

namespace {

// Where the row keeps the index of its user.
constexpr int kPapelIndice = Qt::UserRole + 10;
const QRect kDesenho(200, 80, 620, 560);

}  // namespace

frmMudaUtilizador::frmMudaUtilizador(Estado& estado, MessagePort& mensagens, QWidget* pai)
    : QDialog(pai), estado_(estado), mensagens_(mensagens), lista_(new QTreeWidget(this)) {
    setObjectName(QStringLiteral("frmMudaUtilizador"));
    setWindowTitle(QStringLiteral("Mudar de Utilizador"));
    QFont fonte = font();
    fonte.setPointSize(16);
    setFont(fonte);

    auto* layout = new QVBoxLayout(this);
    lista_->setObjectName(QStringLiteral("lvwUtilizadores"));
    layout->addWidget(lista_);
    auto* botoes = new QHBoxLayout;
    auto* cmdOK = new QPushButton(QStringLiteral("&OK"), this);
    cmdOK->setObjectName(QStringLiteral("cmdOK"));
    auto* cmdCancelar = new QPushButton(QStringLiteral("&Cancelar"), this);
    cmdCancelar->setObjectName(QStringLiteral("cmdCancelar"));
    for (QPushButton* botao : {cmdOK, cmdCancelar}) {
        botao->setMinimumSize(200, 64);
        botoes->addWidget(botao);
    }
    layout->addLayout(botoes);
    connect(cmdOK, &QPushButton::clicked, this, &frmMudaUtilizador::ok);
    connect(cmdCancelar, &QPushButton::clicked, this, &QDialog::reject);
    connect(lista_, &QTreeWidget::itemDoubleClicked, this, &frmMudaUtilizador::ok);

    aplicaFonteTactil(this);
    aplicaCorFundo(this, estado_.gUtilizador);
    // Only the position is kept; the size is the window's own.
    resize(kDesenho.size());
    move(posto::JanUtilizadorL.ler(kDesenho.left()), posto::JanUtilizadorT.ler(kDesenho.top()));
    carregaLista();
}

void frmMudaUtilizador::carregaLista() {
    lookups::Cria_lvwLISTA(lista_, QStringLiteral("Código,0/Nome do Utilizador,5200,C/P,0"));
    lista_->header()->setStretchLastSection(true);
    utilizadores_ = utilizadoresMudanca(estado_);
    for (int i = 0; i < utilizadores_.size(); ++i) {
        const UtilizadorMudanca& u = utilizadores_[i];
        auto* linha = lookups::adicionaLinha(
            lista_, {u.codigo, u.login, u.semPassword() ? kSemPassword : QString()});
        linha->setData(0, kPapelIndice, i);
        linha->setSizeHint(1, QSize(0, 48));
    }
}

bool frmMudaUtilizador::Muda_de_Utilizador() {
    const bool mudou = exec() == QDialog::Accepted;
    posto::JanUtilizadorL.gravar(pos().x());
    posto::JanUtilizadorT.gravar(pos().y());
    return mudou;
}

void frmMudaUtilizador::ok() {
    const QTreeWidgetItem* linha = lista_->currentItem();
    const UtilizadorMudanca* escolhido =
        linha != nullptr ? &utilizadores_[linha->data(0, kPapelIndice).toInt()] : nullptr;
    if (escolhido != nullptr && posto::ConfigRest_PedePWD.ler()) {
        frmMudaUtilizadorPassword prompt(*escolhido, mensagens_, this);
        if (!prompt.Password_str()) return;
    }
    if (!mudaUtilizador(estado_, escolhido, mensagens_, posto::ConfigRest_CAIXA.ler())) return;
    accept();
    Q_EMIT utilizadorMudado();
}

}  // namespace brasel::app
