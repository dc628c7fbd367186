#include "pos/dados_cli_div.h"

#include <QSqlRecord>

namespace brasel::pos {

namespace {

// From this date on a walk-in document names its customer by tax number.
constexpr const char* kDataContribuinteObrigatorio = "2010-12-31";

}  // namespace

QString textoFaltaContribuinte() {
    return QStringLiteral(
        "     Não Definiu o Número de Contribuinte!     \r\n"
        "(Campo de Preenchimento Obrigatório)");
}

std::optional<DadosClienteDiverso> DadosUltimoDocumento(db::Connection& conn,
                                                        const QString& contribuinte) {
    if (contribuinte.trimmed().isEmpty()) return std::nullopt;
    const auto r = conn.firstRow(
        QStringLiteral("select Contribuinte,Deferencia,Descricao,Morada,Local,CodPostal,Pais "
                       "from MovCliente where Contribuinte=? order by Data desc, DataSys desc "
                       "limit 1"),
        {contribuinte.trimmed()});
    if (!r) return std::nullopt;
    DadosClienteDiverso d;
    d.contribuinte = r->value(0).toString();
    d.deferencia = r->value(1).toString();
    d.nome = r->value(2).toString();
    d.morada = r->value(3).toString();
    d.local = r->value(4).toString();
    d.codPostal = r->value(5).toString();
    d.pais = r->value(6).toString();
    return d;
}

bool ConfirmaDadosCliDiv(MessagePort& mensagens, const DadosClienteDiverso& dados,
                         const QString& data, bool lancaSemContribuinte) {
    if (data >= QLatin1String(kDataContribuinteObrigatorio) &&
        dados.contribuinte.trimmed().isEmpty() && !lancaSemContribuinte) {
        mensagens.mensagem(textoFaltaContribuinte(), Icone::Informacao, QStringLiteral("ATENÇÃO"));
        return false;
    }
    const bool moradaIncompleta =
        dados.morada.trimmed().isEmpty() || dados.local.trimmed().isEmpty() ||
        dados.codPostal.trimmed().isEmpty() || dados.pais.trimmed().isEmpty();
    if (moradaIncompleta && mensagens.confirmar(QStringLiteral(
                                "Não preencheu todos os campos da Identificação da Morada.\r\n"
                                "Note que este campos são de preenchimento obrigatório para a "
                                "exportação de dados do SAFT\r\n\r\nPreencher os Campos?")))
        return false;
    return true;
}

}  // namespace brasel::pos
