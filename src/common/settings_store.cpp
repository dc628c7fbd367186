#include "common/settings_store.h"

#include <QDir>
#include <QSettings>
#include <QStandardPaths>
#include <QStringList>

namespace brasel {

namespace {

QString ficheiro(const QString& app) {
    return QDir(pastaDefinicoes()).filePath(app + QStringLiteral(".ini"));
}

QString chaveCompleta(const QString& seccao, const QString& chave) {
    return seccao + QLatin1Char('/') + chave;
}

// Writes through `alterar` and tells whether the file took it.
template <typename Alterar>
bool escrever(const QString& app, Alterar alterar) {
    if (!QDir().mkpath(pastaDefinicoes())) return false;
    QSettings s(ficheiro(app), QSettings::IniFormat);
    alterar(s);
    s.sync();
    return s.status() == QSettings::NoError;
}

}  // namespace

QString pastaDefinicoes() {
    const QString pasta = qEnvironmentVariable("BRASEL_SETTINGS_DIR");
    if (!pasta.isEmpty()) return pasta;
    return QStandardPaths::writableLocation(QStandardPaths::GenericConfigLocation) +
           QStringLiteral("/Brasel");
}

QString GetSetting(const QString& app, const QString& seccao, const QString& chave,
                   const QString& omissao) {
    const QSettings s(ficheiro(app), QSettings::IniFormat);
    const QVariant v = s.value(chaveCompleta(seccao, chave));
    if (!v.isValid()) return omissao;
    // A value edited by hand as a,b reads back as a list; it is still one text.
    if (v.typeId() == QMetaType::QStringList) return v.toStringList().join(QLatin1Char(','));
    return v.toString();
}

bool SaveSetting(const QString& app, const QString& seccao, const QString& chave,
                 const QString& valor) {
    return escrever(app, [&](QSettings& s) { s.setValue(chaveCompleta(seccao, chave), valor); });
}

bool DeleteSetting(const QString& app, const QString& seccao, const QString& chave) {
    return escrever(app, [&](QSettings& s) { s.remove(chaveCompleta(seccao, chave)); });
}

}  // namespace brasel
