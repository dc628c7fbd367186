#include "admin/argumentos.h"

namespace brasel::admin {

namespace {

struct Comando {
    QString nome;
    QStringList obrigatorias;
    QStringList facultativas;
    QStringList interruptores;  // options without a value
};

const QList<Comando>& comandos() {
    static const QList<Comando> lista = {
        {QStringLiteral("create-login"),
         {QStringLiteral("server"), QStringLiteral("login"), QStringLiteral("password")},
         {QStringLiteral("admin-login"), QStringLiteral("admin-password")},
         {QStringLiteral("sysadmin")}},
        {QStringLiteral("create"),
         {QStringLiteral("server"), QStringLiteral("company"), QStringLiteral("login"),
          QStringLiteral("password")},
         {QStringLiteral("name")},
         {}},
        {QStringLiteral("upgrade"),
         {QStringLiteral("server"), QStringLiteral("company"), QStringLiteral("login"),
          QStringLiteral("password")},
         {},
         {}},
        {QStringLiteral("demo"),
         {QStringLiteral("server"), QStringLiteral("company"), QStringLiteral("login"),
          QStringLiteral("password")},
         {QStringLiteral("demo-password"), QStringLiteral("name")},
         {}},
        {QStringLiteral("check"),
         {QStringLiteral("server"), QStringLiteral("company"), QStringLiteral("login"),
          QStringLiteral("password")},
         {},
         {}},
        {QStringLiteral("generate-key"), {QStringLiteral("file")}, {}, {}},
        {QStringLiteral("verify-signatures"),
         {QStringLiteral("server"), QStringLiteral("company"), QStringLiteral("login"),
          QStringLiteral("password")},
         {QStringLiteral("public"), QStringLiteral("key")},
         {}},
        {QStringLiteral("add-server"),
         {QStringLiteral("server")},
         {QStringLiteral("login"), QStringLiteral("password"), QStringLiteral("auth")},
         {}},
    };
    return lista;
}

bool falha(QString* erro, const QString& texto) {
    if (erro) *erro = texto;
    return false;
}

// Reads "--nome valor", "--nome=valor" and switches into the request.
bool lerOpcoes(const Comando& comando, const QStringList& args, Pedido& pedido, QString* erro) {
    for (int i = 1; i < args.size(); ++i) {
        const QString& arg = args[i];
        if (!arg.startsWith(QStringLiteral("--"))) {
            return falha(erro, QStringLiteral("Argumento inesperado: ") + arg);
        }
        QString nome = arg.mid(2);
        std::optional<QString> valor;
        if (const int igual = nome.indexOf(QLatin1Char('=')); igual >= 0) {
            valor = nome.mid(igual + 1);
            nome = nome.left(igual);
        }
        if (comando.interruptores.contains(nome)) {
            if (valor) return falha(erro, QStringLiteral("A opção --%1 não leva valor.").arg(nome));
            pedido.opcoes.insert(nome, QStringLiteral("1"));
            continue;
        }
        if (!comando.obrigatorias.contains(nome) && !comando.facultativas.contains(nome)) {
            return falha(erro, QStringLiteral("A opção --%1 não se aplica ao comando %2.")
                                   .arg(nome, comando.nome));
        }
        if (!valor) {
            if (i + 1 >= args.size()) {
                return falha(erro, QStringLiteral("Falta o valor da opção --") + nome);
            }
            valor = args[++i];
        }
        pedido.opcoes.insert(nome, *valor);
    }
    return true;
}

}  // namespace

QString textoAjuda() {
    return QStringLiteral(
        "Utilização: brasel-admin <comando> [opções]\n"
        "\n"
        "Comandos:\n"
        "  create-login  Cria um login no servidor (ou dá-lhe uma nova password).\n"
        "                --server S --login L --password P [--sysadmin]\n"
        "                [--admin-login A --admin-password B]\n"
        "  create        Cria a base de dados de uma empresa com o esquema completo.\n"
        "                --server S --company CCCC --login L --password P [--name \"Nome\"]\n"
        "  upgrade       Acrescenta à empresa as tabelas e colunas em falta e regista a\n"
        "                versão deste programa.\n"
        "                --server S --company CCCC --login L --password P\n"
        "  demo          Carrega o restaurante de demonstração numa empresa vazia (cria a\n"
        "                empresa quando não existe).\n"
        "                --server S --company CCCC --login L --password P\n"
        "                [--demo-password D] [--name \"Nome\"]\n"
        "  check         Verifica uma empresa: versão, tabelas e colunas, linhas obrigatórias\n"
        "                e a configuração inicial.\n"
        "                --server S --company CCCC --login L --password P\n"
        "  generate-key  Gera uma chave de assinatura nova (para demonstração) no ficheiro F,\n"
        "                legível só pelo dono, e a sua metade pública em F.pub.pem.\n"
        "                --file F\n"
        "  verify-signatures\n"
        "                Verifica todas as cadeias de assinaturas dos documentos da empresa e\n"
        "                indica o primeiro documento que não confere em cada uma. Basta a chave\n"
        "                pública (PEM) ou, em alternativa, o ficheiro da chave.\n"
        "                --server S --company CCCC --login L --password P\n"
        "                (--public F.pub.pem | --key F)\n"
        "  add-server    Acrescenta o servidor à lista de empresas deste posto (ou actualiza\n"
        "                o seu login e password).\n"
        "                --server S [--login L --password P] [--auth SQL|WIN]\n"
        "\n"
        "Servidor (S): uma pasta ou \"sqlite:<pasta>\" para o motor embutido, ou\n"
        "\"postgresql://máquina[:porta]\" para um servidor PostgreSQL.\n"
        "Empresa (CCCC): quatro letras ou algarismos; a base de dados é Vendrola + CCCC.\n"
        "L e P são o login e a password de quem executa o comando; create e demo pedem um\n"
        "administrador do servidor. Numa pasta ainda sem logins, create e demo criam primeiro\n"
        "o login L, como administrador.\n"
        "Os utilizadores da demonstração (SUPERVISOR, ANA e RUI) ficam com a password D\n"
        "(por omissão, P).\n"
        "\n"
        "Saída: 0 sucesso, 1 falha, 2 utilização incorrecta.\n");
}

std::optional<Pedido> lerPedido(const QStringList& args, QString* erro) {
    Pedido pedido;
    if (args.isEmpty()) {
        falha(erro, QStringLiteral("Falta o comando."));
        return std::nullopt;
    }
    if (args.contains(QStringLiteral("--help")) || args.contains(QStringLiteral("-h")) ||
        args.first() == QStringLiteral("help")) {
        pedido.comando = QStringLiteral("help");
        return pedido;
    }
    pedido.comando = args.first();
    for (const Comando& comando : comandos()) {
        if (comando.nome != pedido.comando) continue;
        if (!lerOpcoes(comando, args, pedido, erro)) return std::nullopt;
        for (const QString& obrigatoria : comando.obrigatorias) {
            if (!pedido.tem(obrigatoria)) {
                falha(erro, QStringLiteral("Falta a opção --%1 do comando %2.")
                                .arg(obrigatoria, comando.nome));
                return std::nullopt;
            }
        }
        return pedido;
    }
    falha(erro, QStringLiteral("Comando desconhecido: ") + pedido.comando);
    return std::nullopt;
}

}  // namespace brasel::admin
