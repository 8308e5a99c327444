// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/declarationcommands.h"

#include "app/commandguard.h"
#include "app/plainmessagebox.h"
#include "app/reservation.h"
#include "app/statementcommands.h"
#include "common/paths.h"
#include "config/dhcpdconfigdeclaration.h"
#include "config/dhcpdconfigmodel.h"
#include "config/staticroutes.h"
#include "config/values.h"
#include "dialogs/hostinputdialog.h"
#include "dialogs/ipinputdialog.h"
#include "dialogs/rangeinputdialog.h"
#include "dialogs/sharednetworkinputdialog.h"
#include "dialogs/staticrouteinputdialog.h"
#include "dialogs/subnetinputdialog.h"

#include <QFileDialog>
#include <QFileInfo>
#include <QMessageBox>

namespace {

using Statement = DhcpdConfigStatement;

constexpr int mostZonesTold{20};

template<bool (Statement::*isKind)() const>
bool declarationOf(const Statement &statement)
{
    return statement.isDeclaration() && (statement.*isKind)();
}

bool isHardware(const Statement &statement) { return statement.isParam() && statement.isMacAddress(); }

bool isRoute(const Statement &statement)
{
    return statement.isParam() && ParameterKind::of(statement).type == ValueType::Routes;
}

/// The first child of `declaration` that is of a kind; null when there is none.
const Statement *firstChild(const Statement &declaration, bool (*isKind)(const Statement &))
{
    for (int row{0}; row < declaration.childCount(); ++row) {
        if (const Statement * child{declaration.child(row)}; isKind(*child))
            return child;
    }
    return nullptr;
}

/// Whether `text` is one address and all that a fixed address says: it may say several, or names.
bool isAddress(const Statement &fixedAddress, const QString &text)
{
    return values::isValue(fixedAddress, 1, text) && values::usableAddress(text);
}

int countOf(const Statement &declaration, bool (*isKind)(const Statement &))
{
    int count{};
    for (int row{0}; row < declaration.childCount(); ++row)
        count += isKind(*declaration.child(row)) ? 1 : 0;
    return count;
}

/// The position of the word that holds the first address of `range`.
int firstAddressOf(const Statement &range) { return values::rangeFlag(range).isEmpty() ? 1 : 2; }

} // namespace

void DeclarationCommands::addArbitrary()
{
    m_commands.addAsText(tr("Add arbitrary declaration"), tr("Declaration:"), &DhcpdConfigModel::addDeclaration);
}

void DeclarationCommands::editArbitrary()
{
    m_commands.editAsText(tr("Edit arbitrary declaration"), declarationOf<&Statement::isDeclaration>);
}

void DeclarationCommands::addSharedNetwork()
{
    SharedNetworkInputDialog dialog{m_commands.window()};
    m_commands.add(tr("Add shared network"), dialog,
                   [&](const QModelIndex &parent) { m_commands.model().addSharedNetwork(dialog.name(), parent); });
}

void DeclarationCommands::editSharedNetwork()
{
    SharedNetworkInputDialog dialog{m_commands.window()};
    m_commands.editValue(
        tr("Edit shared network"), dialog, declarationOf<&Statement::isSharedNetwork>,
        [&dialog](const Statement &network) { dialog.setName(values::unquoted(network.textFrom(1))); },
        [&dialog] { return values::quotedIfSpaced(dialog.name()); },
        [&dialog](const Statement &network) {
            const QString name{dialog.name()};
            return values::isValue(network, 1, name) || values::isValue(network, 1, values::quoted(name));
        });
}

void DeclarationCommands::addSubnet()
{
    SubnetInputDialog dialog{m_commands.window()};
    dialog.setAddress(QStringLiteral("192.168.1.0/24"));
    m_commands.add(tr("Add subnet"), dialog, [&](const QModelIndex &parent) {
        m_commands.model().addSubnet(dialog.address(), dialog.netmask(), parent);
    });
}

void DeclarationCommands::editSubnet()
{
    SubnetInputDialog dialog{m_commands.window()};
    m_commands.editValue(
        tr("Edit subnet"), dialog, declarationOf<&Statement::isSubnet>,
        [&dialog](const Statement &subnet) {
            dialog.setAddress(subnet.word(1));
            dialog.setNetmask(subnet.word(3));
        },
        [&dialog] { return values::subnetText(dialog.address(), dialog.netmask()); },
        [&dialog](const Statement &subnet) {
            const QString mask{dialog.netmask()};
            return values::isValue(
                subnet, 1, mask.isEmpty() ? dialog.address() : dialog.address() + QLatin1String{" netmask "} + mask);
        });
}

void DeclarationCommands::addRange()
{
    const Statement &subnet{m_commands.currentStatement()};
    const QStringList range{DhcpdConfigModel::defaultRange(subnet.word(1) + QLatin1Char{'/'} + subnet.word(3))};
    RangeInputDialog dialog{m_commands.window()};
    dialog.setStartIp(range.value(0));
    dialog.setEndIp(range.value(1));
    m_commands.add(tr("Add range"), dialog, [&](const QModelIndex &parent) {
        m_commands.model().addRange(dialog.startIp(), dialog.endIp(), parent);
    });
}

