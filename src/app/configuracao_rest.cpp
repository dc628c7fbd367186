#include "app/configuracao_rest.h"

#include "app/definicoes_posto.h"
#include "db/query_helpers.h"

namespace brasel::app {

namespace {

QString porta(const QString& valor) {
    return kPortasImpressora.contains(valor) ? valor : QString();
}

}  // namespace

ConfiguracaoRest ConfiguracaoRest::ler(const QString& utilizador) {
    ConfiguracaoRest c;
    c.caixa = posto::ConfigRest_CAIXA.ler();
    c.fonte = posto::ConfigRest_Font.ler();
    c.imagemFundo = posto::ConfigRest_BotaoIMG.ler();
    c.impCozinha = posto::ConfigRest_ImpTalaoCozinha.ler();
    c.impCozinhaPorta = porta(posto::ConfigRest_ImpTalaoCozinhaPorta.ler());
    c.impCozinhaNome = posto::ConfigRest_ImpTalaoCozinhaNome.ler();
    c.impBar = posto::ConfigRest_ImpTalaoBar.ler();
    c.impBarPorta = porta(posto::ConfigRest_ImpTalaoBarPorta.ler());
    c.tempoCozinha = posto::ConfigRest_TempoImpTalaoCozinha.ler();
    c.caixaDinheiro = posto::ConfigRest_CaixaDinheiro.ler();
    c.precoIncBrowse = posto::ConfigRest_PrecoIncBrowse.ler();
    c.pedePassword = posto::ConfigRest_PedePWD.ler();
    c.desactivaPassword = posto::ConfigRest_DesactivaPassword.ler();
    c.activaProdutosFacturaREST = posto::ConfigRest_ActivaProdutosFacturaREST.ler();
    c.limpaDocAposFechaDoc = posto::ConfigRest_LimpaDocAposFechaDoc.ler();
    c.nivelEmenta = posto::NivelEmenta.ler();
    c.tipoImprimeMesa = posto::TipoImprimeMesa.ler();
    c.corFundo = posto::JanBackColor.ler(utilizador);
    return c;
}

bool ConfiguracaoRest::gravar(const QString& utilizador) const {
    const bool escritas[] = {
        posto::ConfigRest_CAIXA.gravar(caixa),
        posto::ConfigRest_Font.gravar(fonte),
        posto::ConfigRest_BotaoIMG.gravar(imagemFundo),
        posto::ConfigRest_ImpTalaoCozinha.gravar(impCozinha),
        posto::ConfigRest_ImpTalaoCozinhaPorta.gravar(porta(impCozinhaPorta)),
        posto::ConfigRest_ImpTalaoCozinhaNome.gravar(impCozinhaNome),
        posto::ConfigRest_ImpTalaoBar.gravar(impBar),
        posto::ConfigRest_ImpTalaoBarPorta.gravar(porta(impBarPorta)),
        posto::ConfigRest_TempoImpTalaoCozinha.gravar(tempoCozinha),
        posto::ConfigRest_CaixaDinheiro.gravar(caixaDinheiro),
        posto::ConfigRest_PrecoIncBrowse.gravar(precoIncBrowse),
        posto::ConfigRest_PedePWD.gravar(pedePassword),
        posto::ConfigRest_DesactivaPassword.gravar(desactivaPassword),
        posto::ConfigRest_ActivaProdutosFacturaREST.gravar(activaProdutosFacturaREST),
        posto::ConfigRest_LimpaDocAposFechaDoc.gravar(limpaDocAposFechaDoc),
        posto::NivelEmenta.gravar(nivelEmenta),
        posto::TipoImprimeMesa.gravar(tipoImprimeMesa),
        posto::JanBackColor.gravar(utilizador, corFundo),
    };
    for (bool ok : escritas) {
        if (!ok) return false;
    }
    return true;
}

db::Condicao filtroTipoImprimeMesa() {
    const QString na = QStringLiteral("NA");
    return {QStringLiteral(" and TabTipoMov.Modulo=? and TabTipoMov.AfectaCli=? and "
                           "TabTipoMov.AfectaSTK=? and TabTipoMov.AfectaCaixa=? and "
                           "TabTipoMov.AfectaBan=? "),
            {QStringLiteral("FC"), na, na, na, na}};
}

std::optional<QString> descricaoCodigo(Estado& estado, CodigoConfiguracao tabela,
                                       const QString& codigo) {
    const QString chave = codigo.trimmed();
    if (chave.isEmpty()) return QString();
    QString sql;
    db::Condicao filtro;
    switch (tabela) {
        case CodigoConfiguracao::Caixa:
            sql = QStringLiteral("select Descricao from Caixas where Codigo=?");
            break;
        case CodigoConfiguracao::ImpressoraTalao:
            sql = QStringLiteral("select Descricao from ImpTaloes where Codigo=?");
            break;
        case CodigoConfiguracao::TipoImprimeMesa:
            sql = QStringLiteral("select Descricao from TabTipoMov where codigo=?");
            filtro = filtroTipoImprimeMesa();
            break;
    }
    const auto linha =
        db::primeiraLinha(estado.gConn, sql + filtro.sql, QVariantList{chave} + filtro.valores);
    if (!linha) return std::nullopt;
    return linha->value(0).isNull() ? QString() : linha->value(0).toString().trimmed();
}

void aplicaConfiguracao(Estado& estado, const ConfiguracaoRest& configuracao) {
    estado.gImpTalaoCozinha = configuracao.impCozinha;
    estado.gCaixaDinheiro = configuracao.caixaDinheiro;
    estado.gNivelEmenta = posto::NivelEmenta.ler();
}

}  // namespace brasel::app
