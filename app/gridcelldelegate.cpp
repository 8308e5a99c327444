// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/gridcelldelegate.h"

#include <QPainter>
#include <QTableView>

namespace {

constexpr int lineWidth{1}; // what a line takes, of which it fills one pixel of the screen, however dense that is

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
    const qreal pixel{1 / painter->device()->devicePixelRatioF()};
    const QRectF all{option.rect};
    const qreal side{isMirrored ? all.left() : all.right() - pixel};
    painter->fillRect(QRectF{all.left(), all.bottom() - pixel, all.width(), pixel}, colour);
    painter->fillRect(QRectF{side, all.top(), pixel, all.height()}, colour);
}

QSize GridCellDelegate::sizeHint(const QStyleOptionViewItem &option, const QModelIndex &index) const
{
    return QStyledItemDelegate::sizeHint(option, index) + QSize{lineWidth, lineWidth};
}
