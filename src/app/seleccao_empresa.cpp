#include "app/seleccao_empresa.h"

#include "app/actualizador.h"
#include "app/definicoes_posto.h"
#include "app/importa_empresas.h"
#include "app/verifica_versao.h"
#include "common/cls_encripta.h"
#include "db/connections.h"
#include "db/query_helpers.h"

namespace brasel::app {

namespace {

// Val(): "", or text that is not a number, counts as 0.
bool empresaConvertida(Estado& estado) {
    const QString valor = db::Select_Campo_str(estado, QStringLiteral("ParamGeral"),
                                               QStringLiteral("ConverteuNVARCHAR"), {}, {});
    bool ok = false;
    const double numero = valor.trimmed().toDouble(&ok);
    return ok && numero != 0;
}

}  // namespace

QList<LinhaEmpresa> listarEmpresas(const QString& filtroNome, const QString& filtroAno,
                                   const QString& linhaComando) {
    importarEmpresasIniciais(linhaComando);
    QList<LinhaEmpresa> linhas;
    for (const EntradaServidor& e : lerServidores()) {
        if (!e.emUso()) continue;
        linhas += Empresa_Validacoes::Carregar_Empresas_LVW(e.servidor.trimmed(), e.login,
                                                            e.passwordCifrada, e.tipoAutenticacao,
                                                            filtroNome, filtroAno);
    }
    return linhas;
}

QList<int> procurarEmpresas(const QList<LinhaEmpresa>& linhas, const QString& texto) {
    const QString procurado = texto.trimmed();
    QList<int> encontradas;
    for (int i = 0; i < linhas.size(); ++i) {
        if (linhas[i].codigo.contains(procurado, Qt::CaseInsensitive) ||
            linhas[i].nome.contains(procurado, Qt::CaseInsensitive)) {
            encontradas.append(i);
        }
    }
    return encontradas;
}

ResultadoEmpresa entrarEmpresa(Estado& estado, const LinhaEmpresa& linha, MessagePort& mensagens) {
    estado.gEmpresa = linha.codigo;
    estado.gNomeEmpresa = linha.nome;
    estado.gServidor = linha.servidor;
    estado.gLogin = linha.login;
    estado.gPassword =
        clsEncripta::Desencripta(0, clsEncripta::chaveEmpresas(), linha.passwordCifrada);
    estado.gAutenticacao = linha.autenticacao;

    const bool versaoAceite = VerificaVersaoBD(estado, mensagens);
    ProcessaActualizacoes(estado.config.pastaActualizacoes, mensagens);

    QString password = estado.gPassword;
    if (!db::Abre_Connexao(estado.gConn, estado.gServidor, db::nomeBaseDados(estado.gEmpresa),
                           estado.gLogin, password, {}, estado.gAutenticacao, 120, 60)) {
        mensagens.mensagem(QStringLiteral("Não foi possível a ligação à Empresa ") +
                               estado.gEmpresa + QStringLiteral("!"),
                           Icone::Critico);
        return ResultadoEmpresa::Ficar;
    }
    // A refused version has already said why: checking again would only repeat it.
    if (!versaoAceite) {
        db::Fecha_Conneccao(estado.gConn);
        return ResultadoEmpresa::Ficar;
    }
    if (!empresaConvertida(estado)) {
        mensagens.mensagem(
            QStringLiteral("Não pode entrar nesta Empresa porque ainda não foi convertida!"),
            Icone::Critico);
        db::Fecha_Conneccao(estado.gConn);
        return ResultadoEmpresa::Ficar;
    }
    if (!VerificaVersaoBD(estado, mensagens)) {
        db::Fecha_Conneccao(estado.gConn);
        return ResultadoEmpresa::Ficar;
    }
    return ResultadoEmpresa::Login;
}

}  // namespace brasel::app
