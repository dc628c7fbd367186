#pragma once

#include "cash/lanca_mov_caixa.h"
#include "cash/pagamento.h"
#include "common/currency.h"
#include "pos/perguntas_fecho.h"
#include "pos/tab.h"

#include <QString>

#include <optional>
#include <vector>

namespace brasel::pos {

// The columns of the user's UtilConfGeral row that steer the closing.
struct ConfigFecho {
    bool mostrarFormFechaDoc = false;     // the payment screen is shown
    bool mostrarFormCliDiversos = false;  // the walk-in customer's data are asked
    bool lancaSemContribuinte = false;    // a document may go without a tax number
    bool confirmaUtilizador = false;      // ConfirmacaoEncerramento names "FC"
    bool mostraCliDiverso = false;        // the walk-in customer is proposed afterwards
    bool impressoraTalao = true;          // Impressora "T": receipts, else full pages
};
// The current user's row; the defaults when there is none.
ConfigFecho LerConfigFecho(app::Estado& estado);

// What was settled before the document is written: the proposed number (taken again inside
// the closing lock), the date, the payment, the walk-in data and the split over payment methods.
struct DadosFecho {
    QString numero;
    QString data;  // "yyyy-MM-dd"; the year is its first four characters
    std::optional<cash::Pagamento> pagamento;
    std::optional<DadosClienteDiverso> diverso;
    std::optional<std::vector<cash::ParcialPagamento>> divisao;
};

// A document written by the closing.
struct DocumentoFechado {
    QString tipo;
    QString numero;
    QString ano;
    Currency total;
};

// Why a document could not be written.
enum class FalhaGravacao { Nenhuma, Assinatura, BaseDados, LinhaAlterada };

// Writes the tab's selected lines as one document, in one transaction under the closing lock:
// the number proposed is taken again and moved on while another document holds it; the header
// is signed and inserted, the lines numbered and closed, their other taxes numbered and summed,
// the cash movement written (the cash-effect code not "NA"), the action logged, the table's bill
// flag cleared and UltNumero raised to the number. Any failure rolls everything back (UltNumero
// and the lines as they were) and gives nullopt with the reason in `falha`. Nothing is shown.
std::optional<DocumentoFechado> GravaDocumento(Tab& tab, const DadosFecho& dados,
                                               FalhaGravacao* falha = nullptr);

enum class ResultadoFecho {
    Fechado,    // written (and printed, when asked)
    Recusado,   // a check or the person stopped it; a message said why
    Cancelado,  // a question was left unanswered; nothing written
    Falhou,     // the database or the signature failed; nothing written
};

struct Fecho {
    ResultadoFecho resultado = ResultadoFecho::Recusado;
    std::optional<DocumentoFechado> documento;
};

// The Close button: checks, confirmation, number, display, payment, walk-in data, split over
// payment methods, the document (GravaDocumento), then printing, the table's lock released and
// the tab made ready for the next customer.
Fecho FecharTab(Tab& tab, PerguntasFecho& perguntas);

// The Receipt button: reads the tab again, shows its total on the display and closes it after
// "Fecha Documento ?".
Fecho FecharComTalao(Tab& tab, PerguntasFecho& perguntas);

// After a document: the lines left on the table stay ticked (SelecFecha=1) and on screen; with
// none left the walk-in customer is proposed (MostraCliDiverso) or the table cleared with
// "Proximo Cliente..." on the display. Stored lines are free to change again.
void PreparaProximoCliente(Tab& tab, const ConfigFecho& config);

}  // namespace brasel::pos
