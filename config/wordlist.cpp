// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/wordlist.h"

#include <algorithm>
#include <utility>

namespace {

constexpr std::string_view byteOrderMark{"\xEF\xBB\xBF"};

bool isAscii(char c) { return static_cast<unsigned char>(c) < 0x80; }

char asciiLower(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }

} // namespace

WordList::Buffer::Buffer(const QStringList &words)
{
    for (const QString &word : words) {
        const QByteArray &utf8{m_texts.emplace_back(word.toUtf8())};
        add({utf8.constData(), static_cast<std::size_t>(utf8.size())});
    }
}

WordList::WordList(std::string_view head, const Buffer &words, std::string_view tail)
{
    std::size_t size{head.size() + static_cast<std::size_t>(words.m_emptyCount) + tail.size()};
    for (const std::string_view word : words.m_words)
        size += word.size() + 1 + (word.size() < longWordMark ? 0 : sizeof(Size));
    char *to{std::copy(head.begin(), head.end(), allocate(size))};
    for (const std::string_view word : words.m_words)
        to = std::copy(word.begin(), word.end(), putLength(to, word.size()));
    to = std::fill_n(to, words.m_emptyCount, '\0');
    std::copy(tail.begin(), tail.end(), to);
}

int WordList::count() const
{
    int count{};
    for (auto it = begin(), last = end(); it != last; ++it)
        ++count;
    return count;
}

void WordList::replace(int position, int count, const Buffer &words)
{
    const auto first = iteratorAt(position);
    auto afterwards = first;
    for (; count > 0; --count)
        ++afterwards;

    WordList list{{data(), static_cast<std::size_t>(first.m_at - data())},
                  words,
                  {afterwards.m_at, static_cast<std::size_t>(end().m_at - afterwards.m_at)}};
    std::swap(m_bytes, list.m_bytes);
}

char *WordList::putLength(char *to, std::size_t length)
{
    if (length < longWordMark) {
        *to = static_cast<char>(length);
        return to + 1;
    }
    *to = static_cast<char>(longWordMark);
    return putValue(to + 1, static_cast<Size>(length));
}

/// Room for words that take `size` bytes.
char *WordList::allocate(std::size_t size)
{
    if (size <= nearCapacity) {
        m_bytes.back() = static_cast<char>(size);
        return m_bytes.data();
    }
    m_bytes.back() = static_cast<char>(blockMark);
    char *block{new char[size]};
    putValue(putValue(m_bytes.data(), block), static_cast<Size>(size));
    return block;
}

QString decodedWord(std::string_view utf8)
{
    QString text;
    while (utf8.substr(0, byteOrderMark.size()) == byteOrderMark) {
        text += QChar{QChar::ByteOrderMark};
        utf8.remove_prefix(byteOrderMark.size());
    }
    return text + QString::fromUtf8(utf8.data(), static_cast<int>(utf8.size()));
}

bool equalsIgnoringCase(std::string_view word, std::string_view literal)
{
    const std::size_t common{std::min(word.size(), literal.size())};
    for (std::size_t i{}; i < common; ++i) {
        // Letters beyond ASCII may be case variants of ASCII ones (the Kelvin sign, the long s).
        if (!isAscii(word[i])) {
            return decodedWord(word).compare(QLatin1String{literal.data(), static_cast<int>(literal.size())},
                                             Qt::CaseInsensitive) == 0;
        }
        if (asciiLower(word[i]) != asciiLower(literal[i]))
            return false;
    }
    return word.size() == literal.size();
}
