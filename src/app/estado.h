#pragma once

#include "app/parametros.h"
#include "db/sessao.h"

#include <QString>

#include <array>

namespace brasel::app {

// The five lines of Config.cfg.
struct ConfigCfg {
    QString pastaDados;          // data folder of the embedded server
    QString ficheiroChave;       // signing-key file
    QString numeroCertificado;   // software certificate number printed on documents
    QString mapaPortas;          // file of "COMn=/dev/..." lines
    QString pastaActualizacoes;  // where the updater looks for newer releases
};

// Process-wide state: created by main (or by a test) and passed by reference. Members keep the
// names the rest of the program knows them by.
struct Estado : db::Sessao {
    QString gUtilizador;      // code of the logged-in user
    QString gNomeUtilizador;  // name shown in the status bar

    // Filled at start-up.
    std::array<QString, 13> gMeses;  // 1..12
    QString gSimbolo = QStringLiteral("%");
    ConfigCfg config;

    Parametros param;

    // From the user's UtilConfGeral row (kept from the previous user when the row is missing).
    QString gArmazem;
    QString gCaixa;
    QString gTipoFac;
    bool gVariosPagaComo = false;
    // Heading lines linha2..linha7 of the user's warehouse.
    std::array<QString, 6> gLinhasCabecalho;

    // Workstation settings kept by the main window.
    QString gImpTalaoCozinha;
    QString gCaixaDinheiro;
    QString gNivelEmenta = QStringLiteral("TABGRUPOPRO");
};

}  // namespace brasel::app
