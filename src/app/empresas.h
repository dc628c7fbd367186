#pragma once

#include <QList>
#include <QString>

namespace brasel::app {

// One row of the company list, in the columns of the company window.
struct LinhaEmpresa {
    QString codigo;           // "Código"
    QString nome;             // "Nome da Entidade", with " - (Só Leitura)" or "Desligada"
    QString ano;              // "Ano"
    QString servidor;         // "Servidor"
    QString login;            // "Login" (hidden)
    QString passwordCifrada;  // "Password" (hidden, company-list cipher)
    QString autenticacao;     // "Autenticação" (hidden)
    QString versao;           // "Versão"
    QString tamanho;          // "Tamanho" (hidden), "<n> Mb"
    bool desligada = false;
    bool soLeitura = false;
};

// The column layout of the company list.
inline const QString kColunasEmpresas = QStringLiteral(
    "Código,700/Nome da Entidade,3540/Ano,600,C/Servidor,800,C/Login,0/Password,0/"
    "Autenticação,0,C/Versão,800,C/Tamanho,0,D/");

// The company-list validations of one server.
class Empresa_Validacoes {
  public:
    // The companies of one server entry that pass the name filter (contained, without regard to
    // case) and the year filter (equal); an empty filter keeps every company. A server that cannot
    // be reached, or refuses the credentials, contributes nothing.
    static QList<LinhaEmpresa> Carregar_Empresas_LVW(const QString& servidor, const QString& login,
                                                     const QString& passwordCifrada,
                                                     const QString& autenticacao,
                                                     const QString& filtroNome,
                                                     const QString& filtroAno);
    // Size text of a database: megabytes with " Mb".
    static QString VerTamanhoDB(qint64 bytes);
};

}  // namespace brasel::app
