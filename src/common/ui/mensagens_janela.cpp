#include "common/ui/mensagens_janela.h"

#include <QDialog>
#include <QHBoxLayout>
#include <QLabel>
#include <QMessageBox>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel {

namespace {

QMessageBox::Icon iconeCaixa(Icone icone) {
    switch (icone) {
        case Icone::Critico:
            return QMessageBox::Critical;
        case Icone::Exclamacao:
            return QMessageBox::Warning;
        case Icone::Informacao:
            return QMessageBox::Information;
        case Icone::Pergunta:
            return QMessageBox::Question;
    }
    return QMessageBox::NoIcon;
}

QPushButton* botaoGrande(const QString& nome, const QString& texto, QWidget* pai) {
    auto* botao = new QPushButton(texto, pai);
    botao->setObjectName(nome);
    botao->setMinimumSize(160, 64);
    QFont f = botao->font();
    f.setPointSize(f.pointSize() + 4);
    f.setBold(true);
    botao->setFont(f);
    return botao;
}

}  // namespace

void MensagensJanela::mensagem(const QString& texto, Icone icone, const QString& titulo) {
    QMessageBox caixa(iconeCaixa(icone), titulo.isEmpty() ? QStringLiteral("Brasel") : titulo,
                      texto, QMessageBox::Ok, pai_);
    caixa.setObjectName(QStringLiteral("frmMensagem"));
    caixa.button(QMessageBox::Ok)->setMinimumSize(120, 48);
    caixa.exec();
}

bool MensagensJanela::confirmar(const QString& texto, const QString& titulo) {
    QDialog dialogo(pai_);
    dialogo.setObjectName(QStringLiteral("frmConfirmacao"));
    dialogo.setWindowTitle(titulo.isEmpty() ? QStringLiteral("Brasel") : titulo);
    auto* layout = new QVBoxLayout(&dialogo);
    auto* pergunta = new QLabel(texto, &dialogo);
    pergunta->setWordWrap(true);
    QFont f = pergunta->font();
    f.setPointSize(f.pointSize() + 3);
    pergunta->setFont(f);
    pergunta->setMinimumWidth(420);
    layout->addWidget(pergunta);
    auto* botoes = new QHBoxLayout;
    QPushButton* sim = botaoGrande(QStringLiteral("cmdSim"), QStringLiteral("&Sim"), &dialogo);
    QPushButton* nao = botaoGrande(QStringLiteral("cmdNao"), QStringLiteral("&Não"), &dialogo);
    botoes->addStretch();
    botoes->addWidget(sim);
    botoes->addWidget(nao);
    botoes->addStretch();
    layout->addLayout(botoes);
    QObject::connect(sim, &QPushButton::clicked, &dialogo, &QDialog::accept);
    QObject::connect(nao, &QPushButton::clicked, &dialogo, &QDialog::reject);
    nao->setDefault(true);
    return dialogo.exec() == QDialog::Accepted;
}

}  // namespace brasel
