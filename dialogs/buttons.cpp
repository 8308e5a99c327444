// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/buttons.h"

#include <QPushButton>
#include <QShortcut>

namespace buttons {

void pressByReturn(QPushButton *button)
{
    for (const Qt::Key key : {Qt::Key_Return, Qt::Key_Enter}) {
        const auto *shortcut = new QShortcut{key, button, nullptr, nullptr, Qt::WidgetShortcut};
        QObject::connect(shortcut, &QShortcut::activated, button, &QPushButton::click);
    }
}

void disable(QPushButton *button, QWidget *next)
{
    if (button->hasFocus())
        next->setFocus();
    button->setEnabled(false);
}

} // namespace buttons
