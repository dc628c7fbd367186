#include "app/ui/frm_sel_empresas_validacao.h"

#include "app/importa_empresas.h"
#include "app/lista_servidores.h"
#include "app/ui/lista_tactil.h"
#include "common/ui/estilo_tactil.h"
#include "lookups/ui/lista_colunas.h"

#include <QFileDialog>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace brasel::app {

namespace {

const QString kColunasServidores =
    QStringLiteral("Servidor,2000/Login,2900/Password,0/Autenticação,1500,C/");
constexpr int kPapelIndice = Qt::UserRole + 10;
constexpr int kColunaServidor = 0;

QPushButton* botao(const char* nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumSize(140, 56);
    return b;
}

}  // namespace

frmSelEmpresas_Validacao::frmSelEmpresas_Validacao(MessagePort& mensagens, QWidget* pai)
    : QDialog(pai),
      mensagens_(mensagens),
      lista_(lerServidores()),
      lvwServidores_(new QTreeWidget(this)),
      txtServidor_(new QLineEdit(this)),
      txtLogin_(new QLineEdit(this)),
      txtPassword_(new QLineEdit(this)),
      optSQL_(new QRadioButton(QStringLiteral("SQL"), this)),
      optWIN_(new QRadioButton(QStringLiteral("Windows"), this)) {
    setObjectName(QStringLiteral("frmSelEmpresas_Validacao"));
    setWindowTitle(QStringLiteral("Servidores"));
    resize(900, 640);

    lvwServidores_->setObjectName(QStringLiteral("lvwServidores"));
    lookups::Cria_lvwLISTA(lvwServidores_, kColunasServidores);
    preparaListaTactil(lvwServidores_, kColunaServidor);
    txtServidor_->setObjectName(QStringLiteral("txtServidor"));
    txtLogin_->setObjectName(QStringLiteral("txtLogin"));
    txtPassword_->setObjectName(QStringLiteral("txtPassword"));
    txtPassword_->setEchoMode(QLineEdit::Password);
    optSQL_->setObjectName(QStringLiteral("optSQL"));
    optWIN_->setObjectName(QStringLiteral("optWIN"));
    optSQL_->setChecked(true);
    for (QRadioButton* opcao : {optSQL_, optWIN_})
        opcao->setMinimumHeight(48);
    for (QLineEdit* caixa : {txtServidor_, txtLogin_, txtPassword_})
        caixa->setMinimumHeight(48);

    auto* autenticacao = new QHBoxLayout;
    autenticacao->addWidget(optSQL_);
    autenticacao->addWidget(optWIN_);
    autenticacao->addStretch();
    auto* caixas = new QFormLayout;
    caixas->addRow(QStringLiteral("Servidor"), txtServidor_);
    caixas->addRow(QStringLiteral("Autenticação"), autenticacao);
    caixas->addRow(QStringLiteral("Login"), txtLogin_);
    caixas->addRow(QStringLiteral("Password"), txtPassword_);

    QPushButton* cmdAdicionar = botao("cmdAdicionar", QStringLiteral("&Adicionar"), this);
    QPushButton* cmdAlterar = botao("cmdAlterar", QStringLiteral("A&lterar"), this);
    QPushButton* cmdApagar = botao("cmdApagar", QStringLiteral("Apa&gar"), this);
    QPushButton* cmdImportar = botao("cmdImportar", QStringLiteral("&Importar..."), this);
    QPushButton* cmdGravar = botao("cmdGravar", QStringLiteral("G&ravar"), this);
    QPushButton* cmdSair = botao("cmdSair", QStringLiteral("&Sair"), this);
    auto* botoes = new QHBoxLayout;
    for (QPushButton* b : {cmdAdicionar, cmdAlterar, cmdApagar, cmdImportar})
        botoes->addWidget(b);
    botoes->addStretch();
    botoes->addWidget(cmdGravar);
    botoes->addWidget(cmdSair);

    auto* layout = new QVBoxLayout(this);
    layout->addWidget(lvwServidores_, 1);
    layout->addLayout(caixas);
    layout->addLayout(botoes);

    connect(lvwServidores_, &QTreeWidget::currentItemChanged, this,
            &frmSelEmpresas_Validacao::mostrarEntrada);
    connect(optSQL_, &QRadioButton::toggled, this, &frmSelEmpresas_Validacao::autenticacaoMudou);
    connect(cmdAdicionar, &QPushButton::clicked, this, &frmSelEmpresas_Validacao::acrescentar);
    connect(cmdAlterar, &QPushButton::clicked, this, &frmSelEmpresas_Validacao::alterar);
    connect(cmdApagar, &QPushButton::clicked, this, &frmSelEmpresas_Validacao::apagar);
    connect(cmdImportar, &QPushButton::clicked, this, &frmSelEmpresas_Validacao::escolherFicheiro);
    connect(cmdGravar, &QPushButton::clicked, this, &frmSelEmpresas_Validacao::gravar);
    connect(cmdSair, &QPushButton::clicked, this, &QDialog::reject);

    aplicaFonteTactil(this);
    mostrarLista();
}

