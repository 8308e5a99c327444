// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QObject>

#include <functional>
#include <unordered_set>
#include <vector>

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
    /// Makes the model say in its flags, or not any more, of each node without children that it never has any. Without
    /// that, QTreeView::expandAll() marks every leaf as open, each in a persistent index, which takes four times the
    /// memory and makes the next reset several times as slow; to open the branches one by one takes half as long again.
    using MarkLeaves = std::function<void(bool isMarked)>;

    /// Serves `tree` with the model that it has now, for as long as the tree lives.
    TreeViewState(QTreeView *tree, MarkLeaves markLeaves);

    /// Opens every branch.
    void expandAll();

private:
    void remember();
    void restore();
    void openEveryBranch();
    void openEveryBranchBut(const std::vector<QModelIndex> &closed);
    void openAsBefore();
    void setOpen(const QModelIndex &branch, bool isOpen);
    void forget(const QModelIndex &parent, int first, int last);
    /// Calls `visit` with the index of every node below `parent` that has children, parents first.
    template<typename Visit>
    void forEachBranch(const QModelIndex &parent, const Visit &visit) const;

    QTreeView *m_tree;
    MarkLeaves m_markLeaves;
    // Kept up to date all the time: asking the view about each branch costs as much as opening it.
    std::unordered_set<const void *> m_open;
    int m_top{};
    int m_left{};
};
