#include "app/menu_principal.h"

#include "app/carrega_parametros.h"
#include "app/definicoes_posto.h"
#include "app/verifica_configuracao.h"
#include "db/query_helpers.h"

namespace brasel::app {

bool carregarMenuPrincipal(Estado& estado, MessagePort& mensagens) {
    CarregaParametros(estado, mensagens, posto::ConfigRest_CAIXA.ler());
    if (!db::primeiraLinha(estado.gConn, QStringLiteral("select 1 from paramgeral limit 1"))) {
        mensagens.mensagem(QStringLiteral("Empresa não está devidamente configurada!"),
                           Icone::Critico);
        return false;
    }
    VerificaConfiguracaoInicial(estado, mensagens);
    estado.gImpTalaoCozinha = posto::ConfigRest_ImpTalaoCozinha.ler();
    estado.gNivelEmenta = posto::NivelEmenta.ler();
    estado.gCaixaDinheiro = posto::ConfigRest_CaixaDinheiro.ler();
    if (const auto linha = db::primeiraLinha(
            estado.gConn, QStringLiteral("select Login from Utilizador where Codigo=?"),
            {estado.gUtilizador})) {
        estado.gNomeUtilizador = linha->value(0).toString().trimmed();
    }
    return true;
}

bool alteraCaixaPermitido(Estado& estado) {
    const auto linha = db::primeiraLinha(
        estado.gConn, QStringLiteral("select AltCaixa from UtilConfGeral where Utilizador=?"),
        {estado.gUtilizador});
    return linha && linha->value(0).toString().trimmed() == QStringLiteral("1");
}

QStringList paineisBarraEstado(const Estado& estado, const QDate& hoje) {
    return {estado.gNomeEmpresa, hoje.toString(QStringLiteral("dd-MM-yyyy")),
            estado.gNomeUtilizador + QStringLiteral(" - ") + estado.gUtilizador,
            QStringLiteral("Arm.-> ") + estado.gArmazem, QStringLiteral("Cx.-> ") + estado.gCaixa};
}

void fecharMenuPrincipal(Estado& estado) {
    if (estado.gConn.isOpen()) {
        estado.gConn.exec(QStringLiteral("update Utilizador set UsoPOS=0 where Codigo=?"),
                          {estado.gUtilizador});
    }
    for (db::Connection* conn :
         {&estado.gConn, &estado.gConnContab, &estado.gConnAux, &estado.gConnLocks}) {
        conn->close();
    }
}

}  // namespace brasel::app
