// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>
#include <QDialogButtonBox>
#include <QTest>

/// What the tests of the dialogs have in common: they find widgets by name and drive them with real events.
namespace driver {

/// Shows the dialog, active and with its focus; fails the test when that does not come about.
void open(QDialog &dialog);

/// The widget of the class and name; an empty name stands for the only one of the class. Fails the test without it.
template<typename Widget>
Widget *find(const QWidget &parent, const QString &name = {})
{
    auto *widget = parent.findChild<Widget *>(name.isEmpty() ? QString{} : name);
    if (!widget)
        qFatal("no widget \"%s\" in %s", qPrintable(name), parent.metaObject()->className());
    return widget;
}

/// Types over what the focused widget holds.
void retype(const QString &text);
/// The key to the focused widget.
void press(Qt::Key key, Qt::KeyboardModifiers modifiers = {});
void click(QWidget *widget);
/// Clicks a button of the dialog's button box.
void click(const QDialog &dialog, QDialogButtonBox::StandardButton button);

} // namespace driver
