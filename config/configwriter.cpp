// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/configwriter.h"

#include "common/textencoding.h"
#include "config/dhcpdconfigdeclaration.h"

#include <algorithm>
#include <numeric>
#include <utility>

namespace {

// Deep nesting makes a long text of a short file: each line is indented.
constexpr qint64 maximumBytes{TextEncoding::longestText};

/// What is written so far; null once it is longer than the maximum or blocks are nested too deep.
using Text = QByteArray;

qint64 joinedSize(const WordList &words)
{
    return std::accumulate(words.begin(), words.end(), qint64{-1}, [](qint64 size, std::string_view word) {
        return size + static_cast<qint64>(word.size()) + 1;
    });
}

/// Makes room for so many bytes more and returns where they begin; null, for good, when that is too much.
char *extend(Text &text, qint64 bytes)
{
    const Text::size_type start{text.size()};
    if (text.isNull() || start + bytes > maximumBytes) {
        text = {};
        return nullptr;
    }
    text.resize(static_cast<int>(start + bytes));
    return text.data() + start;
}

void appendLine(Text &text, const DhcpdConfigStatement &statement, std::string_view end)
{
    const qint64 size{statement.indentWidth() + joinedSize(statement.words()) + static_cast<qint64>(end.size())};
    char *to{extend(text, size)};
    if (!to)
        return;
    to = std::fill_n(to, statement.indentWidth(), ' ');
    bool first{true};
    for (const std::string_view word : statement.words()) {
        if (!std::exchange(first, false))
            *to++ = ' ';
        to = std::copy(word.begin(), word.end(), to);
    }
    std::copy(end.begin(), end.end(), to);
}

void append(Text &text, const DhcpdConfigParam &param)
{
    if (!param.words().at(0).empty())
        appendLine(text, param, ";\n");
}

void append(Text &text, const DhcpdConfigDeclaration &declaration);

void appendBody(Text &text, const DhcpdConfigDeclaration &declaration)
{
    for (const auto &param : declaration.parameters())
        append(text, *param);
    for (const auto &child : declaration.declarations())
        append(text, *child);
}

void append(Text &text, const DhcpdConfigDeclaration &declaration)
{
    if (declaration.isRoot()) {
        appendBody(text, declaration);
    } else if (declaration.words().at(0).empty()) {
        return; // its children go with it, deliberately: they would end up in the block around it
    } else if (declaration.isOneLine()) {
        appendLine(text, declaration, ";\n");
    } else if (!declaration.takesStatements()) {
        text = {};
    } else {
        appendLine(text, declaration, " {\n");
        appendBody(text, declaration);
        constexpr std::string_view end{"}\n"};
        if (char *to{extend(text, declaration.indentWidth() + static_cast<qint64>(end.size()))})
            std::copy(end.begin(), end.end(), std::fill_n(to, declaration.indentWidth(), ' '));
    }
}

} // namespace

QByteArray serialize(const DhcpdConfigStatement &statement)
{
    Text text{""}; // empty, not null
    if (statement.isDeclaration())
        append(text, static_cast<const DhcpdConfigDeclaration &>(statement));
    else
        append(text, static_cast<const DhcpdConfigParam &>(statement));
    return text;
}
