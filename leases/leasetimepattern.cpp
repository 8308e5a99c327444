// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasetimepattern.h"

#include "leases/leasetimetexts.h"

#include <algorithm>
#include <utility>

namespace {

constexpr std::size_t secondsOfDay{86'400};
// As many as have a bit each; no text of a time of day has more separators.
constexpr std::size_t mostSplits{13};

} // namespace

LeaseTimePattern::LeaseTimePattern(LeaseNeedle needle, LeaseTimeTexts &texts)
    : m_needle{std::move(needle)}
    , m_texts{texts}
    , m_canBeInTimesOfDay{canBeInTimesOfDay()}
    , m_timesOfDay(secondsOfDay)
{
    const QString &text{m_needle.text};
    for (QString::size_type at{text.indexOf(LeaseTimeTexts::separator)}; at >= 0 && m_splits.size() < mostSplits;
         at = text.indexOf(LeaseTimeTexts::separator, at + 1))
        m_splits.push_back({text.left(at), text.mid(at + 1)});
}

bool LeaseTimePattern::isIn(LeaseTime time) const
{
    if (!time.isValid() || !canBeOn(time))
        return false;
    const unsigned onDate{dateFits(time) & ~known};
    return (onDate & inDate) != 0 || (timeOfDayFits(time) & onDate) != 0;
}

bool LeaseTimePattern::canBeOn(LeaseTime time) const
{
    return m_canBeInTimesOfDay || (dateFits(time) & ~(known | inTimeOfDay)) != 0;
}

/// Whether all its characters are in times of day.
bool LeaseTimePattern::canBeInTimesOfDay() const
{
    const QSet<QChar> characters{m_texts.timeOfDayCharacters()};
    const auto isThere = [this, &characters](QChar character) {
        // Case matters for other letters than a character alone tells: for those outside of the first plane.
        return character.isSurrogate() || characters.contains(character) ||
               (m_needle.sensitivity == Qt::CaseInsensitive &&
                std::any_of(characters.begin(), characters.end(),
                            [character](QChar other) { return other.toCaseFolded() == character.toCaseFolded(); }));
    };
    return std::all_of(m_needle.text.begin(), m_needle.text.end(), isThere);
}

template<typename FitsSplit>
LeaseTimePattern::Fits LeaseTimePattern::findFits(unsigned in, unsigned inOther, const QString &text,
                                                  const FitsSplit &fitsSplit) const
{
    unsigned fits{known | inOther};
    if (m_needle.isIn(text))
        fits |= in;
    unsigned bit{firstSplit};
    for (const Split &split : m_splits) {
        if (fitsSplit(text, split))
            fits |= bit;
        bit <<= 1U;
    }
    return static_cast<Fits>(fits);
}

LeaseTimePattern::Fits LeaseTimePattern::timeOfDayFits(LeaseTime time) const
{
    Fits &fits{m_timesOfDay[time.secondOfDay()]};
    if (fits == 0) {
        fits =
            findFits(inTimeOfDay, inDate, m_texts.timeOfDayText(time), [this](const QString &text, const Split &split) {
                return text.endsWith(split.before, m_needle.sensitivity);
            });
    }
    return fits;
}

LeaseTimePattern::Fits LeaseTimePattern::dateFits(LeaseTime time) const
{
    const std::size_t year{time.dateKey() >> 16U};
    if (year >= m_years.size())
        m_years.resize(year + 1);
    if (!m_years[year])
        m_years[year] = std::make_unique<Year>();
    const std::size_t month{time.dateKey() >> 8U & 0xFFU};
    const std::size_t day{time.dateKey() & 0xFFU};
    Fits &fits{m_years[year]->at(month * daysOfMonth + day)};
    if (fits == 0) {
        fits = findFits(inDate, inTimeOfDay, m_texts.dateText(time), [this](const QString &text, const Split &split) {
            return text.startsWith(split.after, m_needle.sensitivity);
        });
    }
    return fits;
}
