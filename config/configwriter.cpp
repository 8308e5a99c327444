// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/configwriter.h"

#include "config/dhcpdconfigdeclaration.h"

#include <algorithm>
#include <numeric>
#include <utility>

namespace {

int joinedSize(const WordList &words)
{
    return std::accumulate(words.begin(), words.end(), -1,
                           [](int size, std::string_view word) { return size + static_cast<int>(word.size()) + 1; });
}

void appendLine(QByteArray &text, const DhcpdConfigStatement &statement, std::string_view end)
{
    const int start{text.size()};
    text.resize(start + statement.indentWidth() + joinedSize(statement.words()) + static_cast<int>(end.size()));
    char *to{std::fill_n(text.data() + start, statement.indentWidth(), ' ')};
    bool first{true};
    for (const std::string_view word : statement.words()) {
        if (!std::exchange(first, false))
            *to++ = ' ';
        to = std::copy(word.begin(), word.end(), to);
    }
    std::copy(end.begin(), end.end(), to);
}

void append(QByteArray &text, const DhcpdConfigParam &param)
{
    if (!param.words().at(0).empty())
        appendLine(text, param, ";\n");
}

void append(QByteArray &text, const DhcpdConfigDeclaration &declaration);

void appendBody(QByteArray &text, const DhcpdConfigDeclaration &declaration)
{
    for (const auto &param : declaration.parameters())
        append(text, *param);
    for (const auto &child : declaration.declarations())
        append(text, *child);
}

void append(QByteArray &text, const DhcpdConfigDeclaration &declaration)
{
    if (declaration.isRoot()) {
        appendBody(text, declaration);
    } else if (declaration.words().at(0).empty()) {
        return; // its children go with it, deliberately: they would end up in the block around it
    } else if (declaration.isRange() || declaration.isSubclass() || declaration.isFixedAddress()) {
        appendLine(text, declaration, ";\n");
    } else {
        appendLine(text, declaration, " {\n");
        appendBody(text, declaration);
        text.append(declaration.indentWidth(), ' ');
        text += "}\n";
    }
}

} // namespace

QByteArray serialize(const DhcpdConfigStatement &statement)
{
    QByteArray text;
    if (statement.isDeclaration())
        append(text, static_cast<const DhcpdConfigDeclaration &>(statement));
    else
        append(text, static_cast<const DhcpdConfigParam &>(statement));
    return text;
}
