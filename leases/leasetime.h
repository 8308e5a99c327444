// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDate>
#include <QTime>

#include <string_view>

/// A date and a time of day as a lease file states them. It has no time zone, so that a time that the local clock skips
/// is shown like any other.
class LeaseTime final
{
public:
    /// The length of the usual layout, "yyyy/MM/dd hh:mm:ss".
    static constexpr std::size_t usualLength{19};

    /// An invalid time.
    LeaseTime() = default;

    /// The time of a date "yyyy/MM/dd" and a time "hh:mm:ss"; invalid unless QDateTime takes both.
    static LeaseTime parse(std::string_view date, std::string_view time);

    /// Whether the usualLength bytes at `text` have the usual layout, whatever the digits.
    static bool hasUsualLayout(const char *text);
    /// The time of a text of the usual layout; invalid if there is no such day or second.
    static LeaseTime fromUsualLayout(const char *text);

    bool isValid() const { return m_date != 0; }
    QDate date() const;
    QTime time() const;

    /// Numbers that identify the date and the time of day.
    quint32 dateKey() const { return m_date; }
    quint32 timeKey() const { return m_time; }
    /// The number of seconds since midnight.
    quint32 secondOfDay() const { return ((m_time >> 16U) * 60 + (m_time >> 8U & 0xFFU)) * 60 + (m_time & 0xFFU); }

private:
    LeaseTime(unsigned year, unsigned month, unsigned day, unsigned hour, unsigned minute, unsigned second);

    quint32 m_date{}; // year, month, day in 16, 8 and 8 bits; 0 when invalid
    quint32 m_time{}; // hour, minute, second in 8 bits each
};