void DeclarationCommands::editRange()
{
    RangeInputDialog dialog{m_commands.window()};
    const auto fill = [&dialog](const Statement &range) {
        dialog.setStartIp(range.word(firstAddressOf(range)));
        dialog.setEndIp(range.word(firstAddressOf(range) + 1));
    };
    const auto store = [&model = m_commands.model()](const QModelIndex &index, const QStringList &addresses,
                                                     const QStringList & /*shown*/) {
        const Statement &range{*model.statementFor(index)};
        const QString flag{values::rangeFlag(range)};
        if (!model.setData(index, addresses.join(QLatin1Char{' '}), Qt::EditRole) || flag.isEmpty())
            return;
        // The dialog has no field for the flag and the model keeps only the addresses, so it is put back.
        QStringList words{range.wordsFrom(0)};
        words.insert(1, flag);
        model.replaceWords(index, words);
    };
    const auto addresses = [&dialog] { return QStringList{dialog.startIp(), dialog.endIp()}; };
    const auto showsAll = [&addresses](const Statement &range) {
        return values::isValue(range, firstAddressOf(range), addresses().join(QLatin1Char{' '}).trimmed());
    };
    m_commands.edit(tr("Edit range"), dialog, declarationOf<&Statement::isRange>, {fill, addresses, showsAll}, store);
}

void DeclarationCommands::addHost()
{
    HostInputDialog dialog{m_commands.window()};
    dialog.setMac(values::noMacAddress());
    dialog.adjustSize();
    m_commands.add(tr("Add host"), dialog, [&](const QModelIndex &parent) {
        m_commands.model().addHost(dialog.name(), dialog.mac(), dialog.ip(), parent);
    });
}

void DeclarationCommands::editHost()
{
    enum Field
    {
        Name,
        Mac,
        Address
    };
    const auto isFixedAddress = declarationOf<&Statement::isFixedAddress>;

    HostInputDialog dialog{m_commands.window()};
    const auto fill = [&](const Statement &host) {
        const Statement *hardware{firstChild(host, isHardware)};
        const Statement *fixedAddress{firstChild(host, isFixedAddress)};
        dialog.setName(host.textFrom(1));
        dialog.setMac(hardware ? hardware->word(2) : values::noMacAddress());
        dialog.setIp(fixedAddress ? fixedAddress->textFrom(1) : QString{});
    };
    const auto fields = [&dialog] { return QStringList{dialog.name(), dialog.mac(), dialog.ip()}; };
    const auto showsAll = [&](const Statement &host) {
        const Statement *hardware{firstChild(host, isHardware)};
        const Statement *fixedAddress{firstChild(host, isFixedAddress)};
        return values::isValue(host, 1, dialog.name()) && countOf(host, isHardware) <= 1 &&
               countOf(host, isFixedAddress) <= 1 && (!hardware || values::isValue(*hardware, 2, dialog.mac())) &&
               (!fixedAddress || isAddress(*fixedAddress, dialog.ip()));
    };
    const auto store = [&](const QModelIndex &index, const QStringList &now, const QStringList &shown) {
        DhcpdConfigModel &model{m_commands.model()};
        // A refusal is told in a box, and while that is open the host may go.
        const QPersistentModelIndex host{index};
        const auto setValue = [&](Field field, const Statement *statement) {
            if (statement && now.at(field) != shown.at(field))
                model.setData(model.indexOf(*statement, 1), now.at(field), Qt::EditRole);
            return host.isValid();
        };
        const auto child = [&](bool (*isKind)(const Statement &)) {
            return firstChild(*model.statementFor(host), isKind);
        };
        if (!setValue(Name, model.statementFor(host)) || !setValue(Mac, child(isHardware)))
            return;
        const Statement *fixedAddress{child(isFixedAddress)};
        setValue(Address, fixedAddress);
        if (!fixedAddress && now.at(Address) != shown.at(Address)) {
            const QModelIndex parent{host.sibling(host.row(), 0)};
            m_commands.addTo(parent, [&] { model.addFixedAddress(now.at(Address), parent); });
        }
    };
    m_commands.edit(tr("Edit host"), dialog, declarationOf<&Statement::isHost>, {fill, fields, showsAll}, store);
}

