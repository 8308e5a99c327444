// SPDX-License-Identifier: GPL-3.0-or-later
// The main window's commands on the topology tree: its context menus, and adding, editing and removing statements.
#include "app/fmain.h"

#include "app/topologymenus.h"
#include "app/treeexpansion.h"
#include "common/paths.h"
#include "config/bind9reader.h"
#include "config/dhcpdconfigdeclaration.h"
#include "config/dhcpdconfigmodel.h"
#include "config/dhcpdconfigparam.h"
#include "dialogs/domaininputdialog.h"
#include "dialogs/hostinputdialog.h"
#include "dialogs/ipinputdialog.h"
#include "dialogs/macinputdialog.h"
#include "dialogs/multipleipinputdialog.h"
#include "dialogs/rangeinputdialog.h"
#include "dialogs/sharednetworkinputdialog.h"
#include "dialogs/statementinputdialog.h"
#include "dialogs/staticrouteinputdialog.h"
#include "dialogs/subnetinputdialog.h"
#include "dialogs/timeinputdialog.h"
#include "ui_fmain.h"

#include <QFileDialog>
#include <QFileInfo>
#include <QMenu>
#include <QMessageBox>

#include <algorithm>
#include <limits>
#include <string_view>
#include <tuple>

namespace {

using Statement = DhcpdConfigStatement;
using Declaration = DhcpdConfigDeclaration;

constexpr auto bootpFlag = "dynamic-bootp";
constexpr auto routeSeparator = ", ";

QString noMac() { return QStringLiteral("00:00:00:00:00:00"); }

QStringList wordsFrom(const Statement &statement, int first)
{
    QStringList words;
    int index{};
    for (const std::string_view word : statement.words()) {
        if (index++ >= first)
            words.append(decodedWord(word));
    }
    return words;
}

/// The words from `first` on as one text; a value typed by hand may be split over several.
QString textFrom(const Statement &statement, int first)
{
    return wordsFrom(statement, first).join(QLatin1Char{' '}).trimmed();
}

/// The seconds of a lease time, which may be more than the dialog's numbers hold.
int secondsOf(const Statement &time)
{
    using Limits = std::numeric_limits<int>;
    return static_cast<int>(qBound<qint64>(Limits::min(), time.word(1).toLongLong(), Limits::max()));
}

/// The subnet as one text; the mask may be missing.
QString subnetText(const QString &address, const QString &mask)
{
    return mask.isEmpty() ? address : address + QLatin1Char{'/'} + mask;
}

/// A name of several words has to stand in quotes to be one name to the server.
QString quotedIfSpaced(const QString &name)
{
    const QLatin1Char quote{'"'};
    return name.contains(QLatin1Char{' '}) && !name.startsWith(quote) ? quote + name + quote : name;
}

using KindTest = bool (*)(const Statement &);

template<bool (Statement::*isKind)() const>
bool declarationOf(const Statement &statement)
{
    return statement.isDeclaration() && (statement.*isKind)();
}

template<bool (Statement::*isKind)() const>
bool parameterOf(const Statement &statement)
{
    return statement.isParam() && (statement.*isKind)();
}

template<bool (Statement::*isKind)() const>
bool optionOf(const Statement &statement)
{
    return statement.isParam() && statement.isOption() && (statement.*isKind)();
}

/// The first child of `declaration` that is of a kind; null when there is none.
const Statement *firstChild(const Statement &declaration, KindTest isKind)
{
    for (int row = 0; row < declaration.childCount(); ++row) {
        if (const Statement *child = declaration.child(row); isKind(*child))
            return child;
    }
    return nullptr;
}

/// The index of the word that holds the first address of `range`.
int firstAddressOf(const Statement &range)
{
    return range.word(1).compare(QLatin1String{bootpFlag}, Qt::CaseInsensitive) == 0 ? 2 : 1;
}

/// What the dialog of a host shows.
struct HostFields
{
    QString name;
    QString mac;
    QString ip;

    bool operator!=(const HostFields &other) const
    {
        return std::tie(name, mac, ip) != std::tie(other.name, other.mac, other.ip);
    }
};

} // namespace

void FMain::handleTreeContextMenuRequested(QPoint /*position*/)
{
    const QModelIndex index = m_ui->topologyTree->currentIndex();
    if (index.isValid())
        m_topologyMenus->menuFor(*m_configModel->statementFor(index))->popup(QCursor::pos());
}

