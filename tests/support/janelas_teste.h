#pragma once

// Finding and driving the controls of a window by name, modal dialogs included.
#include <QApplication>
#include <QPushButton>
#include <QTimer>
#include <QWidget>

#include <gtest/gtest.h>

#include <functional>

namespace brasel::testing {

template <class T>
T* filho(QWidget* janela, const char* nome) {
    T* w = janela ? janela->findChild<T*>(QString::fromLatin1(nome)) : nullptr;
    EXPECT_NE(w, nullptr) << nome;
    return w;
}

inline void clicar(QWidget* janela, const char* botao) {
    if (auto* b = filho<QPushButton>(janela, botao)) b->click();
}

// Runs `accao` on the modal dialog that the next call opens, once it waits for an answer.
inline void noDialogo(std::function<void(QWidget*)> accao) {
    QTimer::singleShot(0, [accao] {
        QWidget* dialogo = QApplication::activeModalWidget();
        EXPECT_NE(dialogo, nullptr);
        if (dialogo) accao(dialogo);
    });
}

}  // namespace brasel::testing
