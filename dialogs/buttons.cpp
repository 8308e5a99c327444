// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/buttons.h"

#include <QAbstractButton>
#include <QShortcut>

namespace buttons {

void pressByReturn(QAbstractButton *button)
{
    for (const Qt::Key key : {Qt::Key_Return, Qt::Key_Enter}) {
        const auto *shortcut = new QShortcut{key, button, nullptr, nullptr, Qt::WidgetShortcut};
        QObject::connect(shortcut, &QShortcut::activated, button, &QAbstractButton::click);
    }
}

void disable(QAbstractButton *button, QWidget *next)
{
    if (button->hasFocus())
        next->setFocus();
    button->setEnabled(false);
}

} // namespace buttons
