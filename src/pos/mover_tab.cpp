#include "pos/mover_tab.h"

#include "pos/abertura_mesa.h"
#include "pricing/leitura.h"

namespace brasel::pos {

namespace {

const QString kTituloAtencao = QStringLiteral("A T E N Ç Ã O !");
const QString kApenasPronto = QStringLiteral("Cliente apenas de Vendas a Pronto\r\n");

}  // namespace

bool MudarMesa(Tab& tab, PerguntasTab& perguntas) {
    if (!tab.temMesaETipo() || !tab.CarregarDoc(0) || tab.lista().linhas.empty()) return false;
    const std::optional<QString> escolhida = perguntas.mesa();
    if (!escolhida || escolhida->isEmpty() || *escolhida == tab.mesa().codigo) return false;
    const auto r = tab.estado().gConn.firstRow(
        QStringLiteral("select Diversos,TipoCli from Clientes where Codigo=?"), {*escolhida});
    if (!r) return false;
    MesaTab destino;
    destino.diversos = pricing::ligado(r->value(0));
    destino.tipoCli = r->value(1).toString().trimmed();
    if (destino.apenasPronto() && tab.tipo().afectaCli != u"S+") {
        tab.mensagens().mensagem(
            kApenasPronto + QStringLiteral("Não pode Alterar para este Cliente!"), Icone::Critico,
            kTituloAtencao);
        return false;
    }
    if (tab.mensagens().confirmar(QStringLiteral("Transportar Produtos?"))) {
        if (!tab.estado().gConn.exec(QStringLiteral("update MovProduto set Terceiro=? where ") +
                                         QString::fromLatin1(kCondicaoTab),
                                     {*escolhida, tab.mesa().codigo, tab.tipo().codigo,
                                      pricing::textoSql(tab.utilizador())}))
            return false;
    }
    AbrirMesa(tab, *escolhida);
    return true;
}

bool MudarTipo(Tab& tab, PerguntasTab& perguntas) {
    if (tab.mesa().codigo.isEmpty()) return false;
    const std::optional<QString> escolhido = perguntas.tipoMovimento();
    if (!escolhido || escolhido->isEmpty()) return false;
    const auto r = tab.estado().gConn.firstRow(
        QStringLiteral("select AfectaCli,AfectaSTK,AfectaCaixa from TabTipoMov where codigo=?"),
        {*escolhido});
    if (!r) return false;
    const QString afectaCli = r->value(0).toString();
    if (tab.mesa().apenasPronto() && afectaCli != u"S+" && afectaCli != u"S-" &&
        afectaCli != u"NA") {
        tab.mensagens().mensagem(
            kApenasPronto +
                QStringLiteral("Não pode aplicar este tipo de Movimento a este Cliente!"),
            Icone::Critico, kTituloAtencao);
        return false;
    }
    if (!tab.tipo().codigo.isEmpty() &&
        tab.mensagens().confirmar(QStringLiteral("Transportar Produtos?"))) {
        if (!tab.estado().gConn.exec(
                QStringLiteral("update MovProduto set Tipo=?,AfectaCli=?,AfectaStk=?,Caixa=? "
                               "where ") +
                    QString::fromLatin1(kCondicaoTab),
                {*escolhido, afectaCli, r->value(1).toString(), r->value(2).toString(),
                 tab.mesa().codigo, tab.tipo().codigo, pricing::textoSql(tab.utilizador())}))
            return false;
    }
    tab.definirTipo(*escolhido);
    return true;
}

}  // namespace brasel::pos
