#pragma once

#include <QColor>
#include <QRect>
#include <QString>

#include <array>

namespace brasel::app {

// The settings of this workstation, each key named once here with its default. They live in the
// program's own settings (application "Brasel"), section "Brasel" unless a key says otherwise;
// a key never written reads as its default.

// A key and the section that holds it.
class ChavePosto {
  public:
    constexpr ChavePosto(const char* seccao, const char* chave) : seccao_(seccao), chave_(chave) {}
    QString seccao() const { return QString::fromUtf8(seccao_); }
    QString chave() const { return QString::fromUtf8(chave_); }

  protected:
    QString lerTexto(const QString& omissao) const;
    bool gravarTexto(const QString& valor) const;

  private:
    const char* seccao_;
    const char* chave_;
};

inline constexpr const char* kSeccaoBrasel = "Brasel";
inline constexpr const char* kSeccaoConfig = "Config";

// Free text.
class DefTexto : public ChavePosto {
  public:
    constexpr DefTexto(const char* seccao, const char* chave, const char* omissao = "")
        : ChavePosto(seccao, chave), omissao_(omissao) {}
    QString ler() const { return lerTexto(QString::fromUtf8(omissao_)); }
    bool gravar(const QString& valor) const { return gravarTexto(valor); }

  private:
    const char* omissao_;
};

// A check box of the configuration window: stored "1" or "0"; only "1" is on.
class DefFlag : public ChavePosto {
  public:
    using ChavePosto::ChavePosto;
    bool ler() const;
    bool gravar(bool ligado) const;
};

// A whole number kept within a range; a value that is not a number or falls outside reads as
// the default.
class DefInteiro : public ChavePosto {
  public:
    constexpr DefInteiro(const char* seccao, const char* chave, int omissao, int minimo, int maximo)
        : ChavePosto(seccao, chave), omissao_(omissao), minimo_(minimo), maximo_(maximo) {}
    int ler() const;
    bool gravar(int valor) const;

  private:
    int omissao_;
    int minimo_;
    int maximo_;
};

// A position or size of a window; its default is the window's own design value.
class DefGeometria : public ChavePosto {
  public:
    using ChavePosto::ChavePosto;
    int ler(int desenho) const;
    bool gravar(int valor) const;
};

// Left, top, width and height of a window under the keys <prefixo>L, T, W and H. A stored size
// that is not positive gives the design size back, so the window can never vanish.
class GeometriaJanela {
  public:
    constexpr GeometriaJanela(const char* l, const char* t, const char* w, const char* h)
        : l_(kSeccaoBrasel, l), t_(kSeccaoBrasel, t), w_(kSeccaoBrasel, w), h_(kSeccaoBrasel, h) {}
    QRect ler(const QRect& desenho) const;
    bool gravar(const QRect& janela) const;

