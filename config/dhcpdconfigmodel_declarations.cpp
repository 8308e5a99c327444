// SPDX-License-Identifier: GPL-3.0-or-later
// The operations of the configuration model that add declarations, and statements of any words.
#include "config/bind9reader.h"
#include "config/dhcpdconfigmodel.h"
#include "config/values.h"

#include <algorithm>

namespace {

constexpr int wordsOfLine{2};
constexpr int wordsOfBlock{3 * wordsOfLine};

constexpr QLatin1Char blank{' '};

// Whether blocks that stand at the top of a file can be added.
bool takesTopBlocks(const DhcpdConfigDeclaration *declaration)
{
    return declaration && (declaration->isRoot() || declaration->isGroup()) && declaration->takesBlocks();
}

bool takesAnything(const DhcpdConfigDeclaration *declaration)
{
    return declaration && !declaration->isRange() && !declaration->isSubclass();
}

QStringList fixedAddressWords(const QString &address) { return {QStringLiteral("fixed-address"), address}; }

// The names of keys up to the end of `last`; false when that is reached.
bool appendKeyNames(QStringList &names, const DhcpdConfigDeclaration &declaration, const DhcpdConfigStatement &last)
{
    if (declaration.isKeyDeclaration())
        names += values::unquoted(declaration.word(1));
    for (const auto &child : declaration.declarations()) {
        if (!appendKeyNames(names, *child, last))
            return false;
    }
    return &declaration != &last;
}

} // namespace

void DhcpdConfigModel::addSharedNetwork(const QString &name, const QModelIndex &parent)
{
    auto *holder = declarationFor(parent);
    if (!takesTopBlocks(holder))
        refuse(tr("Error adding shared-network. Can not add shared-network to '%1'").arg(keywordFor(parent)));
    else
        addTo(holder, [&] { holder->addDeclaration({QStringLiteral("shared-network"), name}); });
}

void DhcpdConfigModel::addSubnet(const QString &address, const QString &mask, const QModelIndex &parent)
{
    const QString text{values::subnetText(address, mask)};
    const auto subnet = values::parseSubnet(text);
    auto *holder = declarationFor(parent);
    if (!subnet) {
        refuse(tr("Error adding subnet. Invalid subnet '%1'").arg(text));
    } else if (!takesTopBlocks(holder) && !(holder && holder->isSharedNetwork() && holder->takesBlocks())) {
        refuse(tr("Error adding subnet. Can not add subnet to '%1'").arg(keywordFor(parent)));
    } else {
        addTo(holder,
              [&] { holder->addDeclaration(QStringList{QStringLiteral("subnet")} + values::subnetWords(*subnet)); });
    }
}

QStringList DhcpdConfigModel::defaultRange(const QString &subnet)
{
    const auto network = values::parseSubnet(subnet);
    return network ? values::hostRange(*network) : QStringList{QString{}, QString{}};
}

void DhcpdConfigModel::addRange(const QString &start, const QString &end, const QModelIndex &parent)
{
    using values::RangeProblem;
    auto *holder = declarationFor(parent);
    if (!holder) {
        refuse(tr("Error adding range. Can not add range to '%1'").arg(keywordFor(parent)));
        return;
    }
    const auto words = values::rangeWords(*holder, start, end);
    const auto *problem = std::get_if<RangeProblem>(&words);
    if (problem && *problem == RangeProblem::IncompleteSubnet) { // before the kind of the declaration, deliberately
        refuse(tr("Error adding range. Invalid attributes of parent subnet"));
    } else if (!holder->isSubnet()) {
        refuse(tr("Error adding range. Can not add range to '%1'").arg(keywordFor(parent)));
    } else if (!problem) {
        addTo(holder,
              [&] { holder->addDeclaration(QStringList{QStringLiteral("range")} + std::get<QStringList>(words)); });
    } else if (*problem == RangeProblem::InvalidSubnet) {
        refuse(tr("Error adding range. Invalid parent subnet"));
    } else if (*problem == RangeProblem::InvalidStart) {
        refuse(tr("Error adding range. Invalid start IP '%1'").arg(start));
    } else {
        refuse(tr("Error adding range. Invalid end IP '%1'").arg(end));
    }
}

