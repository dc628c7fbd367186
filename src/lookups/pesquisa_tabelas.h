#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "db/query_helpers.h"
#include "lookups/definicoes_pesquisa.h"
#include "lookups/pesquisa.h"

#include <QString>

namespace brasel::lookups {

// A code field as a lookup sees it: the code box's text and the description beside it.
struct CampoCodigo {
    QString codigo;
    QString descricao;
};

// The lookups of the code fields. Each takes the field, a flag that opens the search window
// even when a code was typed, and the caller's extra conditions (" and ...", bound values).
// Typed text starting with "\" searches the descriptions for the rest of it, "/" the codes;
// other text is validated: its description is written, or the lookup's message is shown and
// both texts are cleared. Empty text, or the flag, opens the search window; a chosen row is
// written back, a cancelled search changes nothing. Situations the user may not see in
// searches are refused too.
class PesquisaTabelas {
  public:
    PesquisaTabelas(app::Estado& estado, MessagePort& mensagens, JanelaPesquisa& janela)
        : estado_(estado), mensagens_(mensagens), janela_(janela) {}

    void Documentos(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void Cambios(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void Produtos(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void Clientes(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void Fornecedores(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void ClientesMoradas_LISTA(CampoCodigo& campo, bool forcar = false,
                               const db::Condicao& filtro = {});
    void FornecedoresMoradas_LISTA(CampoCodigo& campo, bool forcar = false,
                                   const db::Condicao& filtro = {});
    // Also leaves out the company's reserved types (ParamGeral TipoSI...).
    void TipoMov(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void PagaComo(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void Vendedores(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void TabPostal(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void OutUnidades(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void Armazens(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void Localizacoes(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void LotesTabela(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void Utilizadores(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void Estacao_Referencias(CampoCodigo& campo, bool forcar = false,
                             const db::Condicao& filtro = {});
    void Sexo_Referencias(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void Referencia_Referencias(CampoCodigo& campo, bool forcar = false,
                                const db::Condicao& filtro = {});
    void Modelo_Referencias(CampoCodigo& campo, bool forcar = false,
                            const db::Condicao& filtro = {});
    void Cor_Referencias(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void Tamanho_Referencias(CampoCodigo& campo, bool forcar = false,
                             const db::Condicao& filtro = {});
    void Comprimento_Referencias(CampoCodigo& campo, bool forcar = false,
                                 const db::Condicao& filtro = {});
    void Caixas(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void Impressoras_Taloes(CampoCodigo& campo, bool forcar = false,
                            const db::Condicao& filtro = {});
    void Delegados(CampoCodigo& campo, bool forcar = false, const db::Condicao& filtro = {});
    void Produtos_FacturaREST(CampoCodigo& campo, bool forcar = false,
                              const db::Condicao& filtro = {});

    // A stored note chosen in the search window (the key opens it filtered), "" when cancelled.
    QString Observacoes_str(const QString& chave = {});

    // Shows the message of a database error met while reading `tabela`.
    void Erros(const QString& erro, const QString& tabela = {});

    // The one routine behind every lookup.
    void pesquisar(const DefinicaoPesquisa& definicao, CampoCodigo& campo, bool forcar,
                   const db::Condicao& filtro);

  private:
    // The caller's conditions and the user's situations.
    db::Condicao condicoes(const DefinicaoPesquisa& definicao, const db::Condicao& filtro);
    db::Condicao tiposReservados();
    // Validates a typed code: its description, or the message and both texts cleared.
    void validar(const DefinicaoPesquisa& definicao, CampoCodigo& campo,
                 const db::Condicao& condicao);
    void abrirJanela(const DefinicaoPesquisa& definicao, CampoCodigo& campo,
                     const db::Condicao& condicao, int campoPesquisa, const QString& chave);

    app::Estado& estado_;
    MessagePort& mensagens_;
    JanelaPesquisa& janela_;
};

}  // namespace brasel::lookups
