#include "app/ui/catalogo_janelas.h"

#include "app/ui/acessos_janela.h"

#include <memory>

namespace brasel::app {

void CatalogoJanelas::registar(const QString& caption, Fabrica fabrica) {
    entradas_.append({caption, std::move(fabrica)});
}

QList<JanelaAcesso> CatalogoJanelas::descricoes() const {
    QList<JanelaAcesso> lista;
    for (const Entrada& entrada : entradas_) {
        const std::unique_ptr<QWidget> janela(entrada.fabrica(nullptr));
        if (janela) lista.append(descreverJanela(janela.get(), entrada.caption));
    }
    return lista;
}

}  // namespace brasel::app