void DhcpdConfigModel::addHost(const QString &name, const QString &mac, const QString &address,
                               const QModelIndex &parent)
{
    auto *holder = declarationFor(parent);
    if (!takesTopBlocks(holder)) {
        refuse(tr("Error adding host. Can not add host to '%1'").arg(keywordFor(parent)));
        return;
    }
    if (name.isEmpty()) {
        refuse(tr("Error adding host. Host name can not be empty."));
        return;
    }
    const bool isMac{values::isValid(ValueType::MacAddress, mac)};
    const auto fixedAddress = values::usableAddress(address);
    addTo(holder, [&] {
        auto *host =
            holder->addDeclaration({QStringLiteral("host"), name.contains(blank) ? values::quoted(name) : name});
        if (!mac.isEmpty()) {
            host->addParam(
                {QStringLiteral("hardware"), QStringLiteral("ethernet"), isMac ? mac : values::noMacAddress()});
        }
        if (fixedAddress)
            host->addDeclaration(fixedAddressWords(*fixedAddress));
    });
}

void DhcpdConfigModel::addFixedAddress(const QString &address, const QModelIndex &parent)
{
    auto *host = declarationFor(parent);
    const auto fixedAddress = values::usableAddress(address);
    if (!host || !host->isHost()) {
        refuse(tr("Error adding fixed address. Can not add to '%1'").arg(keywordFor(parent)));
        return;
    }
    if (!fixedAddress) {
        refuse(tr("Error adding fixed address. Invalid IP '%1'").arg(address));
        return;
    }
    const auto &children = host->declarations();
    const auto old =
        std::find_if(children.begin(), children.end(), [](const auto &child) { return child->isFixedAddress(); });
    if (old == children.end()) {
        addTo(host, [&] { host->addDeclaration(fixedAddressWords(*fixedAddress)); });
    } else {
        (*old)->setWordsFrom(1, {*fixedAddress});
        setModified();
    }
}

bool DhcpdConfigModel::addBind9(const QStringList &statements, const QModelIndex &parent)
{
    auto *holder = declarationFor(parent);
    if (!takesTopBlocks(holder))
        return refuse(tr("Error adding bind9. Can not add bind9 to '%1'").arg(keywordFor(parent)));
    if (statements.isEmpty())
        return refuse(tr("Error adding bind9. bind9 can not be empty."));
    addTo(holder, [&] {
        DhcpdConfigDeclaration *block{};
        for (int i{}; i < statements.size(); i += wordsOfLine) {
            const QStringList words{(statements.at(i) + blank + statements.value(i + 1)).split(blank)};
            if (i % wordsOfBlock == 0)
                block = holder->addDeclaration(words);
            else
                block->addParam(words);
        }
    });
    return true;
}

bool DhcpdConfigModel::addDeclaration(const QStringList &words, const QModelIndex &parent)
{
    auto *holder = declarationFor(parent);
    if (!takesAnything(holder) || !holder->takesBlocks())
        return refuse(tr("Error adding declaration. Can not add declaration to '%1'").arg(keywordFor(parent)));
    addTo(holder, [&] { holder->addDeclaration(words); });
    return true;
}

bool DhcpdConfigModel::addParameter(const QStringList &words, const QModelIndex &parent)
{
    auto *holder = holderFor(parent);
    if (!takesAnything(holder))
        return refuse(tr("Error adding parameter. Can not add parameter to '%1'").arg(keywordFor(parent)));
    addTo(holder, [&] { holder->addParam(words); });
    return true;
}

QStringList DhcpdConfigModel::keyNames(const QModelIndex &parent) const
{
    QStringList names;
    appendKeyNames(names, *m_topNode, *statementFor(parent));
    return names;
}