void FMain::handleTreeDoubleClicked(QModelIndex index) { editStatement(index); }

void FMain::handleEdit() { editStatement(m_ui->topologyTree->currentIndex()); }

void FMain::editStatement(const QModelIndex &index)
{
    struct EditRow
    {
        KindTest isKind;
        void (FMain::*edit)();
    };
    // The first row that fits decides.
    static constexpr EditRow edits[]{
        {declarationOf<&Statement::isSharedNetwork>, &FMain::handleEditSharedNetwork},
        {declarationOf<&Statement::isSubnet>, &FMain::handleEditSubnet},
        {declarationOf<&Statement::isRange>, &FMain::handleEditRange},
        {declarationOf<&Statement::isHost>, &FMain::handleEditHost},
        {declarationOf<&Statement::isFixedAddress>, &FMain::handleEditFixedAddress},
        {declarationOf<&Statement::isDeclaration>, &FMain::handleEditArbitraryDeclaration},
        {optionOf<&Statement::isRouters>, &FMain::handleEditRouters},
        {optionOf<&Statement::isDnsServers>, &FMain::handleEditDns},
        {optionOf<&Statement::isNtpServers>, &FMain::handleEditNtp},
        {optionOf<&Statement::isDomainName>, &FMain::handleEditDomainName},
        {parameterOf<&Statement::isMacAddress>, &FMain::handleEditMacAddress},
        {parameterOf<&Statement::isDefaultLeaseTime>, &FMain::handleEditDefaultLeaseTime},
        {parameterOf<&Statement::isMaxLeaseTime>, &FMain::handleEditMaxLeaseTime},
        {parameterOf<&Statement::isLeaseTime>, &FMain::editOtherLeaseTime},
        {optionOf<&Statement::isMsStaticRoute>, &FMain::handleEditStaticRoute},
        {optionOf<&Statement::isStaticRoute>, &FMain::handleEditStaticRoute},
        {parameterOf<&Statement::isParam>, &FMain::handleEditArbitraryParam},
    };

    if (!index.isValid())
        return;
    const Statement &statement = *m_configModel->statementFor(index);
    if (statement.isRoot())
        return;
    const auto *row = std::find_if(std::begin(edits), std::end(edits),
                                   [&statement](const EditRow &candidate) { return candidate.isKind(statement); });
    (this->*row->edit)();
}

void FMain::removeCurrentStatement()
{
    const QModelIndex index = m_ui->topologyTree->currentIndex();
    if (!index.isValid() || m_configModel->statementFor(index)->isRoot())
        return;
    const QModelIndex parent = index.parent();
    m_configModel->removeStatement(index);
    m_treeExpansion->expandAll();
    m_ui->topologyTree->setCurrentIndex(parent);
}

QModelIndex FMain::currentDeclaration() const
{
    const QModelIndex index = m_ui->topologyTree->currentIndex();
    return index.isValid() && m_configModel->statementFor(index)->isDeclaration() ? index.siblingAtColumn(0)
                                                                                  : QModelIndex{};
}

QModelIndex FMain::currentOfKind(KindTest isKind) const
{
    const QModelIndex index = m_ui->topologyTree->currentIndex();
    const Statement &statement = *m_configModel->statementFor(index);
    return statement.isRoot() || !isKind(statement) ? QModelIndex{} : index;
}

template<typename Change>
void FMain::addTo(const QModelIndex &parent, const Change &change, OpenBranches open)
{
    const auto &declaration = static_cast<const DhcpdConfigDeclaration &>(*m_configModel->statementFor(parent));
    const std::size_t declarationsBefore = declaration.declarations().size();
    const int childrenBefore = declaration.childCount();
    change();
    if (open == OpenBranches::All)
        m_treeExpansion->expandAll();
    if (declaration.childCount() == childrenBefore)
        return; // refused, or an existing statement was changed in place

    // The definition of an option may have come before the declaration, which then stands in another row.
    const QModelIndex current = parent.sibling(declaration.row(), 0);
    QTreeView *tree = m_ui->topologyTree;
    tree->setCurrentIndex(current);
    tree->expand(current);
    const bool declarationAdded = declaration.declarations().size() > declarationsBefore;
    const int rows = declarationAdded ? declaration.childCount() : static_cast<int>(declaration.parameters().size());
    tree->scrollTo(m_configModel->index(rows - 1, 0, current));
}

