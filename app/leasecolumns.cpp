// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/leasecolumns.h"

#include <QHeaderView>
#include <QHelpEvent>
#include <QScopedValueRollback>
#include <QScrollBar>
#include <QTableView>
#include <QToolTip>

#include <algorithm>

namespace {

constexpr int rowsMeasuredUnseen{50}; // while the table has no size

QStyleOptionViewItem optionsFor(const QTableView &table)
{
    QStyleOptionViewItem options;
    options.initFrom(&table);
    options.font = table.font();
    options.fontMetrics = table.fontMetrics();
    return options;
}

} // namespace

LeaseColumns::LeaseColumns(QTableView *table)
    : QObject{table}
    , m_table{table}
    , m_header{table->horizontalHeader()->viewport()}
    , m_rows{table->viewport()}
{
    m_widening.setSingleShot(true);
    m_widening.setInterval(0);
    connect(&m_widening, &QTimer::timeout, this, &LeaseColumns::widen);

    QHeaderView *header{table->horizontalHeader()};
    header->setSectionResizeMode(QHeaderView::ResizeToContents);
    measureVisibleRows();
    const auto widenSoon = [this] { m_widening.start(); };
    connect(table->verticalScrollBar(), &QScrollBar::valueChanged, this, widenSoon);
    connect(table->model(), &QAbstractItemModel::dataChanged, this, widenSoon);
    connect(table->model(), &QAbstractItemModel::rowsInserted, this, widenSoon);
    connect(table->model(), &QAbstractItemModel::modelReset, this, widenSoon);
    connect(header, &QHeaderView::sectionResized, this, &LeaseColumns::noteResized);
    connect(header, &QHeaderView::sectionHandleDoubleClicked, this, [=](int column) { m_setByUser.erase(column); });

    header->viewport()->installEventFilter(this);
    table->viewport()->installEventFilter(this);
}

bool LeaseColumns::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == m_header && event->type() == QEvent::Enter) {
        letUserResize();
    } else if (watched == m_rows && event->type() == QEvent::Resize) {
        measureVisibleRows();
        m_widening.start();
    } else if (watched == m_rows && event->type() == QEvent::ToolTip) {
        showCutText(static_cast<const QHelpEvent &>(*event));
        return true;
    }
    return false;
}

void LeaseColumns::measureVisibleRows()
{
    const int visible{m_table->viewport()->height() / m_table->verticalHeader()->defaultSectionSize()};
    m_table->horizontalHeader()->setResizeContentsPrecision(visible > 0 ? visible + 1 : rowsMeasuredUnseen);
}

// Columns that the header keeps to their contents cannot be dragged, so that it leaves them alone from the moment at
// which the user may want to.
void LeaseColumns::letUserResize() { m_table->horizontalHeader()->setSectionResizeMode(QHeaderView::Interactive); }

void LeaseColumns::noteResized(int column)
{
    if (!m_isWidening && m_table->horizontalHeader()->sectionResizeMode(column) == QHeaderView::Interactive)
        m_setByUser.insert(column);
}

// Never makes a column narrower: while the user scrolls, the columns would dance. Nor the rows' numbers: when a search
// finds nothing, there are none.
void LeaseColumns::widen()
{
    QHeaderView &numbers{*m_table->verticalHeader()};
    numbers.setMinimumWidth(std::max(numbers.minimumWidth(), numbers.width()));
    const QScopedValueRollback widening{m_isWidening, true};
    QHeaderView &header{*m_table->horizontalHeader()};
    const auto &rows = static_cast<const QAbstractItemView &>(*m_table);
    for (int column{0}; column < header.count(); ++column) {
        if (m_setByUser.count(column) == 0)
            header.resizeSection(column, std::max(header.sectionSize(column), rows.sizeHintForColumn(column)));
    }
}

void LeaseColumns::showCutText(const QHelpEvent &event) const
{
    const QModelIndex index{m_table->indexAt(event.pos())};
    const QRect cell{m_table->visualRect(index)};
    const bool isCut{index.isValid() &&
                     (m_table->itemDelegate()->sizeHint(optionsFor(*m_table), index).width() > cell.width() ||
                      cell.left() < 0 || cell.right() > m_table->viewport()->rect().right())};
    // A tip takes what looks like markup for markup.
    const QString text{
        QStringLiteral("<p style='white-space:pre'>%1</p>").arg(index.data().toString().toHtmlEscaped())};
    QToolTip::showText(event.globalPos(), isCut ? text : QString{}, m_table->viewport(), cell);
}
