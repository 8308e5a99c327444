// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/plainmessagebox.h"

#include <QLabel>

PlainMessageBox::PlainMessageBox(Icon icon, const QString &title, const QString &text, StandardButtons buttons,
                                 QWidget *parent)
    : QMessageBox{parent}
{
    setIcon(icon);
    setWindowTitle(title);
    setTextFormat(Qt::PlainText);
    setText(text);
    setStandardButtons(buttons);
}

void PlainMessageBox::setPlainInformativeText(const QString &text)
{
    // The format of the box is that of its text alone, and the label for this one is made with its first text.
    setInformativeText(text.isEmpty() ? text : QStringLiteral(" "));
    if (auto *label = findChild<QLabel *>(QStringLiteral("qt_msgbox_informativelabel")))
        label->setTextFormat(Qt::PlainText);
    setInformativeText(text);
    // A screen reader has read an open box, and notices what is new of the button that has the keyboard only.
    if (QWidget * focused{isVisible() ? focusWidget() : nullptr})
        focused->setAccessibleDescription(text);
}
