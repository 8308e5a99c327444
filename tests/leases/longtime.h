// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QLocale>
#include <QTime>

/// What Qt makes of a time of day, with the spaces that every Qt has: from 6.5 on, some of them are narrow ones.
inline QString longTime(const QLocale &locale, QTime time)
{
    return locale.toString(time, QLocale::LongFormat).replace(QChar{0x202F}, QLatin1Char{' '});
}
