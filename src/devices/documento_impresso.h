#pragma once

#include "common/currency.h"
#include "common/message_port.h"
#include "db/connection.h"
#include "devices/talao_comum.h"

#include <QString>
#include <QStringList>

#include <optional>
#include <vector>

namespace brasel::devices {

// A closed customer document as its printouts show it, read whole before anything is printed.
struct DocumentoImpresso {
    // The document type (TabTipoMov).
    QString tipo;
    QString descricaoTipo;
    QString afectaCli;
    bool tipoAbreCaixa = false;
    int viasTipo = 1;

    // The header (MovCliente).
    QString numero;
    QString ano;
    QString data;     // "yyyy-mm-dd"
    QString dataSys;  // "yyyy-mm-dd HH:MM:SS"
    QString cliente;  // Codigo
    QString nome;
    QString morada;
    QString local;
    QString codPostal;
    QString descricaoPostal;
    QString contribuinte;
    QString observa;
    QString notaCertificacao;
    QString armazem;
    QString login;  // of the user who issued it
    Currency valor;
    Currency desconto;
    Currency iva;
    Currency descontoFinanceiro;
    Currency totalDoc;
    Currency entregou;

    QString horaAbertura;   // the DataSys of its first line
    QStringList cabecalho;  // the shop's Linha1..Linha7

    std::vector<LinhaImpressa> linhas;
    std::vector<GrupoIva> ivas;

    struct Imposto {
        QString codigo;
        Currency valor;
    };
    std::vector<Imposto> impostos;  // other taxes, by code

    struct Pagamento {
        QString codigo;
        QString descricao;
        Currency valor;
    };
    std::vector<Pagamento> pagamentos;

    // Name, address, town, postal code with its description, "Contribuinte : " + number.
    QStringList blocoCliente() const;
    // "Entregou" prints the total when nothing tendered was recorded.
    Currency entregouImpresso() const { return entregou.isZero() ? totalDoc : entregou; }
    Currency troco() const { return entregouImpresso() - totalDoc; }
    // "dd-mm-yyyy" of a stored date, "hh:mm" of a stored timestamp.
    static QString dataImpressa(const QString& data);
    static QString horaImpressa(const QString& dataSys);
};

// Reads the document; a missing header gives "Documento Inexistente", a document without lines
// "Documento Inexistente em movimentos de produtos" (critical), and nothing.
std::optional<DocumentoImpresso> LerDocumentoImpresso(db::Connection& conn, MessagePort& mensagens,
                                                      const QString& tipo, const QString& numero,
                                                      const QString& ano);

// The signature note in pieces of 40 characters.
QStringList PedacosNota(const QString& nota);
// The observation in pieces of 40 characters: each of its lines (split at CR LF) from its
// characters 1, 41, 81, 121 and 161 (at most five pieces a line).
QStringList PedacosObservacao(const QString& observa);

// A closed customer document in the reprint list.
struct DocumentoListado {
    QString tipo;
    QString numero;
    QString ano;
    QString data;
    QString nome;
    Currency totalDoc;
};

// The latest customer documents (newest first), at most `limite`; with `filtro`, only those
// whose type, number, customer code or name contains it.
std::vector<DocumentoListado> ListaDocumentosCliente(db::Connection& conn, const QString& filtro,
                                                     int limite = 200);

}  // namespace brasel::devices
