// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QSet>
#include <QString>
#include <QTime>

#include <array>

class QLocale;

/// The long texts of all times of day in one locale, where a zone is named as UTC. The locale takes microseconds for
/// each, but within an hour texts differ only in their minutes and seconds, so it is enough to ask for a few dozen.
class TimeOfDayTexts final
{
public:
    explicit TimeOfDayTexts(const QLocale &locale);

    QString text(QTime time) const;

    /// All characters that are in any of the texts.
    const QSet<QChar> &characters() const { return m_characters; }

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
    QSet<QChar> m_characters;
};
