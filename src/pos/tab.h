#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "common/message_port.h"
#include "devices/linha_serie.h"
#include "pricing/documento.h"
#include "pricing/lista_linhas.h"
#include "pricing/precos.h"

#include <QString>

#include <cstdint>
#include <functional>
#include <optional>

namespace brasel::pos {

// The movement type a tab is kept under, with the effects its lines are posted with.
struct TipoTab {
    QString codigo;
    QString descricao;
    QString afectaCli;
    QString afectaStk;
    QString afectaCaixa;
};

// The table (a Clientes row) whose tab is open.
struct MesaTab {
    QString codigo;
    QString descricao;
    bool jaImprimiuTalao = false;
    bool diversos = false;  // the walk-in customer
    QString tipoCli;        // "D": cash sales only

    // A customer that may only take cash-sale types.
    bool apenasPronto() const { return diversos || tipoCli == u"D"; }
};

// What the waiter set for the next product only: cleared once a product is added.
struct Pendentes {
    Currency quantidade;  // 0: none (one unit)
    Currency preco;
    bool precoDefinido = false;  // a price of 0 typed on purpose still replaces the product's
    QString obs;
    QString produto;

    void limpar() { *this = Pendentes{}; }
};

// The open tab of one table, movement type and user: the open lines of MovProduto with
// CliFor "C", that Terceiro, Tipo and Utilizador (the user's login) and Fechado "N", held as
// the order screen's line list with its totals. Refusals go to the person through the message
// port; the lamp and the display hooks let a window follow the work.
class Tab {
  public:
    Tab(app::Estado& estado, MessagePort& mensagens, devices::LinhaSerie& linha);

    app::Estado& estado() { return estado_; }
    MessagePort& mensagens() { return mensagens_; }
    devices::LinhaSerie& linhaSerie() { return linha_; }

    // The login that owns the tab's lines.
    QString utilizador() const;
    const MesaTab& mesa() const { return mesa_; }
    const TipoTab& tipo() const { return tipo_; }
    bool temMesaETipo() const { return !mesa_.codigo.isEmpty() && !tipo_.codigo.isEmpty(); }

    pricing::ListaLinhas& lista() { return lista_; }
    const pricing::ListaLinhas& lista() const { return lista_; }
    const pricing::DefinicoesDocumento& definicoes() const { return definicoes_; }
    // ConfigUtil's set-up of the open table; nothing when the user or the table has no row.
    const std::optional<pricing::ConfiguracaoTab>& configuracao() const { return configuracao_; }
    // The price tier in use ("1" when none is configured).
    QString escalao() const;

    Pendentes pendentes;
    // False while the table's provisional bill is printed: stored lines then need the
    // supervisor to change.
    bool edicaoLivre = true;
    // Set while a product is being added: a second press is ignored.
    bool ocupado = false;

    // The busy lamp: 'R' while a product is being added, 'G' once it is stored.
    std::function<void(char)> Luzes;

    // Reads the table's row into the tab (description, flags, rounding settings); false and an
    // empty table when there is none. The lines are not read here.
    bool lerMesa(const QString& codigo);
    // Sets the type from TabTipoMov and reads the tab's lines again; false (no type) when the
    // code has no row.
    bool definirTipo(const QString& codigo);
    // The user's and the table's set-up of prices, seller and general discount.
    void ConfigUtil();
    // Forgets the table and its lines (the type stays).
    void limparMesa();

    // With 0, reads every line of the tab again; with a NumRegisto, appends that line. Then
    // recomputes the totals. False when the database cannot be read (the list is then as it
    // was).
    bool CarregarDoc(std::int64_t NumRegisto = 0);
    // The totals and VAT slots of the ticked lines.
    bool CalculosGerais();

    // Ticks or unticks a line for a partial close (SelecFecha) and recomputes the totals.
    bool marcarLinha(std::int64_t NumRegisto, bool marcada);
    // The list position of a line; -1 when it is not in the list.
    int indiceLinha(std::int64_t NumRegisto) const;
    // Takes a line out of the list (after its row was deleted) and recomputes the totals.
    void retirarLinha(std::int64_t NumRegisto);

    // Whether ConfigRest_PrecoIncBrowse shows the applied price in the price column.
    bool mostraPrecoAplicado() const { return definicoes_.precoAplicado; }

  private:
    app::Estado& estado_;
    MessagePort& mensagens_;
    devices::LinhaSerie& linha_;
    MesaTab mesa_;
    TipoTab tipo_;
    pricing::ListaLinhas lista_;
    pricing::DefinicoesDocumento definicoes_;
    std::optional<pricing::ConfiguracaoTab> configuracao_;
};

// The conditions of a tab's open lines, "?" bound in this order: table, type, login.
inline constexpr const char* kCondicaoTab =
    "CliFor='C' and Terceiro=? and Tipo=? and Utilizador=? and Fechado='N'";

}  // namespace brasel::pos
