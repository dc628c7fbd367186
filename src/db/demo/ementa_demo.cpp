// The demo restaurant's menu: VAT codes, groups and families, products with their price tiers
// and kitchen flags, and a few registered barcodes.
#include "db/demo/partes_demo.h"

namespace brasel::db::demo {

namespace {

struct Iva {
    const char* codigo;
    const char* taxa;
    int incluido;
};

// Drinks are priced with VAT included; the other codes are priced without it.
constexpr Iva kIvas[] = {{"RD", "6", 0}, {"IT", "13", 0}, {"NO", "23", 1}};

struct Nivel {
    const char* codigo;
    const char* descricao;
};

constexpr Nivel kGrupos[] = {{"01", "Bebidas"}, {"02", "Pratos"}, {"03", "Sobremesas"}};

constexpr Nivel kFamilias[] = {
    {"011", "Águas e Refrigerantes"},
    {"012", "Cervejas"},
    {"013", "Vinhos"},
    {"014", "Cafetaria"},
    {"021", "Entradas"},
    {"022", "Peixe"},
    {"023", "Carne"},
    {"024", "Vegetariano"},
    {"031", "Doces"},
    {"032", "Fruta"},
};

struct Produto {
    const char* codigo;
    const char* descricao;
    const char* familia;  // its first two characters are the group
    const char* iva;
    // Tier 1 dining room, 2 terrace, 3 counter.
    const char* precos[3];
    int cozinha;  // ImpCopa: queued for the kitchen, otherwise printed at the bar
    int pesado;   // Pesagem: the quantity comes from the scale
    const char* unidade;
};

constexpr Produto kProdutos[] = {
    {"B001", "Água mineral 0,5 L", "011", "RD", {"1.20", "1.40", "1.00"}, 0, 0, "UN"},
    {"B002", "Água com gás 0,25 L", "011", "RD", {"1.30", "1.50", "1.10"}, 0, 0, "UN"},
    {"B003", "Refrigerante de cola 33 cl", "011", "NO", {"1.80", "2.00", "1.60"}, 0, 0, "UN"},
    {"B004", "Sumo de laranja natural", "011", "NO", {"2.80", "3.00", "2.50"}, 0, 0, "UN"},
    {"B005", "Limonada caseira", "011", "NO", {"2.50", "2.80", "2.20"}, 0, 0, "UN"},
    {"B006", "Imperial", "012", "NO", {"1.60", "1.80", "1.40"}, 0, 0, "UN"},
    {"B007", "Caneca 50 cl", "012", "NO", {"3.20", "3.50", "3.00"}, 0, 0, "UN"},
    {"B008", "Cerveja sem álcool", "012", "NO", {"2.00", "2.20", "1.80"}, 0, 0, "UN"},
    {"B009", "Cerveja preta", "012", "NO", {"2.20", "2.40", "2.00"}, 0, 0, "UN"},
    {"B010", "Vinho da casa tinto (copo)", "013", "NO", {"2.50", "2.80", "2.30"}, 0, 0, "UN"},
    {"B011", "Vinho da casa branco (copo)", "013", "NO", {"2.50", "2.80", "2.30"}, 0, 0, "UN"},
    {"B012", "Vinho verde (garrafa)", "013", "NO", {"12.00", "13.00", "11.00"}, 0, 0, "UN"},
    {"B013",
     "Vinho tinto do Douro (garrafa)",
     "013",
     "NO",
     {"16.00", "17.50", "15.00"},
     0,
     0,
     "UN"},
    {"B014", "Jarro de sangria", "013", "NO", {"14.00", "15.00", "13.00"}, 0, 0, "UN"},
    {"B015", "Café", "014", "IT", {"0.80", "0.90", "0.75"}, 0, 0, "UN"},
    {"B016", "Descafeinado", "014", "IT", {"0.85", "0.95", "0.80"}, 0, 0, "UN"},
    {"B017", "Galão", "014", "IT", {"1.50", "1.70", "1.40"}, 0, 0, "UN"},
    {"B018", "Chá de cidreira", "014", "IT", {"1.30", "1.50", "1.20"}, 0, 0, "UN"},
    {"P001",
     "Couvert (pão, manteiga e azeitonas)",
     "021",
     "RD",
     {"2.00", "2.00", "2.00"},
     0,
     0,
     "UN"},
    {"P002", "Caldo verde", "021", "IT", {"2.50", "2.80", "2.30"}, 1, 0, "UN"},
    {"P003", "Sopa do dia", "021", "IT", {"2.20", "2.50", "2.00"}, 1, 0, "UN"},
    {"P004", "Pica-pau", "021", "IT", {"8.50", "9.20", "8.00"}, 1, 0, "UN"},
    {"P005", "Amêijoas à Bulhão Pato", "021", "IT", {"12.50", "13.50", "12.00"}, 1, 0, "UN"},
    {"P006", "Bacalhau à Brás", "022", "IT", {"11.50", "12.50", "11.00"}, 1, 0, "UN"},
    {"P007", "Polvo à lagareiro", "022", "IT", {"16.50", "17.50", "16.00"}, 1, 0, "UN"},
    {"P008", "Dourada grelhada", "022", "IT", {"13.00", "14.00", "12.50"}, 1, 0, "UN"},
    {"P009", "Arroz de marisco (2 pessoas)", "022", "IT", {"32.00", "34.00", "30.00"}, 1, 0, "UN"},
    {"P010", "Peixe fresco ao quilo", "022", "IT", {"45.000", "48.000", "42.000"}, 1, 1, "KG"},
    {"P011", "Bitoque", "023", "IT", {"9.50", "10.20", "9.00"}, 1, 0, "UN"},
    {"P012", "Secretos de porco preto", "023", "IT", {"14.00", "15.00", "13.50"}, 1, 0, "UN"},
    {"P013", "Francesinha", "023", "IT", {"11.00", "12.00", "10.50"}, 1, 0, "UN"},
    {"P014", "Picanha grelhada", "023", "IT", {"15.50", "16.50", "15.00"}, 1, 0, "UN"},
    {"P015", "Meio frango assado", "023", "IT", {"8.00", "8.80", "7.50"}, 1, 0, "UN"},
    {"P016", "Caril de legumes", "024", "IT", {"10.00", "10.80", "9.50"}, 1, 0, "UN"},
    {"P017", "Hambúrguer vegetariano", "024", "IT", {"10.50", "11.20", "10.00"}, 1, 0, "UN"},
    {"P018", "Salada mista", "024", "IT", {"4.50", "5.00", "4.20"}, 1, 0, "UN"},
    {"S001", "Arroz doce", "031", "IT", {"3.50", "3.80", "3.20"}, 1, 0, "UN"},
    {"S002", "Mousse de chocolate", "031", "IT", {"3.80", "4.10", "3.50"}, 1, 0, "UN"},
    {"S003", "Pudim flan", "031", "IT", {"3.50", "3.80", "3.20"}, 1, 0, "UN"},
    {"S004", "Leite creme queimado", "031", "IT", {"3.80", "4.10", "3.50"}, 1, 0, "UN"},
    {"S005", "Bolo de bolacha", "031", "IT", {"3.80", "4.10", "3.50"}, 1, 0, "UN"},
    {"S006", "Pastel de nata", "031", "IT", {"1.40", "1.60", "1.30"}, 0, 0, "UN"},
    {"S007", "Salada de fruta", "032", "IT", {"3.50", "3.80", "3.20"}, 1, 0, "UN"},
    {"S008", "Fruta da época", "032", "IT", {"2.50", "2.80", "2.30"}, 1, 0, "UN"},
    {"S009", "Ananás fatiado", "032", "IT", {"3.20", "3.50", "3.00"}, 1, 0, "UN"},
};

struct CodigoBarras {
    const char* codigo;
    const char* produto;
};

constexpr CodigoBarras kCodigosBarras[] = {
    {"5601234000016", "B001"}, {"5601234000023", "B002"}, {"5601234000030", "B003"}};

QString texto(const char* s) {
    return QString::fromUtf8(s);
}

const char* taxaIva(const char* codigo) {
    for (const Iva& iva : kIvas) {
        if (qstrcmp(iva.codigo, codigo) == 0) return iva.taxa;
    }
    return "0";
}

}  // namespace

void escreveEmenta(Escritor& e) {
    for (const Iva& iva : kIvas) {
        e.inserir(QStringLiteral("TabIva"), {{QStringLiteral("codigo"), texto(iva.codigo)},
                                             {QStringLiteral("Taxa"), texto(iva.taxa)},
                                             {QStringLiteral("Incluido"), iva.incluido}});
    }
    for (const Nivel& g : kGrupos) {
        e.inserir(QStringLiteral("TabGrupoPro"),
                  {{QStringLiteral("CODIGO"), texto(g.codigo)},
                   {QStringLiteral("Descricao"), texto(g.descricao)}});
    }
    for (const Nivel& f : kFamilias) {
        e.inserir(QStringLiteral("TabFamPro"), {{QStringLiteral("CODIGO"), texto(f.codigo)},
                                                {QStringLiteral("Descricao"), texto(f.descricao)}});
    }
    for (const Produto& p : kProdutos) {
        const QString familia = texto(p.familia);
        e.inserir(QStringLiteral("Produtos"),
                  {{QStringLiteral("Codigo"), texto(p.codigo)},
                   {QStringLiteral("Descricao"), texto(p.descricao)},
                   {QStringLiteral("Situacao"), QStringLiteral("A")},
                   {QStringLiteral("Grupo"), familia.left(2)},
                   {QStringLiteral("Familia"), familia},
                   {QStringLiteral("IvaTabVenda"), texto(p.iva)},
                   {QStringLiteral("IvaTaxaVenda"), texto(taxaIva(p.iva))},
                   {QStringLiteral("PrecoVenda1"), texto(p.precos[0])},
                   {QStringLiteral("PrecoVenda2"), texto(p.precos[1])},
                   {QStringLiteral("PrecoVenda3"), texto(p.precos[2])},
                   {QStringLiteral("UnidadeVenda"), texto(p.unidade)},
                   {QStringLiteral("ImpCopa"), p.cozinha},
                   {QStringLiteral("Pesagem"), p.pesado}});
    }
    for (const CodigoBarras& c : kCodigosBarras) {
        e.inserir(QStringLiteral("ProdutosCodigosBarras"),
                  {{QStringLiteral("CodigoBarras"), texto(c.codigo)},
                   {QStringLiteral("ProdutoBase"), texto(c.produto)}});
    }
}

}  // namespace brasel::db::demo
