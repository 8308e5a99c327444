// SPDX-License-Identifier: GPL-3.0-or-later
// The operations of the configuration model that add parameters or replace their values.
#include "config/dhcpdconfigmodel.h"
#include "config/values.h"

#include <algorithm>

namespace {

template<typename Predicate>
DhcpdConfigParam *findParam(const DhcpdConfigDeclaration &declaration, Predicate predicate)
{
    const auto &params = declaration.parameters();
    const auto found = std::find_if(params.begin(), params.end(), [&](const auto &param) { return predicate(*param); });
    return found == params.end() ? nullptr : found->get();
}

DhcpdConfigParam *findParam(const DhcpdConfigDeclaration &declaration, const ParameterKind &kind)
{
    return findParam(declaration, [&kind](const DhcpdConfigParam &param) { return kind.matches(param); });
}

const ParameterKind &routeKind(bool ms)
{
    return ParameterKind::named(ms ? "ms-classless-static-routes" : "classless-static-routes");
}

} // namespace

bool DhcpdConfigModel::setParameter(const ParameterKind &kind, const QString &value, const QModelIndex &parent)
{
    auto *holder = holderFor(parent);
    if (!holder)
        return refuse(tr(kind.refusal).arg(keywordFor(parent)));
    if (!values::isValid(kind.type, value))
        return refuse(invalidValue(kind.type, value));
    QStringList words{value};
    if (auto *old = findParam(*holder, kind)) {
        while (words.size() < kind.wordsOfNewValue)
            words += QString{};
        old->setWordsFrom(kind.valuePosition(), words);
        setModified();
    } else {
        addTo(holder, [&] { holder->addParam(kind.start() + words); });
    }
    return true;
}

bool DhcpdConfigModel::addLeaseTime(const QString &keyword, const QString &seconds, const QModelIndex &parent)
{
    const std::string word{keyword.toStdString()};
    return setParameter(ParameterKind::leaseTime(word), seconds, parent);
}

bool DhcpdConfigModel::addDefaultLeaseTime(const QString &seconds, const QModelIndex &parent)
{
    return setParameter(ParameterKind::named("default-lease-time"), seconds, parent);
}

bool DhcpdConfigModel::addMaxLeaseTime(const QString &seconds, const QModelIndex &parent)
{
    return setParameter(ParameterKind::named("max-lease-time"), seconds, parent);
}

void DhcpdConfigModel::addRouters(const QString &list, const QModelIndex &parent)
{
    setParameter(ParameterKind::named("routers"), list, parent);
}

void DhcpdConfigModel::addDnsServers(const QString &list, const QModelIndex &parent)
{
    setParameter(ParameterKind::named("domain-name-servers"), list, parent);
}

void DhcpdConfigModel::addNtpServers(const QString &list, const QModelIndex &parent)
{
    setParameter(ParameterKind::named("ntp-servers"), list, parent);
}

void DhcpdConfigModel::addDomainName(const QString &name, const QModelIndex &parent)
{
    setParameter(ParameterKind::named("domain-name"), name, parent);
}

void DhcpdConfigModel::addRoutes(const QStringList &routes, bool ms, const QModelIndex &parent)
{
    auto *holder = holderFor(parent);
    if (!holder || holder->depth() < 1 || routes.isEmpty()) {
        addStaticRoutes(routes, ms, parent);
        return;
    }
    const ParameterKind &kind{routeKind(ms)};
    auto *top = holder->parent();
    while (!top->isRoot())
        top = top->parent();
    addTo(holder, [&] {
        if (!findParam(*top, kind))
            top->addParam(kind.start() + QStringList{values::routeDefinition(ms)});
        holder->addParam(kind.start() + QStringList{values::routeList(routes)});
    });
}

void DhcpdConfigModel::addStaticRoutes(const QStringList &routes, bool ms, const QModelIndex &parent)
{
    const ParameterKind &kind{routeKind(ms)};
    const QString option{kind.start().constLast()};
    auto *holder = holderFor(parent);
    if (!holder) {
        refuse(tr(kind.refusal).arg(keywordFor(parent)));
        return;
    }
    if (routes.isEmpty()) {
        refuse(tr("Error adding static route. Static route parametrs can not be empty."));
        return;
    }
    const auto isNamedLikeOption = [&option](const DhcpdConfigParam &param) {
        return param.keyword().compare(option, Qt::CaseInsensitive) == 0;
    };
    if (auto *old = findParam(*holder, isNamedLikeOption)) {
        // Deliberately keeps what stands there, behind the new words.
        old->insertWords(kind.valuePosition(), 2);
        old->setWord(kind.valuePosition(), option);
        setModified();
        return;
    }
    addTo(holder, [&] {
        auto *outer = holder->parent() && holder->parent() != m_topNode.get() ? holder->parent() : holder;
        if (!findParam(*holder, kind) && !findParam(*outer, kind))
            outer->addParam(kind.start() + QStringList{values::routeDefinition(ms)});
        holder->addParam(kind.start() + QStringList{values::routeList(routes)});
    });
}
