// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/fields.h"

#include "dialogs/patterns.h"

#include <QFontMetrics>
#include <QLineEdit>
#include <QRegularExpressionValidator>

namespace fields {

void validate(QLineEdit *field, const QRegularExpression &pattern)
{
    field->setValidator(new QRegularExpressionValidator{pattern, field});
}

void maskAsMac(QLineEdit *field)
{
    field->setInputMask(patterns::macInputMask());
    widenFor(field, QStringLiteral("DD:DD:DD:DD:DD:DD"));
}

void widenFor(QLineEdit *field, const QString &widest)
{
    // The size hint of a line edit is made for 17 times the letter x and includes what the style puts around the text.
    constexpr int hintLetters{17};
    const QFontMetrics metrics{field->fontMetrics()};
    const int surroundings{field->sizeHint().width() - hintLetters * metrics.horizontalAdvance(QLatin1Char{'x'})};
    field->setMinimumWidth(surroundings + metrics.horizontalAdvance(widest));
}

void widenForAddress(QLineEdit *field) { widenFor(field, QStringLiteral("255.255.255.255")); }

void widenForName(QLineEdit *field) { widenFor(field, QString{32, QLatin1Char{'x'}}); }

} // namespace fields
