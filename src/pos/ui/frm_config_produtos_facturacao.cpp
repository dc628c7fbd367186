#include "pos/ui/frm_config_produtos_facturacao.h"

#include "app/definicoes_posto.h"
#include "app/ui/lista_tactil.h"
#include "common/ui/estilo_tactil.h"
#include "common/ui/indicadores_tacteis.h"
#include "db/query_helpers.h"
#include "lookups/ui/lista_colunas.h"
#include "pos/produtos_facturacao.h"
#include "pos/ui/lista_marcacao.h"

#include <QFormLayout>
#include <QHBoxLayout>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::pos {

namespace {

constexpr int kColunaDescricao = 1;
const QString kFormatoBase = QStringLiteral("yyyy-MM-dd");
const QString kFormatoLista = QStringLiteral("dd-MM-yyyy");

QString mostraData(const QString& base) {
    const QDate d = QDate::fromString(base, kFormatoBase);
    return d.isValid() ? d.toString(kFormatoLista) : base;
}

QDateEdit* campoData(const char* nome, QWidget* pai) {
    auto* d = new QDateEdit(pai);
    d->setObjectName(QString::fromLatin1(nome));
    d->setDisplayFormat(kFormatoLista);
    d->setCalendarPopup(true);
    d->setMinimumHeight(52);
    return d;
}

QPushButton* botao(const char* nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumSize(170, 64);
    return b;
}

}  // namespace

frmConfigProdutosFacturacao::frmConfigProdutosFacturacao(app::Estado& estado,
                                                         MessagePort& mensagens,
                                                         lookups::PesquisaTabelas* pesquisa,
                                                         QWidget* pai)
    : QDialog(pai),
      estado_(estado),
      mensagens_(mensagens),
      pesquisa_(pesquisa),
      txtCodigo_(new QLineEdit(this)),
      txtDescricao_(new QLineEdit(this)),
      txtDataInicial_(campoData("txtDataInicial", this)),
      txtDataFinal_(campoData("txtDataFinal", this)),
      lista_(new QTreeWidget(this)) {
    setObjectName(QStringLiteral("frmConfigProdutosFacturacao"));
    setWindowTitle(QStringLiteral("Produtos da Facturação"));
    auto* layout = new QVBoxLayout(this);
    auto* cabecalho = new QHBoxLayout;
    auto* campos = new QFormLayout;
    txtCodigo_->setObjectName(QStringLiteral("txtCodigo"));
    txtDescricao_->setObjectName(QStringLiteral("txtDescricao"));
    for (QLineEdit* c : {txtCodigo_, txtDescricao_})
        c->setMinimumHeight(52);
    auto* linhaCodigo = new QHBoxLayout;
    linhaCodigo->addWidget(txtCodigo_, 1);
    QPushButton* cmdProximo = botao("cmdProximo", QStringLiteral("&Próximo"), this);
    linhaCodigo->addWidget(cmdProximo);
    campos->addRow(QStringLiteral("Código"), linhaCodigo);
    campos->addRow(QStringLiteral("Descrição"), txtDescricao_);
    auto* datas = new QHBoxLayout;
    datas->addWidget(txtDataInicial_, 1);
    datas->addWidget(txtDataFinal_, 1);
    campos->addRow(QStringLiteral("Período"), datas);
    cabecalho->addLayout(campos, 1);
    layout->addLayout(cabecalho);
    const QDate hoje = db::Get_DataSysServer(estado_).date();
    txtDataInicial_->setDate(hoje);
    txtDataFinal_->setDate(hoje);

    lista_->setObjectName(QStringLiteral("lvwLista"));
    lookups::Cria_lvwLISTA(lista_,
                           QStringLiteral("Produto,1700/Descrição,3000/Dt Inicial,1000,C,DATA/"
                                          "Dt Final,1000,C,DATA/Nivel,1250/"));
    preparaListaMarcacao(lista_);
    app::preparaListaTactil(lista_, kColunaDescricao);
    layout->addWidget(lista_, 1);

    auto* botoes = new QHBoxLayout;
    QPushButton* cmdGravar = botao("cmdGravar", QStringLiteral("&Gravar"), this);
    QPushButton* cmdSair = botao("cmdSair", QStringLiteral("&Sair"), this);
    botoes->addStretch();
    botoes->addWidget(cmdGravar);
    botoes->addWidget(cmdSair);
    layout->addLayout(botoes);

    connect(txtCodigo_, &QLineEdit::editingFinished, this, [this] { codigoAlterado(); });
    connect(cmdProximo, &QPushButton::clicked, this, [this] { proximo(); });
    connect(cmdGravar, &QPushButton::clicked, this, [this] { gravar(); });
    connect(cmdSair, &QPushButton::clicked, this, &QDialog::accept);

    aplicaFonteTactil(this);
    aplicaIndicadoresTacteis(this);
    aplicaCorFundo(this, estado_.gUtilizador);
    resize(1000, 700);
    CarregarProdutos();
}