template<typename Dialog, typename Fill, typename Add>
void FMain::addThroughDialog(const QString &title, const Fill &fill, const Add &add, OpenBranches open)
{
    const QModelIndex parent = currentDeclaration();
    if (!parent.isValid())
        return;
    Dialog dialog{this};
    dialog.setWindowTitle(title);
    fill(dialog);
    if (dialog.exec() == QDialog::Accepted)
        addTo(
            parent, [&] { add(dialog, parent); }, open);
}

template<typename Dialog, typename Fill, typename Value, typename HandOver>
void FMain::editThroughDialog(const QString &title, KindTest isKind, const Fill &fill, const Value &value,
                              const HandOver &handOver)
{
    const QModelIndex current = currentOfKind(isKind);
    if (!current.isValid())
        return;
    Dialog dialog{this};
    dialog.setWindowTitle(title);
    fill(dialog, *m_configModel->statementFor(current));
    const auto shown = value(dialog);
    if (dialog.exec() == QDialog::Accepted && value(dialog) != shown)
        handOver(current.siblingAtColumn(1), value(dialog), shown);
}

template<typename Dialog, typename Fill, typename Value>
void FMain::editValueThroughDialog(const QString &title, KindTest isKind, const Fill &fill, const Value &value)
{
    const auto handOver = [this](const QModelIndex &index, const QString &text, const QString & /*shown*/) {
        m_configModel->setData(index, text, Qt::EditRole);
    };
    editThroughDialog<Dialog>(title, isKind, fill, value, handOver);
}

bool FMain::resumesAdvancedEditing()
{
    return QMessageBox::warning(this, tr("Warning!"),
                                tr("This editing mode for advanced users.\n"
                                   "After applying this changes configuration may be incorrect.\n"
                                   "Do you want to resume?"),
                                QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes) == QMessageBox::Yes;
}

void FMain::addArbitrary(const QString &title, const QString &label,
                         bool (DhcpdConfigModel::*add)(const QStringList &, const QModelIndex &))
{
    if (!currentDeclaration().isValid() || !resumesAdvancedEditing())
        return;
    addThroughDialog<StatementInputDialog>(
        title, [&label](StatementInputDialog &dialog) { dialog.setLabelText(label); },
        [&model = *m_configModel, add](const StatementInputDialog &dialog, const QModelIndex &parent) {
            (model.*add)(dialog.statementWords(), parent);
        },
        OpenBranches::All);
}

void FMain::editArbitrary(const QString &title, const QString &label, KindTest isKind)
{
    if (!currentOfKind(isKind).isValid() || !resumesAdvancedEditing())
        return;
    editThroughDialog<StatementInputDialog>(
        title, isKind,
        [&label](StatementInputDialog &dialog, const Statement &statement) {
            dialog.setLabelText(label);
            dialog.setStatementText(statement.joinedWords());
        },
        [](const StatementInputDialog &dialog) { return dialog.statementWords(); },
        [this](const QModelIndex &index, const QStringList &words, const QStringList & /*shown*/) {
            m_configModel->replaceWords(index, words);
        });
}

void FMain::handleAddArbitraryDeclaration()
{
    addArbitrary(tr("Add arbitrary declaration"), tr("Declaration:"), &DhcpdConfigModel::addDeclaration);
}

void FMain::handleEditArbitraryDeclaration()
{
    editArbitrary(tr("Edit arbitrary declaration"), tr("Declaration:"), declarationOf<&Statement::isDeclaration>);
}

void FMain::handleAddArbitraryParam()
{
    addArbitrary(tr("Add arbitrary parameter"), tr("Parameter:"), &DhcpdConfigModel::addParameter);
}

void FMain::handleEditArbitraryParam()
{
    editArbitrary(tr("Edit arbitrary parameter"), tr("Parameter:"), parameterOf<&Statement::isParam>);
}

void FMain::handleAddSharedNetwork()
{
    addThroughDialog<SharedNetworkInputDialog>(
        tr("Add shared network"), [](const SharedNetworkInputDialog &) {},
        [this](const SharedNetworkInputDialog &dialog, const QModelIndex &parent) {
            m_configModel->addSharedNetwork(dialog.name(), parent);
        });
}

