// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>
#include <QDialogButtonBox>
#include <QTest>

/// Finds the widgets of dialogs and drives them with real events.
namespace driver {

/// Shows the dialog; fails the test unless it becomes active and a widget gets the focus.
void open(QDialog &dialog);

/// The widget of the class and name, or of the class alone where the name is empty; ends the test without one.
template<typename Widget>
Widget *find(const QWidget &parent, const QString &name = {})
{
    auto *widget = parent.findChild<Widget *>(name.isEmpty() ? QString{} : name);
    if (!widget)
        qFatal("no widget \"%s\" in %s", qPrintable(name), parent.metaObject()->className());
    return widget;
}

/// Replaces what the focused widget holds.
void retype(const QString &text);
/// Presses the key in the focused widget.
void press(Qt::Key key, Qt::KeyboardModifiers modifiers = {});
void click(QWidget *widget);
/// Clicks a button of the dialog's button box.
void click(const QDialog &dialog, QDialogButtonBox::StandardButton button);

} // namespace driver
