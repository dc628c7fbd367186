#pragma once

#include <QGuiApplication>

namespace brasel::testing {

// The graphical application of a test program without windows (page printing needs its fonts,
// serial ports its event machinery), made by the first test that needs it and never destroyed,
// like the window tests' own.
inline QGuiApplication& aplicacaoGui() {
    if (auto* existente = qobject_cast<QGuiApplication*>(QCoreApplication::instance()))
        return *existente;
    static int argc = 1;
    static char nome[] = "brasel-testes";
    static char* argv[] = {nome, nullptr};
    static QGuiApplication* aplicacao = new QGuiApplication(argc, argv);
    return *aplicacao;
}

}  // namespace brasel::testing
