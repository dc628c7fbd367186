#include "app/verifica_versao.h"

#include "common/versao.h"
#include "db/connections.h"
#include "db/query_helpers.h"
#include "db/sysadmin.h"

namespace brasel::app {

namespace {

const QString kRequerActualizacao = QStringLiteral(
    "A Versão do Aplicativo Requer que seja efectuada a Actualização de Base de Dados!");

struct Leitura {
    ComparacaoVersao comparacao;
    bool sysAdmin;
};

Leitura lerVersao(db::Sessao& sessao) {
    db::Connection conn;
    if (!db::Abre_Connexao_Local(sessao, conn, 30, 60))
        return {ComparacaoVersao::SemLigacao, false};
    const auto linha =
        db::primeiraLinha(conn, QStringLiteral("select Versao from Actualiza limit 1"));
    const QString versao = linha ? linha->value(0).toString().trimmed() : QString();
    const QString programa = versaoTexto12();
    ComparacaoVersao comparacao = ComparacaoVersao::Igual;
    if (versao.isEmpty()) {
        comparacao = ComparacaoVersao::SemVersao;
    } else if (versao > programa) {
        comparacao = ComparacaoVersao::BaseMaisNova;
    } else if (versao < programa) {
        comparacao = ComparacaoVersao::ProgramaMaisNovo;
    }
    const bool sysAdmin =
        comparacao == ComparacaoVersao::ProgramaMaisNovo && db::loginSysAdmin(conn);
    return {comparacao, sysAdmin};
}

}  // namespace

ComparacaoVersao compararVersaoBD(db::Sessao& sessao) {
    return lerVersao(sessao).comparacao;
}

bool VerificaVersaoBD(db::Sessao& sessao, MessagePort& mensagens) {
    const Leitura leitura = lerVersao(sessao);
    switch (leitura.comparacao) {
        case ComparacaoVersao::Igual:
            return true;
        case ComparacaoVersao::SemLigacao:
            return false;
        case ComparacaoVersao::SemVersao:
            mensagens.mensagem(kRequerActualizacao, Icone::Exclamacao);
            return false;
        case ComparacaoVersao::BaseMaisNova:
            mensagens.mensagem(QStringLiteral("A Versão do Aplicativo Encontra-se Desactualizada!"),
                               Icone::Exclamacao);
            mensagens.mensagem(
                QStringLiteral("A Versão deste Aplicativo é [") + versaoComPontos() +
                    QStringLiteral(
                        "].\r\nPesquise na Gestão de Actualizações Automáticas (Renovix),"
                        "\r\npor Opções\\Actualizações do Serviço ou Reinicie o seu "
                        "Computador."),
                Icone::Informacao);
            return false;
        case ComparacaoVersao::ProgramaMaisNovo:
            mensagens.mensagem(kRequerActualizacao, Icone::Exclamacao);
            mensagens.mensagem(
                leitura.sysAdmin
                    ? QStringLiteral("Na Selecção de Empresas\rRecomendamos que Actualize Todas as "
                                     "Bases de Dados:, Execute Utilitários -> Actualizar Todas as "
                                     "Empresas.")
                    : QStringLiteral("Contacte o Administrador do Sistema antes de Operar."),
                Icone::Informacao);
            return false;
    }
    return false;
}

}  // namespace brasel::app
