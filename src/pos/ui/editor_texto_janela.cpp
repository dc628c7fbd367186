#include "pos/ui/editor_texto_janela.h"

#include "common/ui/estilo_tactil.h"

#include <QDialog>
#include <QHBoxLayout>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::pos {

std::optional<QString> EditorTextoJanela::editar(const QString& texto) {
    QDialog dialogo(pai_);
    dialogo.setObjectName(QStringLiteral("frmEditorTexto"));
    dialogo.setWindowTitle(QStringLiteral("Observações"));
    auto* layout = new QVBoxLayout(&dialogo);
    auto* txtResultado = new QPlainTextEdit(&dialogo);
    txtResultado->setObjectName(QStringLiteral("txtResultado"));
    // Stored notes break their lines with CR LF, as the kitchen's page tickets split them.
    txtResultado->setPlainText(
        QString(texto).replace(QStringLiteral("\r\n"), QStringLiteral("\n")));
    layout->addWidget(txtResultado, 1);
    auto* botoes = new QHBoxLayout;
    auto* cmdOK = new QPushButton(QStringLiteral("&OK"), &dialogo);
    cmdOK->setObjectName(QStringLiteral("cmdOK"));
    auto* cmdCancelar = new QPushButton(QStringLiteral("&Cancelar"), &dialogo);
    cmdCancelar->setObjectName(QStringLiteral("cmdCancelar"));
    botoes->addStretch();
    for (QPushButton* b : {cmdOK, cmdCancelar}) {
        b->setMinimumSize(150, 60);
        botoes->addWidget(b);
    }
    layout->addLayout(botoes);
    QObject::connect(cmdOK, &QPushButton::clicked, &dialogo, &QDialog::accept);
    QObject::connect(cmdCancelar, &QPushButton::clicked, &dialogo, &QDialog::reject);
    aplicaFonteTactil(&dialogo);
    dialogo.resize(640, 360);
    txtResultado->setFocus();
    if (dialogo.exec() != QDialog::Accepted) return std::nullopt;
    return txtResultado->toPlainText().replace(u'\n', QStringLiteral("\r\n"));
}

}  // namespace brasel::pos
