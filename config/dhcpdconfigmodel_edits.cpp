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
    const QStringList oldWords{statement->wordsFrom(0)};
    if (words == oldWords)
        return true;
    statement->setWordsFrom(0, words);
    if (auto *declaration = declarationFor(index)) {
        if (!declaration->takesStatements() && !declaration->isOneLine()) {
            statement->setWordsFrom(0, oldWords);
            return refuse(tr("Error editing '%1'. The block would be nested too deeply.").arg(oldWords.value(0)));
        }
        if (declaration->childCount() > 0)
            declaration->setBraced(); // whatever its keyword has become
    }
    setModified();
    return true;
}

DhcpdConfigDeclaration *DhcpdConfigModel::holderFor(const QModelIndex &index) const
{
    DhcpdConfigDeclaration *declaration{declarationFor(index)};
    return declaration && declaration->takesStatements() ? declaration : nullptr;
}

DhcpdConfigDeclaration *DhcpdConfigModel::declarationFor(const QModelIndex &index) const
{
    DhcpdConfigStatement *statement{statementFor(index)};
    return statement->isDeclaration() ? static_cast<DhcpdConfigDeclaration *>(statement) : nullptr;
}
