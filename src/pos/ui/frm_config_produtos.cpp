#include "pos/ui/frm_config_produtos.h"

#include "app/definicoes_posto.h"
#include "app/ui/lista_tactil.h"
#include "common/ui/estilo_tactil.h"
#include "common/ui/indicadores_tacteis.h"
#include "lookups/ui/lista_colunas.h"
#include "pos/produtos_cozinha.h"
#include "pos/ui/lista_marcacao.h"

#include <QHBoxLayout>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::pos {

frmConfigProdutos::frmConfigProdutos(app::Estado& estado, MessagePort& mensagens, QWidget* pai)
    : QDialog(pai), estado_(estado), mensagens_(mensagens), lista_(new QTreeWidget(this)) {
    setObjectName(QStringLiteral("frmConfigProdutos"));
    setWindowTitle(QStringLiteral("Produtos da Cozinha"));
    auto* layout = new QVBoxLayout(this);
    lista_->setObjectName(QStringLiteral("lvwLista"));
    lookups::Cria_lvwLISTA(lista_, QStringLiteral("Codigo,2000/Descrição,4100/"));
    preparaListaMarcacao(lista_);
    app::preparaListaTactil(lista_, 1);
    layout->addWidget(lista_, 1);
    auto* botoes = new QHBoxLayout;
    auto* cmdGravar = new QPushButton(QStringLiteral("&Gravar"), this);
    cmdGravar->setObjectName(QStringLiteral("cmdGravar"));
    auto* cmdSair = new QPushButton(QStringLiteral("&Sair"), this);
    cmdSair->setObjectName(QStringLiteral("cmdSair"));
    botoes->addStretch();
    for (QPushButton* b : {cmdGravar, cmdSair}) {
        b->setMinimumSize(170, 64);
        botoes->addWidget(b);
    }
    layout->addLayout(botoes);
    connect(cmdGravar, &QPushButton::clicked, this, [this] { gravar(); });
    connect(cmdSair, &QPushButton::clicked, this, &QDialog::accept);
    aplicaFonteTactil(this);
    aplicaIndicadoresTacteis(this);
    aplicaCorFundo(this, estado_.gUtilizador);
    resize(900, 680);
    CarregarProdutos();
}

void frmConfigProdutos::CarregarProdutos() {
    lista_->clear();
    const auto flags = CarregarFlagsCozinha(estado_.gConn, app::posto::NivelEmenta.ler());
    if (!flags) {
        mensagens_.mensagem(QStringLiteral("Erro ao ler os Produtos: ") + estado_.gConn.lastError(),
                            Icone::Critico);
        return;
    }
    for (const FlagCozinha& f : *flags)
        lookups::adicionaLinha(lista_, {f.codigo, f.descricao})
            ->setCheckState(0, f.cozinha ? Qt::Checked : Qt::Unchecked);
    app::ajustaColunasTactil(lista_, 1);
    ajustaColunaMarcada(lista_);
}

void frmConfigProdutos::gravar() {
    QList<FlagCozinha> flags;
    for (int i = 0; i < lista_->topLevelItemCount(); ++i) {
        const QTreeWidgetItem* item = lista_->topLevelItem(i);
        flags.append({item->text(0), item->text(1), item->checkState(0) == Qt::Checked});
    }
    if (GravarFlagsCozinha(estado_.gConn, flags)) {
        mensagens_.mensagem(QStringLiteral("Gravado com Sucesso."), Icone::Informacao);
    } else {
        mensagens_.mensagem(QStringLiteral("Erro ao gravar: ") + estado_.gConn.lastError(),
                            Icone::Critico);
    }
}

}  // namespace brasel::pos
