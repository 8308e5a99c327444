// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/staticroutes.h"

#include <QHostAddress>
#include <QRegularExpression>
#include <QVector>

#include <algorithm>
#include <optional>

namespace staticroutes {

namespace {

constexpr int octetsOfAddress{4};
constexpr int bitsOfOctet{8};
constexpr int longestPrefix{octetsOfAddress * bitsOfOctet};
constexpr int wordsOfRoute{3};
constexpr QLatin1Char comma{','};

using Octets = QVector<quint32>;

struct Route
{
    int prefixLength;
    quint32 network;
    quint32 gateway;

    bool operator==(const Route &other) const
    {
        return prefixLength == other.prefixLength && network == other.network && gateway == other.gateway;
    }
};
using Routes = QVector<Route>;

quint32 maskOf(int prefixLength) { return prefixLength == 0 ? 0 : ~quint32{0} << (longestPrefix - prefixLength); }

/// How many octets of a network its prefix covers.
int coveredOctets(int prefixLength) { return (prefixLength + bitsOfOctet - 1) / bitsOfOctet; }

/// The numbers between commas; nothing when one is no octet.
std::optional<Octets> octetsOf(const QString &text)
{
    Octets octets;
    const QStringList numbers{text.split(comma)};
    for (const QString &number : numbers) {
        bool isNumber{};
        octets += number.trimmed().toUInt(&isNumber);
        if (!isNumber || octets.last() > 0xFFU)
            return {};
    }
    return octets;
}

/// The address that begins with the octets; the others are 0.
quint32 addressOf(const Octets &octets)
{
    quint32 address{};
    for (int i{0}; i < octetsOfAddress; ++i)
        address = address << bitsOfOctet | octets.value(i);
    return address;
}

QString octetText(quint32 address, int octets = octetsOfAddress)
{
    QStringList numbers;
    for (int i{0}; i < octets; ++i)
        numbers += QString::number(address >> (longestPrefix - (i + 1) * bitsOfOctet) & 0xFFU);
    return numbers.join(comma);
}

/// Routes whose parts are told by the blanks between them, as this program writes them; networks may have four octets.
std::optional<Routes> parseParts(const QString &value)
{
    static const QRegularExpression separator{QStringLiteral(", +")};
    QVector<Octets> parts;
    const QStringList texts{value.split(separator)};
    for (const QString &text : texts) {
        const auto octets = octetsOf(text);
        if (!octets)
            return {};
        parts += *octets;
    }

    Routes routes;
    const auto hasAddressAt = [&parts](int place) { return parts.value(place).size() == octetsOfAddress; };
    for (int i{0}; i < parts.size();) {
        const Octets &length{parts.at(i++)};
        if (length.size() != 1 || length.first() > longestPrefix)
            return {};
        Route route{static_cast<int>(length.first()), 0, 0};
        const int covered{coveredOctets(route.prefixLength)};
        if (covered > 0 || (hasAddressAt(i) && hasAddressAt(i + 1))) {
            const Octets network{parts.value(i++)};
            if (network.size() != covered && network.size() != octetsOfAddress)
                return {};
            route.network = addressOf(network);
        }
        if (!hasAddressAt(i))
            return {};
        route.gateway = addressOf(parts.at(i++));
        routes += route;
    }
    return routes;
}

/// Routes in octets alone, as on the wire.
std::optional<Routes> parseOctets(const QString &value)
{
    const auto octets = octetsOf(value);
    if (!octets)
        return {};
    Routes routes;
    for (int i{0}; i < octets->size();) {
        const auto length = static_cast<int>(octets->at(i++));
        const int covered{coveredOctets(length)};
        if (length > longestPrefix || octets->size() - i < covered + octetsOfAddress)
            return {};
        routes +=
            Route{length, addressOf(octets->mid(i, covered)), addressOf(octets->mid(i + covered, octetsOfAddress))};
        i += covered + octetsOfAddress;
    }
    return routes;
}

std::optional<Routes> parse(const QString &value)
{
    const auto routes = parseParts(value);
    return routes ? routes : parseOctets(value);
}

/// The address of a word of the dialog, which takes whatever looks like a net mask for one and gives its length.
std::optional<quint32> addressOfWord(const QString &word)
{
    const auto octets = octetsOf(word);
    if (octets && octets->size() == octetsOfAddress)
        return addressOf(*octets);
    if (octets && octets->size() == 1 && octets->first() <= longestPrefix)
        return maskOf(static_cast<int>(octets->first()));
    return {};
}

QStringList routeWords(const QStringList &words)
{
    const auto mask = addressOfWord(words.value(0));
    const auto network = addressOfWord(words.value(1));
    const auto gateway = addressOfWord(words.value(2));
    if (!mask || !network || !gateway)
        return words;
    int length{0};
    while (length < longestPrefix && maskOf(length) != *mask)
        ++length;
    if (maskOf(length) != *mask)
        return words;
    QStringList result{QString::number(length)};
    if (length > 0)
        result += octetText(*network & *mask, coveredOctets(length));
    return result << octetText(*gateway);
}

} // namespace

QString toDialog(const QString &value)
{
    const auto routes = parse(value);
    if (!routes)
        return value;
    QStringList words;
    for (const Route &route : *routes)
        words << octetText(maskOf(route.prefixLength)) << octetText(route.network) << octetText(route.gateway);
    return words.join(QLatin1String{", "});
}

QStringList fromDialog(const QStringList &words)
{
    QStringList result;
    for (int i{0}; i < words.size(); i += wordsOfRoute)
        result += routeWords(words.mid(i, wordsOfRoute));
    return result;
}

bool areSame(const QString &value, const QString &other)
{
    const auto routes = parse(value);
    return routes && routes == parse(other);
}

} // namespace staticroutes
