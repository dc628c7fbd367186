#include "pos/ui/frm_teclado.h"

#include "common/ui/estilo_tactil.h"
#include "common/ui/indicadores_tacteis.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QVBoxLayout>

namespace brasel::pos {

namespace {

constexpr int kTecla = 62;

struct Simbolo {
    const char* nome;
    const char* texto;
};

// The keys that add themselves, row by row, after the letters of each row.
constexpr Simbolo kFimLinha2[] = {{"cmdVirgula", ","}, {"cmdPonto", "."}, {"cmdMenos", "-"}};
constexpr Simbolo kSimbolos[] = {
    {"cmdAsterisco", "*"},       {"cmdBarra", "/"},      {"cmdBarraInvertida", "\\"},
    {"cmdCardinal", "#"},        {"cmdDolar", "$"},      {"cmdEuro", "€"},
    {"cmdIgual", "="},           {"cmdMais", "+"},       {"cmdAbreParentesis", "("},
    {"cmdFechaParentesis", ")"}, {"cmdPercentagem", "%"}};

}  // namespace

frmTeclado::frmTeclado(MessagePort& mensagens, bool numerico, lookups::PesquisaTabelas* textos,
                       QWidget* pai)
    : QDialog(pai),
      mensagens_(mensagens),
      numerico_(numerico),
      textos_(textos),
      txtResultado_(new QLineEdit(this)),
      chkCapsLock_(new QCheckBox(QStringLiteral("Caps Lock"), this)) {
    setObjectName(QStringLiteral("frmTeclado"));
    auto* layout = new QVBoxLayout(this);
    txtResultado_->setObjectName(QStringLiteral("txtResultado"));
    txtResultado_->setMinimumHeight(kTecla);
    layout->addWidget(txtResultado_);
    auto* teclas = new QHBoxLayout;
    QWidget* letras = criaLetras();
    teclas->addWidget(letras);
    teclas->addSpacing(16);
    teclas->addWidget(criaTeclado(), 0, Qt::AlignTop);
    layout->addLayout(teclas);
    letras->setVisible(!numerico_);
    if (numerico_) txtResultado_->setAlignment(Qt::AlignRight);

    // A physical keyboard may be used too: what it types is the result.
    connect(txtResultado_, &QLineEdit::textEdited, this,
            [this](const QString& texto) { teclado_.setResultado(texto); });
    connect(chkCapsLock_, &QCheckBox::toggled, this, [this] { capsLock(); });

    aplicaFonteTactil(this);
    aplicaIndicadoresTacteis(this);
    chkCapsLock_->setChecked(true);
    capsLock();
}

QPushButton* frmTeclado::tecla(const QString& nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(nome);
    b->setMinimumSize(kTecla, kTecla);
    b->setFocusPolicy(Qt::NoFocus);
    b->setAutoDefault(false);
    return b;
}

QPushButton* frmTeclado::teclaLetra(const QString& nome, const QString& letra, QWidget* pai) {
    QPushButton* b = tecla(nome, letra, pai);
    connect(b, &QPushButton::clicked, this, [this, letra] { CarregaLetra(letra); });
    return b;
}

QWidget* frmTeclado::criaLetras() {
    auto* painel = new QWidget(this);
    auto* grelha = new QGridLayout(painel);
    grelha->setContentsMargins(0, 0, 0, 0);
    grelha->setSpacing(4);
    const QString linhas[] = {QStringLiteral("QWERTYUIOP"), QStringLiteral("ASDFGHJKLÇ"),
                              QStringLiteral("ZXCVBNM")};
    for (int l = 0; l < 3; ++l) {
        int c = 0;
        for (QChar letra : linhas[l]) {
            const QString nome =
                letra == u'Ç' ? QStringLiteral("cmdCedilha") : QStringLiteral("cmd") + letra;
            QPushButton* b = teclaLetra(nome, QString(letra), painel);
            letras_.append(b);
            grelha->addWidget(b, l, c++);
        }
        if (l == 2) {
            for (const Simbolo& s : kFimLinha2)
                grelha->addWidget(
                    teclaLetra(QString::fromLatin1(s.nome), QString::fromUtf8(s.texto), painel), l,
                    c++);
        }
    }
    // The dead keys sit at the end of the first two rows, where a Portuguese keyboard has them.
    const Simbolo acentos[] = {{"cmdAcentoDir", "´"}, {"cmdAcentoEsq", "`"}, {"cmdTilo", "~"}};
    const int posicoes[][2] = {{0, 10}, {0, 11}, {1, 10}};
    for (int i = 0; i < 3; ++i) {
        const QChar acento = QString::fromUtf8(acentos[i].texto).at(0);
        QPushButton* b = tecla(QString::fromLatin1(acentos[i].nome), QString(acento), painel);
        connect(b, &QPushButton::clicked, this, [this, acento] { teclado_.acento(acento); });
        grelha->addWidget(b, posicoes[i][0], posicoes[i][1]);
    }
    int c = 0;
    for (const Simbolo& s : kSimbolos)
        grelha->addWidget(
            teclaLetra(QString::fromLatin1(s.nome), QString::fromUtf8(s.texto), painel), 3, c++);

    auto* ultima = new QHBoxLayout;
    chkCapsLock_->setObjectName(QStringLiteral("chkCapsLock"));
    ultima->addWidget(chkCapsLock_);
    QPushButton* espaco = teclaLetra(QStringLiteral("cmdEspaco"), QStringLiteral(" "), painel);
    espaco->setMinimumWidth(kTecla * 5);
    ultima->addWidget(espaco, 1);
    QPushButton* cmdTemplates =
        tecla(QStringLiteral("cmdTemplates"), QStringLiteral("Textos"), painel);
    cmdTemplates->setVisible(textos_ != nullptr);
    connect(cmdTemplates, &QPushButton::clicked, this, [this] {
        const QString texto = textos_->Observacoes_str();
        if (texto.isEmpty()) return;
        teclado_.acrescenta(texto);
        mostra();
    });
    ultima->addWidget(cmdTemplates);
    grelha->addLayout(ultima, 4, 0, 1, 12);
    return painel;
}

QWidget* frmTeclado::criaTeclado() {
    auto* painel = new QWidget(this);
    auto* grelha = new QGridLayout(painel);
    grelha->setContentsMargins(0, 0, 0, 0);
    grelha->setSpacing(4);
    for (int d = 1; d <= 9; ++d) {
        const QString digito = QString::number(d);
        grelha->addWidget(teclaLetra(QStringLiteral("cmd") + digito, digito, painel),
                          2 - (d - 1) / 3, (d - 1) % 3);
    }
    grelha->addWidget(teclaLetra(QStringLiteral("cmd0"), QStringLiteral("0"), painel), 3, 0);
    grelha->addWidget(teclaLetra(QStringLiteral("cmdPonto1"), QStringLiteral("."), painel), 3, 1);
    QPushButton* cmdBack = tecla(QStringLiteral("cmdBack"), QStringLiteral("←"), painel);
    connect(cmdBack, &QPushButton::clicked, this, [this] {
        teclado_.apaga();
        mostra();
    });
    grelha->addWidget(cmdBack, 3, 2);
    QPushButton* cmdCancelar =
        tecla(QStringLiteral("cmdCancelar"), QStringLiteral("Cancelar"), painel);
    connect(cmdCancelar, &QPushButton::clicked, this, &QDialog::reject);
    QPushButton* cmdEnter = tecla(QStringLiteral("cmdEnter"), QStringLiteral("Enter"), painel);
    connect(cmdEnter, &QPushButton::clicked, this, [this] { enter(); });
    grelha->addWidget(cmdCancelar, 4, 0, 1, 3);
    grelha->addWidget(cmdEnter, 5, 0, 1, 3);
    for (QPushButton* b : {cmdCancelar, cmdEnter})
        b->setMinimumHeight(kTecla);
    return painel;
}

void frmTeclado::CarregaLetra(const QString& letra) {
    teclado_.CarregaLetra(letra);
    mostra();
}

void frmTeclado::capsLock() {
    teclado_.setCapsLock(chkCapsLock_->isChecked());
    for (QPushButton* b : letras_)
        b->setText(teclado_.capsLock() ? b->text().toUpper() : b->text().toLower());
}

void frmTeclado::mostra() {
    txtResultado_->setText(teclado_.resultado());
}

void frmTeclado::enter() {
    if (numerico_ && !lerValorTeclado(teclado_.resultado()).valido) {
        mensagens_.mensagem(QStringLiteral("Valor Inválido!"), Icone::Critico);
        return;
    }
    accept();
}

std::optional<QString> frmTeclado::Teclado(bool mascara, const QString& titulo,
                                           const QString& inicial) {
    setWindowTitle(titulo);
    txtResultado_->setEchoMode(mascara ? QLineEdit::Password : QLineEdit::Normal);
    teclado_.setResultado(inicial);
    mostra();
    adjustSize();
    if (exec() != QDialog::Accepted) return std::nullopt;
    return teclado_.resultado();
}

std::optional<Currency> TecladoJanela::pedirValor(const QString& titulo) {
    frmTeclado teclado(mensagens_, true, nullptr, pai_);
    const auto texto = teclado.Teclado(false, titulo, {});
    if (!texto) return std::nullopt;
    return lerValorTeclado(*texto).valor;
}

std::optional<QString> TecladoJanela::pedirTexto(const QString& titulo, const QString& inicial,
                                                 bool mascara) {
    frmTeclado teclado(mensagens_, false, textos_, pai_);
    return teclado.Teclado(mascara, titulo, inicial);
}

std::optional<QString> TecladoJanela::editar(const QString& texto) {
    return pedirTexto(QStringLiteral("Observações"), texto);
}

}  // namespace brasel::pos
