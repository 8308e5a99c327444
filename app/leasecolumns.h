// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QObject>
#include <QTimer>

#include <set>

class QHelpEvent;
class QTableView;

/// The widths of the lease table's columns: what is visible is shown whole, whether it was scrolled to or has arrived
/// by itself. A column that the user made wider or narrower stays so until its border is double-clicked; a text that is
/// cut off then has a tool tip. The rows' numbers keep the widest room that they have needed.
class LeaseColumns final : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(LeaseColumns)

public:
    /// Serves `table` with the model that it has now, for as long as the table lives.
    explicit LeaseColumns(QTableView *table);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void measureVisibleRows();
    void letUserResize();
    void noteResized(int column);
    void widen();
    void showCutText(const QHelpEvent &event) const;

    QTableView *m_table;
    // Told apart without the table, which is none any more when its parts see their last events.
    const QObject *m_header;
    const QObject *m_rows;
    QTimer m_widening; // once for all that happens before the next turn of the event loop
    std::set<int> m_setByUser;
    bool m_isWidening{};
};
