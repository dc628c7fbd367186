#pragma once

#include <QString>

namespace brasel {

// The settings of this workstation and OS user, kept apart per application ("Brasel" for the
// program's own, "Montiva" for the server list the suite shares): one INI file per application
// in the settings folder. Every call reads or writes the file at once, so two programs of the
// same user see each other's changes.

// BRASEL_SETTINGS_DIR when set (tests, or several workstations on one machine), otherwise the
// user's configuration folder + "/Brasel".
QString pastaDefinicoes();

// The stored value, or `omissao` when the key was never written.
QString GetSetting(const QString& app, const QString& seccao, const QString& chave,
                   const QString& omissao = {});
// False when the file could not be written (the value is then not kept).
bool SaveSetting(const QString& app, const QString& seccao, const QString& chave,
                 const QString& valor);
// Forgets the key, so that the next read gives its default again.
bool DeleteSetting(const QString& app, const QString& seccao, const QString& chave);

}  // namespace brasel
