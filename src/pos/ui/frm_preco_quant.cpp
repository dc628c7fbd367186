#include "pos/ui/frm_preco_quant.h"

#include "common/number_text.h"
#include "common/ui/estilo_tactil.h"
#include "pos/teclado.h"

#include <QFormLayout>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

#include <tuple>

namespace brasel::pos {

namespace {

QLineEdit* campo(const char* nome, const QString& texto, bool activo, QWidget* pai) {
    auto* c = new QLineEdit(texto, pai);
    c->setObjectName(QString::fromLatin1(nome));
    c->setAlignment(Qt::AlignRight);
    c->setMinimumHeight(56);
    c->setEnabled(activo);
    return c;
}

}  // namespace

frmProdutosCodigosBarrasInteractividade::frmProdutosCodigosBarrasInteractividade(
    MessagePort& mensagens, const QString& codigo, const PropostaPrecoQuant& proposta,
    int casasPreco, int casasQuantidade, QWidget* pai)
    : QDialog(pai), mensagens_(mensagens), proposta_(proposta) {
    setObjectName(QStringLiteral("frmProdutosCodigosBarrasInteractividade"));
    setWindowTitle(QStringLiteral("Código ") + codigo);
    auto* layout = new QVBoxLayout(this);
    auto* campos = new QFormLayout;
    txtUnidades_ = campo("txtUnidades", QStringLiteral("1"), true, this);
    txtPreco_ =
        campo("txtPreco", NumeroParaTexto(proposta.preco, casasPreco), proposta.comPreco, this);
    txtQuantidade_ = campo("txtQuantidade", NumeroParaTexto(proposta.quantidade, casasQuantidade),
                           proposta.comQuantidade, this);
    campos->addRow(QStringLiteral("Unidades"), txtUnidades_);
    campos->addRow(QStringLiteral("Preço"), txtPreco_);
    campos->addRow(QStringLiteral("Quantidade"), txtQuantidade_);
    layout->addLayout(campos);
    auto* cmdContinuar = new QPushButton(QStringLiteral("&Continuar"), this);
    cmdContinuar->setObjectName(QStringLiteral("cmdContinuar"));
    cmdContinuar->setMinimumSize(200, 64);
    layout->addWidget(cmdContinuar, 0, Qt::AlignRight);
    connect(cmdContinuar, &QPushButton::clicked, this, [this] { continuar(); });
    aplicaFonteTactil(this);
    resize(520, 340);
}

void frmProdutosCodigosBarrasInteractividade::continuar() {
    PrecoQuant dado;
    for (auto [oferecido, caixa, destino] :
         {std::tuple{proposta_.comPreco, txtPreco_, &dado.preco},
          std::tuple{proposta_.comQuantidade, txtQuantidade_, &dado.quantidade}}) {
        if (!oferecido) continue;
        // The fields show amounts with "," grouping thousands and "." before the decimals; a
        // number typed with a lone "," takes it as the decimal separator.
        QString texto = caixa->text();
        if (texto.contains(u'.')) texto.remove(u',');
        const ValorTeclado v = lerValorTeclado(texto);
        if (!v.valido || !v.valor) {
            mensagens_.mensagem(QStringLiteral("Valor Inválido!"), Icone::Critico);
            caixa->setFocus();
            return;
        }
        *destino = v.valor;
    }
    resultado_ = dado;
    accept();
}

PrecoQuant PrecoQuantJanela::pedir(const QString& codigo, const PropostaPrecoQuant& proposta) {
    frmProdutosCodigosBarrasInteractividade form(mensagens_, codigo, proposta, casasPreco_,
                                                 casasQuantidade_, pai_);
    if (form.exec() != QDialog::Accepted) return {};
    return form.resultado();
}

}  // namespace brasel::pos