  private:
    DefGeometria l_, t_, w_, h_;
};

// The level of the menu buttons, which names the table of its groups: only the three known
// tables are ever given back; an empty or unknown value reads as "TABGRUPOPRO".
class DefNivelEmenta : public ChavePosto {
  public:
    using ChavePosto::ChavePosto;
    QString ler() const;
    // False, and nothing stored, for a value that is none of the three.
    bool gravar(const QString& nivel) const;
};

// The background colour of the touch windows, one key per user ("JanBackColor" + user code),
// stored as RRGGBB hexadecimal text.
class DefCorUtilizador : public ChavePosto {
  public:
    using ChavePosto::ChavePosto;
    QColor ler(const QString& utilizador) const;
    bool gravar(const QString& utilizador, const QColor& cor) const;
};

// A year filter that starts at the current year until one is saved (a saved empty filter stays
// empty: it shows every year).
class DefAnoCorrente : public ChavePosto {
  public:
    using ChavePosto::ChavePosto;
    QString ler() const;
    bool gravar(const QString& ano) const { return gravarTexto(ano); }
};

namespace posto {

// The restaurant configuration window (AConfiguraRest) edits these.
inline constexpr DefTexto ConfigRest_CAIXA{kSeccaoBrasel, "ConfigRest_CAIXA"};
inline constexpr DefTexto ConfigRest_Font{kSeccaoBrasel, "ConfigRest_Font", "Arial"};
inline constexpr DefTexto ConfigRest_BotaoIMG{kSeccaoBrasel, "ConfigRest_BotaoIMG"};
inline constexpr DefTexto ConfigRest_ImpTalaoCozinha{kSeccaoBrasel, "ConfigRest_ImpTalaoCozinha"};
// Printer connections: "" Windows printer, "COM" serial, "PAR" parallel.
inline constexpr DefTexto ConfigRest_ImpTalaoCozinhaPorta{kSeccaoBrasel,
                                                          "ConfigRest_ImpTalaoCozinhaPorta"};
inline constexpr DefTexto ConfigRest_ImpTalaoCozinhaNome{kSeccaoBrasel,
                                                         "ConfigRest_ImpTalaoCozinhaNome"};
inline constexpr DefTexto ConfigRest_ImpTalaoBar{kSeccaoBrasel, "ConfigRest_ImpTalaoBar"};
inline constexpr DefTexto ConfigRest_ImpTalaoBarPorta{kSeccaoBrasel, "ConfigRest_ImpTalaoBarPorta"};
// Seconds between two polls of the kitchen queue. Zero would poll without pause and a huge
// value would overflow the timer's milliseconds, so both read as the default.
inline constexpr DefInteiro ConfigRest_TempoImpTalaoCozinha{
    kSeccaoBrasel, "ConfigRest_TempoImpTalaoCozinha", 30, 1, 86400};
inline constexpr DefTexto ConfigRest_CaixaDinheiro{kSeccaoBrasel, "ConfigRest_CaixaDinheiro"};
inline constexpr DefFlag ConfigRest_PrecoIncBrowse{kSeccaoBrasel, "ConfigRest_PrecoIncBrowse"};
inline constexpr DefFlag ConfigRest_PedePWD{kSeccaoBrasel, "ConfigRest_PedePWD"};
inline constexpr DefFlag ConfigRest_DesactivaPassword{kSeccaoBrasel,
                                                      "ConfigRest_DesactivaPassword"};
inline constexpr DefFlag ConfigRest_ActivaProdutosFacturaREST{
    kSeccaoBrasel, "ConfigRest_ActivaProdutosFacturaREST"};
inline constexpr DefFlag ConfigRest_LimpaDocAposFechaDoc{kSeccaoBrasel,
                                                         "ConfigRest_LimpaDocAposFechaDoc"};
inline constexpr DefNivelEmenta NivelEmenta{kSeccaoBrasel, "NivelEmenta"};
inline constexpr DefTexto TipoImprimeMesa{kSeccaoBrasel, "TipoImprimeMesa"};
inline constexpr DefTexto Divisao_Obs{kSeccaoBrasel, "Divisao_Obs"};
// The walk-in customer form's load-data box.
inline constexpr DefFlag CarregaDados{kSeccaoBrasel, "CarregaDados"};
inline constexpr DefCorUtilizador JanBackColor{kSeccaoBrasel, "JanBackColor"};

// Window geometry, with the design values of each window as defaults.
inline constexpr GeometriaJanela JanPro{"JanProL", "JanProT", "JanProW", "JanProH"};
inline constexpr DefGeometria JanProTamDscr{kSeccaoBrasel, "JanProTamDscr"};
inline constexpr DefGeometria JanProTamPrec{kSeccaoBrasel, "JanProTamPrec"};
inline constexpr DefGeometria JanProTamQTY{kSeccaoBrasel, "JanProTamQTY"};
inline constexpr GeometriaJanela JanCliente{"JanClienteL", "JanClienteT", "JanClienteW",
                                            "JanClienteH"};
inline constexpr GeometriaJanela JanGrupoPro{"JanGrupoProL", "JanGrupoProT", "JanGrupoProW",
                                             "JanGrupoProH"};
inline constexpr DefGeometria JanUtilizadorL{kSeccaoBrasel, "JanUtilizadorL"};
inline constexpr DefGeometria JanUtilizadorT{kSeccaoBrasel, "JanUtilizadorT"};

// The filters of the company selection and the last login name typed.
inline constexpr DefAnoCorrente ME_Ano{kSeccaoConfig, "ME_Ano"};
inline constexpr DefTexto ME_Empresa{kSeccaoConfig, "ME_Empresa"};
inline constexpr DefTexto NomeUtilizador{kSeccaoConfig, "NomeUtilizador"};

}  // namespace posto

// One entry of the server list. The list belongs to the suite (application "Montiva", section
// "Autenticação", keys "Servidor<n>", "Login<n>", "Password<n>", "TipoAutenticacao<n>").
struct EntradaServidor {
    QString servidor;
    QString login;
    QString passwordCifrada;   // as stored, under the company-list cipher
    QString tipoAutenticacao;  // "SQL" or "WIN"

    // An entry is in use when it names a server.
    bool emUso() const { return !servidor.trimmed().isEmpty(); }
    // The plain password ("" when the stored text does not decrypt).
    QString password() const;
    void definirPassword(const QString& plain);
};

inline constexpr int kEntradasServidor = 20;
// Entry n of the list is element n - 1.
using ListaServidores = std::array<EntradaServidor, kEntradasServidor>;

// The twenty entries; the authentication is upper-cased, and a missing one is "SQL".
ListaServidores lerServidores();
// Writes the four keys of every entry; false when the settings could not be written.
bool gravarServidores(const ListaServidores& lista);

}  // namespace brasel::app