void frmConfigProdutosFacturacao::CarregarProdutos() {
    lista_->clear();
    const auto linhas = CarregarProdutosConjunto(estado_.gConn, app::posto::NivelEmenta.ler(),
                                                 txtCodigo_->text().trimmed());
    if (!linhas) {
        mensagens_.mensagem(QStringLiteral("Erro ao ler os Produtos: ") + estado_.gConn.lastError(),
                            Icone::Critico);
        return;
    }
    for (const LinhaConjunto& l : *linhas)
        lookups::adicionaLinha(lista_, {l.produto, l.descricao, mostraData(l.dataInicial),
                                        mostraData(l.dataFinal), l.nivel})
            ->setCheckState(0, l.marcado ? Qt::Checked : Qt::Unchecked);
    app::ajustaColunasTactil(lista_, kColunaDescricao);
    ajustaColunaMarcada(lista_);
}

void frmConfigProdutosFacturacao::codigoAlterado() {
    QString codigo = txtCodigo_->text().trimmed();
    if (pesquisa_ && (codigo.startsWith(u'\\') || codigo.startsWith(u'/'))) {
        lookups::CampoCodigo campo{codigo, {}};
        pesquisa_->Produtos_FacturaREST(campo);
        codigo = campo.codigo;
        txtCodigo_->setText(codigo);
    }
    if (codigo == codigoCarregado_) return;
    codigoCarregado_ = codigo;
    if (const auto conjunto = LerConjunto(estado_.gConn, codigo)) {
        txtDescricao_->setText(conjunto->descricao);
        txtDataInicial_->setDate(QDate::fromString(conjunto->dataInicial, kFormatoBase));
        txtDataFinal_->setDate(QDate::fromString(conjunto->dataFinal, kFormatoBase));
    }
    CarregarProdutos();
}

void frmConfigProdutosFacturacao::proximo() {
    txtCodigo_->setText(ProximoConjunto(estado_));
    txtDescricao_->clear();
    codigoAlterado();
}

void frmConfigProdutosFacturacao::gravar() {
    codigoAlterado();
    ConjuntoProdutos conjunto{txtCodigo_->text().trimmed(), txtDescricao_->text().trimmed(),
                              txtDataInicial_->date().toString(kFormatoBase),
                              txtDataFinal_->date().toString(kFormatoBase)};
    QStringList marcados, desmarcados;
    for (int i = 0; i < lista_->topLevelItemCount(); ++i) {
        const QTreeWidgetItem* item = lista_->topLevelItem(i);
        (item->checkState(0) == Qt::Checked ? marcados : desmarcados) << item->text(0);
    }
    if (GravarConjunto(estado_, mensagens_, estado_.gUtilizador, conjunto, marcados, desmarcados))
        CarregarProdutos();
}

}  // namespace brasel::pos