void FMain::handleEditSharedNetwork()
{
    editValueThroughDialog<SharedNetworkInputDialog>(
        tr("Edit shared network"), declarationOf<&Statement::isSharedNetwork>,
        [](SharedNetworkInputDialog &dialog, const Statement &network) { dialog.setName(textFrom(network, 1)); },
        [](const SharedNetworkInputDialog &dialog) { return quotedIfSpaced(dialog.name()); });
}

void FMain::handleAddSubnet()
{
    addThroughDialog<SubnetInputDialog>(
        tr("Add subnet"), [](SubnetInputDialog &dialog) { dialog.setAddress(QStringLiteral("192.168.1.0/24")); },
        [this](const SubnetInputDialog &dialog, const QModelIndex &parent) {
            m_configModel->addSubnet(dialog.address(), dialog.netmask(), parent);
        });
}

void FMain::handleEditSubnet()
{
    editValueThroughDialog<SubnetInputDialog>(
        tr("Edit subnet"), declarationOf<&Statement::isSubnet>,
        [](SubnetInputDialog &dialog, const Statement &subnet) {
            dialog.setAddress(subnet.word(1));
            dialog.setNetmask(subnet.word(3));
        },
        [](const SubnetInputDialog &dialog) { return subnetText(dialog.address(), dialog.netmask()); });
}

void FMain::handleAddRange()
{
    addThroughDialog<RangeInputDialog>(
        tr("Add range"),
        [this](RangeInputDialog &dialog) {
            const Statement &subnet = *m_configModel->statementFor(currentDeclaration());
            const QStringList range = m_configModel->defaultRange(subnet.word(1) + QLatin1Char{'/'} + subnet.word(3));
            dialog.setStartIp(range.value(0));
            dialog.setEndIp(range.value(1));
        },
        [this](const RangeInputDialog &dialog, const QModelIndex &parent) {
            m_configModel->addRange(dialog.startIp(), dialog.endIp(), parent);
        });
}

void FMain::handleEditRange()
{
    editThroughDialog<RangeInputDialog>(
        tr("Edit range"), declarationOf<&Statement::isRange>,
        [](RangeInputDialog &dialog, const Statement &range) {
            dialog.setStartIp(range.word(firstAddressOf(range)));
            dialog.setEndIp(range.word(firstAddressOf(range) + 1));
        },
        [](const RangeInputDialog &dialog) -> QString { return dialog.startIp() + QLatin1Char{' '} + dialog.endIp(); },
        [this](const QModelIndex &index, const QString &text, const QString & /*shown*/) {
            const Statement &range = *m_configModel->statementFor(index);
            const QString flag = firstAddressOf(range) > 1 ? range.word(1) : QString{};
            if (!m_configModel->setData(index, text, Qt::EditRole) || flag.isEmpty())
                return;
            // The dialog has no field for the flag and the model keeps only the addresses, so it is put back.
            QStringList words = wordsFrom(range, 0);
            words.insert(1, flag);
            m_configModel->replaceWords(index, words);
        });
}

void FMain::handleAddHost()
{
    addThroughDialog<HostInputDialog>(
        tr("Add host"),
        [](HostInputDialog &dialog) {
            dialog.setMac(noMac());
            dialog.adjustSize();
        },
        [this](const HostInputDialog &dialog, const QModelIndex &parent) {
            m_configModel->addHost(dialog.name(), dialog.mac(), dialog.ip(), parent);
        });
}

void FMain::addHostTo(const QModelIndex &network, const QString &name, const QString &mac, const QString &ip)
{
    addTo(
        network, [&] { m_configModel->addHost(name, mac, ip, network); }, OpenBranches::All);
}

