#include "pos/mesas.h"

#include "pricing/leitura.h"

namespace brasel::pos {

namespace {
constexpr int kTamanhoSlot = 11;
constexpr int kTamanhoCodigo = 10;
}  // namespace

QStringList MesasDoUtilizador(const QString& ClientesDiv) {
    // The length over 11 is never a half, so rounding to nearest is adding half a slot.
    const int slots = static_cast<int>((ClientesDiv.size() + kTamanhoSlot / 2) / kTamanhoSlot);
    QStringList codigos;
    for (int i = 0; i < slots; ++i) {
        const QString codigo = ClientesDiv.mid(i * kTamanhoSlot, kTamanhoCodigo).trimmed();
        if (!codigo.isEmpty()) codigos << codigo;
    }
    return codigos;
}

std::vector<BotaoMesa> CarregarClientes(app::Estado& estado) {
    std::vector<BotaoMesa> botoes;
    const auto conf = estado.gConn.firstRow(
        QStringLiteral("select ClientesDiv from UtilConfGeral where utilizador=?"),
        {pricing::textoSql(estado.gUtilizador)});
    if (!conf) return botoes;
    for (const QString& codigo : MesasDoUtilizador(conf->value(0).toString())) {
        const auto r = estado.gConn.firstRow(
            QStringLiteral("select Descricao,JaImprimiuTalao,fotoNormal,fotoCompleta from Clientes "
                           "where Codigo=?"),
            {codigo});
        if (!r) continue;
        BotaoMesa b;
        b.codigo = codigo;
        b.caption = r->value(0).toString();
        if (r->value(1).toInt() == 1) b.caption += QStringLiteral(" [$]");
        b.fotoNormal = r->value(2).toByteArray();
        b.fotoCompleta = r->value(3).toByteArray();
        b.ocupada = estado.gConn
                        .firstRow(QStringLiteral("select NumRegisto from MovProduto where "
                                                 "Terceiro=? and Fechado<>'S' and Numero='' and "
                                                 "CliFor='C' limit 1"),
                                  {codigo})
                        .has_value();
        botoes.push_back(std::move(b));
    }
    return botoes;
}

}  // namespace brasel::pos
