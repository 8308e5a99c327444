// SPDX-License-Identifier: GPL-3.0-or-later
// The operations of the configuration model that add parameters or replace their values.
#include "config/dhcpdconfigmodel.h"

#include <algorithm>

using Statement = DhcpdConfigStatement;

/// An option that a declaration has once.
struct DhcpdConfigModel::OptionKind
{
    const char *name;
    bool (Statement::*isKind)() const;
    const char *refusal; // of what is no declaration
    int wordsOfNewValue; // when it replaces another
};

namespace {

constexpr int optionValue{2}; // the position of an option's value

struct RouteOption
{
    const char *name;
    bool (Statement::*isKind)() const;
    const char *definition;
};

constexpr RouteOption routeOption{"classless-static-routes", &Statement::isStaticRoute,
                                  "code 121 = array of unsigned integer 8"};
constexpr RouteOption msRouteOption{"ms-classless-static-routes", &Statement::isMsStaticRoute,
                                    "code 249 = array of unsigned integer 8"};

QStringList optionWords(const char *name, const QString &value)
{
    return {QStringLiteral("option"), QString::fromLatin1(name), value};
}

template<typename Predicate>
DhcpdConfigParam *findParam(const DhcpdConfigDeclaration &declaration, Predicate predicate)
{
    const auto &params = declaration.parameters();
    const auto found = std::find_if(params.begin(), params.end(), [&](const auto &param) { return predicate(*param); });
    return found == params.end() ? nullptr : found->get();
}

DhcpdConfigParam *findParamByKeyword(const DhcpdConfigDeclaration &declaration, const QString &keyword)
{
    return findParam(declaration, [&](const Statement &param) {
        return param.keyword().compare(keyword, Qt::CaseInsensitive) == 0;
    });
}

DhcpdConfigParam *findOption(const DhcpdConfigDeclaration &declaration, bool (Statement::*isKind)() const)
{
    return findParam(declaration, [&](const Statement &param) { return param.isOption() && (param.*isKind)(); });
}

} // namespace

bool DhcpdConfigModel::addLeaseTime(const QString &keyword, const QString &seconds, const QModelIndex &parent)
{
    auto *const holder = declarationFor(parent);
    if (!holder)
        return refuse(tr("Error adding lease time. Can not add to '%1'").arg(keywordFor(parent)));
    if (seconds.toLongLong() < 1)
        return refuse(tr("Invalid time in seconds '%1'").arg(seconds));
    if (auto *const old = findParamByKeyword(*holder, keyword)) {
        old->setWordsFrom(1, {seconds});
        setModified();
    } else {
        changeTree([&] { holder->addParam({keyword, seconds}); });
    }
    return true;
}

bool DhcpdConfigModel::addDefaultLeaseTime(const QString &seconds, const QModelIndex &parent)
{
    return addLeaseTime(QStringLiteral("default-lease-time"), seconds, parent);
}

bool DhcpdConfigModel::addMaxLeaseTime(const QString &seconds, const QModelIndex &parent)
{
    return addLeaseTime(QStringLiteral("max-lease-time"), seconds, parent);
}

void DhcpdConfigModel::addRouters(const QString &list, const QModelIndex &parent)
{
    static constexpr OptionKind routers{"routers", &Statement::isRouters,
                                        QT_TR_NOOP("Error adding gateways. Can not add to '%1'"), 1};
    addOption(routers, list, parent);
}

void DhcpdConfigModel::addDnsServers(const QString &list, const QModelIndex &parent)
{
    static constexpr OptionKind dnsServers{"domain-name-servers", &Statement::isDnsServers,
                                           QT_TR_NOOP("Error adding DNS servers. Can not add to '%1'"), 1};
    addOption(dnsServers, list, parent);
}

void DhcpdConfigModel::addNtpServers(const QString &list, const QModelIndex &parent)
{
    static constexpr OptionKind ntpServers{"ntp-servers", &Statement::isNtpServers,
                                           QT_TR_NOOP("Error adding NTP servers address. Can not add to '%1'"), 1};
    addOption(ntpServers, list, parent);
}

void DhcpdConfigModel::addDomainName(const QString &name, const QModelIndex &parent)
{
    // A new name gets an empty word behind it, deliberately.
    static constexpr OptionKind domainName{"domain-name", &Statement::isDomainName,
                                           QT_TR_NOOP("Error adding domain name. Can not add to '%1'"), 2};
    addOption(domainName, name, parent);
}

void DhcpdConfigModel::addOption(const OptionKind &kind, const QString &value, const QModelIndex &parent)
{
    auto *const holder = declarationFor(parent);
    if (!holder) {
        refuse(tr(kind.refusal).arg(keywordFor(parent)));
        return;
    }
    auto option = std::make_unique<DhcpdConfigParam>(optionWords(kind.name, value), holder);
    if (!checkOptionValue(*option, value))
        return;
    if (auto *const old = findOption(*holder, kind.isKind)) {
        QStringList newValue{value};
        while (newValue.size() < kind.wordsOfNewValue)
            newValue += QString{};
        old->setWordsFrom(optionValue, newValue);
        setModified();
    } else {
        changeTree([&] { holder->addParam(std::move(option)); });
    }
}

void DhcpdConfigModel::addStaticRoutes(const QStringList &routes, bool ms, const QModelIndex &parent)
{
    const RouteOption &option{ms ? msRouteOption : routeOption};
    auto *const holder = declarationFor(parent);
    if (!holder) {
        refuse(tr("Error adding static route. Can not add static rout to '%1'").arg(keywordFor(parent)));
        return;
    }
    if (routes.isEmpty()) {
        refuse(tr("Error adding static route. Static route parametrs can not be empty."));
        return;
    }
    const auto name = QString::fromLatin1(option.name);
    if (auto *const old = findParamByKeyword(*holder, name)) {
        // Deliberately keeps what stands there, behind the new words.
        old->insertWords(optionValue, 2);
        old->setWord(optionValue, name);
        setModified();
        return;
    }
    changeTree([&] {
        auto *const outer = holder->parent() && holder->parent() != m_topNode.get() ? holder->parent() : holder;
        if (!findOption(*holder, option.isKind) && !findOption(*outer, option.isKind))
            outer->addParam(optionWords(option.name, QString::fromLatin1(option.definition)));
        holder->addParam(optionWords(option.name, routes.join(QStringLiteral(", "))));
    });
}
