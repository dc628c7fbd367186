#include "common/cls_encripta.h"

#include <QByteArray>
#include <QStringDecoder>

#include <openssl/evp.h>
#include <openssl/provider.h>

#include <memory>
#include <optional>

namespace brasel {

namespace {

constexpr int kAlgoritmoBlowfish = 0;
constexpr int kBlocoBlowfish = 8;

// Blowfish lives in OpenSSL's "legacy" provider. It is loaded, with "default", into a library
// context of our own, so nothing else in the process changes what it fetches. The mode is ECB
// with PKCS#7 padding: the key is fixed and public, so the cipher only keeps the passwords from
// being read at a glance, and a deterministic text is what the stored list has always held.
class Blowfish {
  public:
    Blowfish() {
        ctx_ = OSSL_LIB_CTX_new();
        if (ctx_ == nullptr) return;
        legacy_ = OSSL_PROVIDER_load(ctx_, "legacy");
        default_ = OSSL_PROVIDER_load(ctx_, "default");
        if (legacy_ != nullptr && default_ != nullptr) {
            cipher_ = EVP_CIPHER_fetch(ctx_, "BF-ECB", nullptr);
        }
    }
    ~Blowfish() {
        EVP_CIPHER_free(cipher_);
        if (default_ != nullptr) OSSL_PROVIDER_unload(default_);
        if (legacy_ != nullptr) OSSL_PROVIDER_unload(legacy_);
        OSSL_LIB_CTX_free(ctx_);
    }
    Blowfish(const Blowfish&) = delete;
    Blowfish& operator=(const Blowfish&) = delete;

    static const Blowfish& instancia() {
        static const Blowfish bf;
        return bf;
    }

    // nullopt when the key is refused, or when decrypting finds a text that is not ours.
    std::optional<QByteArray> aplicar(bool encriptar, const QByteArray& chave,
                                      const QByteArray& dados) const {
        if (cipher_ == nullptr || chave.isEmpty()) return std::nullopt;
        const std::unique_ptr<EVP_CIPHER_CTX, decltype(&EVP_CIPHER_CTX_free)> c(
            EVP_CIPHER_CTX_new(), &EVP_CIPHER_CTX_free);
        const int enc = encriptar ? 1 : 0;
        // The key length must be set before the key: Blowfish defaults to 16 bytes.
        if (!c || EVP_CipherInit_ex2(c.get(), cipher_, nullptr, nullptr, enc, nullptr) != 1 ||
            EVP_CIPHER_CTX_set_key_length(c.get(), static_cast<int>(chave.size())) != 1 ||
            EVP_CipherInit_ex2(c.get(), nullptr,
                               reinterpret_cast<const unsigned char*>(chave.constData()), nullptr,
                               enc, nullptr) != 1) {
            return std::nullopt;
        }
        QByteArray out(dados.size() + kBlocoBlowfish, '\0');
        auto* destino = reinterpret_cast<unsigned char*>(out.data());
        int n = 0;
        int fim = 0;
        if (EVP_CipherUpdate(c.get(), destino, &n,
                             reinterpret_cast<const unsigned char*>(dados.constData()),
                             static_cast<int>(dados.size())) != 1 ||
            EVP_CipherFinal_ex(c.get(), destino + n, &fim) != 1) {
            return std::nullopt;
        }
        out.truncate(n + fim);
        return out;
    }

  private:
    OSSL_LIB_CTX* ctx_ = nullptr;
    OSSL_PROVIDER* legacy_ = nullptr;
    OSSL_PROVIDER* default_ = nullptr;
    EVP_CIPHER* cipher_ = nullptr;
};

bool hexadecimal(const QString& texto) {
    for (const QChar c : texto) {
        if (!c.isDigit() && !(c >= QLatin1Char('a') && c <= QLatin1Char('f')) &&
            !(c >= QLatin1Char('A') && c <= QLatin1Char('F'))) {
            return false;
        }
    }
    return true;
}

}  // namespace

// An empty password is kept as empty text both ways: an entry without one stays blank.
QString clsEncripta::Encripta(int algoritmo, const QString& chave, const QString& texto) {
    if (algoritmo != kAlgoritmoBlowfish || texto.isEmpty()) return {};
    const auto cifrado = Blowfish::instancia().aplicar(true, chave.toUtf8(), texto.toUtf8());
    if (!cifrado) return {};
    return QString::fromLatin1(cifrado->toHex().toUpper());
}

QString clsEncripta::Desencripta(int algoritmo, const QString& chave, const QString& texto) {
    if (algoritmo != kAlgoritmoBlowfish || texto.isEmpty()) return {};
    if (texto.size() % (2 * kBlocoBlowfish) != 0 || !hexadecimal(texto)) return {};
    const auto claro =
        Blowfish::instancia().aplicar(false, chave.toUtf8(), QByteArray::fromHex(texto.toLatin1()));
    if (!claro) return {};
    QStringDecoder utf8(QStringDecoder::Utf8);
    const QString resultado = utf8.decode(*claro);
    return utf8.hasError() ? QString() : resultado;
}

QString clsEncripta::chaveEmpresas() {
    return QStringLiteral("NuncaAlterar");
}

}  // namespace brasel
