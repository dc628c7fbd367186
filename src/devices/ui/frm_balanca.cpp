#include "devices/ui/frm_balanca.h"

#include "common/ui/estilo_tactil.h"

#include <QFormLayout>
#include <QHBoxLayout>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::devices {

namespace {

QLineEdit* campo(const char* nome, const QString& texto, QWidget* pai) {
    auto* c = new QLineEdit(texto, pai);
    c->setObjectName(QString::fromLatin1(nome));
    c->setMinimumHeight(44);
    return c;
}

QPushButton* botao(const char* nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumSize(200, 64);
    b->setAutoDefault(false);
    return b;
}

}  // namespace

frmBalanca::frmBalanca(app::Estado& estado, QWidget* pai)
    : QDialog(pai), linha_(app::MapaPortas::ler(estado.config.mapaPortas)) {
    setObjectName(QStringLiteral("frmBalanca"));
    QFont fonte = font();
    fonte.setPointSize(16);
    setFont(fonte);
    const DefinicoesBalanca guardadas = DefinicoesBalanca::ler();

    lblPreco_ = new QLabel(this);
    lblPreco_->setObjectName(QStringLiteral("lblPreco"));
    txtPortaCom_ = campo("txtPortaCom", guardadas.portaCom, this);
    txtInicializar_ = campo("txtInicializar", guardadas.inicializar, this);
    txtTimeOut_ = campo("txtTimeOut", guardadas.timeOut, this);
    cmbTipoBalanca_ = new QComboBox(this);
    cmbTipoBalanca_->setObjectName(QStringLiteral("cmbTipoBalanca"));
    cmbTipoBalanca_->setMinimumHeight(44);
    cmbTipoBalanca_->addItems(
        {QString::fromLatin1(kBalancaCS300), QString::fromLatin1(kBalancaD70)});
    cmbTipoBalanca_->setCurrentIndex(guardadas.d70() ? 1 : 0);
    lblEstado_ = new QLabel(this);
    lblEstado_->setObjectName(QStringLiteral("lblEstado"));
    lblEstado_->setWordWrap(true);
    lblEstado_->setMinimumHeight(96);
    lblEstado_->setAlignment(Qt::AlignCenter);
    lblEstado_->setFrameShape(QFrame::Panel);
    lblEstado_->setFrameShadow(QFrame::Sunken);

    auto* formulario = new QFormLayout;
    formulario->addRow(QStringLiteral("Balança"), cmbTipoBalanca_);
    formulario->addRow(QStringLiteral("Porta COM"), txtPortaCom_);
    formulario->addRow(QStringLiteral("Definições da porta"), txtInicializar_);
    formulario->addRow(QStringLiteral("Tempo de espera (s)"), txtTimeOut_);

    auto* cmdCapturarPesagem =
        botao("cmdCapturarPesagem", QStringLiteral("&Capturar Pesagem"), this);
    auto* cmdOK = botao("cmdOK", QStringLiteral("&OK"), this);
    auto* cmdCancelar = botao("cmdCancelar", QStringLiteral("&Cancelar"), this);
    auto* botoes = new QHBoxLayout;
    for (QPushButton* b : {cmdCapturarPesagem, cmdOK, cmdCancelar})
        botoes->addWidget(b);

    auto* layout = new QVBoxLayout(this);
    layout->addWidget(lblPreco_);
    layout->addLayout(formulario);
    layout->addWidget(lblEstado_);
    layout->addLayout(botoes);

    // A field is rewritten as the number it holds when it is left.
    connect(txtPortaCom_, &QLineEdit::editingFinished, this,
            [this] { txtPortaCom_->setText(normalizaPortaCom(txtPortaCom_->text())); });
    connect(txtTimeOut_, &QLineEdit::editingFinished, this,
            [this] { txtTimeOut_->setText(normalizaTimeOut(txtTimeOut_->text())); });
    connect(cmbTipoBalanca_, &QComboBox::currentTextChanged, this, &frmBalanca::actualizaTitulo);
    connect(cmdCapturarPesagem, &QPushButton::clicked, this, &frmBalanca::capturar);
    connect(cmdOK, &QPushButton::clicked, this, &QDialog::accept);
    connect(cmdCancelar, &QPushButton::clicked, this, &QDialog::reject);

    aplicaFonteTactil(this);
    aplicaCorFundo(this, estado.gUtilizador);
    // What the scale answered is read from a step away.
    QFont fonteEstado = lblEstado_->font();
    fonteEstado.setPointSize(22);
    lblEstado_->setFont(fonteEstado);
    resize(760, 560);
    actualizaTitulo();
}

Currency frmBalanca::pesa(Currency precoUnitario) {
    precoUnitario_ = precoUnitario;
    peso_ = Currency();
    lblPreco_->setText(QStringLiteral("Preço unitário: ") + precoUnitario.toText(2));
    lblEstado_->clear();
    return exec() == QDialog::Accepted ? peso_ : Currency();
}

void frmBalanca::done(int resultado) {
    definicoes().gravar();
    QDialog::done(resultado);
}

void frmBalanca::actualizaTitulo() {
    setWindowTitle(QStringLiteral("Ligação à Balança - ") + cmbTipoBalanca_->currentText());
}

DefinicoesBalanca frmBalanca::definicoes() const {
    return {normalizaPortaCom(txtPortaCom_->text()), txtInicializar_->text().trimmed(),
            normalizaTimeOut(txtTimeOut_->text()), cmbTipoBalanca_->currentText()};
}

void frmBalanca::capturar() {
    // The buttons wait while the scale is asked: the wait lets the window repaint, and a second
    // press must not start a weighing inside this one.
    QList<QPair<QPushButton*, bool>> botoes;
    for (QPushButton* b : findChildren<QPushButton*>()) {
        botoes.append({b, b->isEnabled()});
        b->setEnabled(false);
    }
    const ResultadoCaptura resultado =
        devices::capturaPesagem(definicoes(), linha_, precoUnitario_, [this](const QString& texto) {
            lblEstado_->setText(texto);
            lblEstado_->repaint();
        });
    peso_ = resultado.capturada ? resultado.peso : Currency();
    for (const auto& [b, activo] : botoes)
        b->setEnabled(activo);
    if (resultado.capturada) findChild<QPushButton*>(QStringLiteral("cmdOK"))->setFocus();
}

}  // namespace brasel::devices
