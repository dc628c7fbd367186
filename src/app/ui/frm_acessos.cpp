#include "app/ui/frm_acessos.h"

#include "common/ui/estilo_tactil.h"
#include "common/ui/indicadores_tacteis.h"

#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QMessageBox>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::app {

namespace {

QPushButton* botao(const QString& nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(nome);
    b->setMinimumSize(150, 60);
    return b;
}

}  // namespace

frmAcessos::frmAcessos(Estado& estado, MessagePort& mensagens,
                       std::function<QList<JanelaAcesso>()> janelas, QWidget* pai)
    : QDialog(pai),
      estado_(estado),
      mensagens_(mensagens),
      janelas_(std::move(janelas)),
      cmbUtilizador_(new QComboBox(this)),
      arvore_(new QTreeWidget(this)) {
    setObjectName(QStringLiteral("frmAcessos"));
    setWindowTitle(QStringLiteral("Acessos dos Utilizadores"));
    QFont fonte = font();
    fonte.setPointSize(14);
    setFont(fonte);

    auto* layout = new QVBoxLayout(this);
    auto* topo = new QHBoxLayout;
    auto* lblUtilizador = new QLabel(QStringLiteral("Utilizador:"), this);
    topo->addWidget(lblUtilizador);
    cmbUtilizador_->setObjectName(QStringLiteral("cmbUtilizador"));
    cmbUtilizador_->setMinimumHeight(52);
    for (const UtilizadorEditavel& u : utilizadoresEditaveis(estado_))
        cmbUtilizador_->addItem(u.codigo + QStringLiteral(" - ") + u.login, u.codigo);
    cmbUtilizador_->setCurrentIndex(-1);
    topo->addWidget(cmbUtilizador_, 1);
    layout->addLayout(topo);

    arvore_->setObjectName(QStringLiteral("tvwAcessos"));
    arvore_->setHeaderHidden(true);
    arvore_->setUniformRowHeights(true);
    layout->addWidget(arvore_, 1);

    auto* botoes = new QHBoxLayout;
    QPushButton* cmdMarcarTodos =
        botao(QStringLiteral("cmdMarcarTodos"), QStringLiteral("&Todos"), this);
    QPushButton* cmdDesmarcarTodos =
        botao(QStringLiteral("cmdDesmarcarTodos"), QStringLiteral("&Nenhum"), this);
    QPushButton* cmdGravar = botao(QStringLiteral("cmdGravar"), QStringLiteral("&Gravar"), this);
    QPushButton* cmdActualizar =
        botao(QStringLiteral("cmdActualizar"), QStringLiteral("&Actualizar"), this);
    QPushButton* cmdFechar = botao(QStringLiteral("cmdFechar"), QStringLiteral("&Fechar"), this);
    for (QPushButton* b : {cmdMarcarTodos, cmdDesmarcarTodos, cmdGravar, cmdActualizar})
        botoes->addWidget(b);
    botoes->addStretch();
    botoes->addWidget(cmdFechar);
    layout->addLayout(botoes);

    connect(cmdMarcarTodos, &QPushButton::clicked, this, [this] { marcaTodos(true); });
    connect(cmdDesmarcarTodos, &QPushButton::clicked, this, [this] { marcaTodos(false); });
    connect(cmdGravar, &QPushButton::clicked, this, &frmAcessos::grava);
    connect(cmdActualizar, &QPushButton::clicked, this, &frmAcessos::carrega);
    connect(cmdFechar, &QPushButton::clicked, this, &QDialog::accept);
    connect(cmbUtilizador_, &QComboBox::activated, this,
            [this](int indice) { Utilizador(cmbUtilizador_->itemData(indice).toString()); });

    aplicaFonteTactil(this);
    aplicaIndicadoresTacteis(this);
    resize(900, 680);
}

void frmAcessos::Utilizador(const QString& codigo) {
    utilizador_ = codigo;
    cmbUtilizador_->setCurrentIndex(cmbUtilizador_->findData(codigo));
    carrega();
}

void frmAcessos::ShowForm() {
    exec();
}

void frmAcessos::carrega() {
    arvore_->clear();
    itens_.clear();
    direitos_ = lerDireitos(estado_, utilizador_);
    if (direitos_.isEmpty() && !utilizadorSemRestricoes(utilizador_) && !utilizador_.isEmpty() &&
        criarRegisto()) {
        CriaTodososAcessos(estado_, utilizador_, janelas_());
        direitos_ = lerDireitos(estado_, utilizador_);
    }
    const QList<int> pais = paisDireitos(direitos_);
    for (const DireitoAcesso& d : direitos_) {
        auto* item = new QTreeWidgetItem(QStringList{textoDireito(d)});
        item->setFlags((item->flags() | Qt::ItemIsUserCheckable) & ~Qt::ItemIsAutoTristate);
        item->setCheckState(0, d.valor ? Qt::Checked : Qt::Unchecked);
        item->setData(0, kPapelChave, d.chave);
        item->setSizeHint(0, QSize(0, 44));
        itens_.append(item);
    }
    for (int i = 0; i < itens_.size(); ++i) {
        if (pais[i] < 0) {
            arvore_->addTopLevelItem(itens_[i]);
        } else {
            itens_[pais[i]]->addChild(itens_[i]);
        }
    }
    arvore_->expandToDepth(0);
}

bool frmAcessos::criarRegisto() {
    QMessageBox pergunta(
        QMessageBox::Question, windowTitle(),
        QStringLiteral("Não existe Registo em Base de Dados dos Acessos deste Utilizador"),
        QMessageBox::NoButton, this);
    pergunta.setObjectName(QStringLiteral("frmCriarAcessos"));
    QPushButton* criar =
        pergunta.addButton(QStringLiteral("Pretendo Criar o Registo"), QMessageBox::AcceptRole);
    criar->setObjectName(QStringLiteral("cmdCriarRegisto"));
    QPushButton* cancelar = pergunta.addButton(QStringLiteral("Cancelar o Registo dos Acessos"),
                                               QMessageBox::RejectRole);
    cancelar->setObjectName(QStringLiteral("cmdCancelarRegisto"));
    for (QPushButton* b : {criar, cancelar})
        b->setMinimumHeight(56);
    pergunta.setDefaultButton(cancelar);
    pergunta.exec();
    return pergunta.clickedButton() == criar;
}

QList<DireitoAcesso> frmAcessos::direitosMarcados() const {
    QList<DireitoAcesso> direitos = direitos_;
    for (int i = 0; i < direitos.size(); ++i)
        direitos[i].valor = itens_[i]->checkState(0) == Qt::Checked;
    return direitos;
}

void frmAcessos::marcaTodos(bool ligado) {
    for (QTreeWidgetItem* item : itens_)
        item->setCheckState(0, ligado ? Qt::Checked : Qt::Unchecked);
}

void frmAcessos::grava() {
    if (utilizador_.isEmpty()) return;
    if (!gravarDireitos(estado_, utilizador_, direitosMarcados())) {
        mensagens_.mensagem(QStringLiteral("Não foi possível gravar os acessos deste utilizador."),
                            Icone::Critico);
        return;
    }
    direitos_ = direitosMarcados();
}

}  // namespace brasel::app
