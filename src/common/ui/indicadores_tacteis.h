#pragma once

#include <QWidget>

namespace brasel {

// Check boxes, option buttons and the check boxes of lists inside `janela` made large enough
// for a finger (their texts keep the window's font).
void aplicaIndicadoresTacteis(QWidget* janela);

}  // namespace brasel
