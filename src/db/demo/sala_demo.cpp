// The demo restaurant's house: the shop and its heading, storage locations, the till, currencies,
// payment methods, the tables (customer records) and the walk-in customer.
#include "db/demo/partes_demo.h"

#include "db/schema/definicao.h"

#include <span>

namespace brasel::db::demo {

namespace {

struct Par {
    const char* codigo;
    const char* descricao;
};

constexpr Par kLocalizacoes[] = {{"GER", "Geral"}, {"COZ", "Cozinha"}, {"BAR", "Bar"}};
constexpr Par kPagamentos[] = {
    {"NU", "Numerário"}, {"MB", "Multibanco"}, {"CC", "Cartão de Crédito"}, {"MW", "MB Way"}};
constexpr Par kSituacoes[] = {{"A", "Activo"}, {"I", "Inactivo"}};
constexpr Par kPostais[] = {{"1100-148", "Lisboa"}};
constexpr Par kObservacoes[] = {
    {"001", "Sem sal"},    {"002", "Bem passado"}, {"003", "Mal passado"},  {"004", "Sem gelo"},
    {"005", "Para levar"}, {"006", "Sem glúten"},  {"007", "Molho à parte"}};

struct Cambio {
    const char* codigo;
    const char* abreviatura;
    const char* valor;
};

constexpr Cambio kCambios[] = {{"EUR", "€", "1"}, {"USD", "US$", "1.08"}, {"GBP", "£", "0.86"}};

QString texto(const char* s) {
    return QString::fromUtf8(s);
}

void codigosDescricoes(Escritor& e, const QString& tabela, std::span<const Par> pares) {
    for (const Par& p : pares) {
        e.inserir(tabela, {{QStringLiteral("Codigo"), texto(p.codigo)},
                           {QStringLiteral("Descricao"), texto(p.descricao)}});
    }
}

// A table of the house (or the walk-in customer): amounts rounded to the nearest cent at every
// step, prices of its tier.
void escreveMesa(Escritor& e, const QString& codigo, const QString& descricao, int escalao,
                 int diversos) {
    Campos campos{{QStringLiteral("Codigo"), codigo},
                  {QStringLiteral("Descricao"), descricao},
                  {QStringLiteral("Pais"), QStringLiteral("Portugal")},
                  {QStringLiteral("PagaComo"), QStringLiteral("NU")},
                  {QStringLiteral("Diversos"), diversos},
                  {QStringLiteral("PrecoStock"), escalao},
                  {QStringLiteral("JaImprimiuTalao"), 0}};
    for (const QString& sufixo : schema::sufixosArredondamento()) {
        campos.append({QStringLiteral("dec") + sufixo, 2});
        campos.append({QStringLiteral("arre") + sufixo, 1});
    }
    e.inserir(QStringLiteral("Clientes"), campos);
}

}  // namespace

QStringList mesasSala() {
    QStringList codigos;
    for (int i = 1; i <= 20; ++i)
        codigos << QStringLiteral("M%1").arg(i, 2, 10, QLatin1Char('0'));
    return codigos;
}

QStringList mesasEsplanada() {
    QStringList codigos;
    for (int i = 1; i <= 4; ++i)
        codigos << QStringLiteral("E%1").arg(i, 2, 10, QLatin1Char('0'));
    return codigos;
}

void escreveSala(Escritor& e, const QString& nomeEmpresa) {
    e.inserir(QStringLiteral("armazens"),
              {{QStringLiteral("codigo"), kArmazem},
               {QStringLiteral("linha1"), nomeEmpresa},
               {QStringLiteral("linha2"), QStringLiteral("Largo do Chafariz, 12")},
               {QStringLiteral("linha3"), QStringLiteral("1100-148 Lisboa")},
               {QStringLiteral("linha4"), QStringLiteral("Telefone 210 000 000")},
               {QStringLiteral("linha5"), QStringLiteral("Contribuinte n.º 999999990")},
               {QStringLiteral("linha6"), QString()},
               {QStringLiteral("linha7"), QString()}});
    codigosDescricoes(e, QStringLiteral("Localizacao"), kLocalizacoes);
    e.inserir(QStringLiteral("Caixas"),
              {{QStringLiteral("Codigo"), kCaixa},
               {QStringLiteral("Descricao"), QStringLiteral("Caixa principal")}});
    for (const Cambio& c : kCambios) {
        e.inserir(QStringLiteral("Cambios"), {{QStringLiteral("codigo"), texto(c.codigo)},
                                              {QStringLiteral("Abreviatura"), texto(c.abreviatura)},
                                              {QStringLiteral("valor"), texto(c.valor)}});
    }
    for (const Par& p : kPagamentos) {
        e.inserir(QStringLiteral("PagaComo"), {{QStringLiteral("codigo"), texto(p.codigo)},
                                               {QStringLiteral("Descricao"), texto(p.descricao)},
                                               {QStringLiteral("Reembolso"), 0}});
    }
    for (const Par& s : kSituacoes) {
        e.inserir(QStringLiteral("TabSituacao"),
                  {{QStringLiteral("Codigo"), texto(s.codigo)},
                   {QStringLiteral("Descricao"), texto(s.descricao)},
                   {QStringLiteral("Movimenta"), qstrcmp(s.codigo, "A") == 0 ? 1 : 0}});
    }
    codigosDescricoes(e, QStringLiteral("HistoricoOBS"), kObservacoes);
    codigosDescricoes(e, QStringLiteral("TabPostal"), kPostais);
    int numero = 0;
    for (const QString& codigo : mesasSala()) {
        escreveMesa(e, codigo, QStringLiteral("Mesa %1").arg(++numero), 1, 0);
    }
    numero = 0;
    for (const QString& codigo : mesasEsplanada()) {
        escreveMesa(e, codigo, QStringLiteral("Esplanada %1").arg(++numero), 2, 0);
    }
    escreveMesa(e, kConsumidorFinal, QStringLiteral("Consumidor final"), 1, 1);
}

}  // namespace brasel::db::demo
