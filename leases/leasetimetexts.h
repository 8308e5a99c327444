// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leasetime.h"
#include "leases/timeofdaytexts.h"

#include <QHash>
#include <QLocale>
#include <QString>

#include <optional>

/// The texts of times in the default locale: its long time, a separator and its narrow date. Where the locale's long
/// time names a zone, that is UTC: the server writes all its times in it. The locale takes microseconds for a text and
/// few are distinct, so they are remembered.
class LeaseTimeTexts final
{
public:
    static constexpr QLatin1Char separator{' '};

    /// The text of `time`, empty when it is invalid.
    QString text(LeaseTime time);
    /// What comes before and after the separator in the text of a valid time.
    QString timeOfDayText(LeaseTime time);
    QString dateText(LeaseTime time);
    /// All characters that come before the separator in any text.
    QSet<QChar> timeOfDayCharacters();

private:
    void followLocale();
    const TimeOfDayTexts &timesOfDay();

    QLocale m_locale;
    QHash<quint32, QString> m_dates;
    std::optional<TimeOfDayTexts> m_timesOfDay;
};
