#include "documents/assinatura.h"

#include "db/query_helpers.h"
#include "documents/chave_assinatura.h"

#include <QDateTime>
#include <QSqlRecord>
#include <QStringList>

#include <array>

namespace brasel::documents {

namespace {

const QString kInicio2011 = QStringLiteral("2011-01-01");
const QString kNotaCopia = QStringLiteral("Cópia do documento original");
const QString kNotaAntes2011 =
    QStringLiteral("Processado por Computador - Art.º 7 Dec. Lei 147/2003");

QString notaCertificado(const app::Estado& estado) {
    return QStringLiteral("Processado por Programa Certificado nº ") +
           estado.config.numeroCertificado + QStringLiteral("/DGCI");
}

// Table names come from here only, never from input.
QString tabelaCabecalhos(QChar TipoTerceiro) {
    return TipoTerceiro == u'F' ? QStringLiteral("MovFornece") : QStringLiteral("MovCliente");
}

// The timestamp as the signed text carries it; the stored form has a space where the signed one
// has a "T", and both are accepted.
std::optional<QString> dataSysAssinatura(const QString& DataSys) {
    QString t = DataSys.trimmed();
    if (t.size() > 10 && t[10] == u' ') t[10] = u'T';
    const QDateTime quando = QDateTime::fromString(t, Qt::ISODate);
    if (!quando.isValid()) return std::nullopt;
    return quando.toString(QStringLiteral("yyyy-MM-ddTHH:mm:ss"));
}

// The signature of the document before `Numero` of the type and year: numbers are zero-filled to
// one width, so text order is number order. A document without a signature gives "", as does
// the first of a year. nullopt when the database cannot be read.
std::optional<QString> hashAnterior(db::Connection& conn, const QString& tabela,
                                    const QString& Tipo, const QString& Numero,
                                    const QString& Ano) {
    auto q = conn.exec(QStringLiteral("select COALESCE(Hash,'') from ") + tabela +
                           QStringLiteral(" where Tipo=? and Numero<? and Ano=? "
                                          "order by Numero desc LIMIT 1"),
                       {Tipo, Numero, Ano});
    if (!q) return std::nullopt;
    return q->next() ? q->value(0).toString() : QString();
}

// The text of a document's signature with its predecessor's read from the database.
std::optional<QString> textoComAnterior(db::Connection& conn, const QString& tabela,
                                        const QString& Data, const QString& DataSys,
                                        const QString& Tipo, const QString& Numero,
                                        Currency TotalDoc) {
    const auto anterior = hashAnterior(conn, tabela, Tipo, Numero, Data.left(4));
    if (!anterior) return std::nullopt;
    return TextoAssinatura(Data, DataSys, Tipo, Numero, TotalDoc, *anterior);
}

struct DefinicaoTipo {
    int ControloHash = 0;
    int CopiaDocumentoOriginal = 0;
    QString Modulo;
};

// The signature settings of a type; an unknown type is one that is not signed. nullopt when
// the database cannot be read.
std::optional<DefinicaoTipo> lerTipo(db::Connection& conn, const QString& Tipo) {
    auto q = conn.exec(QStringLiteral("select COALESCE(ControloHash,0), "
                                      "COALESCE(CopiaDocumentoOriginal,0), COALESCE(Modulo,'') "
                                      "from TabTipoMov where codigo=?"),
                       {Tipo});
    if (!q) return std::nullopt;
    DefinicaoTipo t;
    if (q->next()) {
        t.ControloHash = q->value(0).toInt();
        t.CopiaDocumentoOriginal = q->value(1).toInt();
        t.Modulo = q->value(2).toString().trimmed();
    }
    return t;
}

// Whether the query finds a row: nullopt when the database cannot be read.
std::optional<bool> existe(db::Connection& conn, const QString& sql, const QVariantList& valores) {
    auto q = conn.exec(sql, valores);
    if (!q) return std::nullopt;
    return q->next();
}

// The header fields of the whole-content signature, in their order. Amounts are written with
// four decimals and "." (no thousands separator), whatever the engine hands back (integer,
// double or decimal text); texts, dates included, as stored; a NULL as "" except carriage and
// the financial discount, which count as 0.
enum class Campo { Texto, Montante, MontanteOuZero };
struct CampoConteudo {
    const char* nome;
    Campo tipo;
};
constexpr std::array<CampoConteudo, 54> kCamposConteudo{{
    {"Tipo", Campo::Texto},
    {"Numero", Campo::Texto},
    {"Data", Campo::Texto},
    {"Ano", Campo::Texto},
    {"Codigo", Campo::Texto},
    {"Descricao", Campo::Texto},
    {"Contribuinte", Campo::Texto},
    {"Morada", Campo::Texto},
    {"Local", Campo::Texto},
    {"CodPostal", Campo::Texto},
    {"Pais", Campo::Texto},
    {"Afecta", Campo::Texto},
    {"Modulo", Campo::Texto},
    {"Utilizador", Campo::Texto},
    {"Armazem", Campo::Texto},
    {"Matricula", Campo::Texto},
    {"Carga", Campo::Texto},
    {"Descarga", Campo::Texto},
    {"NotaCertificacao", Campo::Texto},
    {"VersaoApp", Campo::Texto},
    {"TabIva1", Campo::Texto},
    {"TabIva2", Campo::Texto},
    {"TabIva3", Campo::Texto},
    {"TabIva4", Campo::Texto},
    {"TaxIva1", Campo::Montante},
    {"TaxIva2", Campo::Montante},
    {"TaxIva3", Campo::Montante},
    {"TaxIva4", Campo::Montante},
    {"Valor1", Campo::Montante},
    {"Valor2", Campo::Montante},
    {"Valor3", Campo::Montante},
    {"Valor4", Campo::Montante},
    {"Desconto1", Campo::Montante},
    {"Desconto2", Campo::Montante},
    {"Desconto3", Campo::Montante},
    {"Desconto4", Campo::Montante},
    {"ValIva1", Campo::Montante},
    {"ValIva2", Campo::Montante},
    {"ValIva3", Campo::Montante},
    {"ValIva4", Campo::Montante},
    {"Portes", Campo::MontanteOuZero},
    {"IncidIRS", Campo::Montante},
    {"ValorIRS", Campo::Montante},
    {"Juro", Campo::Montante},
    {"ImpSelo", Campo::Montante},
    {"DescFinPer", Campo::MontanteOuZero},
    {"DescFinVal", Campo::MontanteOuZero},
    {"DescontoPP", Campo::Montante},
    {"DescontoFinanceiroPerc", Campo::Montante},
    {"DescontoFinanceiro", Campo::Montante},
    {"Valor", Campo::Montante},
    {"IVA", Campo::Montante},
    {"Desconto", Campo::Montante},
    {"TotalDoc", Campo::Montante},
}};

QString valorConteudo(const QVariant& v, Campo tipo) {
    if (v.isNull() && tipo != Campo::MontanteOuZero) return {};
    if (tipo == Campo::Texto) return v.toString();
    return Currency::fromVariant(v).toText(4);
}

}  // namespace

std::optional<QString> TextoAssinatura(const QString& Data, const QString& DataSys,
                                       const QString& Tipo, const QString& Numero,
                                       Currency TotalDoc, const QString& HashAnterior) {
    const auto quando = dataSysAssinatura(DataSys);
    if (!quando) return std::nullopt;
    // The header total already carries the document's decimals; two are signed, and a third
    // or fourth takes the one rounding of every amount conversion (ties to even).
    return Data + u';' + *quando + u';' + Tipo + u' ' + Data.left(4) + u'/' + Numero + u';' +
           TotalDoc.toText(2) + u';' + HashAnterior;
}

bool AssinaDocumento(app::Estado& estado, db::Connection& conn, Assinatura& resultado,
                     QString& DataSys, const QString& Tipo, const QString& Numero,
                     const QString& Data, Currency TotalDoc, QChar TipoTerceiro) {
    resultado = {};
    const auto tipo = lerTipo(conn, Tipo);
    auto activa =
        conn.exec(QStringLiteral("select COALESCE(ActivaHashAntes2011,0) from ParamGeral LIMIT 1"));
    if (!tipo || !activa) return false;
    const bool antes2011 = Data < kInicio2011;
    const bool activaAntes2011 = activa->next() && activa->value(0).toInt() != 0;
    const bool copia = tipo->CopiaDocumentoOriginal == 1;

    const QString agora = DataSys.trimmed().isEmpty()
                              ? db::textoDataSys(db::Get_DataSysServer(estado, &conn))
                              : DataSys;
    const auto quando = dataSysAssinatura(agora);
    if (quando) DataSys = *quando;

    if (tipo->ControloHash == 0 || (antes2011 && !activaAntes2011)) {
        resultado.notaCertificacao = antes2011 ? kNotaAntes2011
                                     : copia   ? kNotaCopia
                                               : notaCertificado(estado);
        return true;
    }
    if (tipo->ControloHash == 1 && !VerificaSequencia(conn, Tipo, Numero, Data)) {
        resultado.notaCertificacao =
            QStringLiteral(
                "Existem movimentos com o Número ou Data Superior para o Tipo de "
                "Movimento ") +
            Tipo + u'!';
        return false;
    }
    if (!quando) return false;
    // A copy of a document issued before keeps no signature: nothing is signed, so a copy
    // never fails for want of the key.
    if (copia) {
        resultado.notaCertificacao = kNotaCopia;
        return true;
    }
    const auto texto = textoComAnterior(conn, tabelaCabecalhos(TipoTerceiro), Data, DataSys, Tipo,
                                        Numero, TotalDoc);
    if (!texto) return false;
    resultado.assinou = 1;
    resultado.hash = Assina_Nova(*texto, estado.config.ficheiroChave);
    if (resultado.hash.isEmpty()) return false;
    resultado.notaCertificacao = QString(resultado.hash[0]) + resultado.hash[10] +
                                 resultado.hash[20] + resultado.hash[30] + u'-' +
                                 notaCertificado(estado);
    return true;
}

bool VerificaSequencia(db::Connection& conn, const QString& Tipo, const QString& Numero,
                       const QString& Data) {
    const auto tipo = lerTipo(conn, Tipo);
    if (!tipo) return false;
    const QString tabela =
        tipo->Modulo == QStringLiteral("CL") || tipo->Modulo == QStringLiteral("FC")
            ? QStringLiteral("MovCliente")
            : QStringLiteral("MovFornece");
    const QString ano = Data.left(4);
    const auto posterior = existe(conn,
                                  QStringLiteral("select Numero from ") + tabela +
                                      QStringLiteral(" where Tipo=? and Ano=? and Data>? LIMIT 1"),
                                  {Tipo, ano, Data});
    const auto maior = existe(conn,
                              QStringLiteral("select Numero from ") + tabela +
                                  QStringLiteral(" where Tipo=? and Ano=? and Numero>? LIMIT 1"),
                              {Tipo, ano, Numero});
    return posterior && maior && !*posterior && !*maior;
}

bool VerificaAssinatura(app::Estado& estado, db::Connection& conn, const QString& Tipo,
                        const QString& Numero, const QString& Ano, QChar TipoTerceiro) {
    const QString tabela = tabelaCabecalhos(TipoTerceiro);
    const auto doc = db::primeiraLinha(
        conn,
        QStringLiteral("select COALESCE(Data,''), COALESCE(DataSys,''), TotalDoc, "
                       "COALESCE(Hash,'') from ") +
            tabela + QStringLiteral(" where Tipo=? and Numero=? and Ano=?"),
        {Tipo, Numero, Ano});
    if (!doc) return false;
    const auto texto =
        textoComAnterior(conn, tabela, doc->value(0).toString(), doc->value(1).toString(), Tipo,
                         Numero, Currency::fromVariant(doc->value(2)));
    if (!texto) return false;
    const QString hash = Assina_Nova(*texto, estado.config.ficheiroChave);
    return !hash.isEmpty() && hash == doc->value(3).toString();
}

bool ValidaAssinatura(app::Estado& estado, MessagePort& mensagens, bool Mostrar,
                      const QString& Tipo, const QString& Numero, const QString& Ano) {
    if (Tipo.isEmpty() || Numero.isEmpty() || Ano.isEmpty()) return true;
    db::Connection& conn = estado.gConn;
    const auto tipo = lerTipo(conn, Tipo);
    bool valida = false;
    if (tipo) {
        // Copies of documents issued before are never signed: nothing to check.
        if (tipo->ControloHash == 0 || tipo->CopiaDocumentoOriginal == 1 || Ano.toInt() < 2011 ||
            (tipo->Modulo != QStringLiteral("FC") && tipo->Modulo != QStringLiteral("CL"))) {
            return true;
        }
        const auto encontrado = existe(
            conn, QStringLiteral("select Tipo from MovCliente where Tipo=? and Numero=? and Ano=?"),
            {Tipo, Numero, Ano});
        // A document that cannot be read cannot be shown to be sound: it is not printed.
        if (encontrado && !*encontrado) return true;
        valida = encontrado && VerificaAssinatura(estado, conn, Tipo, Numero, Ano, u'C');
    }
    if (!valida && Mostrar) {
        mensagens.mensagem(
            QStringLiteral("Não pode Imprimir este Documento porque a Assinatura não é Válida!\r\n"
                           "Por favor contacte o seu administrador."),
            Icone::Exclamacao);
    }
    return valida;
}

std::optional<QString> AssinaConteudo(app::Estado& estado, db::Connection& conn, bool Gravar,
                                      const QString& Tipo, const QString& Numero,
                                      const QString& Ano, QChar TipoTerceiro) {
    const QString tabela = tabelaCabecalhos(TipoTerceiro);
    QStringList colunas;
    for (const CampoConteudo& c : kCamposConteudo)
        colunas << QString::fromLatin1(c.nome);
    const auto doc = db::primeiraLinha(conn,
                                       QStringLiteral("select ") + colunas.join(u',') +
                                           QStringLiteral(" from ") + tabela +
                                           QStringLiteral(" where Tipo=? and Numero=? and Ano=?"),
                                       {Tipo, Numero, Ano});
    if (!doc) return std::nullopt;
    QString texto;
    int i = 0;
    for (const CampoConteudo& c : kCamposConteudo)
        texto += valorConteudo(doc->value(i++), c.tipo) + u';';
    const QString assinatura = Assina_Nova(texto, estado.config.ficheiroChave);
    if (assinatura.isEmpty()) return std::nullopt;
    if (Gravar && !conn.exec(QStringLiteral("update ") + tabela +
                                 QStringLiteral(" set Hash_Quoril=? where Tipo=? and Numero=? "
                                                "and Ano=?"),
                             {assinatura, Tipo, Numero, Ano})) {
        return std::nullopt;
    }
    return assinatura;
}

}  // namespace brasel::documents
