// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>
#include <QStringList>

#include <cstring>
#include <iterator>
#include <memory>
#include <string>
#include <string_view>

/// The words of one statement, as UTF-8 in one block of memory: a configuration holds hundreds of thousands of
/// statements, and most of them are never shown. A word may hold any bytes.
class WordList final
{
    using Size = quint32;

public:
    /// Words being gathered, in the form in which a list keeps them.
    class Buffer final
    {
    public:
        Buffer() = default;
        explicit Buffer(const QStringList &words);
        void add(std::string_view word);
        void addEmpty(int count);
        void clear() { m_encoded.clear(); }

    private:
        friend class WordList;
        std::string m_encoded;
    };

    class Iterator final
    {
    public:
        using iterator_category = std::input_iterator_tag;
        using value_type = std::string_view;
        using difference_type = std::ptrdiff_t;
        using pointer = const std::string_view *;
        using reference = std::string_view;

        explicit Iterator(const char *at)
            : m_at{at}
        {
        }
        std::string_view operator*() const;
        Iterator &operator++();
        bool operator==(Iterator other) const { return m_at == other.m_at; }
        bool operator!=(Iterator other) const { return m_at != other.m_at; }

    private:
        friend class WordList;
        const char *m_at;
    };

    WordList() = default;
    explicit WordList(const Buffer &words);

    bool isEmpty() const { return !m_block; }
    /// Counts the words: takes time in proportion to their number.
    int count() const;
    /// The word at `index`; empty when there is none.
    std::string_view at(int index) const;
    /// Puts `words` in the place of `count` words from `position` on, which must lie within the list.
    void replace(int position, int count, const Buffer &words);

    Iterator begin() const;
    Iterator end() const;

private:
    // A word's length takes one byte, or this byte and a Size.
    static constexpr unsigned char longWordMark{255};

    static Size sizeAt(const char *at);
    Iterator iteratorAt(int index) const;

    std::unique_ptr<char[]>
        m_block; // the size of what follows, then each word as its length and its bytes; null: no words
};

// Inline: saving goes through the words of the whole tree with these.

inline WordList::Size WordList::sizeAt(const char *at)
{
    Size size{};
    std::memcpy(&size, at, sizeof size);
    return size;
}

inline std::string_view WordList::Iterator::operator*() const
{
    const auto length = static_cast<unsigned char>(*m_at);
    if (length != longWordMark)
        return {m_at + 1, length};
    return {m_at + 1 + sizeof(Size), sizeAt(m_at + 1)};
}

inline WordList::Iterator &WordList::Iterator::operator++()
{
    const std::string_view word{**this};
    m_at = word.data() + word.size();
    return *this;
}

inline WordList::Iterator WordList::begin() const { return Iterator{m_block ? m_block.get() + sizeof(Size) : nullptr}; }

inline WordList::Iterator WordList::end() const
{
    return Iterator{m_block ? m_block.get() + sizeof(Size) + sizeAt(m_block.get()) : nullptr};
}

/// `utf8` as text; unlike QString::fromUtf8() it keeps a byte order mark at the start.
QString decodedWord(std::string_view utf8);

/// Whether the word is `literal` (in ASCII) when letter case is ignored, as QString compares.
bool equalsIgnoringCase(std::string_view word, std::string_view literal);
