#include "db/schema/construtor.h"

namespace brasel::db::schema {

Def::Def(const char* nome, const char* identidade) {
    tabela_.nome = QString::fromLatin1(nome);
    tabela_.colunas.append({QString::fromLatin1(identidade), Tipo::Identidade, {}});
}

Def& Def::juntar(std::initializer_list<const char*> nomes, Tipo tipo) {
    for (const char* nome : nomes)
        tabela_.colunas.append({QString::fromLatin1(nome), tipo, {}});
    return *this;
}

Def& Def::texto(std::initializer_list<const char*> nomes) {
    return juntar(nomes, Tipo::Texto);
}
Def& Def::inteiro(std::initializer_list<const char*> nomes) {
    return juntar(nomes, Tipo::Inteiro);
}
Def& Def::montante(std::initializer_list<const char*> nomes) {
    return juntar(nomes, Tipo::Montante);
}
Def& Def::imagem(std::initializer_list<const char*> nomes) {
    return juntar(nomes, Tipo::Imagem);
}

Def& Def::coluna(const QString& nome, Tipo tipo, const char* defeito) {
    tabela_.colunas.append({nome, tipo, QString::fromLatin1(defeito)});
    return *this;
}

Def& Def::colunas(const QList<Coluna>& grupo) {
    tabela_.colunas.append(grupo);
    return *this;
}

Def& Def::numeradas(const char* prefixo, int n, Tipo tipo) {
    for (int i = 1; i <= n; ++i)
        coluna(QString::fromLatin1(prefixo) + QString::number(i), tipo);
    return *this;
}

Def& Def::unico(std::initializer_list<const char*> nomes, const char* condicao) {
    Indice indice{{}, true, QString::fromLatin1(condicao)};
    for (const char* nome : nomes)
        indice.colunas.append(QString::fromLatin1(nome));
    tabela_.indices.append(indice);
    return *this;
}

Def& Def::indice(std::initializer_list<const char*> nomes) {
    Indice indice;
    for (const char* nome : nomes)
        indice.colunas.append(QString::fromLatin1(nome));
    tabela_.indices.append(indice);
    return *this;
}

Def& Def::umaLinha() {
    tabela_.umaLinha = true;
    return *this;
}

Tabela tabelaCodigoDescricao(const char* nome) {
    return Def(nome).texto({"Codigo", "Descricao"}).unico({"Codigo"});
}

QStringList sufixosArredondamento() {
    return {QStringLiteral("valor"),     QStringLiteral("iva"),       QStringLiteral("desc"),
            QStringLiteral("merlin"),    QStringLiteral("desclin"),   QStringLiteral("ivalin"),
            QStringLiteral("mergeral"),  QStringLiteral("descgeral"), QStringLiteral("ivageral"),
            QStringLiteral("totalgeral")};
}

const QList<Tabela>& tabelasEmpresa() {
    static const QList<Tabela> tabelas = [] {
        QList<Tabela> t;
        acrescentaConfiguracao(t);
        acrescentaMestres(t);
        acrescentaMovimentos(t);
        acrescentaPontos(t);
        return t;
    }();
    return tabelas;
}

}  // namespace brasel::db::schema
