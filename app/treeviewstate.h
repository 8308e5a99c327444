// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QObject>

#include <unordered_set>

class QModelIndex;
class QTreeView;

/// The open branches of a tree view: keeps them, and the scroll position, over every reset of the view's model, and
/// opens all of a large tree at once.
///
/// A node is known again by its index's internal pointer, which therefore must stay the same over the reset.
class TreeViewState final : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(TreeViewState)

public:
    /// Serves `tree` with the model that it has now, for as long as the tree lives.
    explicit TreeViewState(QTreeView *tree);

    /// Opens every branch. QTreeView::expandAll() also marks every leaf as open, each in a persistent index, which
    /// takes four times the memory and makes the next reset several times as slow.
    void expandAll();

private:
    void remember();
    void restore();
    /// Calls `visit` with the index of every node below `parent` that has children, parents first.
    template<typename Visit>
    void forEachBranch(const QModelIndex &parent, const Visit &visit) const;

    QTreeView *m_tree;
    std::unordered_set<const void *> m_open;
    int m_top{};
    int m_left{};
};
