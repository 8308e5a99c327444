// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/treeviewstate.h"

#include <QScrollBar>
#include <QSignalBlocker>
#include <QTreeView>

#include <utility>

namespace {

// Closing a branch again moves all rows behind it.
constexpr std::size_t fewClosed{16};

} // namespace

TreeViewState::TreeViewState(QTreeView *tree, MarkLeaves markLeaves)
    : QObject{tree}
    , m_tree{tree}
    , m_markLeaves{std::move(markLeaves)}
{
    connect(tree, &QTreeView::expanded, this, [this](const QModelIndex &index) { setOpen(index, true); });
    connect(tree, &QTreeView::collapsed, this, [this](const QModelIndex &index) { setOpen(index, false); });
    connect(tree->model(), &QAbstractItemModel::rowsAboutToBeRemoved, this, &TreeViewState::forget);
    // Connected after the view itself, so that the view has forgotten its branches by the time they are opened again.
    connect(tree->model(), &QAbstractItemModel::modelAboutToBeReset, this, &TreeViewState::remember);
    connect(tree->model(), &QAbstractItemModel::modelReset, this, &TreeViewState::restore);
}

void TreeViewState::expandAll()
{
    openEveryBranch();
    m_open.clear();
    forEachBranch({}, [this](const QModelIndex &branch) { setOpen(branch, true); });
}

void TreeViewState::remember()
{
    m_top = m_tree->verticalScrollBar()->value();
    m_left = m_tree->horizontalScrollBar()->value();
}

void TreeViewState::restore()
{
    std::vector<QModelIndex> closed;
    forEachBranch({}, [&](const QModelIndex &branch) {
        if (m_open.count(branch.internalPointer()) == 0)
            closed.push_back(branch);
    });
    if (closed.size() <= fewClosed)
        openEveryBranchBut(closed);
    else
        openAsBefore();
    m_tree->verticalScrollBar()->setValue(m_top);
    m_tree->horizontalScrollBar()->setValue(m_left);
}

void TreeViewState::openEveryBranch()
{
    const QSignalBlocker silent{m_tree};
    m_markLeaves(true);
    m_tree->expandAll();
    m_markLeaves(false);
}

void TreeViewState::openEveryBranchBut(const std::vector<QModelIndex> &closed)
{
    openEveryBranch();
    for (const QModelIndex &branch : closed)
        m_tree->collapse(branch);
}

void TreeViewState::openAsBefore()
{
    const QSignalBlocker silent{m_tree};
    // The view's own reset has put the layout off, and while it is put off expand() only takes note.
    forEachBranch({}, [this](const QModelIndex &branch) {
        if (m_open.count(branch.internalPointer()) > 0)
            m_tree->expand(branch);
    });
    m_tree->doItemsLayout();
}

void TreeViewState::setOpen(const QModelIndex &branch, bool isOpen)
{
    if (isOpen)
        m_open.insert(branch.internalPointer());
    else
        m_open.erase(branch.internalPointer());
}

void TreeViewState::forget(const QModelIndex &parent, int first, int last)
{
    const QAbstractItemModel &model{*m_tree->model()};
    for (int row{first}; row <= last; ++row) {
        const QModelIndex index{model.index(row, 0, parent)};
        setOpen(index, false);
        forEachBranch(index, [this](const QModelIndex &branch) { setOpen(branch, false); });
    }
}

template<typename Visit>
void TreeViewState::forEachBranch(const QModelIndex &parent, const Visit &visit) const
{
    const QAbstractItemModel *model{m_tree->model()};
    const int rows{model->rowCount(parent)};
    for (int row{0}; row < rows; ++row) {
        const QModelIndex index{model->index(row, 0, parent)};
        if (!model->hasChildren(index))
            continue;
        visit(index);
        forEachBranch(index, visit);
    }
}