void FMain::handleEditHost()
{
    const KindTest isHost = declarationOf<&Statement::isHost>;
    const KindTest isHardware = parameterOf<&Statement::isMacAddress>;
    const KindTest isFixedAddress = declarationOf<&Statement::isFixedAddress>;

    editThroughDialog<HostInputDialog>(
        tr("Edit host"), isHost,
        [=](HostInputDialog &dialog, const Statement &host) {
            const Statement *hardware = firstChild(host, isHardware);
            const Statement *fixedAddress = firstChild(host, isFixedAddress);
            dialog.setName(textFrom(host, 1));
            dialog.setMac(hardware ? hardware->word(2) : noMac());
            dialog.setIp(fixedAddress ? textFrom(*fixedAddress, 1) : QString{});
        },
        [](const HostInputDialog &dialog) {
            return HostFields{quotedIfSpaced(dialog.name()), dialog.mac(), dialog.ip()};
        },
        [=](const QModelIndex &index, const HostFields &fields, const HostFields &shown) {
            const QModelIndex hostIndex = index.siblingAtColumn(0);
            const Statement &host = *m_configModel->statementFor(hostIndex);
            const auto setValue = [&](const Statement *child, const QString &text) {
                return m_configModel->setData(m_configModel->index(child->row(), 1, hostIndex), text, Qt::EditRole);
            };
            if (fields.name != shown.name)
                m_configModel->setData(index, fields.name, Qt::EditRole);
            if (const Statement *hardware = firstChild(host, isHardware); hardware && fields.mac != shown.mac)
                setValue(hardware, fields.mac);
            if (fields.ip == shown.ip)
                return;
            if (const Statement *fixedAddress = firstChild(host, isFixedAddress))
                setValue(fixedAddress, fields.ip);
            else
                addTo(hostIndex, [&] { m_configModel->addFixedAddress(fields.ip, hostIndex); });
        });
}

void FMain::handleAddFixedAddress()
{
    addThroughDialog<IpInputDialog>(
        tr("Add fixed address"), [](const IpInputDialog &) {},
        [this](const IpInputDialog &dialog, const QModelIndex &parent) {
            m_configModel->addFixedAddress(dialog.ip(), parent);
        });
}

void FMain::handleEditFixedAddress()
{
    editValueThroughDialog<IpInputDialog>(
        tr("Edit fixed address"), declarationOf<&Statement::isFixedAddress>,
        [](IpInputDialog &dialog, const Statement &fixedAddress) { dialog.setIp(textFrom(fixedAddress, 1)); },
        [](const IpInputDialog &dialog) { return dialog.ip(); });
}

void FMain::addAddressList(const QString &title, const QString &label,
                           void (DhcpdConfigModel::*add)(const QString &, const QModelIndex &))
{
    addThroughDialog<MultipleIpInputDialog>(
        title, [&label](MultipleIpInputDialog &dialog) { dialog.setLabel(label); },
        [&model = *m_configModel, add](const MultipleIpInputDialog &dialog, const QModelIndex &parent) {
            (model.*add)(dialog.ips(), parent);
        });
}

void FMain::editAddressList(const QString &title, const QString &label, KindTest isKind)
{
    editValueThroughDialog<MultipleIpInputDialog>(
        title, isKind,
        [&label](MultipleIpInputDialog &dialog, const Statement &option) {
            dialog.setLabel(label);
            dialog.setIps(textFrom(option, 2));
        },
        [](const MultipleIpInputDialog &dialog) { return dialog.ips(); });
}

void FMain::handleAddRouters() { addAddressList(tr("Add gateways"), tr("Gateways:"), &DhcpdConfigModel::addRouters); }

void FMain::handleEditRouters()
{
    editAddressList(tr("Edit gateways"), tr("Gateways:"), optionOf<&Statement::isRouters>);
}

void FMain::handleAddDns()
{
    addAddressList(tr("Add DNS servers"), tr("DNS servers:"), &DhcpdConfigModel::addDnsServers);
}

void FMain::handleEditDns()
{
    editAddressList(tr("Edit DNS servers"), tr("DNS servers:"), optionOf<&Statement::isDnsServers>);
}

void FMain::handleAddNtp()
{
    addAddressList(tr("Add NTP servers"), tr("NTP servers:"), &DhcpdConfigModel::addNtpServers);
}

void FMain::handleEditNtp()
{
    editAddressList(tr("Edit NTP servers"), tr("NTP servers:"), optionOf<&Statement::isNtpServers>);
}

void FMain::handleAddDomainName()
{
    addThroughDialog<DomainInputDialog>(
        tr("Add domain name"), [](DomainInputDialog &dialog) { dialog.setDomain(QStringLiteral("example.org")); },
        [this](const DomainInputDialog &dialog, const QModelIndex &parent) {
            m_configModel->addDomainName(dialog.domain(), parent);
        });
}

