// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <array>

class DhcpdConfigStatement;
class ParameterCommands;
class QMenu;
class QWidget;

namespace Ui {
class FMain;
}

/// The context menus of the topology tree, one a kind of statement, and the submenus that they share.
class TopologyMenus final
{
public:
    /// Builds the menus, as children of `parent`, from the actions of `ui` and `parameters`.
    TopologyMenus(const Ui::FMain &ui, const ParameterCommands &parameters, QWidget *parent);

    /// The menu of the commands that fit `statement`.
    QMenu *menuFor(const DhcpdConfigStatement &statement) const;

private:
    enum Menu
    {
        AddOption,
        AddParameter,
        Root,
        Subnet,
        SharedNetwork,
        Host,
        OtherDeclaration,
        Leaf,
        MenuCount
    };
    struct Row;
    static Menu kindOf(const DhcpdConfigStatement &statement);

    std::array<QMenu *, MenuCount> m_menus{};
};
