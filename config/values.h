// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/parameterkind.h"

#include <QNetworkAddressEntry>
#include <QString>
#include <QStringList>

#include <optional>
#include <variant>

class DhcpdConfigStatement;

/// How values look in the server's configuration, and which of them are valid: functions from texts to words or a
/// problem. Whoever calls them has the messages.
namespace values {

/// Whether `text` may be the value of a parameter of that type.
bool isValid(ValueType type, const QString &text);

/// An address that a host can have (neither null, loopback nor broadcast), in its usual form; nothing for any other
/// text.
std::optional<QString> usableAddress(const QString &text);

/// The hardware address of a host of which none is known.
QString noMacAddress();

/// The network that `text` names, for example as "10.1.2.0/24"; nothing when it names none.
std::optional<QNetworkAddressEntry> parseSubnet(const QString &text);

/// An address and a mask (a netmask or a prefix length; empty when the address has one) as one text for parseSubnet().
QString subnetText(const QString &address, const QString &mask);

/// The words of a subnet behind its keyword.
QStringList subnetWords(const QNetworkAddressEntry &subnet);

/// The first and the last address for hosts in a subnet; the first lies behind the last, deliberately, where there is
/// but one address.
QStringList hostRange(const QNetworkAddressEntry &subnet);

/// Why a range cannot be one of its subnet.
enum class RangeProblem
{
    IncompleteSubnet, ///< the subnet has too few words
    InvalidSubnet,
    InvalidStart,
    InvalidEnd ///< also one before the start
};

/// The two addresses of a range in `subnet` as words, in their usual form, or why they make none.
std::variant<QStringList, RangeProblem> rangeWords(const DhcpdConfigStatement &subnet, const QString &start,
                                                   const QString &end);

/// What stands between the keyword and the addresses of `range`; empty where nothing does.
QString rangeFlag(const DhcpdConfigStatement &range);

/// `name` in double quotes, as one word of the server.
QString quoted(const QString &name);

/// `name` without its double quotes.
QString unquoted(const QString &name);

/// `name`, in quotes if it has blanks and is not in quotes yet.
QString quotedIfSpaced(const QString &name);

/// A name for a host that the server takes, made of the one that a client gives itself: letters, digits, hyphens, dots
/// and underscores, each run of others one hyphen. What a client says must not become statements of its own.
QString hostName(const QString &clientName);

/// Whether `text` is all that `statement` says from the word at `position` on, blanks around commas aside.
bool isValue(const DhcpdConfigStatement &statement, int position, const QString &text);

/// Routes as the value of their option.
QString routeList(const QStringList &routes);

/// What defines the option for routes, or the one for MS systems: the server does not know it by itself.
QString routeDefinition(bool ms);

/// Whether an option statement defines the option instead of giving it a value.
bool isDefinition(const DhcpdConfigStatement &option);

} // namespace values
