// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasetime.h"

#include <QString>

#include <array>
#include <cstring>

namespace {

constexpr std::string_view usualLayout{"0000/00/00 00:00:00"};
constexpr std::size_t dateLength{10};
constexpr std::size_t timeLength{8};

static_assert(usualLayout.size() == LeaseTime::usualLength && dateLength + 1 + timeLength == LeaseTime::usualLength);

quint64 load(const char *bytes)
{
    quint64 word{};
    std::memcpy(&word, bytes, sizeof word);
    return word;
}

/// Whether eight bytes have the layout of `pattern`, in which a 0 stands for any digit. All eight are compared at once:
/// a byte is a digit if neither it nor it plus 6 leaves the sixteen characters from '0' on.
bool hasLayout(const char *bytes, const char *pattern)
{
    constexpr quint64 zeros{0x3030303030303030};
    constexpr quint64 highHalves{0xF0F0F0F0F0F0F0F0};
    constexpr quint64 sixes{0x0606060606060606};
    std::array<char, sizeof(quint64)> mask{};
    for (std::size_t i{0}; i < mask.size(); ++i)
        mask[i] = pattern[i] == '0' ? '\0' : '\xFF';
    const quint64 separators{load(mask.data())};
    const quint64 word{load(bytes)};
    const quint64 digits{(word & ~separators) | (zeros & separators)};
    return ((word ^ load(pattern)) & separators) == 0 && (digits & highHalves) == zeros &&
           ((digits + sixes) & highHalves) == zeros;
}

unsigned number(const char *digits, int count)
{
    unsigned value{0};
    for (int i{0}; i < count; ++i)
        value = value * 10 + static_cast<unsigned>(digits[i] - '0');
    return value;
}

} // namespace

LeaseTime::LeaseTime(unsigned year, unsigned month, unsigned day, unsigned hour, unsigned minute, unsigned second)
    : m_date{year << 16U | month << 8U | day}
    , m_time{hour << 16U | minute << 8U | second}
{
}

LeaseTime LeaseTime::parse(std::string_view date, std::string_view time)
{
    if (date.size() != dateLength || time.size() != timeLength)
        return {};
    // One by one: a QDateTime would be invalid where the local clock skips that hour. Qt's parser takes more than
    // digits.
    const QDate qDate{QDate::fromString(QString::fromLatin1(date.data(), dateLength), QStringLiteral("yyyy/MM/dd"))};
    const QTime qTime{QTime::fromString(QString::fromLatin1(time.data(), timeLength), QStringLiteral("hh:mm:ss"))};
    if (!qDate.isValid() || !qTime.isValid())
        return {};
    const auto u = [](int value) { return static_cast<unsigned>(value); };
    return {u(qDate.year()), u(qDate.month()), u(qDate.day()), u(qTime.hour()), u(qTime.minute()), u(qTime.second())};
}

bool LeaseTime::hasUsualLayout(const char *text)
{
    constexpr std::size_t half{sizeof(quint64)};
    constexpr std::size_t last{usualLength - half};
    return hasLayout(text, usualLayout.data()) && hasLayout(text + half, usualLayout.data() + half) &&
           hasLayout(text + last, usualLayout.data() + last);
}

LeaseTime LeaseTime::fromUsualLayout(const char *text)
{
    const LeaseTime read{number(text, 4),      number(text + 5, 2),  number(text + 8, 2),
                         number(text + 11, 2), number(text + 14, 2), number(text + 17, 2)};
    return read.date().isValid() && read.time().isValid() ? read : LeaseTime{};
}

QDate LeaseTime::date() const
{
    return {static_cast<int>(m_date >> 16U), static_cast<int>(m_date >> 8U & 0xFFU), static_cast<int>(m_date & 0xFFU)};
}

QTime LeaseTime::time() const
{
    return {static_cast<int>(m_time >> 16U), static_cast<int>(m_time >> 8U & 0xFFU), static_cast<int>(m_time & 0xFFU)};
}
