#pragma once

#include <QByteArray>
#include <QString>

#include <memory>
#include <optional>

// OpenSSL's key type, kept out of the callers' includes.
struct evp_pkey_st;

namespace brasel::documents {

// The eight components of a signing key as its file holds them, one a line in this order: the
// Base64 text of each big-endian number of an RSA key value.
struct ComponentesChave {
    QString Modulus;
    QString Exponent;
    QString P;
    QString Q;
    QString DP;
    QString DQ;
    QString InverseQ;
    QString D;
};

// Loads the key file: nullopt when it is missing or unreadable, or does not hold exactly eight
// lines of Base64 (blank lines and surrounding spaces are ignored, CR LF or LF endings).
std::optional<ComponentesChave> CarregaChave(const QString& ficheiro);

// An RSA key, private (from the key file) or public only (from a PEM file of its public half).
// Signatures are RSA with SHA-1 and PKCS#1 v1.5 padding, so the same text and key always give
// the same signature; they travel as Base64 text. Texts are signed as their UTF-8 bytes.
class ChaveRsa {
  public:
    // The key of a deployment's key file. The parsed key is kept while the file keeps its path,
    // size and modification time, so signing a closing does not parse and check it again.
    // nullopt when the file cannot be loaded or its numbers do not make a consistent key.
    static std::optional<ChaveRsa> doFicheiro(const QString& ficheiro);
    static std::optional<ChaveRsa> dosComponentes(const ComponentesChave& c);
    // The public half written by GeraChave (or any PEM public RSA key): verifies, never signs.
    static std::optional<ChaveRsa> doPemPublico(const QString& ficheiroPem);
    // A fresh key of `bits` bits with public exponent 65537.
    static std::optional<ChaveRsa> gera(int bits);

    bool privada() const;
    // The Base64 signature of `texto`; "" for a public-only key or when OpenSSL refuses.
    QString assina(const QString& texto) const;
    // Whether `assinatura` (Base64) is this key's signature of `texto`.
    bool confere(const QString& texto, const QString& assinatura) const;
    // The public half as PEM text, for `openssl dgst -sha1 -verify`.
    QByteArray pemPublico() const;
    // The eight components, each zero-padded to the width of its number (172 characters for the
    // modulus and D of a 1024-bit key, 88 for P, Q, DP, DQ and InverseQ). nullopt for a public
    // key.
    std::optional<ComponentesChave> componentes() const;

  private:
    explicit ChaveRsa(std::shared_ptr<evp_pkey_st> chave) : chave_(std::move(chave)) {}
    std::shared_ptr<evp_pkey_st> chave_;
};

// Signs `texto` with the key of `ficheiroChave`: the Base64 signature, or "" when the key file
// cannot be loaded or the signing fails.
QString Assina_Nova(const QString& texto, const QString& ficheiroChave);

// Makes a fresh 1024-bit key: the key file `ficheiro` (eight lines, readable by its owner only)
// and its public half `ficheiro` + ".pub.pem". An existing key file is never overwritten: a
// deployment's chains depend on it. False, with the reason in `erro`, when nothing was written.
bool GeraChave(const QString& ficheiro, QString* erro);

// Where GeraChave writes the public half of `ficheiro`.
QString ficheiroPemPublico(const QString& ficheiroChave);

}  // namespace brasel::documents
