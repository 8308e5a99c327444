// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/parameterkind.h"

#include "config/dhcpdconfigstatement.h"

#include <algorithm>

namespace {

constexpr std::string_view optionKeyword{"option"};

constexpr auto leaseTimeRefusal = QT_TRANSLATE_NOOP("DhcpdConfigModel", "Error adding lease time. Can not add to '%1'");
constexpr auto routeRefusal =
    QT_TRANSLATE_NOOP("DhcpdConfigModel", "Error adding static route. Can not add static rout to '%1'");

constexpr ParameterKind kinds[]{
    {optionKeyword, "routers", QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Gateways"),
     QT_TRANSLATE_NOOP("DhcpdConfigModel", "Error adding gateways. Can not add to '%1'"), ValueType::AddressList},
    {optionKeyword, "domain-name-servers", QT_TRANSLATE_NOOP("DhcpdConfigStatement", "DNS servers"),
     QT_TRANSLATE_NOOP("DhcpdConfigModel", "Error adding DNS servers. Can not add to '%1'"), ValueType::AddressList},
    {optionKeyword, "ntp-servers", QT_TRANSLATE_NOOP("DhcpdConfigStatement", "NTP servers"),
     QT_TRANSLATE_NOOP("DhcpdConfigModel", "Error adding NTP servers address. Can not add to '%1'"),
     ValueType::AddressList},
    // A new name gets an empty word behind it, deliberately.
    {optionKeyword, "domain-name", QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Domain name"),
     QT_TRANSLATE_NOOP("DhcpdConfigModel", "Error adding domain name. Can not add to '%1'"), ValueType::DomainName, 2},
    {optionKeyword, "ms-classless-static-routes", QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Static route MS"),
     routeRefusal, ValueType::Routes},
    {optionKeyword, "classless-static-routes", QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Static route"), routeRefusal,
     ValueType::Routes},
    {"hardware", "ethernet", QT_TRANSLATE_NOOP("DhcpdConfigStatement", "MAC address"), nullptr, ValueType::MacAddress},
    {"max-lease-time",
     {},
     QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Max lease time"),
     leaseTimeRefusal,
     ValueType::Seconds},
    {"default-lease-time",
     {},
     QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Default lease time"),
     leaseTimeRefusal,
     ValueType::Seconds},
    {"key", {}, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Key"), nullptr, ValueType::Text},
    {"algorithm", {}, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Key generation algorithm"), nullptr, ValueType::Text},
    {"secret", {}, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Generated secret"), nullptr, ValueType::Text},
    {"primary", {}, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Master DNS Server"), nullptr, ValueType::Text},
};

constexpr ParameterKind otherOption{optionKeyword, {}, nullptr, nullptr, ValueType::Text};
constexpr ParameterKind otherLeaseTime{{}, {}, nullptr, leaseTimeRefusal, ValueType::Seconds};
constexpr ParameterKind otherParameter{{}, {}, nullptr, nullptr, ValueType::Text};

QString text(std::string_view word) { return QString::fromUtf8(word.data(), static_cast<int>(word.size())); }

} // namespace

const ParameterKind &ParameterKind::of(const DhcpdConfigStatement &param)
{
    const auto kind = std::find_if(std::begin(kinds), std::end(kinds),
                                   [&param](const ParameterKind &candidate) { return candidate.matches(param); });
    if (kind != std::end(kinds))
        return *kind;
    if (param.isOption())
        return otherOption;
    return param.isLeaseTime() ? otherLeaseTime : otherParameter;
}

const ParameterKind &ParameterKind::named(std::string_view nameOrKeyword)
{
    const auto kind = std::find_if(std::begin(kinds), std::end(kinds), [nameOrKeyword](const ParameterKind &candidate) {
        return (candidate.isOption() ? candidate.name : candidate.keyword) == nameOrKeyword;
    });
    Q_ASSERT(kind != std::end(kinds));
    return *kind;
}

ParameterKind ParameterKind::leaseTime(std::string_view keyword)
{
    ParameterKind kind{otherLeaseTime};
    kind.keyword = keyword;
    return kind;
}

bool ParameterKind::matches(const DhcpdConfigStatement &statement) const
{
    return equalsIgnoringCase(statement.words().at(0), keyword) &&
           (name.empty() || equalsIgnoringCase(statement.words().at(1), name));
}

bool ParameterKind::isOption() const { return keyword == optionKeyword; }

QStringList ParameterKind::start() const
{
    return name.empty() ? QStringList{text(keyword)} : QStringList{text(keyword), text(name)};
}

QString ParameterKind::valueOf(const DhcpdConfigStatement &statement) const
{
    const bool isOneWord{type == ValueType::MacAddress || type == ValueType::Seconds};
    return isOneWord ? statement.word(valuePosition()) : statement.textFrom(valuePosition());
}
