#include "documents/chave_assinatura.h"

#include <QDateTime>
#include <QFile>
#include <QFileInfo>
#include <QRegularExpression>
#include <QStringList>

#include <openssl/bio.h>
#include <openssl/bn.h>
#include <openssl/core_names.h>
#include <openssl/evp.h>
#include <openssl/param_build.h>
#include <openssl/pem.h>
#include <openssl/rsa.h>

#include <array>
#include <mutex>

namespace brasel::documents {

namespace {

constexpr int kBitsChave = 1024;

template <typename T, void (*Liberta)(T*)>
struct Libertador {
    void operator()(T* p) const { Liberta(p); }
};
using Bn = std::unique_ptr<BIGNUM, Libertador<BIGNUM, BN_clear_free>>;
using ParamBld = std::unique_ptr<OSSL_PARAM_BLD, Libertador<OSSL_PARAM_BLD, OSSL_PARAM_BLD_free>>;
using Params = std::unique_ptr<OSSL_PARAM, Libertador<OSSL_PARAM, OSSL_PARAM_free>>;
using PkeyCtx = std::unique_ptr<EVP_PKEY_CTX, Libertador<EVP_PKEY_CTX, EVP_PKEY_CTX_free>>;
using MdCtx = std::unique_ptr<EVP_MD_CTX, Libertador<EVP_MD_CTX, EVP_MD_CTX_free>>;

struct LibertaBio {
    void operator()(BIO* b) const { BIO_free(b); }
};
using Bio = std::unique_ptr<BIO, LibertaBio>;

std::shared_ptr<EVP_PKEY> partilhada(EVP_PKEY* k) {
    if (k == nullptr) return {};
    return std::shared_ptr<EVP_PKEY>(k, EVP_PKEY_free);
}

// The names OpenSSL gives the eight numbers, in the file's order.
struct Componente {
    QString ComponentesChave::*membro;
    const char* nome;
    bool metade;  // as wide as half the modulus
};
constexpr std::array<Componente, 8> kComponentes{{
    {&ComponentesChave::Modulus, OSSL_PKEY_PARAM_RSA_N, false},
    {&ComponentesChave::Exponent, OSSL_PKEY_PARAM_RSA_E, false},
    {&ComponentesChave::P, OSSL_PKEY_PARAM_RSA_FACTOR1, true},
    {&ComponentesChave::Q, OSSL_PKEY_PARAM_RSA_FACTOR2, true},
    {&ComponentesChave::DP, OSSL_PKEY_PARAM_RSA_EXPONENT1, true},
    {&ComponentesChave::DQ, OSSL_PKEY_PARAM_RSA_EXPONENT2, true},
    {&ComponentesChave::InverseQ, OSSL_PKEY_PARAM_RSA_COEFFICIENT1, true},
    {&ComponentesChave::D, OSSL_PKEY_PARAM_RSA_D, false},
}};

std::optional<QByteArray> base64(const QString& texto) {
    const auto r =
        QByteArray::fromBase64Encoding(texto.toLatin1(), QByteArray::AbortOnBase64DecodingErrors);
    if (!r || r.decoded.isEmpty()) return std::nullopt;
    return r.decoded;
}

// The parsed key of the last file asked for, kept while the file is unchanged.
struct Cache {
    std::mutex guarda;
    QString caminho;
    QDateTime alterado;
    qint64 tamanho = -1;
    std::shared_ptr<EVP_PKEY> chave;
};

Cache& cache() {
    static Cache c;
    return c;
}

bool escreveFicheiro(const QString& caminho, const QByteArray& conteudo,
                     QFileDevice::Permissions permissoes, QString* erro) {
    QFile f(caminho);
    if (!f.open(QIODevice::WriteOnly | QIODevice::NewOnly, permissoes) ||
        f.write(conteudo) != conteudo.size() || !f.flush()) {
        if (erro)
            *erro =
                QStringLiteral("Não foi possível escrever %1: %2").arg(caminho, f.errorString());
        return false;
    }
    return true;
}

}  // namespace

std::optional<ComponentesChave> CarregaChave(const QString& ficheiro) {
    if (ficheiro.isEmpty()) return std::nullopt;
    QFile f(ficheiro);
    if (!f.open(QIODevice::ReadOnly)) return std::nullopt;
    // A key file has eight short lines; anything much larger is not one.
    const QByteArray conteudo = f.read(64 * 1024);
    QStringList linhas;
    for (const QString& l :
         QString::fromLatin1(conteudo).split(QRegularExpression(QStringLiteral("\r?\n")))) {
        if (!l.trimmed().isEmpty()) linhas << l.trimmed();
    }
    if (linhas.size() != static_cast<qsizetype>(kComponentes.size())) return std::nullopt;
    ComponentesChave c;
    for (std::size_t i = 0; i < kComponentes.size(); ++i) {
        const QString& linha = linhas[static_cast<qsizetype>(i)];
        if (!base64(linha)) return std::nullopt;
        c.*kComponentes[i].membro = linha;
    }
    return c;
}

std::optional<ChaveRsa> ChaveRsa::doFicheiro(const QString& ficheiro) {
    const QFileInfo info(ficheiro);
    if (ficheiro.isEmpty() || !info.isFile()) return std::nullopt;
    Cache& c = cache();
    const std::lock_guard bloqueio(c.guarda);
    const QString caminho = info.absoluteFilePath();
    if (c.chave && c.caminho == caminho && c.alterado == info.lastModified() &&
        c.tamanho == info.size()) {
        return ChaveRsa(c.chave);
    }
    const auto componentes = CarregaChave(ficheiro);
    if (!componentes) return std::nullopt;
    auto chave = dosComponentes(*componentes);
    if (!chave) return std::nullopt;
    c.caminho = caminho;
    c.alterado = info.lastModified();
    c.tamanho = info.size();
    c.chave = chave->chave_;
    return chave;
}

std::optional<ChaveRsa> ChaveRsa::dosComponentes(const ComponentesChave& c) {
    std::array<Bn, kComponentes.size()> numeros;
    const ParamBld bld(OSSL_PARAM_BLD_new());
    if (!bld) return std::nullopt;
    for (std::size_t i = 0; i < kComponentes.size(); ++i) {
        const auto bytes = base64(c.*kComponentes[i].membro);
        if (!bytes) return std::nullopt;
        numeros[i].reset(BN_bin2bn(reinterpret_cast<const unsigned char*>(bytes->constData()),
                                   static_cast<int>(bytes->size()), nullptr));
        if (!numeros[i] ||
            OSSL_PARAM_BLD_push_BN(bld.get(), kComponentes[i].nome, numeros[i].get()) != 1) {
            return std::nullopt;
        }
    }
    const Params params(OSSL_PARAM_BLD_to_param(bld.get()));
    const PkeyCtx ctx(EVP_PKEY_CTX_new_from_name(nullptr, "RSA", nullptr));
    EVP_PKEY* k = nullptr;
    if (!params || !ctx || EVP_PKEY_fromdata_init(ctx.get()) != 1 ||
        EVP_PKEY_fromdata(ctx.get(), &k, EVP_PKEY_KEYPAIR, params.get()) != 1) {
        return std::nullopt;
    }
    auto chave = partilhada(k);
    // Eight numbers that do not belong together would sign without complaint and every
    // signature would fail to verify: the whole key is checked once, when loaded.
    const PkeyCtx verifica(EVP_PKEY_CTX_new_from_pkey(nullptr, chave.get(), nullptr));
    if (!verifica || EVP_PKEY_check(verifica.get()) != 1) return std::nullopt;
    return ChaveRsa(std::move(chave));
}

std::optional<ChaveRsa> ChaveRsa::doPemPublico(const QString& ficheiroPem) {
    QFile f(ficheiroPem);
    if (ficheiroPem.isEmpty() || !f.open(QIODevice::ReadOnly)) return std::nullopt;
    const QByteArray pem = f.read(64 * 1024);
    const Bio bio(BIO_new_mem_buf(pem.constData(), static_cast<int>(pem.size())));
    if (!bio) return std::nullopt;
    auto chave = partilhada(PEM_read_bio_PUBKEY(bio.get(), nullptr, nullptr, nullptr));
    if (!chave || !EVP_PKEY_is_a(chave.get(), "RSA")) return std::nullopt;
    return ChaveRsa(std::move(chave));
}

std::optional<ChaveRsa> ChaveRsa::gera(int bits) {
    const PkeyCtx ctx(EVP_PKEY_CTX_new_from_name(nullptr, "RSA", nullptr));
    EVP_PKEY* k = nullptr;
    if (!ctx || EVP_PKEY_keygen_init(ctx.get()) != 1 ||
        EVP_PKEY_CTX_set_rsa_keygen_bits(ctx.get(), bits) != 1 ||
        EVP_PKEY_generate(ctx.get(), &k) != 1) {
        return std::nullopt;
    }
    return ChaveRsa(partilhada(k));
}

bool ChaveRsa::privada() const {
    BIGNUM* d = nullptr;
    const bool tem = EVP_PKEY_get_bn_param(chave_.get(), OSSL_PKEY_PARAM_RSA_D, &d) == 1;
    BN_clear_free(d);
    return tem;
}

QString ChaveRsa::assina(const QString& texto) const {
    if (!privada()) return {};
    const QByteArray dados = texto.toUtf8();
    const MdCtx md(EVP_MD_CTX_new());
    EVP_PKEY_CTX* pctx = nullptr;
    std::size_t tamanho = 0;
    if (!md ||
        EVP_DigestSignInit_ex(md.get(), &pctx, "SHA1", nullptr, nullptr, chave_.get(), nullptr) !=
            1 ||
        EVP_PKEY_CTX_set_rsa_padding(pctx, RSA_PKCS1_PADDING) != 1 ||
        EVP_DigestSign(md.get(), nullptr, &tamanho,
                       reinterpret_cast<const unsigned char*>(dados.constData()),
                       static_cast<std::size_t>(dados.size())) != 1) {
        return {};
    }
    QByteArray assinatura(static_cast<qsizetype>(tamanho), '\0');
    if (EVP_DigestSign(md.get(), reinterpret_cast<unsigned char*>(assinatura.data()), &tamanho,
                       reinterpret_cast<const unsigned char*>(dados.constData()),
                       static_cast<std::size_t>(dados.size())) != 1) {
        return {};
    }
    assinatura.truncate(static_cast<qsizetype>(tamanho));
    return QString::fromLatin1(assinatura.toBase64());
}

bool ChaveRsa::confere(const QString& texto, const QString& assinatura) const {
    const auto bytes = base64(assinatura);
    if (!bytes) return false;
    const QByteArray dados = texto.toUtf8();
    const MdCtx md(EVP_MD_CTX_new());
    EVP_PKEY_CTX* pctx = nullptr;
    return md &&
           EVP_DigestVerifyInit_ex(md.get(), &pctx, "SHA1", nullptr, nullptr, chave_.get(),
                                   nullptr) == 1 &&
           EVP_PKEY_CTX_set_rsa_padding(pctx, RSA_PKCS1_PADDING) == 1 &&
           EVP_DigestVerify(md.get(), reinterpret_cast<const unsigned char*>(bytes->constData()),
                            static_cast<std::size_t>(bytes->size()),
                            reinterpret_cast<const unsigned char*>(dados.constData()),
                            static_cast<std::size_t>(dados.size())) == 1;
}

QByteArray ChaveRsa::pemPublico() const {
    const Bio bio(BIO_new(BIO_s_mem()));
    if (!bio || PEM_write_bio_PUBKEY(bio.get(), chave_.get()) != 1) return {};
    char* dados = nullptr;
    const long tamanho = BIO_get_mem_data(bio.get(), &dados);
    return QByteArray(dados, static_cast<qsizetype>(tamanho));
}

std::optional<ComponentesChave> ChaveRsa::componentes() const {
    if (!privada()) return std::nullopt;
    const int largura = EVP_PKEY_get_size(chave_.get());
    ComponentesChave c;
    for (const Componente& comp : kComponentes) {
        BIGNUM* n = nullptr;
        if (EVP_PKEY_get_bn_param(chave_.get(), comp.nome, &n) != 1) return std::nullopt;
        const Bn numero(n);
        const int bytes = comp.membro == &ComponentesChave::Exponent ? BN_num_bytes(n)
                          : comp.metade                              ? (largura + 1) / 2
                                                                     : largura;
        QByteArray binario(bytes, '\0');
        if (BN_bn2binpad(n, reinterpret_cast<unsigned char*>(binario.data()), bytes) != bytes) {
            return std::nullopt;
        }
        c.*comp.membro = QString::fromLatin1(binario.toBase64());
    }
    return c;
}

QString Assina_Nova(const QString& texto, const QString& ficheiroChave) {
    const auto chave = ChaveRsa::doFicheiro(ficheiroChave);
    return chave ? chave->assina(texto) : QString();
}

QString ficheiroPemPublico(const QString& ficheiroChave) {
    return ficheiroChave + QStringLiteral(".pub.pem");
}

bool GeraChave(const QString& ficheiro, QString* erro) {
    const auto falha = [erro](const QString& texto) {
        if (erro) *erro = texto;
        return false;
    };
    if (ficheiro.isEmpty()) return falha(QStringLiteral("Falta o nome do ficheiro da chave."));
    if (QFileInfo::exists(ficheiro)) {
        return falha(QStringLiteral("O ficheiro %1 já existe: a chave existente não é substituída.")
                         .arg(ficheiro));
    }
    const auto chave = ChaveRsa::gera(kBitsChave);
    const auto c = chave ? chave->componentes() : std::nullopt;
    if (!c) return falha(QStringLiteral("Não foi possível gerar a chave."));
    QByteArray texto;
    for (const Componente& comp : kComponentes)
        texto += ((*c).*comp.membro).toLatin1() + '\n';
    const QString pem = ficheiroPemPublico(ficheiro);
    QFile::remove(pem);
    return escreveFicheiro(ficheiro, texto, QFileDevice::ReadOwner | QFileDevice::WriteOwner,
                           erro) &&
           escreveFicheiro(pem, chave->pemPublico(),
                           QFileDevice::ReadOwner | QFileDevice::WriteOwner |
                               QFileDevice::ReadGroup | QFileDevice::ReadOther,
                           erro);
}

}  // namespace brasel::documents
