#pragma once

#include "app/definicoes_posto.h"
#include "common/currency.h"
#include "db/connection.h"
#include "devices/balanca_serie.h"
#include "devices/linha_serie.h"

#include <QString>

#include <functional>
#include <memory>

namespace brasel::devices {

// The scale of this workstation, edited in the weighing dialog and saved when it closes.
namespace posto {
inline constexpr app::DefTexto MPortaCom{app::kSeccaoBrasel, "MPortaCom", "1"};
inline constexpr app::DefTexto MInicializar{app::kSeccaoBrasel, "MInicializar", "9600,o,7,1"};
inline constexpr app::DefTexto MTimeOut{app::kSeccaoBrasel, "MTimeOut", "0.5"};
inline constexpr app::DefTexto MTipoBalanca{app::kSeccaoBrasel, "MTipoBalanca", "CS300"};
}  // namespace posto

inline constexpr const char* kBalancaCS300 = "CS300";
inline constexpr const char* kBalancaD70 = "D70";

// A field of the dialog rewritten as the number it starts with, as it is left: the port as a
// whole number, 0 or less (or no number) becoming "1"; the time-out in seconds, fractions
// allowed, 0 or less becoming "0.1".
QString normalizaPortaCom(const QString& texto);
QString normalizaTimeOut(const QString& texto);

// The four settings as the dialog shows them.
struct DefinicoesBalanca {
    QString portaCom;
    QString inicializar;
    QString timeOut;
    QString tipoBalanca;

    static DefinicoesBalanca ler();
    bool gravar() const;

    int porta() const;
    double segundos() const;
    bool d70() const;
};

// The driver of the model: the indicator for "D70", the price-computing scale otherwise.
std::unique_ptr<BalancaSerie> criaBalanca(const QString& tipoBalanca);

// One press of the capture button: the weighing on the dialog's own line, with each stage told
// through `estado` ("Aguarde por Favor...", "Inicializando..." or "Estabelecendo Ligação...",
// then the error or "Captura efectuada   [ 1.250 ]"). `peso` is the weight taken, 0 when none.
struct ResultadoCaptura {
    bool capturada = false;
    Currency peso;
    Currency pvp;
    QString estado;
};
ResultadoCaptura capturaPesagem(const DefinicoesBalanca& definicoes, LinhaSerie& linha,
                                Currency precoUnitario,
                                const std::function<void(const QString&)>& estado = {});

// The weighing dialog as the order screen sees it: weighs at the unit price given and returns
// the weight taken, 0 when none (cancelled or failed).
class PortaBalanca {
  public:
    virtual ~PortaBalanca() = default;
    virtual Currency pesa(Currency precoUnitario) = 0;
};

// The unit price sent to the scale: the price with VAT when the VAT table's prices include it
// (TabIva.Incluido "1"), otherwise the price without VAT plus the rate. Nothing when the
// amount does not fit.
std::optional<Currency> precoUnitarioBalanca(db::Connection& conn, Currency precoSemIva,
                                             const QString& tabIva, Currency precoComIva,
                                             double taxa);

// Weighs a product sold by weight and returns the weight captured (0 when none).
Currency Balanca_cur(db::Connection& conn, PortaBalanca& dialogo, Currency precoSemIva,
                     const QString& tabIva, Currency precoComIva, double taxa);

}  // namespace brasel::devices
