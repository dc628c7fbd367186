#include "app/carrega_parametros.h"

#include "db/query_helpers.h"

#include <functional>
#include <optional>
#include <vector>

namespace brasel::app {

namespace {

using Leitor = std::function<void(const QVariant&, Parametros&, MessagePort&)>;

struct Coluna {
    QString nome;
    Leitor ler;
};

// Numeric columns are converted only when they hold a number; a NULL leaves the value as it was.
std::optional<double> numero(const QVariant& v) {
    bool ok = false;
    const double n = v.toString().trimmed().toDouble(&ok);
    if (v.isNull() || !ok) return std::nullopt;
    return n;
}

template <typename T>
Leitor inteiro(T Parametros::*membro) {
    return [membro](const QVariant& v, Parametros& p, MessagePort&) {
        if (const auto n = numero(v)) p.*membro = static_cast<T>(*n);
    };
}

template <std::size_t N>
Leitor inteiroEm(std::array<std::int32_t, N> Parametros::*membro, int indice) {
    return [membro, indice](const QVariant& v, Parametros& p, MessagePort&) {
        if (const auto n = numero(v)) (p.*membro)[indice] = static_cast<std::int32_t>(*n);
    };
}

Leitor dinheiro(Currency Parametros::*membro) {
    return [membro](const QVariant& v, Parametros& p, MessagePort&) {
        if (!v.isNull()) p.*membro = Currency::fromVariant(v);
    };
}

Leitor texto(QString Parametros::*membro) {
    return [membro](const QVariant& v, Parametros& p, MessagePort&) {
        p.*membro = v.isNull() ? QString() : v.toString();
    };
}

Leitor booleano(bool Parametros::*membro) {
    return [membro](const QVariant& v, Parametros& p, MessagePort& m) {
        p.*membro = IntToBool(v.toString().trimmed().toLongLong(), m);
    };
}

Leitor dimensao(int indice) {
    return [indice](const QVariant& v, Parametros& p, MessagePort&) {
        p.NomesDimensoes[indice] = v.isNull() ? QString() : v.toString();
    };
}

const std::vector<Coluna>& colunas() {
    static const std::vector<Coluna> lista = [] {
        using P = Parametros;
        std::vector<Coluna> c{
            {QStringLiteral("taxajuromora"), dinheiro(&P::taxajuromora)},
            {QStringLiteral("impostoselo"), dinheiro(&P::impostoselo)},
            {QStringLiteral("tipojuromora"), texto(&P::tipojuromora)},
            {QStringLiteral("registosVisualizar"), inteiro(&P::registosVisualizar)},
            {QStringLiteral("tipoavencas"), texto(&P::tipoavencas)},
            {QStringLiteral("txivaavencas"), texto(&P::txivaavencas)},
            {QStringLiteral("LimiteRecapitulativos"), dinheiro(&P::LimiteRecapitulativos)},
            {QStringLiteral("casadec"), inteiro(&P::casadec)},
            {QStringLiteral("casadecpreco"), inteiro(&P::casadecpreco)},
            {QStringLiteral("casadecquant"), inteiro(&P::casadecquant)},
            {QStringLiteral("casadecquantOutUni"), inteiro(&P::casadecquantOutUni)},
            {QStringLiteral("ActualizaUPC"), inteiro(&P::ActualizaUPC)},
            {QStringLiteral("cambiodef"), texto(&P::cambiodef)},
            {QStringLiteral("cambioeuro"), texto(&P::cambioeuro)},
            {QStringLiteral("zerarclientes"), inteiro(&P::zerarclientes)},
            {QStringLiteral("zerarfornece"), inteiro(&P::zerarfornece)},
            {QStringLiteral("zerarproduto"), inteiro(&P::zerarproduto)},
            {QStringLiteral("ControlaProdutoFornecedor"), inteiro(&P::ControlaProdutoFornecedor)},
            {QStringLiteral("banarre"), inteiro(&P::banarre)},
            {QStringLiteral("bandec"), inteiro(&P::bandec)},
            {QStringLiteral("MensagCli"), texto(&P::MensagCli)},
            {QStringLiteral("Mensagfor"), texto(&P::Mensagfor)},
            {QStringLiteral("Mensagpro"), texto(&P::Mensagpro)},
            {QStringLiteral("MensagproPMC"), texto(&P::MensagproPMC)},
            {QStringLiteral("controlaquant"), texto(&P::controlaquant)},
            {QStringLiteral("docaberto"), texto(&P::docaberto)},
            {QStringLiteral("clidiversos"), texto(&P::clidiversos)},
            {QStringLiteral("forndiversos"), texto(&P::forndiversos)},
            {QStringLiteral("proddiversos"), texto(&P::proddiversos)},
            {QStringLiteral("proddiversos2"), texto(&P::proddiversos2)},
            {QStringLiteral("ano"), texto(&P::ano)},
            {QStringLiteral("mes"), texto(&P::mes)},
            {QStringLiteral("controlaano"), texto(&P::controlaano)},
            {QStringLiteral("controlames"), texto(&P::controlames)},
            {QStringLiteral("GridLine"), booleano(&P::GridLine)},
            {QStringLiteral("ContinuaAdicionar"), booleano(&P::ContinuaAdicionar)},
            {QStringLiteral("AfectaDep"), texto(&P::AfectaDep)},
            {QStringLiteral("AfectaLev"), texto(&P::AfectaLev)},
            {QStringLiteral("prontovestir"), inteiro(&P::prontovestir)},
            {QStringLiteral("AnoCalculo"), texto(&P::AnoCalculo)},
            {QStringLiteral("ImpCabecalhos"),
             [](const QVariant& v, P& p, MessagePort&) {
                 p.ImpCabecalhos = v.toString().trimmed() == QStringLiteral("1");
             }},
            {QStringLiteral("controlespecifico"), inteiro(&P::controlespecifico)},
            {QStringLiteral("controlOficial"), inteiro(&P::controlOficial)},
        };
        const QStringList tipos{QStringLiteral("valor"),    QStringLiteral("iva"),
                                QStringLiteral("desc"),     QStringLiteral("merlin"),
                                QStringLiteral("desclin"),  QStringLiteral("ivalin"),
                                QStringLiteral("mergeral"), QStringLiteral("descgeral"),
                                QStringLiteral("ivageral"), QStringLiteral("totalgeral")};
        for (int i = 0; i < tipos.size(); ++i) {
            c.push_back({QStringLiteral("cliarre") + tipos[i], inteiroEm(&P::cliarre, i)});
            c.push_back({QStringLiteral("clidec") + tipos[i], inteiroEm(&P::clidec, i)});
            c.push_back({QStringLiteral("forarre") + tipos[i], inteiroEm(&P::forarre, i)});
            c.push_back({QStringLiteral("fordec") + tipos[i], inteiroEm(&P::fordec, i)});
        }
        for (int i = 0; i < 4; ++i) {
            c.push_back({QStringLiteral("caiarre") + tipos[6 + i], inteiroEm(&P::caiarre, i)});
            c.push_back({QStringLiteral("caidec") + tipos[6 + i], inteiroEm(&P::caidec, i)});
        }
        const QStringList dimensoes{QStringLiteral("NomeEstacao"),    QStringLiteral("NomeSexo"),
                                    QStringLiteral("NomeReferencia"), QStringLiteral("NomeModelo"),
                                    QStringLiteral("NomeCor"),        QStringLiteral("NomeTamanho"),
                                    QStringLiteral("NomeComprimento")};
        for (int i = 0; i < dimensoes.size(); ++i)
            c.push_back({dimensoes[i], dimensao(i + 1)});
        return c;
    }();
    return lista;
}

}  // namespace

bool IntToBool(long long valor, MessagePort& mensagens) {
    if (valor == 1) return true;
    if (valor == 0 || valor == -1) return false;
    mensagens.mensagem(QStringLiteral("Esta Função só deve ser utilizada com valores de 1; 0 e -1"),
                       Icone::Critico);
    return false;
}

void lerParamGeral(const QSqlRecord& linha, Parametros& param, MessagePort& mensagens) {
    for (const Coluna& coluna : colunas()) {
        const int i = linha.indexOf(coluna.nome);
        if (i >= 0) coluna.ler(linha.value(i), param, mensagens);
    }
}

void CarregaParametros(Estado& estado, MessagePort& mensagens, const QString& caixaPosto) {
    db::Connection& conn = estado.gConn;
    if (const auto linha =
            db::primeiraLinha(conn, QStringLiteral("select * from paramgeral limit 1"))) {
        lerParamGeral(*linha, estado.param, mensagens);
    }
    if (const auto linha = db::primeiraLinha(
            conn, QStringLiteral("select * from utilconfgeral where utilizador=?"),
            {estado.gUtilizador})) {
        auto valor = [&](const char* nome) {
            const int i = linha->indexOf(QLatin1String(nome));
            return i < 0 || linha->value(i).isNull() ? QString() : linha->value(i).toString();
        };
        estado.gArmazem = valor("armazem");
        estado.gCaixa = valor("caixa");
        estado.gTipoFac = valor("tipofac");
        estado.gVariosPagaComo = valor("VariosPagaComo").trimmed().toDouble() == 1.0;
    }
    if (!caixaPosto.trimmed().isEmpty()) estado.gCaixa = caixaPosto.trimmed();
    if (const auto linha = db::primeiraLinha(
            conn, QStringLiteral("select * from armazens where codigo=?"), {estado.gArmazem})) {
        for (int n = 2; n <= 7; ++n) {
            const int i = linha->indexOf(QStringLiteral("linha%1").arg(n));
            if (i >= 0) estado.gLinhasCabecalho[n - 2] = linha->value(i).toString().trimmed();
        }
    }
}

}  // namespace brasel::app
