// The company's parameters, its users and their settings, the lock and version rows, the log
// and the device definitions.
#include "db/schema/construtor.h"

namespace brasel::db::schema {

namespace {

// cliarre<valor> .. cliarre<totalgeral>, then clidec<valor> .. : one family of documents.
QList<Coluna> arredondamentosFamilia(const QString& prefixo, const QStringList& sufixos) {
    QList<Coluna> colunas;
    for (const char* meio : {"arre", "dec"}) {
        for (const QString& sufixo : sufixos) {
            colunas.append({prefixo + QString::fromLatin1(meio) + sufixo, Tipo::Inteiro, {}});
        }
    }
    return colunas;
}

Tabela paramGeral() {
    const QStringList caixa = {QStringLiteral("mergeral"), QStringLiteral("descgeral"),
                               QStringLiteral("ivageral"), QStringLiteral("totalgeral")};
    return Def("ParamGeral")
        .montante({"taxajuromora", "impostoselo"})
        .texto({"tipojuromora"})
        .inteiro({"registosVisualizar"})
        .texto({"tipoavencas", "txivaavencas"})
        .montante({"LimiteRecapitulativos"})
        .inteiro({"casadec", "casadecpreco", "casadecquant", "casadecquantOutUni", "ActualizaUPC"})
        // The national currency's code (a Cambios row): also the company's currency code.
        .texto({"cambiodef", "cambioeuro"})
        .inteiro({"zerarclientes", "zerarfornece", "zerarproduto", "ControlaProdutoFornecedor"})
        .colunas(arredondamentosFamilia(QStringLiteral("cli"), sufixosArredondamento()))
        .colunas(arredondamentosFamilia(QStringLiteral("for"), sufixosArredondamento()))
        .colunas(arredondamentosFamilia(QStringLiteral("cai"), caixa))
        .inteiro({"banarre", "bandec"})
        .texto({"MensagCli", "Mensagfor", "Mensagpro", "MensagproPMC", "controlaquant", "docaberto",
                "Clidiversos", "forndiversos", "proddiversos", "proddiversos2", "Ano", "mes",
                "controlaano", "controlames"})
        .inteiro({"GridLine", "ContinuaAdicionar"})
        .texto({"AfectaDep", "AfectaLev"})
        .inteiro({"prontovestir"})
        .texto({"NomeEstacao", "NomeSexo", "NomeReferencia", "NomeModelo", "NomeCor", "NomeTamanho",
                "NomeComprimento", "AnoCalculo"})
        .inteiro({"ImpCabecalhos", "controlespecifico", "controlOficial"})
        // A database this program made or brought up to date is converted.
        .coluna(QStringLiteral("ConverteuNVARCHAR"), Tipo::Inteiro, "1")
        .texto({"NomeEmpresa", "Server", "empresa", "Login", "Password", "ContabAutenticaSQL",
                "ServerSNC", "empresaSNC", "LoginSNC", "PasswordSNC", "ContabAutenticaSQLSNC"})
        .inteiro({"corte1", "corte2", "DIVISAO"})
        .texto({"Prefixo1Preco", "Prefixo2Preco"})
        .inteiro({"PrefixoPrecoCorte1", "PrefixoPrecoCorte2", "PrefixoPrecoDivisor"})
        .texto({"Prefixo1Quant", "Prefixo2Quant"})
        .inteiro({"PrefixoQuantCorte1", "PrefixoQuantCorte2", "PrefixoQuantDivisor"})
        .texto({"CodigoBarras"})
        .inteiro({"ActivaHashAntes2011", "CopiaDocumentoOriginal"})
        .montante({"TaxaInerente"})
        .inteiro({"FormulaPrecoMedioCusto", "PMCArmazem"})
        .texto({"PrecoTranfAcertos", "UltPrecoCusto"})
        .inteiro({"FormulaCalcCambioB", "TabDescontosMandaDataVazia", "ControlaIVA_FAF",
                  "TipoCursor_Print", "ZeraDepart", "EMail_CertificaPDF"})
        .texto({"EMail_FicheiroCertificadoNome", "EMail_CertificadoPassword",
                "EMail_CertificadoRazao", "EMail_CertificadoLocalidade"})
        .inteiro({"EMail_RecebeRecibo"})
        .texto({"EMail_Recibo", "EMail_Assunto", "EMail_CorpoMensagem"})
        // The company's default warehouse, handed to the posting of open lines.
        .texto({"armazem"})
        .texto({"TipoSICliD", "TipoSICliC", "TipoSIForD", "TipoSIForC", "TipoSIBanD", "TipoSIBanC",
                "TipoSIPro", "TipoSICaiD", "TipoSICaiC"})
        .umaLinha();
}

Tabela utilConfGeral() {
    return Def("UtilConfGeral")
        .texto({"utilizador", "armazem", "caixa", "tipofac"})
        .inteiro({"VariosPagaComo", "AltCaixa"})
        .texto({"TipoImpTalao"})
        .inteiro({"imptotal", "impivas", "IvaIncluido", "SaltaLinhas", "PausaImpressao",
                  "DecimaisImpTaloes", "CaixaDinheiroPorDrive", "UsaDisplay"})
        .texto({"CodigoDisplay", "PortaTalao"})
        .inteiro({"ImpTalaoViasTipoMov"})
        .texto({"VendaPronto", "VendaCredito", "DVendaPronto", "DVendaCredito", "VendaProntoB",
                "VendaCreditoB"})
        .inteiro({"MostraCliDiverso"})
        .texto({"ClientesDiv"})
        // Logging stays on unless a user's row says 0.
        .coluna(QStringLiteral("ActivaLogGeral"), Tipo::Inteiro, "1")
        .texto({"Precario"})
        .inteiro({"PVP"})
        .texto({"Descontos"})
        .inteiro({"Desconto1", "Desconto2", "Desconto3"})
        .texto({"DescFFpro", "VendDef", "vendedorUtil", "DescGERAL", "AltTipoMov", "Impressora"})
        .inteiro({"TemBalanca", "LancaSemContribuinte"})
        .texto({"ConfirmacaoEncerramento"})
        .inteiro({"MostrarFormFechaDoc", "MostrarFormCliDiversos", "abrecaixa"})
        .texto({"Obs1", "Obs2", "Obs3"})
        .unico({"utilizador"});
}

}  // namespace

void acrescentaConfiguracao(QList<Tabela>& t) {
    t.append(paramGeral());
    t.append(Def("Actualiza").texto({"Versao"}).umaLinha());
    t.append(Def("LockFacCli").inteiro({"tmp"}).umaLinha());
    t.append(Def("LockCli").inteiro({"Tmp"}).umaLinha());
    t.append(Def("Utilizador")
                 .texto({"Codigo", "Login", "Password", "DataSys"})
                 .inteiro({"UsoPOS"})
                 .unico({"Codigo"})
                 .unico({"Login"}, "Login<>''"));
    t.append(utilConfGeral());
    t.append(Def("UtilConfig_Div")
                 .texto({"Utilizador", "NomeForm", "Chave", "Conteudo", "TipoConteudo", "DataSys"})
                 .unico({"Utilizador", "NomeForm", "Chave"}));
    t.append(Def("Acessos")
                 .texto({"utilizador", "chave"})
                 .inteiro({"value"})
                 .texto({"chave1", "form", "ctrl", "caption", "ctrlcap"})
                 .unico({"utilizador", "chave"}));
    t.append(Def("LogGeral")
                 .texto({"Utilizador", "Modulo", "Accao", "Observa", "Descricao"})
                 .montante({"Valor"})
                 .texto({"Tipo", "Numero", "Ano", "Produto", "Terceiro", "DataSys"}));
    t.append(Def("QuorilComNet_Config").texto({"Servidor", "Login", "Password"}));
    t.append(Def("ImpTaloes")
                 .texto({"Codigo", "Descricao", "COM", "abrircaixa", "feednlines", "small_on",
                         "medium_on", "large_on", "large_off", "corte", "cor0", "cor1", "reset",
                         "setinternationalCHR"})
                 .unico({"Codigo"}));
    t.append(
        Def("TabDisplay")
            .texto({"Codigo", "Descricao"})
            .inteiro({"Porta", "NumLetras"})
            .texto({"Limpa", "InitMostrador", "InitLinha1", "FimLinha1", "InitLinha2", "FimLinha2"})
            .inteiro({"Alinha1", "Alinha2"})
            .unico({"Codigo"}));
    t.append(Def("ConfigProd").texto({"TipoSaida", "TipoEnt", "Fornece", "cliente"}));
    t.append(Def("PDocumentos", "Record").texto({"Codigo", "Descricao"}));
    t.append(Def("pcampos").texto({"Documento", "Campo"}).inteiro({"Linha", "Coluna", "Largura"}));
}

}  // namespace brasel::db::schema
