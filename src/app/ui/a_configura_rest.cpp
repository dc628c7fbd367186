#include "app/ui/a_configura_rest.h"

#include "app/definicoes_posto.h"
#include "common/ui/estilo_tactil.h"
#include "common/ui/indicadores_tacteis.h"
#include "lookups/ui/campo_codigo_janela.h"

#include <QColorDialog>
#include <QFileDialog>
#include <QFileInfo>
#include <QFormLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QPrinterInfo>
#include <QPushButton>
#include <QRadioButton>
#include <QTabWidget>
#include <QVBoxLayout>

namespace brasel::app {

namespace {

constexpr int kAlturaTactil = 52;

QPushButton* botao(const QString& nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(nome);
    b->setMinimumSize(140, kAlturaTactil);
    return b;
}

QLineEdit* caixaTexto(const QString& nome, QWidget* pai) {
    auto* t = new QLineEdit(pai);
    t->setObjectName(nome);
    t->setMinimumHeight(kAlturaTactil);
    return t;
}

// The options of a group, each with its value, side by side.
QButtonGroup* grupoOpcoes(const QString& nome, const QStringList& textos, QWidget* pai,
                          QHBoxLayout* linha) {
    auto* grupo = new QButtonGroup(pai);
    grupo->setObjectName(nome);
    for (int i = 0; i < textos.size(); ++i) {
        auto* opcao = new QRadioButton(textos[i], pai);
        opcao->setObjectName(nome + QString::number(i));
        opcao->setMinimumHeight(kAlturaTactil);
        grupo->addButton(opcao, i);
        linha->addWidget(opcao);
    }
    linha->addStretch();
    return grupo;
}

void marca(QButtonGroup* grupo, const QStringList& valores, const QString& valor) {
    grupo->button(qMax(0, valores.indexOf(valor)))->setChecked(true);
}

QString marcado(const QButtonGroup* grupo, const QStringList& valores) {
    return valores.value(qMax(0, grupo->checkedId()));
}

}  // namespace

AConfiguraRest::AConfiguraRest(Estado& estado, MessagePort& mensagens, QWidget* pai)
    : QDialog(pai),
      estado_(estado),
      mensagens_(mensagens),
      janelaPesquisa_(estado, this),
      pesquisaTabelas_(estado, mensagens, janelaPesquisa_) {
    setObjectName(QStringLiteral("AConfiguraRest"));
    setWindowTitle(QStringLiteral("Configurações"));
    QFont fonte = font();
    fonte.setPointSize(14);
    setFont(fonte);

    auto* layout = new QVBoxLayout(this);
    auto* paginas = new QTabWidget(this);
    paginas->setObjectName(QStringLiteral("tabPaginas"));
    paginas->addTab(paginaPosto(), QStringLiteral("Posto"));
    paginas->addTab(paginaImpressoras(), QStringLiteral("Impressoras"));
    paginas->addTab(paginaOpcoes(), QStringLiteral("Opções"));
    layout->addWidget(paginas, 1);

    auto* fundo = new QHBoxLayout;
    fundo->addStretch();
    QPushButton* cmdFechar = botao(QStringLiteral("cmdFechar"), QStringLiteral("&Fechar"), this);
    cmdFechar->setMinimumSize(200, 64);
    fundo->addWidget(cmdFechar);
    layout->addLayout(fundo);
    connect(cmdFechar, &QPushButton::clicked, this, &QDialog::accept);

    aplicaFonteTactil(this);
    aplicaIndicadoresTacteis(this);
    resize(980, 700);
    mostra(ConfiguracaoRest::ler(estado_.gUtilizador));
}

AConfiguraRest::CampoCodigo AConfiguraRest::campoCodigo(const QString& nome,
                                                        CodigoConfiguracao tabela,
                                                        QHBoxLayout* linha) {
    CampoCodigo campo{caixaTexto(QStringLiteral("txt") + nome, this), new QLabel(this), tabela};
    campo.codigo->setMaximumWidth(160);
    campo.descricao->setObjectName(QStringLiteral("lbl") + nome);
    campo.descricao->setMinimumWidth(300);
    QPushButton* procura = botao(QStringLiteral("cmdPesquisa") + nome, QStringLiteral("..."), this);
    procura->setMinimumWidth(64);
    linha->addWidget(campo.codigo);
    linha->addWidget(procura);
    linha->addWidget(campo.descricao, 1);
    connect(campo.codigo, &QLineEdit::editingFinished, this,
            [this, campo] { pesquisa(campo, false); });
    connect(procura, &QPushButton::clicked, this, [this, campo] { pesquisa(campo, true); });
    return campo;
}

QWidget* AConfiguraRest::paginaPosto() {
    auto* pagina = new QWidget(this);
    auto* form = new QFormLayout(pagina);
    form->setVerticalSpacing(14);
    auto linhaCodigo = [&](const QString& titulo, const QString& nome, CodigoConfiguracao tabela) {
        auto* linha = new QHBoxLayout;
        form->addRow(titulo, linha);
        return campoCodigo(nome, tabela, linha);
    };

    caixa_ = linhaCodigo(QStringLiteral("Caixa do posto:"), QStringLiteral("Caixa"),
                         CodigoConfiguracao::Caixa);

    cmbFonte_ = new QFontComboBox(pagina);
    cmbFonte_->setObjectName(QStringLiteral("cmbFonte"));
    cmbFonte_->setMinimumHeight(kAlturaTactil);
    form->addRow(QStringLiteral("Letra:"), cmbFonte_);

    auto* imagem = new QHBoxLayout;
    txtImagem_ = caixaTexto(QStringLiteral("txtImagem"), pagina);
    imagem->addWidget(txtImagem_, 1);
    QPushButton* cmdImagem =
        botao(QStringLiteral("cmdImagem"), QStringLiteral("&Procurar..."), pagina);
    imagem->addWidget(cmdImagem);
    form->addRow(QStringLiteral("Imagem de fundo:"), imagem);
    connect(cmdImagem, &QPushButton::clicked, this, &AConfiguraRest::escolheImagem);

    auto* cor = new QHBoxLayout;
    lblCor_ = new QLabel(pagina);
    lblCor_->setObjectName(QStringLiteral("lblCor"));
    lblCor_->setFixedSize(120, kAlturaTactil);
    lblCor_->setFrameShape(QFrame::Box);
    lblCor_->setAutoFillBackground(true);
    cor->addWidget(lblCor_);
    QPushButton* cmdCor = botao(QStringLiteral("cmdCor"), QStringLiteral("&Cor..."), pagina);
    cor->addWidget(cmdCor);
    cor->addStretch();
    form->addRow(QStringLiteral("Cor de fundo:"), cor);
    connect(cmdCor, &QPushButton::clicked, this, &AConfiguraRest::escolheCor);

    auto* niveis = new QHBoxLayout;
    nivelEmenta_ = grupoOpcoes(
        QStringLiteral("optNivelEmenta"),
        {QStringLiteral("Grupos"), QStringLiteral("Famílias"), QStringLiteral("Sub-Famílias")},
        pagina, niveis);
    form->addRow(QStringLiteral("Botões da ementa:"), niveis);

    tipoImprimeMesa_ =
        linhaCodigo(QStringLiteral("Documento da conta da mesa:"),
                    QStringLiteral("TipoImprimeMesa"), CodigoConfiguracao::TipoImprimeMesa);

    txtCaixaDinheiro_ = caixaTexto(QStringLiteral("txtCaixaDinheiro"), pagina);
    form->addRow(QStringLiteral("Gaveta de dinheiro:"), txtCaixaDinheiro_);
    return pagina;
}

QButtonGroup* AConfiguraRest::grupoPortas(const QString& nome, QWidget* pai) {
    auto* linha = new QHBoxLayout;
    QButtonGroup* grupo =
        grupoOpcoes(nome,
                    {QStringLiteral("Impressora do sistema"), QStringLiteral("Série (COM)"),
                     QStringLiteral("Paralela (PAR)")},
                    pai, linha);
    static_cast<QFormLayout*>(pai->layout())->addRow(QStringLiteral("Ligação:"), linha);
    return grupo;
}

QWidget* AConfiguraRest::paginaImpressoras() {
    auto* pagina = new QWidget(this);
    auto* layout = new QVBoxLayout(pagina);
    auto grupoImpressora = [&](const QString& titulo, const QString& nome, CampoCodigo& campo,
                               QButtonGroup*& porta) {
        auto* caixa = new QGroupBox(titulo, pagina);
        auto* form = new QFormLayout(caixa);
        auto* linha = new QHBoxLayout;
        form->addRow(QStringLiteral("Impressora:"), linha);
        campo =
            campoCodigo(QStringLiteral("Imp") + nome, CodigoConfiguracao::ImpressoraTalao, linha);
        porta = grupoPortas(QStringLiteral("opt") + nome + QStringLiteral("Porta"), caixa);
        layout->addWidget(caixa);
        return form;
    };

    QFormLayout* cozinha = grupoImpressora(QStringLiteral("Cozinha"), QStringLiteral("Cozinha"),
                                           impCozinha_, portaCozinha_);
    cmbImpCozinhaNome_ = new QComboBox(pagina);
    cmbImpCozinhaNome_->setObjectName(QStringLiteral("cmbImpCozinhaNome"));
    cmbImpCozinhaNome_->setEditable(true);
    cmbImpCozinhaNome_->setMinimumHeight(kAlturaTactil);
    cmbImpCozinhaNome_->addItems(QPrinterInfo::availablePrinterNames());
    cozinha->addRow(QStringLiteral("Impressora do sistema:"), cmbImpCozinhaNome_);

    auto* tempo = new QHBoxLayout;
    spnTempoCozinha_ = new QSpinBox(pagina);
    spnTempoCozinha_->setObjectName(QStringLiteral("spnTempoCozinha"));
    spnTempoCozinha_->setRange(1, 86400);
    spnTempoCozinha_->setSuffix(QStringLiteral(" s"));
    spnTempoCozinha_->setMinimumSize(140, kAlturaTactil);
    tempo->addWidget(spnTempoCozinha_);
    QPushButton* cmdGravar = botao(QStringLiteral("cmdGravar"), QStringLiteral("&Gravar"), pagina);
    tempo->addWidget(cmdGravar);
    tempo->addStretch();
    cozinha->addRow(QStringLiteral("Intervalo dos pedidos:"), tempo);
    connect(cmdGravar, &QPushButton::clicked, this, &AConfiguraRest::gravaTempo);

    grupoImpressora(QStringLiteral("Bar"), QStringLiteral("Bar"), impBar_, portaBar_);
    layout->addStretch();
    return pagina;
}

QCheckBox* AConfiguraRest::opcao(const QString& nome, const QString& texto) {
    auto* c = new QCheckBox(texto, this);
    c->setObjectName(nome);
    c->setMinimumHeight(kAlturaTactil);
    return c;
}

QWidget* AConfiguraRest::paginaOpcoes() {
    auto* pagina = new QWidget(this);
    auto* layout = new QVBoxLayout(pagina);
    chkPrecoIncBrowse_ = opcao(QStringLiteral("chkPrecoIncBrowse"),
                               QStringLiteral("Preços com IVA incluído nas listas de produtos"));
    chkPedePWD_ = opcao(QStringLiteral("chkPedePWD"),
                        QStringLiteral("Pedir a password ao mudar de utilizador"));
    chkDesactivaPassword_ = opcao(
        QStringLiteral("chkDesactivaPassword"),
        QStringLiteral("Não pedir a password do supervisor para alterar pedidos já enviados"));
    chkActivaProdutosFacturaREST_ =
        opcao(QStringLiteral("chkActivaProdutosFacturaREST"),
              QStringLiteral("Usar os botões de produtos configurados"));
    chkLimpaDocAposFechaDoc_ = opcao(QStringLiteral("chkLimpaDocAposFechaDoc"),
                                     QStringLiteral("Limpar o ecrã depois de fechar o documento"));
    for (QCheckBox* c : {chkPrecoIncBrowse_, chkPedePWD_, chkDesactivaPassword_,
                         chkActivaProdutosFacturaREST_, chkLimpaDocAposFechaDoc_}) {
        c->setParent(pagina);
        layout->addWidget(c);
    }
    layout->addStretch();
    return pagina;
}

void AConfiguraRest::mostra(const ConfiguracaoRest& c) {
    const auto codigo = [this](const CampoCodigo& campo, const QString& valor) {
        campo.codigo->setText(valor);
        campo.descricao->setText(descricaoCodigo(estado_, campo.tabela, valor).value_or(QString()));
    };
    codigo(caixa_, c.caixa);
    cmbFonte_->setCurrentText(c.fonte);
    txtImagem_->setText(c.imagemFundo);
    cor_ = c.corFundo;
    mostraCor();
    marca(nivelEmenta_, kNiveisEmenta, c.nivelEmenta);
    codigo(tipoImprimeMesa_, c.tipoImprimeMesa);
    txtCaixaDinheiro_->setText(c.caixaDinheiro);
    codigo(impCozinha_, c.impCozinha);
    marca(portaCozinha_, kPortasImpressora, c.impCozinhaPorta);
    cmbImpCozinhaNome_->setCurrentText(c.impCozinhaNome);
    codigo(impBar_, c.impBar);
    marca(portaBar_, kPortasImpressora, c.impBarPorta);
    spnTempoCozinha_->setValue(c.tempoCozinha);
    chkPrecoIncBrowse_->setChecked(c.precoIncBrowse);
    chkPedePWD_->setChecked(c.pedePassword);
    chkDesactivaPassword_->setChecked(c.desactivaPassword);
    chkActivaProdutosFacturaREST_->setChecked(c.activaProdutosFacturaREST);
    chkLimpaDocAposFechaDoc_->setChecked(c.limpaDocAposFechaDoc);
}

ConfiguracaoRest AConfiguraRest::configuracao() const {
    ConfiguracaoRest c;
    c.caixa = caixa_.codigo->text().trimmed();
    c.fonte = cmbFonte_->currentText().trimmed();
    c.imagemFundo = txtImagem_->text().trimmed();
    c.impCozinha = impCozinha_.codigo->text().trimmed();
    c.impCozinhaPorta = marcado(portaCozinha_, kPortasImpressora);
    c.impCozinhaNome = cmbImpCozinhaNome_->currentText().trimmed();
    c.impBar = impBar_.codigo->text().trimmed();
    c.impBarPorta = marcado(portaBar_, kPortasImpressora);
    c.tempoCozinha = spnTempoCozinha_->value();
    c.caixaDinheiro = txtCaixaDinheiro_->text().trimmed();
    c.precoIncBrowse = chkPrecoIncBrowse_->isChecked();
    c.pedePassword = chkPedePWD_->isChecked();
    c.desactivaPassword = chkDesactivaPassword_->isChecked();
    c.activaProdutosFacturaREST = chkActivaProdutosFacturaREST_->isChecked();
    c.limpaDocAposFechaDoc = chkLimpaDocAposFechaDoc_->isChecked();
    c.nivelEmenta = marcado(nivelEmenta_, kNiveisEmenta);
    c.tipoImprimeMesa = tipoImprimeMesa_.codigo->text().trimmed();
    c.corFundo = cor_;
    return c;
}

void AConfiguraRest::mostraCor() {
    QPalette paleta = lblCor_->palette();
    paleta.setColor(QPalette::Window, cor_);
    lblCor_->setPalette(paleta);
}

void AConfiguraRest::pesquisa(const CampoCodigo& campo, bool forcar) {
    // Leaving an empty box chooses nothing; only the search button opens the search for it.
    if (!forcar && campo.codigo->text().trimmed().isEmpty()) {
        campo.descricao->clear();
        return;
    }
    lookups::pesquisaNoCampo(campo.codigo, campo.descricao, [&](lookups::CampoCodigo& c) {
        switch (campo.tabela) {
            case CodigoConfiguracao::Caixa:
                pesquisaTabelas_.Caixas(c, forcar);
                break;
            case CodigoConfiguracao::ImpressoraTalao:
                pesquisaTabelas_.Impressoras_Taloes(c, forcar);
                break;
            case CodigoConfiguracao::TipoImprimeMesa:
                pesquisaTabelas_.TipoMov(c, forcar, filtroTipoImprimeMesa());
                break;
        }
    });
}

void AConfiguraRest::escolheImagem() {
    const QString actual = txtImagem_->text();
    const QString ficheiro = QFileDialog::getOpenFileName(
        this, QStringLiteral("Imagem de Fundo"),
        actual.isEmpty() ? QString() : QFileInfo(actual).absolutePath(),
        QStringLiteral("Ficheiro de Imagem (*.bmp *.gif *.jpg *.ico )"));
    if (!ficheiro.isEmpty()) txtImagem_->setText(ficheiro);
}

void AConfiguraRest::escolheCor() {
    const QColor escolhida = QColorDialog::getColor(cor_, this, QStringLiteral("Cor de Fundo"));
    if (!escolhida.isValid()) return;
    cor_ = escolhida;
    mostraCor();
}

void AConfiguraRest::gravaTempo() {
    if (!posto::ConfigRest_TempoImpTalaoCozinha.gravar(spnTempoCozinha_->value())) {
        mensagens_.mensagem(QStringLiteral("Não foi possível gravar a configuração do posto."),
                            Icone::Critico);
        return;
    }
    Q_EMIT configuracaoGravada();
}

void AConfiguraRest::done(int resultado) {
    const ConfiguracaoRest c = configuracao();
    if (c.gravar(estado_.gUtilizador)) {
        aplicaConfiguracao(estado_, c);
        Q_EMIT configuracaoGravada();
    } else {
        mensagens_.mensagem(QStringLiteral("Não foi possível gravar a configuração do posto."),
                            Icone::Critico);
    }
    QDialog::done(resultado);
}

}  // namespace brasel::app
