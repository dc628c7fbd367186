#include "db/procedimentos/mete_no_mov_pro.h"

#include <QStringList>
#include <QUuid>

namespace brasel::db {

namespace {

using V = ValoresMovPro;

QString instrucaoInsercao(const Dialect& dialecto) {
    QStringList colunas;
    QStringList marcas;
    for (const CampoMovPro& c : camposMovPro()) {
        const QString coluna = QString::fromLatin1(c.coluna);
        colunas << coluna;
        // The line's time stamp is the server's unless the caller brings one.
        marcas << (coluna == u"DataSys" ? QStringLiteral("COALESCE(NULLIF(?,''),%1)")
                                              .arg(dialecto.serverTimeExpression())
                                        : QStringLiteral("?"));
    }
    return QStringLiteral("insert into MovProduto (%1) values (%2) returning NumRegisto")
        .arg(colunas.join(QLatin1Char(',')), marcas.join(QLatin1Char(',')));
}

}  // namespace

const std::vector<CampoMovPro>& camposMovPro() {
    static const std::vector<CampoMovPro> campos{
        {"Codigo", &V::Codigo},
        {"Descricao", &V::Descricao},
        {"Tipo", &V::Tipo},
        {"Numero", &V::Numero},
        {"Ano", &V::Ano},
        {"Data", &V::Data},
        {"Preco", &V::Preco},
        {"QuantNormal", &V::QuantNormal},
        {"QuantConvert", &V::QuantConvert},
        {"Cubicagem1", &V::Cubicagem1},
        {"Cubicagem2", &V::Cubicagem2},
        {"Cubicagem3", &V::Cubicagem3},
        {"QuantCubicagem", &V::QuantCubicagem},
        {"IvaTabela", &V::IvaTabela},
        {"IvaTaxa", &V::IvaTaxa},
        {"ValorIva", &V::ValorIva},
        {"DescontoPer1", &V::DescontoPer1},
        {"DescontoPer2", &V::DescontoPer2},
        {"DescontoPer3", &V::DescontoPer3},
        {"DescontoPerGeral", &V::DescontoPerGeral},
        {"ValDescontoGeral", &V::ValDescontoGeral},
        {"ValDesconto1", &V::ValDesconto1},
        {"ValDesconto2", &V::ValDesconto2},
        {"ValDesconto3", &V::ValDesconto3},
        {"TotalDesconto", &V::TotalDesconto},
        {"ValDespesa", &V::ValDespesa},
        {"DespesaPer", &V::DespesaPer},
        {"ValorIliq", &V::ValorIliq},
        {"PVPAplicado", &V::PVPAplicado},
        {"PrecoAplicado", &V::PrecoAplicado},
        {"PMCusto", &V::PMCusto},
        {"UPCompra", &V::UPCompra},
        {"UPCusto", &V::UPCusto},
        {"Portes", &V::Portes},
        {"Terceiro", &V::Terceiro},
        {"CliFor", &V::CliFor},
        {"Unidade", &V::Unidade},
        {"Vendedor", &V::Vendedor},
        {"ComissaoPer", &V::ComissaoPer},
        {"Armazem", &V::Armazem},
        {"ArmazemDest", &V::ArmazemDest},
        {"AfectaCli", &V::AfectaCli},
        {"AfectaFor", &V::AfectaFor},
        {"AfectaStk", &V::AfectaStk},
        {"Caixa", &V::Caixa},
        {"Aplic", &V::Aplic},
        {"TipoEncomenda", &V::TipoEncomenda},
        {"NumEncomenda", &V::NumEncomenda},
        {"RegiEncomenda", &V::RegiEncomenda},
        {"TipoGuia", &V::TipoGuia},
        {"NumGuia", &V::NumGuia},
        {"DataGuia", &V::DataGuia},
        {"Estacao", &V::Estacao},
        {"Sexo", &V::Sexo},
        {"Referencia", &V::Referencia},
        {"Modelo", &V::Modelo},
        {"Cor", &V::Cor},
        {"Tamanho", &V::Tamanho},
        {"Comprimento", &V::Comprimento},
        {"Fornece", &V::Fornece},
        {"ObsLinha", &V::ObsLinha},
        {"Chave", &V::Chave},
        {"ContaContab", &V::ContaContab},
        {"Fechado", &V::Fechado},
        {"ProdDiversos", &V::ProdDiversos},
        {"Localizacao", &V::Localizacao},
        {"OutUniCod", &V::OutUniCod},
        {"OutUniQuant", &V::OutUniQuant},
        {"ImpTrans", &V::ImpTrans},
        {"Cambio", &V::Cambio},
        {"ValCambio", &V::ValCambio},
        {"Sinal", &V::Sinal},
        {"VendedorFixo", &V::VendedorFixo},
        {"Utilizador", &V::Utilizador},
        {"DataSys", &V::DataSys},
        {"Lote", &V::Lote},
        {"DataValidade", &V::DataValidade},
        {"DataFabrico", &V::DataFabrico},
        {"Integrou", &V::Integrou},
        {"TaxaIRS", &V::TaxaIRS},
        {"IncidIRS", &V::IncidIRS},
        {"ValorIRS", &V::ValorIRS},
        {"NumControlo", &V::NumControlo},
        {"Rotura", &V::Rotura},
        {"SelecFecha", &V::SelecFecha},
        {"Ordem_EDI", &V::Ordem_EDI},
        {"DataDevolucao", &V::DataDevolucao},
        {"Identifica", &V::Identifica},
        {"Paletes", &V::Paletes},
        {"Pecas", &V::Pecas},
        {"Bonus", &V::Bonus},
        {"DocPublicidade", &V::DocPublicidade},
        {"DocAssinatura", &V::DocAssinatura},
        {"NumOrdemAssiPub", &V::NumOrdemAssiPub},
        {"Travine", &V::Travine},
        {"CalculoFacturaDesconto", &V::CalculoFacturaDesconto},
        {"Promocao", &V::Promocao},
        {"ArmazemTemporario", &V::ArmazemTemporario},
        {"ArmazemTemporario_QtyChecked", &V::ArmazemTemporario_QtyChecked},
        {"Referencia_Troca", &V::Referencia_Troca},
        {"Armazem_PMCusto", &V::Armazem_PMCusto},
        {"Armazem_UPCompra", &V::Armazem_UPCompra},
        {"Armazem_UPCusto", &V::Armazem_UPCusto},
        {"IvaCustos_Taxa", &V::IvaCustos_Taxa},
        {"IvaCustos_Valor", &V::IvaCustos_Valor},
    };
    return campos;
}

QVariant valorParaColuna(const ValoresMovPro& valores, const CampoMovPro& campo) {
    return std::visit(
        [&valores](auto membro) -> QVariant {
            const auto& valor = valores.*membro;
            using T = std::decay_t<decltype(valor)>;
            if constexpr (std::is_same_v<T, QString>) {
                return valor.isNull() ? QStringLiteral("") : valor;
            } else if constexpr (std::is_same_v<T, Currency>) {
                return valor.toText();
            } else if constexpr (std::is_same_v<T, std::int64_t>) {
                return QVariant::fromValue<qlonglong>(valor);
            } else {
                return QVariant(valor);
            }
        },
        campo.campo);
}

std::int64_t MeteNoMovPro(Connection& conn, ValoresMovPro& valores) {
    ValoresMovPro linha = valores;
    if (linha.Identifica.trimmed().isEmpty())
        linha.Identifica = QUuid::createUuid().toString(QUuid::WithBraces).toUpper();
    QVariantList parametros;
    parametros.reserve(static_cast<qsizetype>(camposMovPro().size()));
    for (const CampoMovPro& c : camposMovPro())
        parametros << valorParaColuna(linha, c);
    // Built once per engine; the connection keeps the statement prepared for the next line.
    static const QString sqlite = instrucaoInsercao(Dialect(Engine::Sqlite));
    static const QString postgres = instrucaoInsercao(Dialect(Engine::Postgres));
    const QString& sql = conn.engine() == Engine::Postgres ? postgres : sqlite;
    const auto novo = conn.firstRow(sql, parametros);
    if (!novo) return 0;
    const std::int64_t numRegisto = novo->value(0).toLongLong();
    if (numRegisto > 0) valores.Identifica = linha.Identifica;
    return numRegisto;
}

}  // namespace brasel::db