void FMain::handleEditDomainName()
{
    editValueThroughDialog<DomainInputDialog>(
        tr("Edit domain name"), optionOf<&Statement::isDomainName>,
        [](DomainInputDialog &dialog, const Statement &option) { dialog.setDomain(textFrom(option, 2)); },
        [](const DomainInputDialog &dialog) { return dialog.domain(); });
}

void FMain::addLeaseTime(const QString &title, bool (DhcpdConfigModel::*add)(const QString &, const QModelIndex &))
{
    addThroughDialog<TimeInputDialog>(
        title, [](const TimeInputDialog &) {},
        [&model = *m_configModel, add](const TimeInputDialog &dialog, const QModelIndex &parent) {
            (model.*add)(dialog.seconds(), parent);
        });
}

void FMain::editLeaseTime(const QString &title, KindTest isKind)
{
    editValueThroughDialog<TimeInputDialog>(
        title, isKind, [](TimeInputDialog &dialog, const Statement &time) { dialog.setSeconds(secondsOf(time)); },
        [](const TimeInputDialog &dialog) { return dialog.seconds(); });
}

void FMain::handleAddMaxLeaseTime() { addLeaseTime(tr("Add max lease time"), &DhcpdConfigModel::addMaxLeaseTime); }

void FMain::handleEditMaxLeaseTime()
{
    editLeaseTime(tr("Edit max lease time"), parameterOf<&Statement::isMaxLeaseTime>);
}

void FMain::handleAddDefaultLeaseTime()
{
    addLeaseTime(tr("Add default lease time"), &DhcpdConfigModel::addDefaultLeaseTime);
}

void FMain::handleEditDefaultLeaseTime()
{
    editLeaseTime(tr("Edit default lease time"), parameterOf<&Statement::isDefaultLeaseTime>);
}

void FMain::editOtherLeaseTime() { editLeaseTime(tr("Edit time"), parameterOf<&Statement::isLeaseTime>); }

void FMain::handleEditMacAddress()
{
    editValueThroughDialog<MacInputDialog>(
        tr("Edit MAC address"), parameterOf<&Statement::isMacAddress>,
        [](MacInputDialog &dialog, const Statement &hardware) { dialog.setMac(hardware.word(2)); },
        [](const MacInputDialog &dialog) { return dialog.mac(); });
}

void FMain::handleAddStaticRoute()
{
    addThroughDialog<StaticRouteInputDialog>(
        tr("Add static route"), [](const StaticRouteInputDialog &) {},
        [this](const StaticRouteInputDialog &dialog, const QModelIndex &parent) {
            m_configModel->addStaticRoutes(dialog.routes(), dialog.isMsRoute(), parent);
        });
}

void FMain::handleEditStaticRoute()
{
    const KindTest isRoute = [](const Statement &statement) {
        return optionOf<&Statement::isStaticRoute>(statement) || optionOf<&Statement::isMsStaticRoute>(statement);
    };
    const QModelIndex current = m_ui->topologyTree->currentIndex();
    if (m_configModel->statementFor(current)->word(2).startsWith(QLatin1String{"code"})) {
        // Not a list of routes but the definition of the option.
        editArbitrary(tr("Edit static route"), tr("Parameter:"), isRoute);
        return;
    }
    editValueThroughDialog<StaticRouteInputDialog>(
        tr("Edit static route"), isRoute,
        [](StaticRouteInputDialog &dialog, const Statement &option) {
            dialog.setRoutes(textFrom(option, 2), option.isMsStaticRoute());
            dialog.lockMsRoute();
        },
        [](const StaticRouteInputDialog &dialog) { return dialog.routes().join(QLatin1String{routeSeparator}); });
}

void FMain::handleAddBind9Settings()
{
    const QModelIndex parent = currentDeclaration();
    if (!parent.isValid())
        return;
    const auto answer = QMessageBox::information(
        this, tr("Information"), tr("Add configuration to automatically configure binding with bind9 DNS server?"),
        QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes);
    if (answer != QMessageBox::Yes)
        return;
    const QString file = QFileDialog::getOpenFileName(this, tr("Choose the bind9 configuration with the update key"),
                                                      QFileInfo{paths::bind9LocalConfiguration()}.absolutePath());
    if (file.isEmpty())
        return;
    addTo(
        parent, [&] { m_configModel->addBind9(bind9::prepared(file, m_configModel->keyNames(parent)), parent); },
        OpenBranches::All);
}
