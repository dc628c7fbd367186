#pragma once

#include "app/estado.h"
#include "db/query_helpers.h"

#include <QColor>
#include <QString>
#include <QStringList>

#include <optional>

namespace brasel::app {

// The settings of this workstation that the restaurant configuration window edits, read and
// written together.
struct ConfiguracaoRest {
    QString caixa;
    QString fonte;
    QString imagemFundo;
    QString impCozinha;
    QString impCozinhaPorta;  // "", "COM" or "PAR"
    QString impCozinhaNome;
    QString impBar;
    QString impBarPorta;
    int tempoCozinha = 30;  // seconds
    QString caixaDinheiro;
    bool precoIncBrowse = false;
    bool pedePassword = false;
    bool desactivaPassword = false;
    bool activaProdutosFacturaREST = false;
    bool limpaDocAposFechaDoc = false;
    QString nivelEmenta;
    QString tipoImprimeMesa;
    QColor corFundo;  // of `utilizador`

    static ConfiguracaoRest ler(const QString& utilizador);
    // Writes every key; false when one could not be written (the others are still written).
    bool gravar(const QString& utilizador) const;
};

// The printer connections of the option groups, in their order: Windows printer, serial,
// parallel. A stored value that is none of these reads as the first.
inline const QStringList kPortasImpressora = {QString(), QStringLiteral("COM"),
                                              QStringLiteral("PAR")};
// The menu levels, in the order of the window's options.
inline const QStringList kNiveisEmenta = {
    QStringLiteral("TABGRUPOPRO"), QStringLiteral("TABFAMPRO"), QStringLiteral("TABSUBFAMPRO")};

// The tables whose codes the window takes.
enum class CodigoConfiguracao {
    Caixa,            // Caixas
    ImpressoraTalao,  // ImpTaloes
    TipoImprimeMesa,  // TabTipoMov, within filtroTipoImprimeMesa()
};

// The document types that may print a table's bill: customer documents that move no account,
// stock, cash or bank.
db::Condicao filtroTipoImprimeMesa();

// The description of a stored code, to show beside it: "" for an empty code (none chosen),
// nothing when its table no longer has it (or the type no longer fits). Nothing is said: typed
// codes are checked, with their messages, by the lookups.
std::optional<QString> descricaoCodigo(Estado& estado, CodigoConfiguracao tabela,
                                       const QString& codigo);

// What the main window keeps of these settings, taken again after they were saved.
void aplicaConfiguracao(Estado& estado, const ConfiguracaoRest& configuracao);

}  // namespace brasel::app
