// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/statementcommands.h"

#include "app/commandguard.h"
#include "app/treeviewstate.h"
#include "config/dhcpdconfigdeclaration.h"
#include "config/dhcpdconfigmodel.h"
#include "dialogs/statementinputdialog.h"

#include <QMessageBox>
#include <QTreeView>

StatementCommands::StatementCommands(QTreeView *tree, DhcpdConfigModel *model, TreeViewState *viewState,
                                     QWidget *window)
    : m_tree{tree}
    , m_model{*model}
    , m_viewState{*viewState}
    , m_window{window}
{
}

QModelIndex StatementCommands::currentDeclaration() const
{
    const QModelIndex index{m_tree->currentIndex()};
    return index.isValid() && currentStatement().isDeclaration() ? index.siblingAtColumn(0) : QModelIndex{};
}

const DhcpdConfigStatement &StatementCommands::currentStatement() const
{
    return *m_model.statementFor(m_tree->currentIndex());
}

bool StatementCommands::isCurrent(const StatementTest &isKind) const
{
    return !currentStatement().isRoot() && isKind(currentStatement());
}

void StatementCommands::addTo(const QModelIndex &parent, const std::function<void()> &change, OpenBranches open)
{
    const auto &declaration = static_cast<const DhcpdConfigDeclaration &>(*m_model.statementFor(parent));
    const std::size_t declarationsBefore{declaration.declarations().size()};
    const int childrenBefore{declaration.childCount()};
    change();
    if (open == OpenBranches::All)
        m_viewState.expandAll();
    if (declaration.childCount() == childrenBefore)
        return; // refused, or an existing statement was changed in place

    const QModelIndex current{m_model.indexOf(declaration)};
    m_tree->setCurrentIndex(current);
    m_tree->expand(current);
    const bool isDeclarationAdded{declaration.declarations().size() > declarationsBefore};
    const int rows{isDeclarationAdded ? declaration.childCount() : static_cast<int>(declaration.parameters().size())};
    m_tree->scrollTo(m_model.index(rows - 1, 0, current));
}

void StatementCommands::add(const QString &title, QDialog &dialog,
                            const std::function<void(const QModelIndex &parent)> &change, OpenBranches open)
{
    // Whatever resets the tree while the dialog is open makes the index invalid.
    const QPersistentModelIndex parent{currentDeclaration()};
    if (!parent.isValid() || !mayStartCommand())
        return;
    dialog.setWindowTitle(title);
    if (dialog.exec() == QDialog::Accepted && parent.isValid()) {
        addTo(
            parent, [&] { change(parent); }, open);
    }
}

void StatementCommands::edit(const QString &title, QDialog &dialog, const StatementTest &isKind, const Fields &fields,
                             const Store &store)
{
    if (!isCurrent(isKind) || !mayStartCommand())
        return;
    fields.fill(currentStatement());
    if (!fields.showsAll(currentStatement())) {
        editAsText(title, isKind);
        return;
    }
    const QPersistentModelIndex index{m_model.indexOf(currentStatement(), 1)};
    const QStringList shown{fields.values()};
    dialog.setWindowTitle(title);
    if (dialog.exec() != QDialog::Accepted || !index.isValid())
        return;
    const QStringList values{fields.values()};
    if (values != shown)
        store(index, values, shown);
}

void StatementCommands::editValue(const QString &title, QDialog &dialog, const StatementTest &isKind, const Fill &fill,
                                  const std::function<QString()> &value, const StatementTest &showsAll)
{
    edit(title, dialog, isKind, {fill, [&value] { return QStringList{value()}; }, showsAll},
         [this](const QModelIndex &index, const QStringList &values, const QStringList & /*shown*/) {
             m_model.setData(index, values.first(), Qt::EditRole);
         });
}

void StatementCommands::addAsText(const QString &title, const QString &label,
                                  bool (DhcpdConfigModel::*operation)(const QStringList &words,
                                                                      const QModelIndex &parent))
{
    if (!currentDeclaration().isValid() || !mayStartCommand() || !askForAdvancedEditing())
        return;
    StatementInputDialog dialog{m_window};
    dialog.setLabelText(label);
    add(
        title, dialog, [&](const QModelIndex &parent) { (m_model.*operation)(dialog.statementWords(), parent); },
        OpenBranches::All);
}

void StatementCommands::editAsText(const QString &title, const StatementTest &isKind)
{
    if (!isCurrent(isKind) || !mayStartCommand() || !askForAdvancedEditing())
        return;
    StatementInputDialog dialog{m_window};
    edit(title, dialog, isKind,
         {[&dialog](const DhcpdConfigStatement &statement) {
              dialog.setLabelText(statement.isDeclaration() ? tr("Declaration:") : tr("Parameter:"));
              dialog.setStatementText(statement.joinedWords());
          },
          [&dialog] { return dialog.statementWords(); },
          [](const DhcpdConfigStatement & /*statement*/) { return true; }},
         [this](const QModelIndex &index, const QStringList &words, const QStringList & /*shown*/) {
             m_model.replaceWords(index, words);
         });
}

bool StatementCommands::askForAdvancedEditing()
{
    return QMessageBox::warning(m_window, tr("Warning!"),
                                tr("This editing mode for advanced users.\n"
                                   "After applying this changes configuration may be incorrect.\n"
                                   "Do you want to resume?"),
                                QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes) == QMessageBox::Yes;
}
