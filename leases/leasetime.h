// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDate>
#include <QHash>
#include <QLocale>
#include <QString>
#include <QTime>

#include <array>
#include <ctime>
#include <optional>
#include <string_view>

/// A date and a time of day as a lease file states them. It has no time zone, so that one inside a daylight saving gap
/// of the local zone is shown like any other.
class LeaseTime final
{
public:
    /// The length of a usual "yyyy/MM/dd hh:mm:ss".
    static constexpr std::size_t usualLength{19};

    /// An invalid time.
    LeaseTime() = default;

    /// The time of a date "yyyy/MM/dd" and a time "hh:mm:ss"; invalid unless QDateTime takes both.
    static LeaseTime parse(std::string_view date, std::string_view time);

    /// Whether the usualLength bytes at `text` are digits, slashes, a space and colons in the usual places.
    static bool hasUsualLayout(const char *text);
    /// The time of a text of the usual layout; invalid if there is no such day or second.
    static LeaseTime fromUsualLayout(const char *text);

    bool isValid() const { return m_date != 0; }
    QDate date() const;
    QTime time() const;

    /// Numbers that stand for the date and for the time of day, each unique among its kind.
    quint32 dateKey() const { return m_date; }
    quint32 timeKey() const { return m_time; }
    /// The number of seconds since midnight.
    quint32 secondOfDay() const { return ((m_time >> 16U) * 60 + (m_time >> 8U & 0xFFU)) * 60 + (m_time & 0xFFU); }

private:
    LeaseTime(unsigned year, unsigned month, unsigned day, unsigned hour, unsigned minute, unsigned second);

    quint32 m_date{}; // year, month, day in 16, 8 and 8 bits; 0 when invalid
    quint32 m_time{}; // hour, minute, second in 8 bits each
};

/// The long texts of all times of day in one locale. The locale takes microseconds a text, but within an hour texts
/// differ only where the minute and the second stand, so that it need be asked for a few dozen only.
class TimeOfDayTexts final
{
public:
    explicit TimeOfDayTexts(const QLocale &locale);

    QString text(QTime time) const;

private:
    /// Where a number stands in a text.
    struct Field
    {
        int position;
        int length;
    };

    /// The text of a time in an hour, and where its minute and second stand.
    struct Hour
    {
        QString text;
        Field minute;
        Field second;
    };

    static Field difference(const QString &left, const QString &right);

    std::array<Hour, 24> m_hours;
    std::array<QString, 60> m_minutes;
    std::array<QString, 60> m_seconds;
};

/// The texts of times in the default locale: its long time, a separator and its narrow date. Long times usually name
/// the local zone, as it is called when the text is made: with daylight saving time or without. The locale takes
/// microseconds a text and the distinct ones are few, so they are remembered.
class LeaseTimeTexts final
{
public:
    static constexpr QLatin1Char separator{' '};

    /// The text of `time`, empty when it is invalid.
    QString text(LeaseTime time);
    /// What stands before and after the separator in the text of a valid time.
    QString timeOfDayText(LeaseTime time);
    QString dateText(LeaseTime time);

private:
    void heedLocale();
    void heedZone();

    QLocale m_locale;
    QHash<quint32, QString> m_dates;
    std::optional<TimeOfDayTexts> m_timesOfDay;
    std::time_t m_zoneHeeded{};
};
