#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "common/message_port.h"
#include "devices/linha_serie.h"

#include <QString>

#include <optional>

namespace brasel::devices {

// What the print-choice dialog decided for a receipt.
struct EscolhaImpressao {
    enum Escolha { Nenhum = 0, TalaoCompra = 1, Contabilistico = 2 };
    int escolha = Nenhum;
    int vias = 1;             // 0 to 99
    bool observacao = false;  // the document's observation instead of its lines (choice 2)
};

// The dialog's answer in one amount: choice + copies / 100, and one thousandth more when the
// observation is to be printed, so a caller reading only choice and copies still reads them.
Currency EmpacotaEscolha(const EscolhaImpressao& escolha);
EscolhaImpressao DesempacotaEscolha(Currency valor);

// The copies the dialog proposes for a document type: Vias of the type when the user's
// ImpTalaoViasTipoMov is 1, else 1. Nothing (and "Não tem o POS configurado para o utilizador "
// + user) when the user has no row.
std::optional<int> CarregarVias(db::Connection& conn, MessagePort& mensagens,
                                const QString& utilizador, const QString& tipoDocumento);

// Opens the drawer of the user for a receipt of `tipoDocumento` ("" unconditionally, as the
// dialog's button does): the way the user's settings name through AbreGaveta, and the
// workstation's OPOS drawer (ConfigRest_CaixaDinheiro) whatever the type says. The OPOS device
// gets one pulse, not one from each call.
void AbreGavetaTalao(app::Estado& estado, LinhaSerie& linha, const QString& tipoDocumento,
                     bool drivePermitido);

}  // namespace brasel::devices
