// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/parameterkind.h"

#include <QCoreApplication>
#include <QList>

#include <string_view>

class QAction;
class StatementCommands;

/// The commands that add and edit a parameter of a kind of its own, a row of one table for each kind.
class ParameterCommands final
{
    Q_DECLARE_TR_FUNCTIONS(FMain)

public:
    /// Makes the actions of the add commands, as children of the window of `commands`, which lives longer than this.
    explicit ParameterCommands(StatementCommands &commands);
    Q_DISABLE_COPY_MOVE(ParameterCommands)

    /// The add commands of options and of other parameters, in the order of the menus.
    const QList<QAction *> &optionActions() const { return m_optionActions; }
    const QList<QAction *> &otherActions() const { return m_otherActions; }

    /// Adds a parameter of the kind with that name, see ParameterKind::named(), to the current declaration.
    void add(std::string_view name);
    /// Edits the current parameter if it is of the kind with that name.
    void edit(std::string_view name);
    /// Edits the current parameter by the dialog of its kind, or as text where that has none.
    void editCurrent();
    /// Adds or edits a parameter of any words.
    void addArbitrary();
    void editArbitrary();

private:
    void add(const ParameterKind &kind);
    void edit(const ParameterKind &kind);

    StatementCommands &m_commands;
    QList<QAction *> m_optionActions;
    QList<QAction *> m_otherActions;
};
