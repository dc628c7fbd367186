#include "devices/gaveta.h"

#include "devices/definicao_impressora.h"
#include "devices/impressao_serie.h"
#include "devices/impressora_talao.h"
#include "devices/impressora_windows.h"

#include <QCoreApplication>
#include <QFile>

namespace brasel::devices {

namespace {

// The drawer code of the ticket printer `codigoImpressora`, through the serial control.
bool abreNaImpressora(db::Connection& conn, const QString& codigoImpressora, LinhaSerie& linha) {
    const auto definicao = LerDefinicaoImpressora(conn, codigoImpressora);
    if (!definicao || definicao->codigos.abrirCaixa.isEmpty()) return false;
    CImpressoraTalao impressora;
    impressora.setCtrlInterface(&linha);
    if (!impressora.SetPortaComm(definicao->porta, kDefinicoesTalao)) return false;
    GuardaPorta guarda(linha);
    if (!guarda.obtida()) return false;
    impressora.chrABRIRCAIXA = definicao->codigos.abrirCaixa;
    QCoreApplication::processEvents();
    return impressora.AbreCaixa();
}

}  // namespace

bool AbreGaveta(db::Connection& conn, const QString& utilizador, const MeiosGaveta& meios,
                const QString& tipoDocumento, bool drivePermitido) {
    const QString tipo = tipoDocumento.trimmed();
    if (!tipo.isEmpty()) {
        const auto linhaTipo = conn.firstRow(
            QStringLiteral("select abrecaixa from TabTipoMov where Codigo=?"), {tipo});
        if (linhaTipo && linhaTipo->value(0).toString().trimmed() != QStringLiteral("1"))
            return false;
    }
    const auto config =
        conn.firstRow(QStringLiteral("select TipoImpTalao,CaixaDinheiroPorDrive from UtilConfGeral "
                                     "where utilizador=?"),
                      {utilizador});
    const QString codigoImpressora = config ? config->value(0).toString() : QString();
    if (config && config->value(1).toInt() == 1) {
        return tipo.isEmpty() && drivePermitido && AbreGavetaPorDrive(meios.impressoraPagina);
    }
    const bool opos = AbreGavetaOPOS(meios.dispositivoOPOS);
    const bool impressora = abreNaImpressora(conn, codigoImpressora, meios.linha);
    return opos || impressora;
}

bool AbreGavetaOPOS(const QString& dispositivo) {
    const QString caminho = dispositivo.trimmed();
    if (caminho.isEmpty()) return false;
    QFile gaveta(caminho);
    if (!gaveta.open(QIODevice::WriteOnly | QIODevice::ExistingOnly | QIODevice::Unbuffered))
        return false;
    return gaveta.write(kPulsoGaveta) == kPulsoGaveta.size();
}

bool AbreGavetaPorDrive(const QString& impressora) {
    TrabalhoImpressao trabalho;
    if (!trabalho.inicia(impressora, QStringLiteral("Abretura do Caixa - Por Drive"),
                         QPageLayout::Portrait))
        return false;
    return trabalho.imprimeLinha(QStringLiteral("---")) && trabalho.termina();
}

}  // namespace brasel::devices
