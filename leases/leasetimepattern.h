// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leaseneedle.h"
#include "leases/leasetime.h"

#include <QString>

#include <array>
#include <memory>
#include <vector>

class LeaseTimeTexts;

/// Tells whether a needle is in the text of a time. What of it is in each time of day and in each date is found out
/// only once.
class LeaseTimePattern final
{
public:
    LeaseTimePattern(LeaseNeedle needle, LeaseTimeTexts &texts);

    bool isIn(LeaseTime time) const;

    /// Whether it may be in the text of any time of the day of `time`.
    bool canBeOn(LeaseTime time) const;

private:
    /// The bit `known`, and one for each place where the needle can be in a text: in the time of day, in the date, and
    /// across the separator, with any one of its own separators there.
    using Fits = quint16; // small, for there are many
    static constexpr unsigned known{1U};
    static constexpr unsigned inTimeOfDay{2U};
    static constexpr unsigned inDate{4U};
    static constexpr unsigned firstSplit{8U};

    /// The parts of the needle before and after the separator.
    struct Split
    {
        QString before;
        QString after;
    };

    // By month and day, as a key has them.
    static constexpr std::size_t daysOfMonth{32};
    using Year = std::array<Fits, 13 * daysOfMonth>;

    Fits timeOfDayFits(LeaseTime time) const;
    Fits dateFits(LeaseTime time) const;
    template<typename FitsSplit>
    Fits findFits(unsigned in, unsigned inOther, const QString &text, const FitsSplit &fitsSplit) const;

    bool canBeInTimesOfDay() const;

    LeaseNeedle m_needle;
    LeaseTimeTexts &m_texts;
    std::vector<Split> m_splits;
    bool m_canBeInTimesOfDay;
    mutable std::vector<Fits> m_timesOfDay;
    mutable std::vector<std::unique_ptr<Year>> m_years;
};
