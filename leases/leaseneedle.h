// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>

/// A text to look for, and whether letter case matters. It is in another text if QString::contains() says so.
struct LeaseNeedle
{
    bool isIn(const QString &whole) const { return whole.contains(text, sensitivity); }
    bool operator==(const LeaseNeedle &other) const { return text == other.text && sensitivity == other.sensitivity; }

    QString text;
    Qt::CaseSensitivity sensitivity;
};
