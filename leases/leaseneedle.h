// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>

#include <algorithm>

/// A text to look for, and whether letter case matters. It is in another text if QString::contains() says so.
struct LeaseNeedle
{
    bool isIn(const QString &whole) const { return whole.contains(text, sensitivity); }
    /// Whether letter case makes no difference: where nothing is a letter nor can be equal to one.
    bool isCaseless() const
    {
        return std::all_of(text.begin(), text.end(), [](QChar c) { return c.unicode() < 0x80 && !c.isLetter(); });
    }
    bool operator==(const LeaseNeedle &other) const { return text == other.text && sensitivity == other.sensitivity; }

    QString text;
    Qt::CaseSensitivity sensitivity;
};
