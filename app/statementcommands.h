// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QCoreApplication>
#include <QModelIndex>
#include <QStringList>

#include <functional>

class DhcpdConfigModel;
class DhcpdConfigStatement;
class QDialog;
class QString;
class QTreeView;
class QWidget;
class TreeViewState;

/// What all commands on the topology tree do alike: they find the statement that they are about, ask with a dialog, and
/// show what was added.
class StatementCommands final
{
    Q_DECLARE_TR_FUNCTIONS(FMain)

public:
    /// A test of a statement.
    using StatementTest = std::function<bool(const DhcpdConfigStatement &statement)>;

    /// The view state, model and dialogs' parent are used for as long as this lives.
    StatementCommands(QTreeView *tree, DhcpdConfigModel *model, TreeViewState *viewState, QWidget *window);
    Q_DISABLE_COPY_MOVE(StatementCommands)

    DhcpdConfigModel &model() const { return m_model; }
    /// The parent of the commands' dialogs.
    QWidget *window() const { return m_window; }

    /// The tree's current index where it is a declaration's; else invalid.
    QModelIndex currentDeclaration() const;
    /// The statement at the tree's current index; the invisible top node where there is none.
    const DhcpdConfigStatement &currentStatement() const;

    /// What is open in the tree after an add besides the declaration that was added to.
    enum class OpenBranches
    {
        AsBefore,
        All
    };
    /// Runs `change`, which may add children to the declaration at `parent`, and shows what was added.
    void addTo(const QModelIndex &parent, const std::function<void()> &change,
               OpenBranches open = OpenBranches::AsBefore);

    /// Asks with `dialog`, and when it is accepted lets `change` add to the current declaration.
    void add(const QString &title, QDialog &dialog, const std::function<void(const QModelIndex &parent)> &change,
             OpenBranches open = OpenBranches::AsBefore);

    using Fill = std::function<void(const DhcpdConfigStatement &statement)>;
    /// How a dialog is made to show a statement, the values that it shows then, and whether those are all that the
    /// statement says.
    struct Fields
    {
        Fill fill;
        std::function<QStringList()> values;
        StatementTest showsAll;
    };
    /// Stores the values of an accepted dialog in the statement at an index of column 1; those it showed at first are
    /// given too.
    using Store = std::function<void(const QModelIndex &index, const QStringList &values, const QStringList &shown)>;

    /// Asks with `dialog` about the current statement, if that is of the kind, and when it is accepted with other
    /// values than it showed at first, has them stored. A statement that the dialog cannot show all of is edited as
    /// text.
    void edit(const QString &title, QDialog &dialog, const StatementTest &isKind, const Fields &fields,
              const Store &store);
    /// The same for a single value, which goes to the model's setData().
    void editValue(const QString &title, QDialog &dialog, const StatementTest &isKind, const Fill &fill,
                   const std::function<QString()> &value, const StatementTest &showsAll);

    /// Adds a statement of any words to the current declaration, after a warning.
    void addAsText(const QString &title, const QString &label,
                   bool (DhcpdConfigModel::*operation)(const QStringList &words, const QModelIndex &parent));
    /// Edits all words of the current statement, if that is of the kind, after a warning.
    void editAsText(const QString &title, const StatementTest &isKind);

private:
    bool isCurrent(const StatementTest &isKind) const;
    bool askForAdvancedEditing();

    QTreeView *m_tree;
    DhcpdConfigModel &m_model;
    TreeViewState &m_viewState;
    QWidget *m_window;
};
