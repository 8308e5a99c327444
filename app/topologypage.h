// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "app/declarationcommands.h"
#include "app/parametercommands.h"
#include "app/statementcommands.h"
#include "app/topologymenus.h"

#include <QObject>

class TreeViewState;
struct Reservation;

/// The tab "Topology": the configuration as a tree, the commands on it, and which of them a statement offers.
class TopologyPage final : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(TopologyPage)

public:
    /// Shows `model`, which holds a configuration already, in the tree of `ui`; `window` is the parent of dialogs.
    TopologyPage(const Ui::FMain &ui, DhcpdConfigModel *model, QWidget *window);

    ParameterCommands &parameters() { return m_parameters; }
    DeclarationCommands &declarations() { return m_declarations; }

    /// Opens the whole tree, with columns as wide as their contents, and makes the top row current.
    void showAll();
    /// Offers the commands on the current statement, in a menu at a place on the screen.
    void openMenu(const QPoint &place);
    /// Opens the editor that fits the statement at `index`; nothing for the nodes above the file's statements.
    void edit(const QModelIndex &index);
    void editCurrent();
    void removeCurrent();
    /// Enables those of the commands in the tool bar that fit the statement at `index`; an invalid one changes nothing.
    void enableAddActions(const QModelIndex &index);
    /// Offers to add a host for a lease.
    void reserve(const Reservation &lease);

signals:
    /// The user wants to see this page.
    void requested();

private:
    const Ui::FMain &m_ui;
    DhcpdConfigModel *m_model;
    TreeViewState *m_viewState; // the tree's
    StatementCommands m_commands;
    ParameterCommands m_parameters;
    DeclarationCommands m_declarations;
    TopologyMenus m_menus;
};
