#include "pos/ui/a_grupos.h"

#include "common/ui/estilo_tactil.h"
#include "pos/grupos.h"

#include <QGridLayout>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::pos {

namespace {
constexpr int kColunas = 3;
}

aGrupos::aGrupos(app::Estado& estado, const QString& nivel, QWidget* pai) : QDialog(pai) {
    setObjectName(QStringLiteral("aGrupos"));
    setWindowTitle(QStringLiteral("Grupos"));
    auto* layout = new QVBoxLayout(this);
    layout->addLayout(new QGridLayout);
    auto* cancelar = new QPushButton(QStringLiteral("Cancelar"), this);
    cancelar->setObjectName(QStringLiteral("cmdCancelar"));
    cancelar->setMinimumSize(200, 64);
    layout->addWidget(cancelar, 0, Qt::AlignRight);
    connect(cancelar, &QPushButton::clicked, this, &QDialog::reject);
    CarregarGrupos(estado, nivel);
    aplicaFonteTactil(this);
    aplicaCorFundo(this, estado.gUtilizador);
    guardaGeometria(this, app::posto::JanGrupoPro);
}

void aGrupos::CarregarGrupos(app::Estado& estado, const QString& nivel) {
    auto* grelha = static_cast<QGridLayout*>(layout()->itemAt(0)->layout());
    int i = 0;
    for (const GrupoEmenta& g : pos::CarregarGrupos(estado, nivel)) {
        auto* b = new QPushButton(g.descricao, this);
        b->setObjectName(QStringLiteral("cmdGrupo_") + g.codigo);
        b->setMinimumSize(220, 80);
        const QString codigo = g.codigo;
        connect(b, &QPushButton::clicked, this, [this, codigo] {
            escolhido_ = codigo;
            accept();
        });
        grelha->addWidget(b, i / kColunas, i % kColunas);
        ++i;
    }
}

std::optional<QString> aGrupos::escolher() {
    escolhido_.clear();
    if (exec() != QDialog::Accepted || escolhido_.isEmpty()) return std::nullopt;
    return escolhido_;
}

}  // namespace brasel::pos
