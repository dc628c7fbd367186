#include "app/lista_servidores.h"

namespace brasel::app {

namespace {

bool indiceValido(int indice) {
    return indice >= 0 && indice < kEntradasServidor;
}

// The entry as it is stored: server and login without surrounding blanks, the authentication
// upper-cased ("SQL" when none is given).
EntradaServidor normalizada(EntradaServidor entrada) {
    entrada.servidor = entrada.servidor.trimmed();
    entrada.login = entrada.login.trimmed();
    entrada.tipoAutenticacao = entrada.tipoAutenticacao.trimmed().toUpper();
    if (entrada.tipoAutenticacao.isEmpty()) entrada.tipoAutenticacao = QStringLiteral("SQL");
    return entrada;
}

}  // namespace

int indiceServidor(const ListaServidores& lista, const QString& servidor, int excepto) {
    const QString procurado = servidor.trimmed();
    if (procurado.isEmpty()) return -1;
    for (int i = 0; i < kEntradasServidor; ++i) {
        if (i == excepto) continue;
        if (lista[static_cast<std::size_t>(i)].servidor.trimmed().compare(
                procurado, Qt::CaseInsensitive) == 0) {
            return i;
        }
    }
    return -1;
}

EdicaoServidor acrescentarServidor(ListaServidores& lista, const EntradaServidor& entrada) {
    if (!entrada.emUso()) return EdicaoServidor::SemServidor;
    if (indiceServidor(lista, entrada.servidor) >= 0) return EdicaoServidor::Repetido;
    for (EntradaServidor& livre : lista) {
        if (!livre.emUso()) {
            livre = normalizada(entrada);
            return EdicaoServidor::Feita;
        }
    }
    return EdicaoServidor::Cheia;
}

EdicaoServidor alterarServidor(ListaServidores& lista, int indice, const EntradaServidor& entrada) {
    if (!indiceValido(indice) || !entrada.emUso()) return EdicaoServidor::SemServidor;
    if (indiceServidor(lista, entrada.servidor, indice) >= 0) return EdicaoServidor::Repetido;
    lista[static_cast<std::size_t>(indice)] = normalizada(entrada);
    return EdicaoServidor::Feita;
}

bool apagarServidor(ListaServidores& lista, int indice) {
    if (!indiceValido(indice)) return false;
    for (int i = indice; i + 1 < kEntradasServidor; ++i)
        lista[static_cast<std::size_t>(i)] = lista[static_cast<std::size_t>(i + 1)];
    lista.back() = EntradaServidor{};
    return true;
}

QString mensagemEdicao(EdicaoServidor resultado) {
    switch (resultado) {
        case EdicaoServidor::Feita:
            return {};
        case EdicaoServidor::SemServidor:
            return QStringLiteral("Tem que indicar o Servidor!");
        case EdicaoServidor::Repetido:
            return QStringLiteral("Servidor já Existente!");
        case EdicaoServidor::Cheia:
            return QStringLiteral("Não pode definir mais de %1 Servidores!").arg(kEntradasServidor);
    }
    return {};
}

}  // namespace brasel::app
