#include "pos/ui/a_clientes.h"

#include "common/ui/estilo_tactil.h"
#include "lookups/pesquisa_tabelas.h"
#include "lookups/ui/w_pesquisa_nova.h"
#include "pos/mesas.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QPixmap>
#include <QPushButton>
#include <QScrollArea>
#include <QVBoxLayout>

namespace brasel::pos {

namespace {
constexpr int kColunas = 5;
}

AClientes::AClientes(app::Estado& estado, MessagePort& mensagens, QWidget* pai)
    : QDialog(pai), estado_(estado), mensagens_(mensagens), grelha_(new QWidget) {
    setObjectName(QStringLiteral("AClientes"));
    setWindowTitle(QStringLiteral("Mesas"));
    auto* layout = new QVBoxLayout(this);
    auto* rolo = new QScrollArea(this);
    rolo->setWidgetResizable(true);
    rolo->setWidget(grelha_);
    new QGridLayout(grelha_);
    layout->addWidget(rolo, 1);

    auto* barra = new QHBoxLayout;
    auto* outros = new QPushButton(QStringLiteral("Outros Clientes"), this);
    outros->setObjectName(QStringLiteral("cmdOutros"));
    auto* cancelar = new QPushButton(QStringLiteral("Cancelar"), this);
    cancelar->setObjectName(QStringLiteral("cmdCancelar"));
    for (QPushButton* b : {outros, cancelar})
        b->setMinimumSize(200, 64);
    barra->addWidget(outros);
    barra->addStretch();
    barra->addWidget(cancelar);
    layout->addLayout(barra);
    connect(outros, &QPushButton::clicked, this, &AClientes::outros);
    connect(cancelar, &QPushButton::clicked, this, &QDialog::reject);

    aplicaFonteTactil(this);
    aplicaCorFundo(this, estado_.gUtilizador);
    resize(900, 640);
    guardaGeometria(this, app::posto::JanCliente);
    CarregarClientes();
}

void AClientes::CarregarClientes() {
    auto* grelha = static_cast<QGridLayout*>(grelha_->layout());
    while (QLayoutItem* item = grelha->takeAt(0)) {
        delete item->widget();
        delete item;
    }
    int i = 0;
    for (const BotaoMesa& m : pos::CarregarClientes(estado_)) {
        auto* b = new QPushButton(m.caption, grelha_);
        b->setObjectName(QStringLiteral("cmdMesa_") + m.codigo);
        b->setMinimumSize(150, 96);
        b->setProperty("ocupada", m.ocupada);
        QPixmap foto;
        if (!m.foto().isEmpty() && foto.loadFromData(m.foto())) {
            b->setIcon(foto);
            b->setIconSize(QSize(48, 48));
        }
        // An occupied table stands out even without pictures.
        if (m.ocupada) b->setStyleSheet(QStringLiteral("background-color: #f4b183;"));
        const QString codigo = m.codigo;
        connect(b, &QPushButton::clicked, this, [this, codigo] {
            escolhido_ = codigo;
            accept();
        });
        grelha->addWidget(b, i / kColunas, i % kColunas);
        ++i;
    }
}

void AClientes::outros() {
    lookups::PesquisaEmJanela janela(estado_, this);
    lookups::PesquisaTabelas pesquisa(estado_, mensagens_, janela);
    lookups::CampoCodigo campo;
    pesquisa.Clientes(campo, true, {QStringLiteral(" and Diversos<>?"), {1}});
    if (campo.codigo.isEmpty()) return;
    escolhido_ = campo.codigo;
    accept();
}

std::optional<QString> AClientes::escolher() {
    escolhido_.clear();
    if (exec() != QDialog::Accepted || escolhido_.isEmpty()) return std::nullopt;
    return escolhido_;
}

}  // namespace brasel::pos
