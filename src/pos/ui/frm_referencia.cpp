#include "pos/ui/frm_referencia.h"

#include "common/ui/estilo_tactil.h"
#include "lookups/ui/campo_codigo_janela.h"
#include "pricing/leitura.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::pos {

namespace {

using Procura = void (lookups::PesquisaTabelas::*)(lookups::CampoCodigo&, bool,
                                                   const db::Condicao&);

// One field of the form: its controls' names, the caption used when the company gave the
// dimension none, and its lookup.
struct Campo {
    const char* nome;
    const char* titulo;
    Procura procura;
};

constexpr Campo kDefinicoes[frmReferencia::kCampos] = {
    {"Estacao", "Estação", &lookups::PesquisaTabelas::Estacao_Referencias},
    {"Sexo", "Sexo", &lookups::PesquisaTabelas::Sexo_Referencias},
    {"Referencia", "Referência", &lookups::PesquisaTabelas::Referencia_Referencias},
    {"Modelo", "Modelo", &lookups::PesquisaTabelas::Modelo_Referencias},
    {"Cor", "Cor", &lookups::PesquisaTabelas::Cor_Referencias},
    {"Tamanho", "Tamanho", &lookups::PesquisaTabelas::Tamanho_Referencias},
    {"Comprimento", "Comprimento", &lookups::PesquisaTabelas::Comprimento_Referencias},
    {"Fornecedor", "Fornecedor", &lookups::PesquisaTabelas::Fornecedores},
};

QPushButton* botao(const QString& nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(nome);
    b->setMinimumSize(150, 56);
    b->setAutoDefault(false);
    return b;
}

}  // namespace

frmReferencia::frmReferencia(app::Estado& estado, lookups::PesquisaTabelas& pesquisa,
                             const QString& produto, QWidget* pai)
    : QDialog(pai), pesquisa_(pesquisa) {
    setObjectName(QStringLiteral("frmReferencia"));
    const auto descricao =
        estado.gConn.firstRow(QStringLiteral("select Descricao from Produtos where Codigo=?"),
                              {pricing::textoSql(produto)});
    setWindowTitle(
        QStringLiteral("Referência do Produto ") + produto +
        (descricao ? QStringLiteral(" - ") + descricao->value(0).toString() : QString()));
    auto* layout = new QVBoxLayout(this);
    auto* grelha = new QGridLayout;
    grelha->setColumnStretch(2, 1);
    for (int i = 0; i < kCampos; ++i) {
        const Campo& c = kDefinicoes[i];
        const QString nome = QString::fromLatin1(c.nome);
        // The attributes are captioned as the company names its dimensions 1 to 7.
        const QString dimensao =
            i < 7 ? estado.param.NomesDimensoes[static_cast<std::size_t>(i + 1)].trimmed()
                  : QString();
        auto* rotulo =
            new QLabel(dimensao.isEmpty() ? QString::fromUtf8(c.titulo) : dimensao, this);
        auto* codigo = new QLineEdit(this);
        codigo->setObjectName(QStringLiteral("txt") + nome);
        codigo->setMinimumHeight(52);
        codigo->setMaximumWidth(220);
        auto* texto = new QLabel(this);
        texto->setObjectName(QStringLiteral("lbl") + nome);
        auto* cmd = botao(QStringLiteral("cmd") + nome, QStringLiteral("Pesquisar"), this);
        grelha->addWidget(rotulo, i, 0);
        grelha->addWidget(codigo, i, 1);
        grelha->addWidget(texto, i, 2);
        grelha->addWidget(cmd, i, 3);
        codigos_[static_cast<std::size_t>(i)] = codigo;
        descricoes_[static_cast<std::size_t>(i)] = texto;
        connect(codigo, &QLineEdit::editingFinished, this, [this, i] {
            if (codigos_[static_cast<std::size_t>(i)]->isModified()) procura(i, false);
        });
        connect(cmd, &QPushButton::clicked, this, [this, i] { procura(i, true); });
    }
    layout->addLayout(grelha);
    layout->addStretch();

    auto* botoes = new QHBoxLayout;
    botoes->addStretch();
    auto* cmdOK = botao(QStringLiteral("cmdOK"), QStringLiteral("&OK"), this);
    auto* cmdCancelar = botao(QStringLiteral("cmdCancelar"), QStringLiteral("&Cancelar"), this);
    botoes->addWidget(cmdOK);
    botoes->addWidget(cmdCancelar);
    layout->addLayout(botoes);
    connect(cmdOK, &QPushButton::clicked, this, [this] { confirmar(); });
    connect(cmdCancelar, &QPushButton::clicked, this, &QDialog::reject);

    aplicaFonteTactil(this);
    resize(860, 640);
}

void frmReferencia::procura(int i, bool forcar) {
    const auto n = static_cast<std::size_t>(i);
    QLineEdit* codigo = codigos_[n];
    codigo->setModified(false);
    // An emptied field holds no value: nothing to check.
    if (!forcar && codigo->text().trimmed().isEmpty()) {
        codigo->clear();
        descricoes_[n]->clear();
        return;
    }
    lookups::pesquisaNoCampo(codigo, descricoes_[n], [&](lookups::CampoCodigo& campo) {
        (pesquisa_.*kDefinicoes[i].procura)(campo, forcar, {});
    });
}

void frmReferencia::confirmar() {
    // A code typed but not yet checked is checked now; a refused one is cleared and the form
    // stays open for another.
    bool recusado = false;
    for (int i = 0; i < kCampos; ++i) {
        QLineEdit* codigo = codigos_[static_cast<std::size_t>(i)];
        if (!codigo->isModified()) continue;
        const bool tinha = !codigo->text().trimmed().isEmpty();
        procura(i, false);
        recusado = recusado || (tinha && codigo->text().isEmpty());
    }
    if (recusado) return;
    ReferenciaEscolhida r;
    for (int i = 0; i < 7; ++i)
        r.atributos[static_cast<std::size_t>(i)] =
            codigos_[static_cast<std::size_t>(i)]->text().trimmed();
    r.fornecedor = codigos_[7]->text().trimmed();
    escolhida_ = r;
    accept();
}

std::optional<ReferenciaEscolhida> frmReferencia::escolher() {
    if (exec() != QDialog::Accepted) return std::nullopt;
    return escolhida_;
}

}  // namespace brasel::pos
