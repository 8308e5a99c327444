// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QString>

#include <string>
#include <string_view>

/// A piece of a lease file's text as a QByteArray.
QByteArray leaseBytes(std::string_view text);
/// A piece of a lease file's text as it is shown.
QString decodeLeaseText(std::string_view text);

/// The texts of a table, one after the other in one piece of memory, each identified by a number.
class LeaseTexts final
{
public:
    /// The number of a text. 0, also the default, is the empty text.
    using Id = quint32;

    void reserve(std::size_t bytes) { m_bytes.reserve(bytes); }
    Id add(std::string_view text);
    /// The text of a number that add() returned; valid until the next add().
    std::string_view at(Id id) const
    {
        const char *text{m_bytes.data() + id};
        return *text == longText ? longTextAt(id) : std::string_view{text + 1, static_cast<unsigned char>(*text)};
    }

    /// All texts in the order in which they were added, with other bytes between them.
    std::string_view memory() const { return m_bytes; }

private:
    // The bytes of a text follow their count, which takes one byte, or this one and eight more.
    static constexpr char longText{'\xFF'};

    std::string_view longTextAt(Id id) const;

    std::string m_bytes{'\0'}; // the empty text
};
