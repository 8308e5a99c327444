// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/wordlist.h"

#include <algorithm>
#include <cstring>

namespace {

constexpr std::string_view byteOrderMark{"\xEF\xBB\xBF"};

bool isAscii(char c) { return static_cast<unsigned char>(c) < 0x80; }

char asciiLower(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }

} // namespace

WordList::Buffer::Buffer(const QStringList &words)
{
    for (const QString &word : words) {
        const QByteArray utf8{word.toUtf8()};
        add({utf8.constData(), static_cast<std::size_t>(utf8.size())});
    }
}

void WordList::Buffer::add(std::string_view word)
{
    if (word.size() < longWordMark) {
        m_encoded.push_back(static_cast<char>(word.size()));
    } else {
        const auto size = static_cast<Size>(word.size());
        m_encoded.push_back(static_cast<char>(longWordMark));
        m_encoded.append(reinterpret_cast<const char *>(&size), sizeof size);
    }
    m_encoded.append(word);
}

void WordList::Buffer::addEmpty(int count) { m_encoded.append(static_cast<std::size_t>(count), '\0'); }

WordList::WordList(const Buffer &words) { replace(0, 0, words); }

int WordList::count() const
{
    int count{};
    for (auto it = begin(), last = end(); it != last; ++it)
        ++count;
    return count;
}

std::string_view WordList::at(int index) const
{
    if (index < 0)
        return {};
    const auto it = iteratorAt(index);
    return it == end() ? std::string_view{} : *it;
}

void WordList::replace(int position, int count, const Buffer &words)
{
    const auto first = iteratorAt(position);
    auto afterwards = first;
    for (; count > 0; --count)
        ++afterwards;

    const std::string_view head{begin().m_at, static_cast<std::size_t>(first.m_at - begin().m_at)};
    const std::string_view tail{afterwards.m_at, static_cast<std::size_t>(end().m_at - afterwards.m_at)};
    const auto size = static_cast<Size>(head.size() + words.m_encoded.size() + tail.size());
    // Not make_unique(), which would fill the block with zeros first.
    std::unique_ptr<char[]> block{size > 0 ? new char[sizeof size + size] : nullptr};
    if (block) {
        char *to{block.get()};
        for (const std::string_view part : {std::string_view{reinterpret_cast<const char *>(&size), sizeof size}, head,
                                            std::string_view{words.m_encoded}, tail})
            to = std::copy(part.begin(), part.end(), to);
    }
    m_block = std::move(block);
}

WordList::Iterator WordList::iteratorAt(int index) const
{
    auto it = begin();
    for (const auto last = end(); index > 0 && it != last; --index)
        ++it;
    return it;
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
