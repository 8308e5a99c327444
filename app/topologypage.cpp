// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/topologypage.h"

#include "app/commandguard.h"
#include "app/reservation.h"
#include "app/treeviewstate.h"
#include "config/dhcpdconfigmodel.h"
#include "ui_fmain.h"

#include <QHeaderView>
#include <QMenu>

#include <algorithm>

namespace {

using Statement = DhcpdConfigStatement;

/// The tree's view state can only be made once the tree has its model.
TreeViewState *showIn(QTreeView *tree, DhcpdConfigModel *model)
{
    tree->setModel(model);
    tree->setContextMenuPolicy(Qt::CustomContextMenu);
    return new TreeViewState{tree, [model](bool isMarked) { model->markLeaves(isMarked); }};
}

} // namespace

TopologyPage::TopologyPage(const Ui::FMain &ui, DhcpdConfigModel *model, QWidget *window)
    : m_ui{ui}
    , m_model{model}
    , m_viewState{showIn(ui.topologyTree, model)}
    , m_commands{ui.topologyTree, model, m_viewState, window}
    , m_parameters{m_commands}
    , m_declarations{m_commands}
    , m_menus{ui, m_parameters, window}
{
    connect(ui.actionRemove, &QAction::triggered, this, &TopologyPage::removeCurrent);
}

void TopologyPage::showAll()
{
    QTreeView *tree{m_ui.topologyTree};
    m_viewState->expandAll();
    tree->header()->resizeSections(QHeaderView::ResizeToContents);
    tree->setCurrentIndex(m_model->index(0, 0));
}

void TopologyPage::openMenu(const QPoint &place)
{
    if (m_ui.topologyTree->currentIndex().isValid())
        m_menus.menuFor(m_commands.currentStatement())->popup(place);
}

void TopologyPage::edit(const QModelIndex &index)
{
    static constexpr struct
    {
        bool (Statement::*isKind)() const;
        void (DeclarationCommands::*edit)();
    } editors[]{
        {&Statement::isSharedNetwork, &DeclarationCommands::editSharedNetwork},
        {&Statement::isSubnet, &DeclarationCommands::editSubnet},
        {&Statement::isRange, &DeclarationCommands::editRange},
        {&Statement::isHost, &DeclarationCommands::editHost},
        {&Statement::isFixedAddress, &DeclarationCommands::editFixedAddress},
        {&Statement::isDeclaration, &DeclarationCommands::editArbitrary},
    };

    const Statement &statement{*m_model->statementFor(index)};
    if (statement.isRoot())
        return;
    if (statement.isDeclaration()) {
        const auto *editor = std::find_if(std::begin(editors), std::end(editors), [&statement](const auto &candidate) {
            return (statement.*candidate.isKind)();
        });
        (m_declarations.*editor->edit)();
    } else if (ParameterKind::of(statement).type == ValueType::Routes) {
        m_declarations.editStaticRoute();
    } else {
        m_parameters.editCurrent();
    }
}

void TopologyPage::editCurrent() { edit(m_ui.topologyTree->currentIndex()); }

void TopologyPage::removeCurrent()
{
    const QModelIndex index{m_ui.topologyTree->currentIndex()};
    const Statement &statement{*m_model->statementFor(index)};
    if (statement.isRoot() || !mayStartCommand())
        return;
    const Statement &parent{*statement.parent()};
    m_model->removeStatement(index);
    m_viewState->expandAll();
    m_ui.topologyTree->setCurrentIndex(m_model->indexOf(parent));
}

void TopologyPage::enableAddActions(const QModelIndex &index)
{
    if (!index.isValid())
        return;
    const Statement &statement{*m_model->statementFor(index)};
    const bool isRoot{statement.isDeclaration() && statement.isRoot()};
    const bool isSharedNetwork{statement.isDeclaration() && statement.isSharedNetwork()};
    m_ui.aAddSharedNetwork->setEnabled(isRoot);
    m_ui.aAddSubnet->setEnabled(isRoot || isSharedNetwork);
    m_ui.aAddHost->setEnabled(isRoot);
}

void TopologyPage::reserve(const Reservation &lease)
{
    if (!m_declarations.reserve(lease))
        return;
    emit requested();
    // The name as the lease has it is looked for, deliberately, even if another was typed.
    const QModelIndex network{m_model->index(0, 0)};
    for (int row{0}; row < m_model->rowCount(network); ++row) {
        if (m_model->index(row, 1, network).data().toString() == lease.hostName) {
            m_ui.topologyTree->setCurrentIndex(m_model->index(row, 0, network));
            break;
        }
    }
}
