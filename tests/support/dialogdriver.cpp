// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/support/dialogdriver.h"

#include <QApplication>
#include <QPushButton>

namespace driver {

void open(QDialog &dialog)
{
    dialog.show();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    QTRY_VERIFY(QApplication::focusWidget());
}

void retype(const QString &text)
{
    press(Qt::Key_A, Qt::ControlModifier);
    press(Qt::Key_Delete);
    QTest::keyClicks(QApplication::focusWidget(), text);
}

void press(Qt::Key key, Qt::KeyboardModifiers modifiers)
{
    QVERIFY(QApplication::focusWidget());
    QTest::keyClick(QApplication::focusWidget(), key, modifiers);
}

void click(QWidget *widget) { QTest::mouseClick(widget, Qt::LeftButton); }

void click(const QDialog &dialog, QDialogButtonBox::StandardButton button)
{
    click(find<QDialogButtonBox>(dialog)->button(button));
}

} // namespace driver
