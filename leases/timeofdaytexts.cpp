// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/timeofdaytexts.h"

#include <QDateTime>
#include <QLocale>

#include <algorithm>
#include <iterator>

namespace {

// The locale whose texts `locale` has for times: the system's may take them from another one, which Qt does not tell.
QLocale localeOfTimes(const QLocale &locale)
{
    if (locale != QLocale::system())
        return locale;
    for (const char *variable : {"LC_ALL", "LC_TIME", "LANG"}) {
        if (const QString name{qEnvironmentVariable(variable)}; !name.isEmpty())
            return QLocale{name};
    }
    return locale;
}

} // namespace

TimeOfDayTexts::TimeOfDayTexts(const QLocale &locale)
{
    // Two numbers with no digit in common.
    constexpr int number{11};
    constexpr int otherNumber{22};
    // A time without a date would be given the name of the local zone.
    const QLocale timeLocale{localeOfTimes(locale)};
    QString format{timeLocale.timeFormat(QLocale::LongFormat)};
    // Qt 6.5 began to put a narrow space before "AM" and "PM", which nobody can type to find a time.
    format.replace(QChar{0x202F}, QLatin1Char{' '});
    const QDate anyDay{1970, 1, 1};
    const auto text = [&](int hour, int minute, int second) {
        return timeLocale.toString(QDateTime{anyDay, QTime{hour, minute, second}, Qt::UTC}, format);
    };
    for (std::size_t i{0}; i < m_hours.size(); ++i) {
        const int hour{static_cast<int>(i)};
        const QString example{text(hour, number, number)};
        m_hours[i] = {example, difference(example, text(hour, otherNumber, number)),
                      difference(example, text(hour, number, otherNumber))};
    }
    const Hour &first{m_hours.front()};
    const auto numberIn = [&first](const QString &whole, Field field) {
        return whole.mid(field.position, field.length + whole.size() - first.text.size());
    };
    for (std::size_t i{0}; i < m_minutes.size(); ++i) {
        m_minutes[i] = numberIn(text(0, static_cast<int>(i), number), first.minute);
        m_seconds[i] = numberIn(text(0, number, static_cast<int>(i)), first.second);
    }

    const auto addCharacters = [this](const QString &of) {
        for (const QChar character : of)
            m_characters.insert(character);
    };
    for (const Hour &hour : m_hours)
        addCharacters(hour.text);
    std::for_each(m_minutes.begin(), m_minutes.end(), addCharacters);
    std::for_each(m_seconds.begin(), m_seconds.end(), addCharacters);
}

/// Where `left` differs from `right`, which has the same length.
TimeOfDayTexts::Field TimeOfDayTexts::difference(const QString &left, const QString &right)
{
    const auto begin = std::mismatch(left.cbegin(), left.cend(), right.cbegin(), right.cend()).first;
    const auto end = std::mismatch(left.crbegin(), std::make_reverse_iterator(begin), right.crbegin()).first.base();
    return {static_cast<int>(begin - left.cbegin()), static_cast<int>(end - begin)};
}

QString TimeOfDayTexts::text(QTime time) const
{
    const Hour &hour{m_hours[static_cast<std::size_t>(time.hour())]};
    const QString &minute{m_minutes[static_cast<std::size_t>(time.minute())]};
    const QString &second{m_seconds[static_cast<std::size_t>(time.second())]};
    QString text{hour.text};
    const auto put = [&text](Field field, const QString &number) {
        text.replace(field.position, field.length, number);
    };
    // No locale writes the second before the minute, whose position stays right like this.
    put(hour.second, second);
    put(hour.minute, minute);
    return text;
}
