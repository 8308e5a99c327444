// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QObject>

class QAbstractItemView;

/// Lets a screen reader say the cell of a view that has the keyboard. By itself, Qt tells of the view alone when the
/// keyboard comes to it, and of every new current cell as if that had the keyboard, wherever the keyboard is.
class SpokenFocus final : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(SpokenFocus)

public:
    /// Serves `view` with the model that it has now, for as long as the view lives.
    explicit SpokenFocus(QAbstractItemView *view);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void sayCurrentCell();
    void sayWhereElse() const;

    QAbstractItemView *m_view;
};
