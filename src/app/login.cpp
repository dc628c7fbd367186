#include "app/login.h"

#include "app/arranque.h"
#include "app/carrega_parametros.h"
#include "app/definicoes_posto.h"
#include "app/login_supervisor.h"
#include "common/ediv.h"
#include "db/connections.h"
#include "db/query_helpers.h"

namespace brasel::app {

namespace {

const QString kLoginSuporte = QStringLiteral("QUORIL");

bool autenticacaoWindows(const Estado& estado) {
    return estado.gAutenticacao.trimmed().compare(QStringLiteral("WIN"), Qt::CaseInsensitive) == 0;
}

bool abrirComoUtilizador(Estado& estado, db::Connection& conn, const QString& nome,
                         const QString& password) {
    QString pw = password;
    return db::Abre_Connexao(conn, estado.gServidor, db::nomeBaseDados(estado.gEmpresa), nome, pw,
                             {}, estado.gAutenticacao, 0, 60);
}

// Logins are compared without regard to case, as the server compares them: the supervisor's
// row is stored as "Supervisor" and looked up as "SUPERVISOR".
QString codigoDoLogin(Estado& estado, const QString& nome) {
    return db::Select_Campo_str(estado, QStringLiteral("Utilizador"), QStringLiteral("Codigo"),
                                QStringLiteral("upper(Login)"), nome)
        .trimmed();
}

void insereUtilizador(Estado& estado, const QString& codigo, const QString& login,
                      const QString& password) {
    // An existing row refuses the insert, which is what is wanted.
    estado.gConn.exec(QStringLiteral("insert into Utilizador (Codigo, Login, Password, DataSys) "
                                     "values (?,?,?,?)"),
                      {codigo, login, password, db::Get_DataSysServer_InsertIntoSQL(estado)});
}

void avisaSeEmUso(Estado& estado, const QString& codigo, MessagePort& mensagens) {
    const auto linha = db::primeiraLinha(
        estado.gConn, QStringLiteral("select UsoPOS from Utilizador where Codigo=?"), {codigo});
    if (!linha || linha->value(0).toString().trimmed() != QStringLiteral("1")) return;
    mensagens.mensagem(
        QStringLiteral("Se este código não é o seu, deve sair do aplicativo, caso contrário, "
                       "sendo o seu, deve apenas\r\ndesbloquear na ficha de utilizadores!\r\n"
                       "O não cumprimento dos avisos anteriores pode gerar graves problemas nos "
                       "ficheiros!!!!"),
        Icone::Exclamacao, QStringLiteral("<< UTILIZADOR JÁ EM USO >>"));
}

}  // namespace

void fecharLigacoes(Estado& estado) {
    for (db::Connection* conn :
         {&estado.gConn, &estado.gConnContab, &estado.gConnAux, &estado.gConnLocks}) {
        db::Fecha_Conneccao(*conn);
    }
}

ResultadoLogin validarLogin(Estado& estado, const QString& nomeEscrito, const QString& password,
                            const FornecedorJanelas& janelas, MessagePort& mensagens) {
    const QString nome = nomeEscrito.trimmed().toUpper();
    // Nobody is logged in until this login succeeds.
    estado.gUtilizador.clear();
    // Without a name the server would take the operating-system user instead.
    if (nome.isEmpty()) {
        db::Fecha_Conneccao(estado.gConn);
        return ResultadoLogin::PasswordErrada;
    }

    // A server that cannot be asked is left alone: opening the company says the rest.
    if (nome == kLoginSupervisor && Ver_se_Existe_Login(estado, nome) == false &&
        !criarLoginSupervisor(estado, password, mensagens)) {
        return ResultadoLogin::Recusado;
    }
    if (!abrirComoUtilizador(estado, estado.gConn, nome, password))
        return ResultadoLogin::PasswordErrada;

    if (nome == kLoginSuporte)
        insereUtilizador(estado, QStringLiteral("00"), kLoginSuporte, QStringLiteral(""));
    if (nome == kLoginSupervisor && codigoDoLogin(estado, nome).isEmpty()) {
        insereUtilizador(estado, QStringLiteral("01"), QStringLiteral("Supervisor"),
                         EDiv::Encrypt(password));
    }
    const QString codigo = codigoDoLogin(estado, nome);
    if (codigo.isEmpty()) {
        mensagens.mensagem(QStringLiteral("O Utilizador ") + nome +
                               QStringLiteral(" Não está Criado Nesta Empresa!"),
                           Icone::Critico);
        db::Fecha_Conneccao(estado.gConn);
        return ResultadoLogin::Recusado;
    }
    avisaSeEmUso(estado, codigo, mensagens);

    if (!abrirComoUtilizador(estado, estado.gConnAux, nome, password) ||
        !abrirComoUtilizador(estado, estado.gConnLocks, nome, password)) {
        fecharLigacoes(estado);
        return ResultadoLogin::PasswordErrada;
    }
    estado.gUtilizador = codigo;
    CarregaParametros(estado, mensagens, posto::ConfigRest_CAIXA.ler());

    if (!acessoPrograma(estado, codigo, janelas)) {
        mensagens.mensagem(QStringLiteral("Acesso Negado ao Programa ") + kPrograma,
                           Icone::Critico);
        fecharLigacoes(estado);
        estado.gUtilizador.clear();
        return ResultadoLogin::Recusado;
    }
    estado.gConn.exec(QStringLiteral("update Utilizador set UsoPOS=1 where Codigo=?"), {codigo});
    posto::NomeUtilizador.gravar(nome);
    return ResultadoLogin::Entrou;
}

AberturaLogin prepararLogin(const Estado& estado, bool automatico) {
    AberturaLogin abertura;
    if (autenticacaoWindows(estado) && !WTS_NomeCliente().isEmpty()) {
        abertura.nome = WTS_NomeUtilizador();
        abertura.nomeBloqueado = true;
        abertura.entrarJa = automatico && !abertura.nome.trimmed().isEmpty();
        return abertura;
    }
    abertura.nome = posto::NomeUtilizador.ler();
    return abertura;
}

}  // namespace brasel::app
