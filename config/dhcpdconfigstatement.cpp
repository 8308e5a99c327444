// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/dhcpdconfigstatement.h"

#include "config/dhcpdconfigdeclaration.h"

#include <algorithm>
#include <limits>
#include <utility>

namespace {

constexpr int topDepth{-2};
constexpr int indentUnit{4};

} // namespace

DhcpdConfigStatement::DhcpdConfigStatement(const WordList::Buffer &words, DhcpdConfigDeclaration *parent)
    : m_words{words}
{
    setParent(parent);
}

bool DhcpdConfigStatement::insertWords(int position, int count)
{
    if (position < 0 || position > wordCount())
        return false;
    if (count < 1)
        return true;
    WordList::Buffer words;
    words.addEmpty(count);
    m_words.replace(position, 0, words);
    return true;
}

bool DhcpdConfigStatement::removeWords(int position, int count)
{
    if (position < 0 || qint64{position} + count > wordCount())
        return false;
    if (count >= 1)
        m_words.replace(position, count, {});
    return true;
}

bool DhcpdConfigStatement::setWord(int index, const QString &text)
{
    if (index < 0 || index >= wordCount())
        return false;
    m_words.replace(index, 1, WordList::Buffer{QStringList{text}});
    return true;
}

QString DhcpdConfigStatement::text(int column) const
{
    switch (column) {
    case 0:
        return label();
    case 1:
        return valueText();
    default:
        return word(column);
    }
}

QStringList DhcpdConfigStatement::wordsFrom(int position) const
{
    QStringList words;
    int index{};
    for (const std::string_view word : m_words) {
        if (index++ >= position)
            words += decodedWord(word);
    }
    return words;
}

bool DhcpdConfigStatement::setWordsFrom(int position, const QStringList &words)
{
    const int count{wordCount()};
    if (position < 0 || position > count)
        return false;
    m_words.replace(position, count - position, WordList::Buffer{words});
    return true;
}

void DhcpdConfigStatement::setParent(DhcpdConfigDeclaration *parent)
{
    static_assert(maximumBlockDepth < std::numeric_limits<decltype(m_depth)>::max());
    m_parent = parent;
    m_depth = static_cast<decltype(m_depth)>(parent ? parent->depth() + 1 : topDepth);
}

QString DhcpdConfigStatement::indent() const { return {indentWidth(), QLatin1Char{' '}}; }

int DhcpdConfigStatement::indentWidth() const { return std::max(0, depth()) * indentUnit; }

QString DhcpdConfigStatement::joinedWordsFrom(int position) const
{
    QString text;
    int skip{std::min(position, wordCount() - 1)};
    bool first{true};
    for (const std::string_view word : m_words) {
        if (skip-- > 0)
            continue;
        if (!std::exchange(first, false))
            text += QLatin1Char{' '};
        text += decodedWord(word);
    }
    return text;
}
