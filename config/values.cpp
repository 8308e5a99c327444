// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/values.h"

#include "config/dhcpdconfigstatement.h"
#include "config/patterns.h"

#include <QHostAddress>

#include <algorithm>

namespace values {

namespace {

constexpr QLatin1Char blank{' '};
constexpr QLatin1Char quote{'"'};
constexpr QLatin1Char comma{','};

bool isUsable(const QHostAddress &address)
{
    return !address.isNull() && !address.isLoopback() && !address.isBroadcast();
}

/// The network of a subnet statement; nothing when its words name none.
std::optional<QNetworkAddressEntry> subnetOf(const DhcpdConfigStatement &statement)
{
    QNetworkAddressEntry subnet;
    subnet.setIp(QHostAddress{statement.word(1)});
    subnet.setNetmask(QHostAddress{statement.word(3)});
    if (subnet.ip().isNull() || subnet.netmask().isNull() || subnet.prefixLength() == -1)
        return {};
    return subnet;
}

bool isUsableIn(const QNetworkAddressEntry &subnet, const QHostAddress &address)
{
    return isUsable(address) && address.isInSubnet(subnet.ip(), subnet.prefixLength());
}

bool isUsableList(const QString &list)
{
    const QStringList pieces{list.split(comma)};
    return std::all_of(pieces.begin(), pieces.end(),
                       [](const QString &piece) { return usableAddress(piece).has_value(); });
}

QString withoutBlanksAtCommas(QString text)
{
    static const QRegularExpression commas{QStringLiteral(" *, *")};
    return text.replace(commas, QStringLiteral(","));
}

} // namespace

bool isValid(ValueType type, const QString &text)
{
    switch (type) {
    case ValueType::AddressList:
        return isUsableList(text);
    case ValueType::DomainName:
        return domainRegExp().match(text).hasMatch();
    case ValueType::MacAddress:
        return macRegExp().match(text).hasMatch();
    case ValueType::Seconds:
        return text.toLongLong() >= 1;
    case ValueType::Routes:
    case ValueType::Text:
        break;
    }
    return true;
}

std::optional<QString> usableAddress(const QString &text)
{
    const QHostAddress address{text};
    return isUsable(address) ? std::optional{address.toString()} : std::nullopt;
}

QString noMacAddress() { return QStringLiteral("00:00:00:00:00:00"); }

std::optional<QNetworkAddressEntry> parseSubnet(const QString &text)
{
    const auto [address, prefixLength] = QHostAddress::parseSubnet(text);
    if (address.isNull() || prefixLength == -1)
        return {};
    QNetworkAddressEntry subnet;
    subnet.setIp(address);
    subnet.setPrefixLength(prefixLength);
    return subnet;
}

QString subnetText(const QString &address, const QString &mask)
{
    return mask.isEmpty() ? address : address + QLatin1Char{'/'} + mask;
}

QStringList subnetWords(const QNetworkAddressEntry &subnet)
{
    return {subnet.ip().toString(), QStringLiteral("netmask"), subnet.netmask().toString()};
}

QStringList hostRange(const QNetworkAddressEntry &subnet)
{
    const quint32 base{subnet.ip().toIPv4Address()};
    const quint32 hostBits{~subnet.netmask().toIPv4Address()};
    const quint32 first{base + 1};
    const quint32 last{base + (hostBits > 1 ? hostBits - 1 : hostBits)};
    return {QHostAddress{first}.toString(), QHostAddress{last}.toString()};
}

std::variant<QStringList, RangeProblem> rangeWords(const DhcpdConfigStatement &subnet, const QString &start,
                                                   const QString &end)
{
    if (subnet.wordCount() < 3)
        return RangeProblem::IncompleteSubnet;
    const auto network = subnetOf(subnet);
    if (!network)
        return RangeProblem::InvalidSubnet;
    const QHostAddress first{start};
    if (!isUsableIn(*network, first))
        return RangeProblem::InvalidStart;
    const QHostAddress last{end};
    if (!isUsableIn(*network, last) || last.toIPv4Address() < first.toIPv4Address())
        return RangeProblem::InvalidEnd;
    return QStringList{first.toString(), last.toString()};
}

QString rangeFlag(const DhcpdConfigStatement &range)
{
    const QString word{range.word(1)};
    return word.compare(QLatin1String{"dynamic-bootp"}, Qt::CaseInsensitive) == 0 ? word : QString{};
}

QString quoted(const QString &name) { return quote + name + quote; }

QString unquoted(const QString &name) { return QString{name}.remove(quote); }

QString quotedIfSpaced(const QString &name)
{
    return name.contains(blank) && !name.startsWith(quote) ? quoted(name) : name;
}

QString hostName(const QString &clientName)
{
    static const QRegularExpression others{QStringLiteral("[^A-Za-z0-9._-]+")};
    static const QRegularExpression hyphensAtEnds{QStringLiteral("^-+|-+$")};
    return QString{clientName}.replace(others, QStringLiteral("-")).remove(hyphensAtEnds);
}

bool isValue(const DhcpdConfigStatement &statement, int position, const QString &text)
{
    QStringList words{statement.wordsFrom(position)};
    while (!words.isEmpty() && words.last().isEmpty())
        words.removeLast();
    return withoutBlanksAtCommas(words.join(blank)) == withoutBlanksAtCommas(text);
}

QString routeList(const QStringList &routes) { return routes.join(QStringLiteral(", ")); }

QString routeDefinition(bool ms)
{
    return ms ? QStringLiteral("code 249 = array of unsigned integer 8")
              : QStringLiteral("code 121 = array of unsigned integer 8");
}

bool isDefinition(const DhcpdConfigStatement &option) { return option.word(2).startsWith(QLatin1String{"code"}); }

} // namespace values
