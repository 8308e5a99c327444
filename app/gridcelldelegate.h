// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QStyledItemDelegate>

class QTableView;

/// Paints cells and their part of the table's grid, which looks as the table's own. That one is drawn line by line and
/// pixel by pixel, and takes as long as all cells together.
class GridCellDelegate final : public QStyledItemDelegate
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(GridCellDelegate)

public:
    /// Paints for `table`, for as long as it lives.
    explicit GridCellDelegate(QTableView *table);

    void paint(QPainter *painter, const QStyleOptionViewItem &option, const QModelIndex &index) const override;
    QSize sizeHint(const QStyleOptionViewItem &option, const QModelIndex &index) const override;
};
