#include "app/ui/acessos_janela.h"

#include <QPushButton>

namespace brasel::app {

JanelaAcesso descreverJanela(const QWidget* janela, const QString& caption) {
    JanelaAcesso descricao{
        janela->objectName(), caption.isEmpty() ? janela->windowTitle() : caption, {}};
    for (const QPushButton* botao : janela->findChildren<QPushButton*>()) {
        if (!botao->objectName().isEmpty())
            descricao.botoes.append({botao->objectName(), botao->text()});
    }
    return descricao;
}

void aplicarAcessos(QWidget* janela, const ResultadoAcesso& resultado) {
    for (QPushButton* botao : janela->findChildren<QPushButton*>()) {
        const auto valor = resultado.botoes.constFind(botao->objectName());
        if (valor != resultado.botoes.constEnd()) botao->setEnabled(*valor);
    }
}

bool verificarAcesso(Estado& estado, QWidget* janela, const QString& caption,
                     MessagePort& mensagens, const QString& sufixo) {
    const ResultadoAcesso resultado =
        FormAcessos(estado, descreverJanela(janela, caption), estado.gUtilizador, sufixo);
    if (!resultado.permitido) {
        mensagens.mensagem(QStringLiteral("Acesso Negado !"), Icone::Critico);
        return false;
    }
    aplicarAcessos(janela, resultado);
    return true;
}

}  // namespace brasel::app
