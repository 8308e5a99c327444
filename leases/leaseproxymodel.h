// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leasehits.h"

#include <QSortFilterProxyModel>

#include <array>
#include <memory>
#include <optional>

class DhcpdLeasesModel;
class LeaseSearch;

/// A filter and search for a DhcpdLeasesModel that keep up with typing over a million leases.
///
/// All of QSortFilterProxyModel keeps working, also through a pointer to it. The filter that this class's
/// setFilterFixedString() sets comes on top of the base's: a row is shown if both accept it.
class LeaseProxyModel final : public QSortFilterProxyModel
{
    Q_OBJECT

public:
    explicit LeaseProxyModel(QObject *parent = nullptr);
    ~LeaseProxyModel() override;

    void setSourceModel(QAbstractItemModel *model) override;

    /// Shows only the leases that have `text`, in the same letter case, in any column; all if it is empty. Views see
    /// a single reset.
    void setFilterFixedString(const QString &text);

    /// Like the base's, but fast for Qt::MatchContains.
    QModelIndexList match(const QModelIndex &start, int role, const QVariant &value, int hits = 1,
                          Qt::MatchFlags flags = {Qt::MatchStartsWith | Qt::MatchWrap}) const override;

protected:
    bool filterAcceptsRow(int row, const QModelIndex &parent) const override;

private:
    const DhcpdLeasesModel *leases() const;
    /// Whether match() can do without the base's search.
    bool isSearchable(const QModelIndex &start, int role, int hits, Qt::MatchFlags flags) const;
    /// What filterAcceptsRow() does where it is not known at once, kept out of what is called a million times.
    Q_NEVER_INLINE bool isAccepted(int row, const QModelIndex &parent) const;
    QModelIndexList firstMatches(const QModelIndex &start, int most) const;
    void search(const QAbstractItemModel *model);
    void searchAgain();
    void forgetFound();

    QString m_text;
    // During a reset after which no filter hides a row.
    bool m_showsAll{};
    std::unique_ptr<LeaseSearch> m_search; // null when no text is set
    // Until the leases change: what m_search found, and the search of the last match().
    std::optional<LeaseHits> m_found;
    mutable std::unique_ptr<LeaseSearch> m_lastMatch;
    std::array<QMetaObject::Connection, 3> m_connections;
};
