// SPDX-License-Identifier: GPL-3.0-or-later
// The edit operations of the configuration model.
#include "config/dhcpdconfigmodel.h"

bool DhcpdConfigModel::removeRows(int row, int count, const QModelIndex &parent)
{
    DhcpdConfigStatement *const statement{statementFor(parent)};
    const bool inRange{row >= 0 && count >= 0 && count <= statement->childCount() - row};
    if (!inRange)
        return false;
    if (count > 0) {
        beginRemoveRows(parent, row, row + count - 1);
        statement->removeChildren(row, count);
        endRemoveRows();
    }
    setModified();
    return true;
}

void DhcpdConfigModel::removeStatement(const QModelIndex &index)
{
    DhcpdConfigStatement *const statement{statementFor(index)};
    DhcpdConfigDeclaration *const parentNode{statement->parent()};
    if (!parentNode)
        return;
    beginResetModel();
    parentNode->removeChild(statement);
    endResetModel();
    setModified();
}
