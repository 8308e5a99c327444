// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasetimetexts.h"

namespace {

// Far more days than a lease file names, and too few to take much memory.
constexpr int rememberedDates{10'000};

} // namespace

QString LeaseTimeTexts::text(LeaseTime time)
{
    return time.isValid() ? timeOfDayText(time) + separator + dateText(time) : QString{};
}

QString LeaseTimeTexts::timeOfDayText(LeaseTime time) { return timesOfDay().text(time.time()); }

QSet<QChar> LeaseTimeTexts::timeOfDayCharacters() { return timesOfDay().characters(); }

QString LeaseTimeTexts::dateText(LeaseTime time)
{
    followLocale();
    if (m_dates.size() >= rememberedDates)
        m_dates.clear();
    auto text = m_dates.find(time.dateKey());
    if (text == m_dates.end())
        text = m_dates.insert(time.dateKey(), m_locale.toString(time.date(), QLocale::NarrowFormat));
    return *text;
}

const TimeOfDayTexts &LeaseTimeTexts::timesOfDay()
{
    followLocale();
    if (!m_timesOfDay)
        m_timesOfDay.emplace(m_locale);
    return *m_timesOfDay;
}

void LeaseTimeTexts::followLocale()
{
    if (const QLocale locale; locale != m_locale) {
        m_locale = locale;
        m_dates.clear();
        m_timesOfDay.reset();
    }
}
