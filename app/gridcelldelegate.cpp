// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/gridcelldelegate.h"

#include <QPainter>
#include <QTableView>

namespace {

constexpr int lineWidth{1};

QColor lineColour(const QStyleOptionViewItem &option)
{
    const QStyle *style{option.widget->style()};
    return QColor::fromRgb(static_cast<QRgb>(style->styleHint(QStyle::SH_Table_GridLineColor, &option, option.widget)));
}

} // namespace

GridCellDelegate::GridCellDelegate(QTableView *table)
    : QStyledItemDelegate{table}
{
    table->setShowGrid(false);
    table->setItemDelegate(this);
}

void GridCellDelegate::paint(QPainter *painter, const QStyleOptionViewItem &option, const QModelIndex &index) const
{
    const bool isMirrored{option.direction == Qt::RightToLeft};
    QStyleOptionViewItem cell{option};
    cell.rect.adjust(isMirrored ? lineWidth : 0, 0, isMirrored ? 0 : -lineWidth, -lineWidth);
    QStyledItemDelegate::paint(painter, cell, index);

    const QColor colour{lineColour(option)};
    const QRect &all{option.rect};
    const int side{isMirrored ? all.left() : cell.rect.right() + 1};
    painter->fillRect(all.left(), cell.rect.bottom() + 1, all.width(), lineWidth, colour);
    painter->fillRect(side, all.top(), lineWidth, all.height(), colour);
}

QSize GridCellDelegate::sizeHint(const QStyleOptionViewItem &option, const QModelIndex &index) const
{
    return QStyledItemDelegate::sizeHint(option, index) + QSize{lineWidth, lineWidth};
}
