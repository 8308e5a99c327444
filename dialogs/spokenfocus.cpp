// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/spokenfocus.h"

#include <QAbstractItemView>
#include <QAccessible>
#include <QApplication>
#include <QEvent>

SpokenFocus::SpokenFocus(QAbstractItemView *view)
    : QObject{view}
    , m_view{view}
{
    view->installEventFilter(this);
    connect(view->selectionModel(), &QItemSelectionModel::currentChanged, this, &SpokenFocus::sayWhereElse);
}

bool SpokenFocus::eventFilter(QObject * /*watched*/, QEvent *event)
{
    // Queued: Qt tells of the view after this event.
    if (event->type() == QEvent::FocusIn && QAccessible::isActive())
        QMetaObject::invokeMethod(this, &SpokenFocus::sayCurrentCell, Qt::QueuedConnection);
    return false;
}

void SpokenFocus::sayCurrentCell()
{
    // Only the view knows which of its children the cell is to a screen reader, and tells of one that becomes current.
    const QModelIndex current{m_view->currentIndex()};
    if (m_view->hasFocus() && current.isValid())
        emit m_view->selectionModel()->currentChanged(current, current);
}

void SpokenFocus::sayWhereElse() const
{
    QWidget *widget{QApplication::focusWidget()};
    if (!widget || widget == m_view || !QAccessible::isActive())
        return;
    QAccessibleEvent event{widget, QAccessible::Focus};
    QAccessible::updateAccessibility(&event);
}
