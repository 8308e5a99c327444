// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/keyboardmenu.h"

#include <QAbstractItemView>
#include <QApplication>
#include <QContextMenuEvent>
#include <QShortcut>

KeyboardMenu::KeyboardMenu(QAbstractItemView *view)
    : QObject{view}
    , m_view{view}
{
    view->installEventFilter(this);
    // Qt knows the menu key only.
    const QKeySequence key{QStringLiteral("Shift+F10")};
    const auto *shortcut = new QShortcut{key, view, nullptr, nullptr, Qt::WidgetShortcut};
    connect(shortcut, &QShortcut::activated, this, &KeyboardMenu::request);
}

bool KeyboardMenu::eventFilter(QObject * /*watched*/, QEvent *event)
{
    const bool isByKey{event->type() == QEvent::ContextMenu &&
                       static_cast<QContextMenuEvent *>(event)->reason() == QContextMenuEvent::Keyboard};
    if (isByKey)
        request();
    return isByKey;
}

void KeyboardMenu::request()
{
    const QModelIndex current{m_view->currentIndex()};
    if (!current.isValid() || QApplication::activePopupWidget())
        return;
    m_view->scrollTo(current);
    const QRect cell{m_view->visualRect(current).intersected(m_view->viewport()->rect())};
    emit requested(m_view->viewport()->mapToGlobal(cell.bottomLeft()));
}
