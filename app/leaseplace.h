// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QtGlobal>

#include <optional>

class QTableView;

/// Where the user is in the lease table: the current cell and how far it is scrolled, by address, since a change of the
/// lease file may renumber the rows or reset the model.
class LeasePlace final
{
public:
    explicit LeasePlace(const QTableView &table);

    /// Goes there again; nothing becomes current when the address is gone.
    void restoreIn(QTableView &table) const;

private:
    std::optional<quint32> m_current;
    int m_column{};
    bool m_cellSelected{}; // the current cell alone, not its row
    std::optional<quint32> m_top;
    int m_left;
};
