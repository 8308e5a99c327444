// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <array>
#include <cstring>
#include <iterator>
#include <string_view>
#include <vector>

/// The words of one statement, as UTF-8: a configuration holds hundreds of thousands of statements, and most of them
/// are never shown. The words of most statements stand in the list itself, longer ones in a block of memory. A word may
/// hold any bytes.
class WordList final
{
    using Size = quint32;

public:
    /// Words being gathered for a list.
    class Buffer final
    {
    public:
        Buffer() = default;
        explicit Buffer(const QStringList &words);
        Q_DISABLE_COPY_MOVE(Buffer)
        ~Buffer() = default;

        /// Adds a word whose bytes stay where they are until the list is made.
        void add(std::string_view word) { m_words.emplace_back(word.data(), word.size()); }
        /// Adds empty words behind all others.
        void addEmpty(int count) { m_emptyCount += count; }
        void clear();
        int count() const { return static_cast<int>(m_words.size()) + m_emptyCount; }

    private:
        friend class WordList;
        std::vector<std::string_view> m_words;
        std::vector<QByteArray> m_texts; // the bytes of words that came as text
        int m_emptyCount{};
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

    explicit WordList(const Buffer &words)
        : WordList{{}, words, {}}
    {
    }
    Q_DISABLE_COPY_MOVE(WordList)
    ~WordList()
    {
        if (isInBlock())
            delete[] data();
    }

    bool isEmpty() const { return size() == 0; }

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
    // What the words take together takes the last byte of the list, or this byte there, the block's address in front
    // and a Size behind that.
    static constexpr unsigned char blockMark{255};
    // Most statements fit, and with it a parameter fills the 72 bytes that malloc() would round its size up to.
    static constexpr std::size_t nearCapacity{47};

    template<class T>
    static T valueAt(const char *at);
    template<class T>
    static char *putValue(char *to, T value);
    static char *putLength(char *to, std::size_t length);

    /// The words between others, which come as a list keeps them.
    WordList(std::string_view head, const Buffer &words, std::string_view tail);
    char *allocate(std::size_t size);
    bool isInBlock() const { return static_cast<unsigned char>(m_bytes.back()) == blockMark; }
    const char *data() const;
    Size size() const;
    Iterator iteratorAt(int index) const;

    alignas(char *) std::array<char, nearCapacity + 1> m_bytes; // each word is its length and its bytes
};

// Inline: reading makes all words, and saving goes through them, with these.

inline void WordList::Buffer::clear()
{
    m_words.clear();
    m_emptyCount = 0;
}

template<class T>
T WordList::valueAt(const char *at)
{
    T value{};
    std::memcpy(&value, at, sizeof value);
    return value;
}

template<class T>
char *WordList::putValue(char *to, T value)
{
    std::memcpy(to, &value, sizeof value);
    return to + sizeof value;
}

inline const char *WordList::data() const
{
    return isInBlock() ? valueAt<const char *>(m_bytes.data()) : m_bytes.data();
}

inline WordList::Size WordList::size() const
{
    return isInBlock() ? valueAt<Size>(m_bytes.data() + sizeof(char *)) : static_cast<unsigned char>(m_bytes.back());
}

inline std::string_view WordList::Iterator::operator*() const
{
    const auto length = static_cast<unsigned char>(*m_at);
    if (length != longWordMark)
        return {m_at + 1, length};
    return {m_at + 1 + sizeof(Size), valueAt<Size>(m_at + 1)};
}

inline WordList::Iterator &WordList::Iterator::operator++()
{
    const std::string_view word{**this};
    m_at = word.data() + word.size();
    return *this;
}

inline WordList::Iterator WordList::begin() const { return Iterator{data()}; }

inline WordList::Iterator WordList::end() const { return Iterator{data() + size()}; }

inline WordList::Iterator WordList::iteratorAt(int index) const
{
    auto it = begin();
    for (const auto last = end(); index > 0 && it != last; --index)
        ++it;
    return it;
}

inline std::string_view WordList::at(int index) const
{
    if (index < 0)
        return {};
    const auto it = iteratorAt(index);
    return it == end() ? std::string_view{} : *it;
}

/// `utf8` as text; unlike QString::fromUtf8() it keeps a byte order mark at the start.
QString decodedWord(std::string_view utf8);

/// Whether the word is `literal` (in ASCII) when letter case is ignored, as QString compares.
bool equalsIgnoringCase(std::string_view word, std::string_view literal);