bool DeclarationCommands::reserve(const Reservation &lease)
{
    // Without a configuration there is nothing that the host could be added to.
    DhcpdConfigModel &model{m_commands.model()};
    const QPersistentModelIndex network{model.index(0, 0)};
    if (!network.isValid() || !mayStartCommand())
        return false;
    HostInputDialog dialog{m_commands.window()};
    dialog.setWindowTitle(tr("Reserve an IP address"));
    dialog.setIp(lease.address);
    dialog.setMac(lease.mac);
    dialog.setName(values::hostName(lease.hostName));
    dialog.adjustSize();
    if (dialog.exec() != QDialog::Accepted || !network.isValid())
        return false;

    m_commands.addTo(
        network, [&] { model.addHost(dialog.name(), dialog.mac(), dialog.ip(), network); },
        StatementCommands::OpenBranches::All);
    return QMessageBox::information(m_commands.window(), tr("Information"),
                                    tr("The IP address is reserved.\nGo to topology?"),
                                    QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes;
}

void DeclarationCommands::addFixedAddress()
{
    IpInputDialog dialog{m_commands.window()};
    m_commands.add(tr("Add fixed address"), dialog,
                   [&](const QModelIndex &parent) { m_commands.model().addFixedAddress(dialog.ip(), parent); });
}

void DeclarationCommands::editFixedAddress()
{
    IpInputDialog dialog{m_commands.window()};
    m_commands.editValue(
        tr("Edit fixed address"), dialog, declarationOf<&Statement::isFixedAddress>,
        [&dialog](const Statement &fixedAddress) { dialog.setIp(fixedAddress.textFrom(1)); },
        [&dialog] { return dialog.ip(); },
        [&dialog](const Statement &fixedAddress) { return isAddress(fixedAddress, dialog.ip()); });
}

void DeclarationCommands::addStaticRoute()
{
    StaticRouteInputDialog dialog{m_commands.window()};
    m_commands.add(tr("Add static route"), dialog, [&](const QModelIndex &parent) {
        m_commands.model().addRoutes(staticroutes::fromDialog(dialog.routes()), dialog.isMsRoute(), parent);
    });
}

void DeclarationCommands::editStaticRoute()
{
    if (values::isDefinition(m_commands.currentStatement())) {
        m_commands.editAsText(tr("Edit static route"), isRoute);
        return;
    }
    StaticRouteInputDialog dialog{m_commands.window()};
    const auto value = [&dialog] { return values::routeList(staticroutes::fromDialog(dialog.routes())); };
    m_commands.editValue(
        tr("Edit static route"), dialog, isRoute,
        [&dialog](const Statement &option) {
            dialog.setRoutes(staticroutes::toDialog(option.textFrom(2)), option.isMsStaticRoute());
            dialog.lockMsRoute();
        },
        value, [&value](const Statement &option) { return staticroutes::areSame(option.textFrom(2), value()); });
}

void DeclarationCommands::addBind9Settings()
{
    const QPersistentModelIndex parent{m_commands.currentDeclaration()};
    if (!parent.isValid() || !mayStartCommand())
        return;
    QWidget *window{m_commands.window()};
    const auto answer = QMessageBox::information(
        window, tr("Information"), tr("Add configuration to automatically configure binding with bind9 DNS server?"),
        QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes);
    if (answer != QMessageBox::Yes)
        return;
    const QString file{QFileDialog::getOpenFileName(window, tr("Choose the bind9 configuration with the update key"),
                                                    QFileInfo{paths::bind9LocalConfiguration()}.absolutePath())};
    if (file.isEmpty() || !parent.isValid())
        return;
    DhcpdConfigModel &model{m_commands.model()};
    const bind9::Preparation found{bind9::prepared(file, model.keyNames(parent), model.keyNames())};
    bool isAdded{};
    m_commands.addTo(
        parent, [&] { isAdded = model.addBind9(found.statements, parent); }, StatementCommands::OpenBranches::All);
    if (found.leftOut.isEmpty() || (!isAdded && !found.statements.isEmpty()))
        return; // all is said
    PlainMessageBox{QMessageBox::Information, tr("Information"), leftOutText(found.leftOut), QMessageBox::Ok, window}
        .exec();
}

QString DeclarationCommands::leftOutText(const QVector<bind9::LeftOutZone> &zones)
{
    QStringList lines{tr("These zones were left out:")};
    const QVector<bind9::LeftOutZone> told{zones.mid(0, mostZonesTold)};
    for (const bind9::LeftOutZone &zone : told)
        lines += tr("%1: %2").arg(zone.name, reasonText(zone));
    if (zones.size() > mostZonesTold)
        lines += tr("%1 more").arg(zones.size() - mostZonesTold);
    return lines.join(QLatin1Char{'\n'});
}

QString DeclarationCommands::reasonText(const bind9::LeftOutZone &zone)
{
    using Reason = bind9::LeftOutZone::Reason;
    switch (zone.reason) {
    case Reason::NotPrimary:
        return tr("the name server is not its primary one");
    case Reason::NoUpdateKey:
        return tr("no key may update it");
    case Reason::RefusedName:
        return tr("the DHCP server does not accept its name");
    case Reason::UnknownKey:
        return tr("its key '%1' is not known").arg(zone.key);
    case Reason::RefusedKey:
        return tr("the DHCP server does not accept its key '%1'").arg(zone.key);
    case Reason::KeyBehind:
        break;
    }
    return tr("its key '%1' stands behind this place in the configuration").arg(zone.key);
}
