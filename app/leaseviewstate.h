// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QItemSelectionModel>

#include <optional>

class QTableView;

/// The current cell of the lease table and how far it is scrolled. Rows are remembered by their addresses, since a
/// change of the lease file may renumber them or reset the model.
class LeaseViewState final
{
public:
    explicit LeaseViewState(const QTableView &table);

    /// Brings the table back to this state; nothing is current when the address has gone.
    void restoreIn(QTableView &table) const;

private:
    std::optional<quint32> m_current;
    int m_column{};
    QItemSelectionModel::SelectionFlags m_selection;
    std::optional<quint32> m_top;
    int m_left{};
};
