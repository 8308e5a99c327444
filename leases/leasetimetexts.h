// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leasetime.h"
#include "leases/timeofdaytexts.h"

#include <QHash>
#include <QLocale>
#include <QString>

#include <ctime>
#include <optional>

/// The texts of times in the default locale: its long time, a separator and its narrow date. Long times usually name
/// the local zone as it is called when the text is made, with daylight saving time or without. The locale takes
/// microseconds for a text and few are distinct, so they are remembered.
class LeaseTimeTexts final
{
public:
    static constexpr QLatin1Char separator{' '};

    /// The text of `time`, empty when it is invalid.
    QString text(LeaseTime time);
    /// What comes before and after the separator in the text of a valid time.
    QString timeOfDayText(LeaseTime time);
    QString dateText(LeaseTime time);

private:
    void followLocale();
    void followZone();

    QLocale m_locale;
    QHash<quint32, QString> m_dates;
    std::optional<TimeOfDayTexts> m_timesOfDay;
    std::time_t m_zoneChecked{};
};
