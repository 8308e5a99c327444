// SPDX-License-Identifier: GPL-3.0-or-later
// The checks of the configuration model on values, and how a value becomes words of its statement.
#include "config/addresses.h"
#include "config/dhcpdconfigmodel.h"
#include "config/patterns.h"

bool DhcpdConfigModel::setParamValue(DhcpdConfigParam *param, const QVariant &value)
{
    const QString text{value.toString()};
    if (param->isMacAddress())
        return setMacValue(param, text);
    if (param->isOption())
        return checkOptionValue(*param, text) && param->setWordsFrom(2, {text});
    if (param->isLeaseTime() && text.toLongLong() < 1)
        return refuse(tr("Invalid time in seconds '%1").arg(text)); // deliberately without the closing quote
    return param->setWordsFrom(1, {text});
}

bool DhcpdConfigModel::setDeclarationValue(DhcpdConfigDeclaration *declaration, const QVariant &value)
{
    const QString text{value.toString()};
    if (declaration->isRoot() || declaration->isGroup())
        return false;
    if (declaration->isRange())
        return setRangeValue(declaration, text);
    if (declaration->isSubnet())
        return setSubnetValue(declaration, text);
    if (declaration->isFixedAddress())
        return setIpValue(declaration, text);
    return declaration->setWordsFrom(1, {text});
}

bool DhcpdConfigModel::checkOptionValue(const DhcpdConfigParam &option, const QString &text)
{
    const bool isAddressList{option.isRouters() || option.isDnsServers() || option.isNtpServers()};
    if (isAddressList && !addresses::isUsableList(text))
        return refuse(tr("Invalid one or more IP in list '%1'").arg(text));
    if (option.isDomainName() && !domainRegExp().match(text).hasMatch())
        return refuse(tr("Invalid domain name '%1'").arg(text));
    return true;
}

bool DhcpdConfigModel::setSubnetValue(DhcpdConfigStatement *statement, const QString &text)
{
    const auto subnet = addresses::parseSubnet(text);
    if (!subnet)
        return refuse(tr("Error editing subnet. Invalid subnet '%1'").arg(text));
    return statement->setWordsFrom(1,
                                   {subnet->ip().toString(), QStringLiteral("netmask"), subnet->netmask().toString()});
}

bool DhcpdConfigModel::setIpValue(DhcpdConfigStatement *statement, const QString &text)
{
    const QHostAddress address{text};
    if (!addresses::isUsable(address))
        return refuse(tr("Invalid IP '%1'").arg(text));
    return statement->setWordsFrom(1, {address.toString()});
}

bool DhcpdConfigModel::setMacValue(DhcpdConfigStatement *statement, const QString &text)
{
    if (!macRegExp().match(text).hasMatch())
        return refuse(tr("Invalid MAC '%1'").arg(text));
    return statement->setWordsFrom(2, {text});
}

bool DhcpdConfigModel::setRangeValue(DhcpdConfigStatement *statement, const QString &text)
{
    const DhcpdConfigDeclaration *holder{statement->parent()};
    if (!holder->isSubnet())
        holder = holder->parent();
    if (!holder || !holder->isSubnet())
        return refuse(
            tr("Error editing range. Can not edit range in '%1'").arg(holder ? holder->keyword() : QString{}));
    if (holder->wordCount() <= 2)
        return refuse(tr("Error editing range. Invalid attributes of parent subnet"));
    const auto subnet = addresses::subnetOf(*holder);
    if (!subnet)
        return refuse(tr("Error editing range. Invalid parent subnet"));

    const QStringList pieces{text.split(QLatin1Char{' '})};
    const QHostAddress start{pieces.value(0)};
    if (!addresses::isUsableIn(*subnet, start))
        return refuse(tr("Error editing range. Invalid start IP '%1'").arg(start.toString()));
    const QHostAddress end{pieces.value(1)};
    if (!addresses::isUsableIn(*subnet, end) || end.toIPv4Address() < start.toIPv4Address())
        return refuse(tr("Error editing range. Invalid end IP '%1'").arg(end.toString()));
    return statement->setWordsFrom(1, {start.toString(), end.toString()});
}
