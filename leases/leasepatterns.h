// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leasetable.h"
#include "leases/leasetime.h"

#include <QString>

#include <array>
#include <memory>
#include <string_view>
#include <vector>

/// A text to look for, and whether letter case matters: it is in another text if QString::contains() says so.
struct LeaseNeedle
{
    bool isIn(const QString &whole) const { return whole.contains(text, sensitivity); }
    bool operator==(const LeaseNeedle &other) const { return text == other.text && sensitivity == other.sensitivity; }

    QString text;
    Qt::CaseSensitivity sensitivity;
};

/// Tells whether a needle is in the text of an IPv4 address without making that text.
class LeaseAddressPattern final
{
public:
    explicit LeaseAddressPattern(const LeaseNeedle &needle);

    /// Whether it may be in any address at all.
    bool canBeIn() const { return m_canBeIn; }

    bool isIn(quint32 address) const
    {
        return (m_fits[0][address >> 24U] & m_fits[1][address >> 16U & 0xFFU] & m_fits[2][address >> 8U & 0xFFU] &
                m_fits[3][address & 0xFFU]) != 0;
    }

private:
    // For each octet and each value of it, a bit for each of the octets in which the needle can begin: whether the
    // value fits there.
    std::array<std::array<quint8, 256>, 4> m_fits{};
    bool m_canBeIn{};
};

/// Tells whether a needle is in the text of a time. Whether it is in, or which part of it ends or begins, a time of day
/// or a date is found out once for each.
class LeaseTimePattern final
{
public:
    LeaseTimePattern(LeaseNeedle needle, LeaseTimeTexts &texts);

    bool isIn(LeaseTime time) const { return time.isValid() && (timeOfDayFits(time) & dateFits(time) & ~known) != 0; }

private:
    /// The bit `known`, and one for each place that the needle can have in a text: in the time of day, in the date, and
    /// over the separator with any of its own separators there.
    using Fits = quint16; // small, for there are many
    static constexpr unsigned known{1U};
    static constexpr unsigned inTimeOfDay{2U};
    static constexpr unsigned inDate{4U};
    static constexpr unsigned firstSplit{8U};

    /// What of the needle stands before and after the separator.
    struct Split
    {
        QString before;
        QString after;
    };

    // By month and day as they are in a key.
    static constexpr std::size_t daysOfMonth{32};
    using Year = std::array<Fits, 13 * daysOfMonth>;

    Fits timeOfDayFits(LeaseTime time) const;
    Fits dateFits(LeaseTime time) const;
    template<typename FitsSplit>
    Fits findFits(unsigned in, unsigned inOther, const QString &text, const FitsSplit &fitsSplit) const;

    LeaseNeedle m_needle;
    LeaseTimeTexts &m_texts;
    std::vector<Split> m_splits;
    mutable std::vector<Fits> m_timesOfDay;
    mutable std::vector<std::unique_ptr<Year>> m_years;
};

/// Tells whether a needle is in the text of a lease's bytes, from the bytes alone where those are ASCII.
class LeaseTextPattern final
{
public:
    explicit LeaseTextPattern(LeaseNeedle needle);

    bool isIn(std::string_view bytes) const;

    /// The first place in `memory` with something worth a look with isIn(), or its end: no text before it has the
    /// needle.
    const char *nextCandidate(std::string_view memory) const;

private:
    /// What bytes are, or for letters without case become by setting a bit.
    struct ByteTest
    {
        bool accepts(char byte) const { return (static_cast<quint8>(byte) | setBits) == value; }

        quint8 setBits;
        quint8 value;
    };

    LeaseNeedle m_needle;
    bool m_canBeInAscii{true};
    std::vector<ByteTest> m_bytes;
    ByteTest m_first{};
    ByteTest m_second{};
};

/// Applies a pattern to many of a table's texts: fast if they are asked for in the order in which they were added.
class LeaseTextScan final
{
public:
    LeaseTextScan(const LeaseTextPattern &pattern, const LeaseTexts &texts);

    bool operator()(LeaseTexts::Id id);

    /// Whether the needle may be in any text at all.
    bool hasCandidates() const { return m_hasCandidates; }

private:
    const LeaseTextPattern &m_pattern;
    const LeaseTexts &m_texts;
    const char *m_begin; // the texts from here to m_candidate do not have the needle
    const char *m_candidate;
    bool m_hasCandidates;
};
