// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/topologymenus.h"

#include "app/fmain.h"
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

/// A menu's title and entries: actions of the form, separators, and menus that stand in an earlier row as submenus.
struct TopologyMenus::Row
{
    Menu menu;
    const char *title;
    std::vector<std::variant<QAction *, Separator, Menu>> entries;
};

TopologyMenus::TopologyMenus(const Ui::FMain &ui, QWidget *parent)
{
    const char *const actions = QT_TRANSLATE_NOOP("FMain", "Actions");
    const Separator separator;
    const std::vector<Row> table{
        {AddOption,
         QT_TRANSLATE_NOOP("FMain", "Add option"),
         {ui.aAddRouters, ui.aAddDns, ui.aAddNtpServers, ui.aAddDomainName, ui.aAddDHCPDynamicUpdate}},
        {AddParameter,
         QT_TRANSLATE_NOOP("FMain", "Add parameter"),
         {AddOption, separator, ui.aAddDefaultLeaseTime, ui.aAddMaxLeaseTime, separator, ui.aAddParam}},
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
        auto *menu = new QMenu{FMain::tr(row.title), parent};
        m_menus.at(row.menu) = menu;
        for (const auto &entry : row.entries) {
            if (const auto *action = std::get_if<QAction *>(&entry))
                menu->addAction(*action);
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
