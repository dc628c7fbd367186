#include "app/importa_empresas.h"

#include "app/lista_servidores.h"
#include "common/ediv.h"

#include <QDir>
#include <QFile>
#include <QStringDecoder>

#include <algorithm>

namespace brasel::app {

namespace {

QString textoDoFicheiro(const QByteArray& bytes) {
    QStringDecoder utf8(QStringDecoder::Utf8, QStringDecoder::Flag::Stateless);
    QString texto = utf8.decode(bytes);
    if (!utf8.hasError()) return texto;
    // The old list came from a Windows program: its cipher text is full of 8-bit characters.
    QStringDecoder ansi("Windows-1252");
    if (ansi.isValid()) return ansi.decode(bytes);
    return QString::fromLatin1(bytes);
}

struct Colunas {
    qsizetype servidor = 0;
    qsizetype login = 1;
    qsizetype password = 2;
};

// The columns of the rows: named by a first row of names (which is then taken out), or in
// their usual order. nullopt when the names lack one of the three.
std::optional<Colunas> colunasDasLinhas(QList<QStringList>& linhas, QString* erro) {
    if (linhas.isEmpty()) return Colunas{};
    const QStringList& primeira = linhas.first();
    const auto posicao = [&primeira](const char* nome) {
        for (qsizetype i = 0; i < primeira.size(); ++i) {
            if (primeira[i].trimmed().compare(QLatin1String(nome), Qt::CaseInsensitive) == 0)
                return i;
        }
        return qsizetype{-1};
    };
    const Colunas c{posicao("Server"), posicao("UID"), posicao("PWD")};
    if (c.servidor < 0) return Colunas{};
    if (c.login < 0 || c.password < 0) {
        if (erro) *erro = QStringLiteral("O ficheiro não tem as colunas Server, UID e PWD.");
        return std::nullopt;
    }
    linhas.removeFirst();
    return c;
}

QString campo(const QStringList& linha, qsizetype i) {
    return i < linha.size() ? linha[i] : QString();
}

}  // namespace

QList<QStringList> lerLinhasCsv(const QString& texto) {
    QList<QStringList> linhas;
    QStringList linha;
    QString valor;
    bool entreAspas = false;
    bool linhaComConteudo = false;
    const auto fechaCampo = [&] {
        linha.append(valor);
        valor.clear();
    };
    const auto fechaLinha = [&] {
        if (linhaComConteudo) {
            fechaCampo();
            linhas.append(linha);
        }
        linha.clear();
        valor.clear();
        linhaComConteudo = false;
    };
    for (qsizetype i = 0; i < texto.size(); ++i) {
        const QChar c = texto[i];
        if (entreAspas) {
            if (c != QLatin1Char('"')) {
                valor.append(c);
            } else if (i + 1 < texto.size() && texto[i + 1] == QLatin1Char('"')) {
                valor.append(c);
                ++i;
            } else {
                entreAspas = false;
            }
            continue;
        }
        if (c == QLatin1Char('"')) {
            entreAspas = true;
            linhaComConteudo = true;
        } else if (c == QLatin1Char(',')) {
            fechaCampo();
            linhaComConteudo = true;
        } else if (c == QLatin1Char('\n')) {
            fechaLinha();
        } else if (c != QLatin1Char('\r')) {
            valor.append(c);
            linhaComConteudo = true;
        }
    }
    fechaLinha();
    return linhas;
}

std::optional<QList<EntradaServidor>> lerEmpresasCsv(const QString& ficheiro, QString* erro) {
    QFile f(ficheiro);
    if (!f.open(QIODevice::ReadOnly)) {
        if (erro) *erro = QStringLiteral("Não foi possível abrir o ficheiro ") + ficheiro;
        return std::nullopt;
    }
    QList<QStringList> linhas = lerLinhasCsv(textoDoFicheiro(f.readAll()));
    const auto colunas = colunasDasLinhas(linhas, erro);
    if (!colunas) return std::nullopt;
    QList<EntradaServidor> entradas;
    for (const QStringList& linha : linhas) {
        EntradaServidor e;
        e.servidor = campo(linha, colunas->servidor).trimmed();
        if (e.servidor.isEmpty()) continue;
        e.login = campo(linha, colunas->login).trimmed();
        e.definirPassword(EDiv::Decrypt(campo(linha, colunas->password)));
        e.tipoAutenticacao = QStringLiteral("SQL");
        entradas.append(e);
    }
    std::stable_sort(entradas.begin(), entradas.end(),
                     [](const EntradaServidor& a, const EntradaServidor& b) {
                         return a.servidor.compare(b.servidor, Qt::CaseInsensitive) < 0;
                     });
    return entradas;
}

ResultadoImportacao juntarServidores(ListaServidores& lista, const QList<EntradaServidor>& novos) {
    ResultadoImportacao r;
    for (const EntradaServidor& e : novos) {
        switch (acrescentarServidor(lista, e)) {
            case EdicaoServidor::Feita:
                ++r.importados;
                break;
            case EdicaoServidor::Repetido:
                ++r.repetidos;
                break;
            case EdicaoServidor::Cheia:
                ++r.semLugar;
                break;
            case EdicaoServidor::SemServidor:
                break;
        }
    }
    return r;
}

QString pastaDaLinhaComando(const QString& linhaComando) {
    const QString linha = linhaComando.trimmed();
    if (linha.isEmpty() || linha.startsWith(QStringLiteral("<@>"))) return {};
    if (linha.startsWith(QLatin1Char('"'))) {
        const qsizetype fim = linha.indexOf(QLatin1Char('"'), 1);
        return fim < 0 ? linha.mid(1) : linha.mid(1, fim - 1);
    }
    const qsizetype branco = linha.indexOf(QLatin1Char(' '));
    return branco < 0 ? linha : linha.left(branco);
}

bool importarEmpresasIniciais(const QString& linhaComando) {
    ListaServidores lista = lerServidores();
    if (std::any_of(lista.begin(), lista.end(), [](const auto& e) { return e.emUso(); }))
        return false;
    const QString pasta = pastaDaLinhaComando(linhaComando);
    if (pasta.isEmpty()) return false;
    const auto entradas = lerEmpresasCsv(QDir(pasta).filePath(kFicheiroEmpresasAntigo));
    if (!entradas) return false;
    if (juntarServidores(lista, *entradas).importados == 0) return false;
    return gravarServidores(lista);
}

}  // namespace brasel::app
