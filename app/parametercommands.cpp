// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/parametercommands.h"

#include "app/statementcommands.h"
#include "app/valuedialog.h"
#include "config/dhcpdconfigmodel.h"
#include "config/values.h"

#include <QAction>
#include <QDialog>
#include <QIcon>
#include <QWidget>

#include <algorithm>

namespace {

/// The commands of a kind of parameter. The order of the rows is that of the menus.
struct Row
{
    std::string_view kind; // its name, see ParameterKind::named(); empty: lease times of no other kind
    const char *action;    // the object name of the command that adds one; null: there is none
    const char *addTitle;  // of the action and the dialog
    const char *editTitle;
    const char *label;      // of the dialog's field; empty: as the dialog has it
    const char *firstValue; // when one is added; empty: as the dialog has it
};

const Row rows[]{
    {"routers", "aAddRouters", QT_TRANSLATE_NOOP("FMain", "Add gateways"), QT_TRANSLATE_NOOP("FMain", "Edit gateways"),
     QT_TRANSLATE_NOOP("FMain", "Gateways:"), ""},
    {"domain-name-servers", "aAddDns", QT_TRANSLATE_NOOP("FMain", "Add DNS servers"),
     QT_TRANSLATE_NOOP("FMain", "Edit DNS servers"), QT_TRANSLATE_NOOP("FMain", "DNS servers:"), ""},
    {"ntp-servers", "aAddNtpServers", QT_TRANSLATE_NOOP("FMain", "Add NTP servers"),
     QT_TRANSLATE_NOOP("FMain", "Edit NTP servers"), QT_TRANSLATE_NOOP("FMain", "NTP servers:"), ""},
    {"domain-name", "aAddDomainName", QT_TRANSLATE_NOOP("FMain", "Add domain name"),
     QT_TRANSLATE_NOOP("FMain", "Edit domain name"), "", "example.org"},
    {"default-lease-time", "aAddDefaultLeaseTime", QT_TRANSLATE_NOOP("FMain", "Add default lease time"),
     QT_TRANSLATE_NOOP("FMain", "Edit default lease time"), "", ""},
    {"max-lease-time", "aAddMaxLeaseTime", QT_TRANSLATE_NOOP("FMain", "Add max lease time"),
     QT_TRANSLATE_NOOP("FMain", "Edit max lease time"), "", ""},
    {"hardware", nullptr, "", QT_TRANSLATE_NOOP("FMain", "Edit MAC address"), "", ""},
    {"", nullptr, "", QT_TRANSLATE_NOOP("FMain", "Edit time"), "", ""},
};

const Row &rowFor(const ParameterKind &kind)
{
    return *std::find_if(std::begin(rows), std::end(rows), [&kind](const Row &row) {
        return row.kind.empty() || &ParameterKind::named(row.kind) == &kind;
    });
}

/// The action of an add command: the one of the form, where the form has it.
QAction *makeAction(const Row &row, QWidget *window)
{
    const QLatin1String name{row.action};
    auto *action = window->findChild<QAction *>(name);
    if (!action) {
        action = new QAction{ParameterCommands::tr(row.addTitle), window};
        action->setObjectName(name);
    }
    action->setIcon(QIcon::fromTheme(QStringLiteral("configure")));
    return action;
}

bool isParameter(const DhcpdConfigStatement &statement) { return statement.isParam(); }

} // namespace

ParameterCommands::ParameterCommands(StatementCommands &commands)
    : m_commands{commands}
{
    for (const Row &row : rows) {
        if (!row.action)
            continue;
        QAction *action{makeAction(row, commands.window())};
        QObject::connect(action, &QAction::triggered, action, [this, name = row.kind] { add(name); });
        (ParameterKind::named(row.kind).isOption() ? m_optionActions : m_otherActions) += action;
    }
}

void ParameterCommands::add(std::string_view name) { add(ParameterKind::named(name)); }

void ParameterCommands::edit(std::string_view name) { edit(ParameterKind::named(name)); }

void ParameterCommands::editCurrent()
{
    const ParameterKind &kind{ParameterKind::of(m_commands.currentStatement())};
    if (kind.type == ValueType::Text)
        editArbitrary();
    else
        edit(kind);
}

void ParameterCommands::addArbitrary()
{
    m_commands.addAsText(tr("Add arbitrary parameter"), tr("Parameter:"), &DhcpdConfigModel::addParameter);
}

void ParameterCommands::editArbitrary() { m_commands.editAsText(tr("Edit arbitrary parameter"), isParameter); }

void ParameterCommands::add(const ParameterKind &kind)
{
    const Row &row{rowFor(kind)};
    const ValueDialog input{ValueDialog::make(kind.type, tr(row.label), m_commands.window())};
    if (*row.firstValue != '\0')
        input.setValue(QLatin1String{row.firstValue});
    m_commands.add(tr(row.addTitle), *input.dialog,
                   [&](const QModelIndex &parent) { m_commands.model().setParameter(kind, input.value(), parent); });
}

void ParameterCommands::edit(const ParameterKind &kind)
{
    const Row &row{rowFor(kind)};
    const ValueDialog input{ValueDialog::make(kind.type, tr(row.label), m_commands.window())};
    m_commands.editValue(
        tr(row.editTitle), *input.dialog,
        [&kind](const DhcpdConfigStatement &statement) {
            return statement.isParam() && &ParameterKind::of(statement) == &kind;
        },
        [&](const DhcpdConfigStatement &statement) { input.setValue(kind.valueOf(statement)); }, input.value,
        [&](const DhcpdConfigStatement &statement) {
            return values::isValue(statement, kind.valuePosition(), input.value());
        });
}
