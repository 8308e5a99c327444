// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/treeviewstate.h"

#include <QScrollBar>
#include <QTreeView>

TreeViewState::TreeViewState(QTreeView *tree)
    : QObject{tree}
    , m_tree{tree}
{
    // Connected after the view itself, so that the view has forgotten its branches by the time they are opened again.
    connect(tree->model(), &QAbstractItemModel::modelAboutToBeReset, this, &TreeViewState::remember);
    connect(tree->model(), &QAbstractItemModel::modelReset, this, &TreeViewState::restore);
}

void TreeViewState::expandAll()
{
    // Setting a root, even the same, puts the layout off, and while it is put off expand() only takes note.
    m_tree->setRootIndex(m_tree->rootIndex());
    forEachBranch({}, [this](const QModelIndex &index) { m_tree->expand(index); });
    m_tree->doItemsLayout();
}

void TreeViewState::remember()
{
    m_open.clear();
    m_top = m_tree->verticalScrollBar()->value();
    m_left = m_tree->horizontalScrollBar()->value();
    forEachBranch({}, [this](const QModelIndex &index) {
        if (m_tree->isExpanded(index))
            m_open.insert(index.internalPointer());
    });
}

void TreeViewState::restore()
{
    // The view's own reset has put the layout off.
    forEachBranch({}, [this](const QModelIndex &index) {
        if (m_open.count(index.internalPointer()) > 0)
            m_tree->expand(index);
    });
    m_tree->doItemsLayout();
    m_tree->verticalScrollBar()->setValue(m_top);
    m_tree->horizontalScrollBar()->setValue(m_left);
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
