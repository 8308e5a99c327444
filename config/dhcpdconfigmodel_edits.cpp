// SPDX-License-Identifier: GPL-3.0-or-later
// What the configuration model does to any statement.
#include "config/dhcpdconfigmodel.h"

bool DhcpdConfigModel::removeRows(int row, int count, const QModelIndex &parent)
{
    DhcpdConfigDeclaration *declaration{declarationFor(parent)};
    if (!declaration || row < 0 || count < 0 || count > declaration->childCount() - row)
        return false;
    if (count > 0) {
        beginRemoveRows(parent, row, row + count - 1);
        declaration->removeChildren(row, count);
        endRemoveRows();
    }
    setModified();
    return true;
}

void DhcpdConfigModel::removeStatement(const QModelIndex &index)
{
    DhcpdConfigStatement *statement{statementFor(index)};
    DhcpdConfigDeclaration *parentNode{statement->parent()};
    if (!parentNode)
        return;
    changeTree([=] { parentNode->removeChild(statement); });
}

bool DhcpdConfigModel::replaceWords(const QModelIndex &index, const QStringList &words)
{
    DhcpdConfigStatement *statement{statementFor(index)};
    if (statement->isRoot())
        return false;
    if (words != statement->wordsFrom(0)) {
        if (statement->isDeclaration() && statement->childCount() > 0)
            static_cast<DhcpdConfigDeclaration *>(statement)->setBraced(); // whatever its keyword becomes
        statement->setWordsFrom(0, words);
        setModified();
    }
    return true;
}

DhcpdConfigDeclaration *DhcpdConfigModel::declarationFor(const QModelIndex &index) const
{
    DhcpdConfigStatement *statement{statementFor(index)};
    return statement->isDeclaration() ? static_cast<DhcpdConfigDeclaration *>(statement) : nullptr;
}
