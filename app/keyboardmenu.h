// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QObject>

class QAbstractItemView;
class QPoint;

/// Asks for the context menu of a view's current row when the menu key or Shift+F10 is pressed in the view. The view's
/// own request is then not made: whoever answers that one shows the menu where the mouse is.
class KeyboardMenu final : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(KeyboardMenu)

public:
    /// Serves `view` for as long as that lives.
    explicit KeyboardMenu(QAbstractItemView *view);

    bool eventFilter(QObject *watched, QEvent *event) override;

signals:
    /// The menu is wanted at a place on the screen, just below the current row, which is in sight.
    void requested(const QPoint &place);

private:
    void request();

    QAbstractItemView *m_view;
};
