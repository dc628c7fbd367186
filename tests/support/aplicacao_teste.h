#pragma once

#include <QApplication>

namespace brasel::testing {

// The one application object of a window test program, made by the first test that needs it.
// It is never destroyed: tearing it down among the exit handlers, after the statics of the
// platform plugin, crashes the program once a modal window has run.
inline QApplication& aplicacaoTeste() {
    if (auto* existente = qobject_cast<QApplication*>(QCoreApplication::instance()))
        return *existente;
    static int argc = 1;
    static char nome[] = "brasel-testes-janelas";
    static char* argv[] = {nome, nullptr};
    static QApplication* aplicacao = new QApplication(argc, argv);
    return *aplicacao;
}

}  // namespace brasel::testing
