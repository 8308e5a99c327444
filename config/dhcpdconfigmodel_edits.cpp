// SPDX-License-Identifier: GPL-3.0-or-later
// What the configuration model does to any statement.
#include "config/dhcpdconfigmodel.h"

bool DhcpdConfigModel::removeRows(int row, int count, const QModelIndex &parent)
{
    DhcpdConfigDeclaration *const declaration{declarationFor(parent)};
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
    DhcpdConfigStatement *const statement{statementFor(index)};
    DhcpdConfigDeclaration *const parentNode{statement->parent()};
    if (!parentNode)
        return;
    changeTree([=] { parentNode->removeChild(statement); });
}

bool DhcpdConfigModel::replaceWords(const QModelIndex &index, const QStringList &words)
{
    DhcpdConfigStatement *const statement{statementFor(index)};
    if (statement->isRoot())
        return false;
    QStringList oldWords;
    for (const std::string_view word : statement->words())
        oldWords += decodedWord(word);
    if (words != oldWords) {
        statement->setWordsFrom(0, words);
        setModified();
    }
    return true;
}

DhcpdConfigDeclaration *DhcpdConfigModel::declarationFor(const QModelIndex &index) const
{
    DhcpdConfigStatement *const statement{statementFor(index)};
    return statement->isDeclaration() ? static_cast<DhcpdConfigDeclaration *>(statement) : nullptr;
}
