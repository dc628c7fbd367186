#pragma once

#include "app/estado.h"

#include <QList>
#include <QMap>
#include <QString>

#include <functional>
#include <optional>

namespace brasel::app {

// The program's name: the first part of every rights key and the key of the program right.
inline const QString kPrograma = QStringLiteral("Brasel");

// What the rights need to know of a window: its name, caption and command buttons.
struct BotaoJanela {
    QString nome;     // objectName, e.g. "cmdGravarDoc"
    QString caption;  // as shown, with "&"
};
struct JanelaAcesso {
    QString nome;  // objectName, e.g. "frmFacturacao"
    QString caption;
    QList<BotaoJanela> botoes;
};

// Rights keys: program + window (+ suffix) for a window, the window key + "." + the button name
// for a button. The dot never occurs in window or button names, so keys stay unique and stable.
QString chaveJanela(const QString& janela, const QString& sufixo = {});
QString chaveBotao(const QString& chaveDaJanela, const QString& botao);

// Users "00" and "01" are never restricted.
bool utilizadorSemRestricoes(const QString& utilizador);
// Buttons the rights never touch: not named "cmd...", captions holding FECHA, CANCEL, VOLTA or SAI
// (the ways out of a window), and the answers cmdSim and cmdNao.
bool botaoRestringivel(const BotaoJanela& botao);

struct ResultadoAcesso {
    bool permitido = false;
    // Enabled state of each restrictable button, by name (empty for users without restrictions).
    QMap<QString, bool> botoes;
};

// The access check of a window: creates its rows (all granted) the first time a user opens it,
// then reads the window's right and its buttons' rights.
ResultadoAcesso FormAcessos(Estado& estado, const JanelaAcesso& janela, const QString& utilizador,
                            const QString& sufixo = {});

// Creates the missing rights rows of a window and of its restrictable buttons with `valor`.
void GetBotoes(Estado& estado, const JanelaAcesso& janela, const QString& utilizador, int valor,
               const QString& sufixo = {});

// The value of one right, or nullopt when the user has no row for it.
std::optional<int> CheckUtilizApp(Estado& estado, const QString& chave, const QString& utilizador);

// The program right and every window of `janelas` with its buttons, all granted (not for the
// users without restrictions).
void CriaTodososAcessos(Estado& estado, const QString& utilizador,
                        const QList<JanelaAcesso>& janelas);
// Deletes a user's rights; "TODOS" deletes every user's.
void ApagaTodososAcessos(Estado& estado, const QString& utilizador);

// One row of the rights editor's tree.
struct DireitoAcesso {
    QString chave;
    QString chave1;  // parent key
    QString form;
    QString ctrl;
    QString caption;
    QString ctrlcap;
    bool valor = false;
};
QList<DireitoAcesso> lerDireitos(Estado& estado, const QString& utilizador);
// Saves the values of the editor; never for user "00".
bool gravarDireitos(Estado& estado, const QString& utilizador,
                    const QList<DireitoAcesso>& direitos);

// The program's windows as the rights see them, made only when a user's rights must be created.
using FornecedorJanelas = std::function<QList<JanelaAcesso>()>;

// Whether a user may run the program: users without restrictions always; others by the program
// right, created granted with every window's rights when the user has none yet.
bool acessoPrograma(Estado& estado, const QString& utilizador, const FornecedorJanelas& janelas);

}  // namespace brasel::app
