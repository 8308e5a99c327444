// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/patterns.h"

const QRegularExpression &macRegExp()
{
    static const QRegularExpression pattern{
        QStringLiteral(R"(\b([0-9a-fA-F]{2}([:-]|$)){6}$|([0-9a-fA-F]{4}([.]|$)){3}\b)")};
    return pattern;
}

const QRegularExpression &domainRegExp()
{
    static const QRegularExpression pattern{
        QStringLiteral(R"(^"([a-zA-Z0-9]([a-zA-Z0-9\-]{0,61}[a-zA-Z0-9])?\.)+[a-zA-Z]{2,6}"$)")};
    return pattern;
}
