// SPDX-License-Identifier: GPL-3.0-or-later
// How the configuration model checks a new value of a statement and makes it the statement's words.
#include "config/dhcpdconfigmodel.h"
#include "config/values.h"

using values::RangeProblem;

bool DhcpdConfigModel::setParamValue(DhcpdConfigParam *param, const QString &text)
{
    const ParameterKind &kind{ParameterKind::of(*param)};
    // A time is told apart here: the message lacks the closing quote, deliberately.
    if (!values::isValid(kind.type, text)) {
        return refuse(kind.type == ValueType::Seconds ? tr("Invalid time in seconds '%1").arg(text)
                                                      : invalidValue(kind.type, text));
    }
    return param->setWordsFrom(kind.valuePosition(), {text});
}

QString DhcpdConfigModel::invalidValue(ValueType type, const QString &text)
{
    switch (type) {
    case ValueType::AddressList:
        return tr("Invalid one or more IP in list '%1'").arg(text);
    case ValueType::DomainName:
        return tr("Invalid domain name '%1'").arg(text);
    case ValueType::MacAddress:
        return tr("Invalid MAC '%1'").arg(text);
    case ValueType::Seconds:
        return tr("Invalid time in seconds '%1'").arg(text);
    case ValueType::Routes:
    case ValueType::Text:
        break;
    }
    return {};
}

bool DhcpdConfigModel::setDeclarationValue(DhcpdConfigDeclaration *declaration, const QString &text)
{
    if (declaration->isRoot() || declaration->isGroup())
        return false;
    if (declaration->isRange())
        return setRangeValue(declaration, text);
    if (declaration->isSubnet())
        return setSubnetValue(declaration, text);
    if (declaration->isFixedAddress())
        return setAddressValue(declaration, text);
    return declaration->setWordsFrom(1, {text});
}

bool DhcpdConfigModel::setSubnetValue(DhcpdConfigDeclaration *subnet, const QString &text)
{
    const auto network = values::parseSubnet(text);
    if (!network)
        return refuse(tr("Error editing subnet. Invalid subnet '%1'").arg(text));
    return subnet->setWordsFrom(1, values::subnetWords(*network));
}

bool DhcpdConfigModel::setAddressValue(DhcpdConfigDeclaration *fixedAddress, const QString &text)
{
    const auto address = values::usableAddress(text);
    if (!address)
        return refuse(tr("Invalid IP '%1'").arg(text));
    return fixedAddress->setWordsFrom(1, {*address});
}

bool DhcpdConfigModel::setRangeValue(DhcpdConfigDeclaration *range, const QString &text)
{
    const DhcpdConfigDeclaration *holder{range->parent()};
    if (!holder->isSubnet())
        holder = holder->parent();
    if (!holder || !holder->isSubnet()) {
        return refuse(
            tr("Error editing range. Can not edit range in '%1'").arg(holder ? holder->keyword() : QString{}));
    }

    const QStringList pieces{text.split(QLatin1Char{' '})};
    const QString start{pieces.value(0)};
    const QString end{pieces.value(1)};
    const auto words = values::rangeWords(*holder, start, end);
    const auto *problem = std::get_if<RangeProblem>(&words);
    if (!problem)
        return range->setWordsFrom(1, std::get<QStringList>(words));
    switch (*problem) {
    case RangeProblem::IncompleteSubnet:
        return refuse(tr("Error editing range. Invalid attributes of parent subnet"));
    case RangeProblem::InvalidSubnet:
        return refuse(tr("Error editing range. Invalid parent subnet"));
    case RangeProblem::InvalidStart:
        return refuse(tr("Error editing range. Invalid start IP '%1'").arg(QHostAddress{start}.toString()));
    case RangeProblem::InvalidEnd:
        break;
    }
    return refuse(tr("Error editing range. Invalid end IP '%1'").arg(QHostAddress{end}.toString()));
}
