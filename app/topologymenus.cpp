// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/topologymenus.h"

#include "app/parametercommands.h"
#include "app/windowtext.h"
#include "config/dhcpdconfigstatement.h"
#include "ui_fmain.h"

#include <QMenu>

#include <variant>
#include <vector>

namespace {

struct Separator
{
};

} // namespace

/// A menu's title and entries: actions, alone or several, separators, and menus of earlier rows as submenus.
struct TopologyMenus::Row
{
    Menu menu;
    const char *title;
    std::vector<std::variant<QAction *, QList<QAction *>, Separator, Menu>> entries;
};

TopologyMenus::TopologyMenus(const Ui::FMain &ui, const ParameterCommands &parameters, QWidget *parent)
{
    const char *actions{QT_TRANSLATE_NOOP("FMain", "Actions")};
    const Separator separator{};
    const std::vector<Row> table{
        {AddOption, QT_TRANSLATE_NOOP("FMain", "Add option"), {parameters.optionActions(), ui.aAddDHCPDynamicUpdate}},
        {AddParameter,
         QT_TRANSLATE_NOOP("FMain", "Add parameter"),
         {AddOption, separator, parameters.otherActions(), separator, ui.aAddParam}},
        {Root,
         actions,
         {ui.aAddSharedNetwork, ui.aAddSubnet, ui.aAddHost, ui.aAddStaticRoute, separator, ui.aAddDeclaration,
          AddParameter}},
        {Subnet,
         actions,
         {ui.aAddRange, separator, ui.aAddDeclaration, separator, AddParameter, separator, ui.actionEdit,
          ui.actionRemove}},
        {SharedNetwork,
         actions,
         {ui.aAddSubnet, separator, ui.aAddDeclaration, separator, AddParameter, separator, ui.actionEdit,
          ui.actionRemove}},
        {Host,
         actions,
         {ui.aAddFixedIp, separator, ui.aAddDeclaration, separator, ui.aAddStaticRoute, separator, AddParameter,
          separator, ui.actionEdit, ui.actionRemove}},
        {OtherDeclaration,
         actions,
         {ui.aAddDeclaration, separator, AddParameter, separator, ui.actionEdit, ui.actionRemove}},
        {Leaf, actions, {ui.actionEdit, ui.actionRemove}},
    };

    for (const Row &row : table) {
        auto *menu = new QMenu{WindowText::tr(row.title), parent};
        m_menus.at(row.menu) = menu;
        for (const auto &entry : row.entries) {
            if (const auto *action = std::get_if<QAction *>(&entry))
                menu->addAction(*action);
            else if (const auto *several = std::get_if<QList<QAction *>>(&entry))
                menu->addActions(*several);
            else if (const auto *submenu = std::get_if<Menu>(&entry))
                menu->addMenu(m_menus.at(*submenu));
            else
                menu->addSeparator();
        }
    }
}

QMenu *TopologyMenus::menuFor(const DhcpdConfigStatement &statement) const { return m_menus.at(kindOf(statement)); }

TopologyMenus::Menu TopologyMenus::kindOf(const DhcpdConfigStatement &statement)
{
    if (statement.isRoot())
        return Root;
    if (statement.isParam() || statement.isRange() || statement.isFixedAddress() || statement.isSubclass())
        return Leaf;
    if (statement.isSubnet())
        return Subnet;
    if (statement.isSharedNetwork())
        return SharedNetwork;
    return statement.isHost() ? Host : OtherDeclaration;
}
