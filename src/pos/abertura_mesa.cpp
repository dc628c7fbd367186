#include "pos/abertura_mesa.h"

#include "app/registo_log.h"
#include "devices/mostra_no_display.h"
#include "pricing/leitura.h"

namespace brasel::pos {

namespace {

const QString kOutrosUtilizadores = QStringLiteral(
    "CliFor='C' and Terceiro=? and Tipo=? and Numero='' and Fechado='N' and "
    "Utilizador<>?");

struct LinhaOutroUtilizador {
    qint64 numRegisto = 0;
    QString codigo;
    QString utilizador;
    QString ivaTabela;
};

// The distinct VAT tables of the user's open lines on the tab's table and type.
QStringList IvasDaTab(Tab& tab) {
    QStringList ivas;
    auto q = tab.estado().gConn.exec(
        QStringLiteral("select distinct IvaTabela from MovProduto where ") +
            QString::fromLatin1(kCondicaoTab) + QStringLiteral(" and IvaTabela<>''"),
        {tab.mesa().codigo, tab.tipo().codigo, pricing::textoSql(tab.utilizador())});
    while (q && q->next())
        ivas << q->value(0).toString();
    return ivas;
}

}  // namespace

QStringList TransfereLinhasOutrosUtilizadores(Tab& tab) {
    app::Estado& estado = tab.estado();
    const QVariantList chave{tab.mesa().codigo, tab.tipo().codigo,
                             pricing::textoSql(tab.utilizador())};
    if (!estado.gConn.firstRow(QStringLiteral("select NumRegisto from MovProduto where ") +
                                   kOutrosUtilizadores +
                                   QStringLiteral(" order by NumRegisto limit 1"),
                               chave))
        return {};
    if (!tab.mensagens().confirmar(QStringLiteral("Cliente/Mesa já Aberta por outro Utilizador.") +
                                   QStringLiteral("\r\nDeseja passar para o seu?")))
        return {};

    std::vector<LinhaOutroUtilizador> linhas;
    auto q = estado.gConn.exec(
        QStringLiteral("select NumRegisto,Codigo,Utilizador,IvaTabela from MovProduto where ") +
            kOutrosUtilizadores + QStringLiteral(" order by NumRegisto"),
        chave);
    if (!q) return {};
    while (q->next())
        linhas.push_back({q->value(0).toLongLong(), q->value(1).toString(), q->value(2).toString(),
                          q->value(3).toString()});
    q.reset();

    QStringList ivas = IvasDaTab(tab);
    QStringList recusadas;
    db::WriteTransaction transaccao(estado.gConn);
    if (!transaccao.active()) return {};
    for (const LinhaOutroUtilizador& l : linhas) {
        if (!l.ivaTabela.isEmpty() && !ivas.contains(l.ivaTabela) && ivas.size() >= 4) {
            recusadas << QStringLiteral("(") + l.codigo +
                             QStringLiteral(") -> Atingido o Limite de quatro IVAS");
            continue;
        }
        if (!estado.gConn.exec(
                QStringLiteral("update MovProduto set Utilizador=? where NumRegisto=?"),
                {pricing::textoSql(tab.utilizador()), l.numRegisto}))
            return {};
        if (!l.ivaTabela.isEmpty() && !ivas.contains(l.ivaTabela)) ivas << l.ivaTabela;
        db::EntradaLog entrada;
        entrada.modulo = QStringLiteral("FC");
        entrada.accao = QStringLiteral("A");
        entrada.observa = QStringLiteral("Facturação de Clientes REST");
        entrada.descricao = QStringLiteral("Mudança de Produto Util. (") + l.utilizador +
                            QStringLiteral(") para (") + tab.utilizador() + QStringLiteral(")");
        entrada.produto = l.codigo;
        entrada.terceiro = tab.mesa().codigo;
        app::RegistaLogGeral(estado, entrada);
    }
    if (!transaccao.commit()) return {};
    if (!recusadas.isEmpty()) {
        tab.mensagens().mensagem(QStringLiteral("Não foi possível passar todos os Produtos:\r\n") +
                                     recusadas.join(QStringLiteral("\r\n")),
                                 Icone::Exclamacao);
    }
    return recusadas;
}

InicioFacturacao ValoresIniciais(app::Estado& estado) {
    InicioFacturacao inicio;
    const auto r = estado.gConn.firstRow(
        QStringLiteral("select VendaPronto,MostraCliDiverso from UtilConfGeral where utilizador=?"),
        {pricing::textoSql(estado.gUtilizador)});
    if (!r) return inicio;
    inicio.tipo = r->value(0).toString();
    if (pricing::ligado(r->value(1))) inicio.mesa = estado.param.clidiversos;
    return inicio;
}

bool AbrirMesa(Tab& tab, const QString& codigo) {
    tab.edicaoLivre = true;
    if (!tab.lerMesa(codigo)) {
        tab.limparMesa();
        devices::MostraNoDisplay(tab.estado(), tab.linhaSerie(),
                                 QString::fromLatin1(kDisplayProximoCliente));
        return false;
    }
    if (!tab.tipo().codigo.isEmpty()) TransfereLinhasOutrosUtilizadores(tab);
    tab.CarregarDoc(0);
    tab.ConfigUtil();
    if (tab.mesa().jaImprimiuTalao) tab.edicaoLivre = false;
    return true;
}

}  // namespace brasel::pos
