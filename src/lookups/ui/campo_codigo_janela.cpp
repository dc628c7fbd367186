#include "lookups/ui/campo_codigo_janela.h"

namespace brasel::lookups {

void pesquisaNoCampo(QLineEdit* codigo, QLabel* descricao,
                     const std::function<void(CampoCodigo&)>& pesquisa) {
    CampoCodigo campo{codigo->text(), descricao->text()};
    pesquisa(campo);
    codigo->setText(campo.codigo);
    descricao->setText(campo.descricao);
}

}  // namespace brasel::lookups
