#include "documents/ui/frm_factura_cli_2via.h"

#include "common/ui/estilo_tactil.h"
#include "devices/documento_impresso.h"
#include "devices/documento_pagina.h"
#include "devices/escolha_impressao.h"
#include "devices/formata_colunas.h"
#include "devices/talao_documento.h"
#include "devices/ui/frm_impresao.h"
#include "documents/assinatura.h"

#include <QDate>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::documents {

namespace {

QLineEdit* campo(const char* nome, QWidget* pai) {
    auto* c = new QLineEdit(pai);
    c->setObjectName(QString::fromLatin1(nome));
    c->setMinimumHeight(48);
    return c;
}

QPushButton* botao(const char* nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumSize(200, 72);
    return b;
}

}  // namespace

frmFacturaCli2Via::frmFacturaCli2Via(app::Estado& estado, MessagePort& mensagens,
                                     devices::LinhaSerie& linha, QWidget* pai)
    : QWidget(pai), estado_(estado), mensagens_(mensagens), linha_(linha) {
    setObjectName(QStringLiteral("frmFacturaCli2Via"));
    setWindowTitle(QStringLiteral("Segundas Vias de Documentos"));

    txtFiltro_ = campo("txtFiltro", this);
    txtFiltro_->setPlaceholderText(QStringLiteral("Tipo, número ou cliente"));
    lvwDocumentos_ = new QTableWidget(0, 6, this);
    lvwDocumentos_->setObjectName(QStringLiteral("lvwDocumentos"));
    lvwDocumentos_->setHorizontalHeaderLabels({QStringLiteral("Tipo"), QStringLiteral("Número"),
                                               QStringLiteral("Ano"), QStringLiteral("Data"),
                                               QStringLiteral("Cliente"), QStringLiteral("Total")});
    lvwDocumentos_->setSelectionBehavior(QAbstractItemView::SelectRows);
    lvwDocumentos_->setSelectionMode(QAbstractItemView::SingleSelection);
    lvwDocumentos_->setEditTriggers(QAbstractItemView::NoEditTriggers);
    lvwDocumentos_->verticalHeader()->setVisible(false);
    lvwDocumentos_->verticalHeader()->setDefaultSectionSize(44);
    lvwDocumentos_->horizontalHeader()->setSectionResizeMode(4, QHeaderView::Stretch);
    txtTipo_ = campo("txtTipo", this);
    txtNumero_ = campo("txtNumero", this);
    txtAno_ = campo("txtAno", this);
    txtAno_->setText(QString::number(QDate::currentDate().year()));

    auto* chave = new QHBoxLayout;
    for (auto [rotulo, c] : {std::pair{QStringLiteral("Tipo:"), txtTipo_},
                             std::pair{QStringLiteral("Número:"), txtNumero_},
                             std::pair{QStringLiteral("Ano:"), txtAno_}}) {
        chave->addWidget(new QLabel(rotulo, this));
        chave->addWidget(c);
    }
    auto* cmdImprimir = botao("cmdImprimir", QStringLiteral("&Imprimir"), this);
    auto* cmdSair = botao("cmdSair", QStringLiteral("&Sair"), this);
    auto* botoes = new QHBoxLayout;
    botoes->addStretch();
    botoes->addWidget(cmdImprimir);
    botoes->addWidget(cmdSair);

    auto* filtro = new QHBoxLayout;
    filtro->addWidget(new QLabel(QStringLiteral("Procurar:"), this));
    filtro->addWidget(txtFiltro_);
    auto* layout = new QVBoxLayout(this);
    layout->addLayout(filtro);
    layout->addWidget(lvwDocumentos_, 1);
    layout->addLayout(chave);
    layout->addLayout(botoes);

    connect(txtFiltro_, &QLineEdit::textChanged, this, &frmFacturaCli2Via::carregarLista);
    connect(lvwDocumentos_, &QTableWidget::itemSelectionChanged, this,
            &frmFacturaCli2Via::seleccionou);
    connect(lvwDocumentos_, &QTableWidget::cellDoubleClicked, this, [this] { imprimir(); });
    connect(cmdImprimir, &QPushButton::clicked, this, [this] { imprimir(); });
    connect(cmdSair, &QPushButton::clicked, this, &QWidget::close);

    aplicaFonteTactil(this);
    aplicaCorFundo(this, estado.gUtilizador);
    resize(960, 640);
    carregarLista();
}

void frmFacturaCli2Via::carregarLista() {
    const auto lista = devices::ListaDocumentosCliente(estado_.gConn, txtFiltro_->text());
    lvwDocumentos_->setRowCount(0);
    lvwDocumentos_->setRowCount(static_cast<int>(lista.size()));
    int linha = 0;
    for (const devices::DocumentoListado& d : lista) {
        const QStringList celulas{d.tipo, d.numero,
                                  d.ano,  devices::DocumentoImpresso::dataImpressa(d.data),
                                  d.nome, devices::ValorTalao(d.totalDoc, estado_.param.casadec)};
        for (int c = 0; c < celulas.size(); ++c) {
            auto* item = new QTableWidgetItem(celulas.at(c));
            if (c == 5) item->setTextAlignment(Qt::AlignRight | Qt::AlignVCenter);
            lvwDocumentos_->setItem(linha, c, item);
        }
        ++linha;
    }
    lvwDocumentos_->resizeColumnsToContents();
    lvwDocumentos_->horizontalHeader()->setSectionResizeMode(4, QHeaderView::Stretch);
}

void frmFacturaCli2Via::seleccionou() {
    const int l = lvwDocumentos_->currentRow();
    if (l < 0) return;
    txtTipo_->setText(lvwDocumentos_->item(l, 0)->text());
    txtNumero_->setText(lvwDocumentos_->item(l, 1)->text());
    txtAno_->setText(lvwDocumentos_->item(l, 2)->text());
}

bool frmFacturaCli2Via::imprimir() {
    const QString tipo = txtTipo_->text().trimmed();
    const QString numero = txtNumero_->text().trimmed();
    const QString ano = txtAno_->text().trimmed();
    if (tipo.isEmpty() || numero.isEmpty() || ano.isEmpty()) {
        mensagens_.mensagem(QStringLiteral("Seleccione o documento a imprimir."),
                            Icone::Informacao);
        return false;
    }
    if (!ValidaAssinatura(estado_, mensagens_, true, tipo, numero, ano)) return false;
    const auto config =
        devices::CarregaConfigImpressao(estado_.gConn, estado_.gUtilizador, mensagens_);
    if (!config) return false;
    if (!config->talaoTermico()) {
        QString pdf;
        if (!devices::ImprimeDocumentoPagina(estado_, mensagens_, tipo, numero, ano,
                                             config->impressoraPagina(), &pdf))
            return false;
        if (!pdf.isEmpty()) {
            mensagens_.mensagem(QStringLiteral("Documento gravado em ") + pdf, Icone::Informacao);
        }
        return true;
    }
    devices::frmImpresao escolha(estado_, mensagens_, linha_, this);
    const devices::EscolhaImpressao e = devices::DesempacotaEscolha(escolha.Abrir(tipo));
    if (e.escolha == devices::EscolhaImpressao::Nenhum) return false;
    return devices::ImprimeTalao(
        estado_, mensagens_, linha_,
        {tipo, numero, ano, e.escolha == devices::EscolhaImpressao::TalaoCompra, e.vias,
         e.observacao});
}

}  // namespace brasel::documents
