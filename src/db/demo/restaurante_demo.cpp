// The demo restaurant: its general parameters, devices, users and their settings, and the load
// of every piece in one transaction.
#include "db/demo/restaurante_demo.h"

#include "common/ediv.h"
#include "db/demo/partes_demo.h"
#include "db/schema/definicao.h"

#include <QDate>
#include <QDateTime>

namespace brasel::db::demo {

namespace {

const QString kImpressora = QStringLiteral("EP1");
const QString kDisplay = QStringLiteral("DP1");

void escreveParametros(Escritor& e, const QString& nomeEmpresa) {
    const QDate hoje = QDate::currentDate();
    Campos campos{
        {QStringLiteral("NomeEmpresa"), nomeEmpresa},
        {QStringLiteral("Ano"), QString::number(hoje.year())},
        {QStringLiteral("mes"), QStringLiteral("%1").arg(hoje.month(), 2, 10, QLatin1Char('0'))},
        {QStringLiteral("cambiodef"), QStringLiteral("EUR")},
        {QStringLiteral("cambioeuro"), QStringLiteral("EUR")},
        {QStringLiteral("casadec"), 2},
        {QStringLiteral("casadecpreco"), 3},
        {QStringLiteral("casadecquant"), 3},
        {QStringLiteral("casadecquantOutUni"), 3},
        {QStringLiteral("Clidiversos"), kConsumidorFinal},
        {QStringLiteral("armazem"), kArmazem},
        {QStringLiteral("registosVisualizar"), 500},
        {QStringLiteral("GridLine"), 1},
        {QStringLiteral("ImpCabecalhos"), 1},
        {QStringLiteral("FormulaPrecoMedioCusto"), 1},
        {QStringLiteral("ConverteuNVARCHAR"), 1},
        {QStringLiteral("banarre"), 1},
        {QStringLiteral("bandec"), 2}};
    // Every amount of every kind of document rounds to the nearest cent.
    const QStringList caixa = {QStringLiteral("mergeral"), QStringLiteral("descgeral"),
                               QStringLiteral("ivageral"), QStringLiteral("totalgeral")};
    for (const QString& prefixo : {QStringLiteral("cli"), QStringLiteral("for")}) {
        for (const QString& sufixo : schema::sufixosArredondamento()) {
            campos.append({prefixo + QStringLiteral("arre") + sufixo, 1});
            campos.append({prefixo + QStringLiteral("dec") + sufixo, 2});
        }
    }
    for (const QString& sufixo : caixa) {
        campos.append({QStringLiteral("caiarre") + sufixo, 1});
        campos.append({QStringLiteral("caidec") + sufixo, 2});
    }
    e.actualizar(QStringLiteral("ParamGeral"), campos);
}

void escreveDispositivos(Escritor& e) {
    // An 80 mm ESC/POS printer on COM1 with the Portuguese code page (860) and a drawer on it.
    e.inserir(QStringLiteral("ImpTaloes"),
              {{QStringLiteral("Codigo"), kImpressora},
               {QStringLiteral("Descricao"), QStringLiteral("Impressora de talões ESC/POS 80 mm")},
               {QStringLiteral("COM"), QStringLiteral("1")},
               {QStringLiteral("abrircaixa"), QStringLiteral("27+112+0+25+250")},
               {QStringLiteral("feednlines"), QStringLiteral("27+100")},
               {QStringLiteral("small_on"), QStringLiteral("27+33+1")},
               {QStringLiteral("medium_on"), QStringLiteral("27+33+16")},
               {QStringLiteral("large_on"), QStringLiteral("27+33+48")},
               {QStringLiteral("large_off"), QStringLiteral("27+33+0")},
               {QStringLiteral("corte"), QStringLiteral("29+86+66+0")},
               {QStringLiteral("cor0"), QStringLiteral("27+114+0")},
               {QStringLiteral("cor1"), QStringLiteral("27+114+1")},
               {QStringLiteral("reset"), QStringLiteral("27+64")},
               {QStringLiteral("setinternationalCHR"), QStringLiteral("27+116+3")}});
    // A two-line, 20-column customer display on COM2.
    e.inserir(QStringLiteral("TabDisplay"),
              {{QStringLiteral("Codigo"), kDisplay},
               {QStringLiteral("Descricao"), QStringLiteral("Mostrador de cliente 2x20")},
               {QStringLiteral("Porta"), 2},
               {QStringLiteral("NumLetras"), 20},
               {QStringLiteral("Limpa"), QStringLiteral("12")},
               {QStringLiteral("InitMostrador"), QStringLiteral("27+64")},
               {QStringLiteral("InitLinha1"), QStringLiteral("27+81+65")},
               {QStringLiteral("FimLinha1"), QStringLiteral("13")},
               {QStringLiteral("InitLinha2"), QStringLiteral("27+81+66")},
               {QStringLiteral("FimLinha2"), QStringLiteral("13")},
               {QStringLiteral("Alinha1"), 2},
               {QStringLiteral("Alinha2"), 0}});
}

// The table codes a user sees, each in a slot of ten characters and a separator.
QString clientesDiv(const QStringList& mesas) {
    QStringList slots;
    for (const QString& mesa : mesas)
        slots << mesa.leftJustified(10, QLatin1Char(' '));
    return slots.join(QLatin1Char(';'));
}

void escreveUtilizador(Escritor& e, const UtilizadorDemo& u, const QString& password) {
    const QString agora =
        QDateTime::currentDateTime().toString(QStringLiteral("yyyy-MM-dd HH:mm:ss"));
    e.inserir(QStringLiteral("Utilizador"), {{QStringLiteral("Codigo"), u.codigo},
                                             {QStringLiteral("Login"), u.login},
                                             {QStringLiteral("Password"), EDiv::Encrypt(password)},
                                             {QStringLiteral("DataSys"), agora},
                                             {QStringLiteral("UsoPOS"), 0}});
    e.inserir(QStringLiteral("TabVendedor"),
              {{QStringLiteral("Codigo"), u.codigo}, {QStringLiteral("Descricao"), u.nome}});
    // The supervisor works the counter with every table and the scale; the waiters share the
    // terrace and each keeps half of the dining room.
    QStringList mesas = mesasSala();
    if (u.codigo == QStringLiteral("02")) mesas = mesas.mid(0, 10);
    if (u.codigo == QStringLiteral("03")) mesas = mesas.mid(10);
    mesas << mesasEsplanada();
    const int sup = u.supervisor ? 1 : 0;
    e.inserir(QStringLiteral("UtilConfGeral"),
              {{QStringLiteral("utilizador"), u.codigo},
               {QStringLiteral("armazem"), kArmazem},
               {QStringLiteral("caixa"), kCaixa},
               {QStringLiteral("tipofac"), kVendaDinheiro},
               {QStringLiteral("VariosPagaComo"), 1},
               {QStringLiteral("AltCaixa"), sup},
               {QStringLiteral("TipoImpTalao"), kImpressora},
               {QStringLiteral("imptotal"), 1},
               {QStringLiteral("impivas"), 1},
               {QStringLiteral("IvaIncluido"), 1},
               {QStringLiteral("SaltaLinhas"), 5},
               {QStringLiteral("PausaImpressao"), 0},
               {QStringLiteral("DecimaisImpTaloes"), 2},
               {QStringLiteral("CaixaDinheiroPorDrive"), 0},
               {QStringLiteral("UsaDisplay"), 1},
               {QStringLiteral("CodigoDisplay"), kDisplay},
               {QStringLiteral("PortaTalao"), QStringLiteral("COM")},
               {QStringLiteral("ImpTalaoViasTipoMov"), 0},
               {QStringLiteral("VendaPronto"), kVendaDinheiro},
               {QStringLiteral("VendaCredito"), kFactura},
               {QStringLiteral("DVendaPronto"), kDevolucaoDinheiro},
               {QStringLiteral("DVendaCredito"), kNotaCredito},
               {QStringLiteral("MostraCliDiverso"), sup},
               {QStringLiteral("ClientesDiv"), clientesDiv(mesas)},
               {QStringLiteral("ActivaLogGeral"), 1},
               {QStringLiteral("Precario"), QStringLiteral("C")},
               {QStringLiteral("PVP"), 1},
               {QStringLiteral("Descontos"), QStringLiteral("C")},
               {QStringLiteral("Desconto1"), 1},
               {QStringLiteral("Desconto2"), 2},
               {QStringLiteral("Desconto3"), 3},
               {QStringLiteral("VendDef"), QStringLiteral("U")},
               {QStringLiteral("vendedorUtil"), u.codigo},
               {QStringLiteral("DescGERAL"), QStringLiteral("D")},
               {QStringLiteral("AltTipoMov"), QString::number(sup)},
               {QStringLiteral("Impressora"), QStringLiteral("T")},
               {QStringLiteral("TemBalanca"), sup},
               {QStringLiteral("LancaSemContribuinte"), 1},
               {QStringLiteral("MostrarFormFechaDoc"), 1},
               {QStringLiteral("MostrarFormCliDiversos"), 1},
               {QStringLiteral("abrecaixa"), 1},
               {QStringLiteral("Obs1"), QStringLiteral("Obrigado pela sua visita!")},
               {QStringLiteral("Obs2"), QStringLiteral("Volte sempre.")}});
    if (!u.supervisor) {
        e.inserir(QStringLiteral("Acessos"),
                  {{QStringLiteral("utilizador"), u.codigo},
                   {QStringLiteral("chave"), QStringLiteral("Brasel")},
                   {QStringLiteral("value"), 1},
                   {QStringLiteral("caption"), QStringLiteral("Brasel")}});
    }
}

}  // namespace

QList<UtilizadorDemo> utilizadoresDemo() {
    return {
        {QStringLiteral("01"), QStringLiteral("SUPERVISOR"), QStringLiteral("Supervisor"), true},
        {QStringLiteral("02"), QStringLiteral("ANA"), QStringLiteral("Ana Martins"), false},
        {QStringLiteral("03"), QStringLiteral("RUI"), QStringLiteral("Rui Fonseca"), false}};
}

QString nomeRestauranteDemo() {
    return QStringLiteral("Restaurante Tasca do Largo");
}

bool empresaComDados(Connection& conn) {
    for (const char* tabela : {"Produtos", "Clientes", "Utilizador"}) {
        if (conn.firstRow(QStringLiteral("select 1 from %1 limit 1").arg(QLatin1String(tabela)))) {
            return true;
        }
    }
    return false;
}

bool carregarRestauranteDemo(Connection& conn, const QString& passwordUtilizadores,
                             const QString& nomeEmpresa, QString* erro) {
    auto falha = [&](const QString& texto) {
        if (erro) *erro = texto;
        return false;
    };
    if (empresaComDados(conn)) {
        return falha(QStringLiteral(
            "A empresa já tem produtos, clientes ou utilizadores: o restaurante de demonstração "
            "só se carrega numa empresa vazia."));
    }
    WriteTransaction transaccao(conn);
    if (!transaccao.active()) return falha(conn.lastError());
    const QString nome = nomeEmpresa.trimmed().isEmpty() ? nomeRestauranteDemo() : nomeEmpresa;
    Escritor e(conn);
    escreveParametros(e, nome);
    escreveSala(e, nome);
    escreveEmenta(e);
    escreveDocumentos(e);
    escreveDispositivos(e);
    for (const UtilizadorDemo& u : utilizadoresDemo())
        escreveUtilizador(e, u, passwordUtilizadores);
    if (!e.ok()) return falha(e.erro());
    if (!transaccao.commit()) return falha(conn.lastError());
    return true;
}

}  // namespace brasel::db::demo
