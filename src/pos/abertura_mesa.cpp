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

// The tax region (TabIva.Zona) of every VAT code; a code without a row is in the region "".
QHash<QString, QString> ZonasIva(db::Connection& conn) {
    QHash<QString, QString> zonas;
    auto q = conn.exec(QStringLiteral("select codigo, Zona from TabIva"));
    while (q && q->next())
        zonas.insert(q->value(0).toString(), q->value(1).toString().trimmed());
    return zonas;
}

// Why a line of VAT table `iva` may not join the tab, "" when it may. Another region is told
// first: making room among the four tables would not let that line in.
QString razaoRecusa(const QStringList& ivas, const QString& iva,
                    const QHash<QString, QString>& zonas) {
    if (!Ver_Zonas_IVA_MovProduto_bln(ivas, iva, zonas))
        return QStringLiteral("IVA de Zonas Diferentes");
    if (!Ver_4_Ivas_MovProduto_bln(ivas, iva))
        return QStringLiteral("Atingido o Limite de quatro IVAS");
    return {};
}

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

bool Ver_4_Ivas_MovProduto_bln(const QStringList& ivasDaTab, const QString& iva) {
    return iva.isEmpty() || ivasDaTab.contains(iva) || ivasDaTab.size() < 4;
}

bool Ver_Zonas_IVA_MovProduto_bln(const QStringList& ivasDaTab, const QString& iva,
                                  const QHash<QString, QString>& zonas) {
    if (iva.isEmpty()) return true;
    const QString zona = zonas.value(iva);
    for (const QString& daTab : ivasDaTab)
        if (zonas.value(daTab) != zona) return false;
    return true;
}

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
    const QHash<QString, QString> zonas = ZonasIva(estado.gConn);
    QStringList recusadas;
    db::WriteTransaction transaccao(estado.gConn);
    if (!transaccao.active()) return {};
    for (const LinhaOutroUtilizador& l : linhas) {
        const QString razao = razaoRecusa(ivas, l.ivaTabela, zonas);
        if (!razao.isEmpty()) {
            recusadas << QStringLiteral("(") + l.codigo + QStringLiteral(") -> ") + razao;
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
