// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/support/contexttranslator.h"

bool ContextTranslator::isEmpty() const { return false; }

QString ContextTranslator::translate(const char *context, const char *sourceText, const char * /*disambiguation*/,
                                     int /*n*/) const
{
    return QString::fromUtf8(context) + QLatin1Char{'|'} + QString::fromUtf8(sourceText);
}
