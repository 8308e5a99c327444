// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QStringList>

#include <string_view>

class DhcpdConfigStatement;

/// What the value of a parameter is.
enum class ValueType
{
    AddressList, ///< addresses with commas between them
    DomainName,  ///< a name in double quotes
    MacAddress,
    Routes,
    Seconds,
    Text ///< anything
};

/// A kind of parameter: what it is recognised by, what it is called, and what its value is.
struct ParameterKind final
{
    /// The kind of `param`. Whatever is not in the table of kinds is another option, lease time or parameter.
    static const ParameterKind &of(const DhcpdConfigStatement &param);
    /// The kind with that option name or, for those that are no options, keyword; it has to be in the table.
    static const ParameterKind &named(std::string_view nameOrKeyword);
    /// The kind of a lease time with that keyword, which has to outlive it.
    static ParameterKind leaseTime(std::string_view keyword);

    bool matches(const DhcpdConfigStatement &statement) const;
    bool isOption() const;
    /// The words before the value.
    QStringList start() const;
    /// The position of the value's first word.
    int valuePosition() const { return isOption() || !name.empty() ? 2 : 1; }
    /// The value of a statement of this kind: one word, or all of a list or name, which may be spread over several.
    QString valueOf(const DhcpdConfigStatement &statement) const;

    std::string_view keyword;
    std::string_view name; ///< the word behind the keyword, for options and hardware addresses
    const char *label;     ///< in the context DhcpdConfigStatement; null: the word before the value
    const char *refusal;   ///< of a statement that cannot hold it, in the context DhcpdConfigModel; null: never added
    ValueType type;
    int wordsOfNewValue{1}; ///< when it replaces another
};
