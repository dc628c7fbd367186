#include "app/ui/frm_sel_empresa.h"

#include "app/actualizador.h"
#include "app/definicoes_posto.h"
#include "app/seleccao_empresa.h"
#include "app/ui/frm_sel_empresa_pesquisar.h"
#include "app/ui/frm_sel_empresas_validacao.h"
#include "app/ui/lista_tactil.h"
#include "common/ui/estilo_tactil.h"
#include "lookups/ui/lista_colunas.h"

#include <QCloseEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace brasel::app {

namespace {

// Where a row of the list keeps the index of its company (the list may be sorted).
constexpr int kPapelIndice = Qt::UserRole + 10;
constexpr int kColunaNome = 1;

QPushButton* botao(const char* nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumSize(150, 56);
    return b;
}

}  // namespace

frmSelEmpresa::frmSelEmpresa(Estado& estado, MessagePort& mensagens, QString linhaComando,
                             QWidget* pai)
    : QWidget(pai),
      estado_(estado),
      mensagens_(mensagens),
      linhaComando_(std::move(linhaComando)),
      lblVersao_(new QLabel(this)),
      txtAno_(new QLineEdit(this)),
      txtEmpresa_(new QLineEdit(this)),
      lvwEmpresas_(new QTreeWidget(this)) {
    setObjectName(QStringLiteral("frmSelEmpresa"));
    setWindowTitle(QStringLiteral("Selecção de Empresa"));
    resize(1000, 700);

    lblVersao_->setObjectName(QStringLiteral("lblVersao"));
    lblVersao_->setText(legendaVersoes(VerificaNovasVersoes(estado_.config.pastaActualizacoes)));
    txtAno_->setObjectName(QStringLiteral("txtAno"));
    txtAno_->setMaxLength(4);
    txtAno_->setMaximumWidth(110);
    txtAno_->setText(posto::ME_Ano.ler());
    txtEmpresa_->setObjectName(QStringLiteral("txtEmpresa"));
    txtEmpresa_->setText(posto::ME_Empresa.ler());
    for (QLineEdit* caixa : {txtAno_, txtEmpresa_})
        caixa->setMinimumHeight(48);

    lvwEmpresas_->setObjectName(QStringLiteral("lvwEmpresas"));
    lookups::Cria_lvwLISTA(lvwEmpresas_, kColunasEmpresas);
    preparaListaTactil(lvwEmpresas_, kColunaNome);

    QPushButton* cmdFiltrar = botao("cmdFiltrar", QStringLiteral("&Filtrar"), this);
    QPushButton* cmdPesquisar = botao("cmdPesquisar", QStringLiteral("&Pesquisar"), this);
    QPushButton* cmdServidores = botao("cmdServidores", QStringLiteral("&Servidores"), this);
    QPushButton* cmdOK = botao("cmdOK", QStringLiteral("&OK"), this);
    QPushButton* cmdCancelar = botao("cmdCancelar", QStringLiteral("&Cancelar"), this);

    auto* filtros = new QHBoxLayout;
    filtros->addWidget(new QLabel(QStringLiteral("Ano"), this));
    filtros->addWidget(txtAno_);
    filtros->addSpacing(16);
    filtros->addWidget(new QLabel(QStringLiteral("Empresa"), this));
    filtros->addWidget(txtEmpresa_, 1);
    filtros->addWidget(cmdFiltrar);

    auto* botoes = new QHBoxLayout;
    botoes->addWidget(cmdPesquisar);
    botoes->addWidget(cmdServidores);
    botoes->addStretch();
    botoes->addWidget(cmdOK);
    botoes->addWidget(cmdCancelar);

    auto* layout = new QVBoxLayout(this);
    layout->addWidget(lblVersao_);
    layout->addLayout(filtros);
    layout->addWidget(lvwEmpresas_, 1);
    layout->addLayout(botoes);

    connect(cmdFiltrar, &QPushButton::clicked, this, &frmSelEmpresa::filtrar);
    connect(txtEmpresa_, &QLineEdit::returnPressed, this, &frmSelEmpresa::filtrar);
    connect(txtAno_, &QLineEdit::returnPressed, this, &frmSelEmpresa::filtrar);
    connect(cmdPesquisar, &QPushButton::clicked, this, &frmSelEmpresa::pesquisar);
    connect(cmdServidores, &QPushButton::clicked, this, &frmSelEmpresa::servidores);
    connect(cmdOK, &QPushButton::clicked, this, &frmSelEmpresa::entrar);
    connect(lvwEmpresas_, &QTreeWidget::itemActivated, this, &frmSelEmpresa::entrar);
    connect(cmdCancelar, &QPushButton::clicked, this, &QWidget::close);

    aplicaFonteTactil(this);
    filtrar();
}

void frmSelEmpresa::filtrar() {
    linhas_ =
        listarEmpresas(txtEmpresa_->text().trimmed(), txtAno_->text().trimmed(), linhaComando_);
    lookups::Cria_lvwLISTA(lvwEmpresas_, kColunasEmpresas);
    for (int i = 0; i < linhas_.size(); ++i) {
        const LinhaEmpresa& e = linhas_[i];
        QTreeWidgetItem* item = lookups::adicionaLinha(
            lvwEmpresas_, {e.codigo, e.nome, e.ano, e.servidor, e.login, e.passwordCifrada,
                           e.autenticacao, e.versao, e.tamanho});
        item->setData(0, kPapelIndice, i);
    }
    ajustaColunasTactil(lvwEmpresas_, kColunaNome);
    if (!linhas_.isEmpty()) seleccionar(0);
}

void frmSelEmpresa::seleccionar(int indice) {
    for (int i = 0; i < lvwEmpresas_->topLevelItemCount(); ++i) {
        QTreeWidgetItem* item = lvwEmpresas_->topLevelItem(i);
        if (item->data(0, kPapelIndice).toInt() == indice) {
            lvwEmpresas_->setCurrentItem(item);
            lvwEmpresas_->scrollToItem(item);
            return;
        }
    }
}

int frmSelEmpresa::indiceSeleccionado() const {
    const QTreeWidgetItem* item = lvwEmpresas_->currentItem();
    return item ? item->data(0, kPapelIndice).toInt() : -1;
}

void frmSelEmpresa::entrar() {
    const int indice = indiceSeleccionado();
    if (indice < 0 || indice >= linhas_.size()) return;
    if (entrarEmpresa(estado_, linhas_[indice], mensagens_) != ResultadoEmpresa::Login) return;
    guardarFiltros();
    saiu_ = true;
    Q_EMIT empresaEscolhida();
}

void frmSelEmpresa::pesquisar() {
    frmSelEmpresaPesquisar pesquisa(linhas_, this);
    if (pesquisa.exec() == QDialog::Accepted && pesquisa.escolhida() >= 0)
        seleccionar(pesquisa.escolhida());
}

void frmSelEmpresa::servidores() {
    frmSelEmpresas_Validacao manutencao(mensagens_, this);
    if (manutencao.exec() == QDialog::Accepted) filtrar();
}

void frmSelEmpresa::guardarFiltros() {
    posto::ME_Ano.gravar(txtAno_->text().trimmed());
    posto::ME_Empresa.gravar(txtEmpresa_->text().trimmed());
}

void frmSelEmpresa::closeEvent(QCloseEvent* evento) {
    if (!saiu_) {
        guardarFiltros();
        saiu_ = true;
        Q_EMIT cancelado();
    }
    evento->accept();
}

}  // namespace brasel::app