void frmSelEmpresas_Validacao::mostrarLista() {
    lookups::Cria_lvwLISTA(lvwServidores_, kColunasServidores);
    for (int i = 0; i < kEntradasServidor; ++i) {
        const EntradaServidor& e = lista_[static_cast<std::size_t>(i)];
        if (!e.emUso()) continue;
        lookups::adicionaLinha(lvwServidores_,
                               {e.servidor, e.login, e.passwordCifrada, e.tipoAutenticacao})
            ->setData(0, kPapelIndice, i);
    }
    ajustaColunasTactil(lvwServidores_, kColunaServidor);
}

int frmSelEmpresas_Validacao::indiceSeleccionado() const {
    const QTreeWidgetItem* item = lvwServidores_->currentItem();
    return item ? item->data(0, kPapelIndice).toInt() : -1;
}

void frmSelEmpresas_Validacao::mostrarEntrada() {
    const int indice = indiceSeleccionado();
    if (indice < 0) return;
    const EntradaServidor& e = lista_[static_cast<std::size_t>(indice)];
    txtServidor_->setText(e.servidor);
    txtLogin_->setText(e.login);
    txtPassword_->setText(e.password());
    (e.tipoAutenticacao == QStringLiteral("WIN") ? optWIN_ : optSQL_)->setChecked(true);
    autenticacaoMudou();
}

void frmSelEmpresas_Validacao::autenticacaoMudou() {
    const bool sql = optSQL_->isChecked();
    txtLogin_->setEnabled(sql);
    txtPassword_->setEnabled(sql);
}

EntradaServidor frmSelEmpresas_Validacao::entradaDasCaixas() const {
    EntradaServidor e;
    e.servidor = txtServidor_->text();
    // Windows authentication logs in as the operating-system user: no login nor password.
    if (optSQL_->isChecked()) {
        e.login = txtLogin_->text();
        e.definirPassword(txtPassword_->text());
        e.tipoAutenticacao = QStringLiteral("SQL");
    } else {
        e.tipoAutenticacao = QStringLiteral("WIN");
    }
    return e;
}

void frmSelEmpresas_Validacao::acrescentar() {
    const EdicaoServidor r = acrescentarServidor(lista_, entradaDasCaixas());
    if (r != EdicaoServidor::Feita) {
        mensagens_.mensagem(mensagemEdicao(r), Icone::Critico);
        return;
    }
    mostrarLista();
}

void frmSelEmpresas_Validacao::alterar() {
    const int indice = indiceSeleccionado();
    if (indice < 0) return;
    const EdicaoServidor r = alterarServidor(lista_, indice, entradaDasCaixas());
    if (r != EdicaoServidor::Feita) {
        mensagens_.mensagem(mensagemEdicao(r), Icone::Critico);
        return;
    }
    mostrarLista();
}

void frmSelEmpresas_Validacao::apagar() {
    if (apagarServidor(lista_, indiceSeleccionado())) mostrarLista();
}

void frmSelEmpresas_Validacao::gravar() {
    if (!gravarServidores(lista_)) {
        mensagens_.mensagem(QStringLiteral("Não foi possível gravar a lista de Servidores!"),
                            Icone::Critico);
        return;
    }
    accept();
}

void frmSelEmpresas_Validacao::escolherFicheiro() {
    const QString ficheiro =
        QFileDialog::getOpenFileName(this, QStringLiteral("Importar Servidores"), QString(),
                                     QStringLiteral("Lista de Empresas (*.csv)"));
    if (!ficheiro.isEmpty()) importar(ficheiro);
}

void frmSelEmpresas_Validacao::importar(const QString& ficheiro) {
    QString erro;
    const auto entradas = lerEmpresasCsv(ficheiro, &erro);
    if (!entradas) {
        mensagens_.mensagem(erro, Icone::Critico);
        return;
    }
    const ResultadoImportacao r = juntarServidores(lista_, *entradas);
    QString texto = QStringLiteral("Foram importados %1 Servidores.").arg(r.importados);
    if (r.repetidos > 0) texto += QStringLiteral("\r\n%1 já existiam na lista.").arg(r.repetidos);
    if (r.semLugar > 0) {
        texto += QStringLiteral("\r\n%1 não couberam na lista (máximo de %2).")
                     .arg(r.semLugar)
                     .arg(kEntradasServidor);
    }
    mensagens_.mensagem(texto, Icone::Informacao);
    mostrarLista();
}

}  // namespace brasel::app
