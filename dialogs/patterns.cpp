// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/patterns.h"

#include <QRegularExpression>
#include <QString>

namespace patterns {

const QRegularExpression &subnet()
{
    static const QRegularExpression pattern{
        QStringLiteral(R"(\b([0-9]{1,3}\.){3}[0-9]{1,3}(\/([0-9]|[1-2][0-9]|3[0-2]))?\b)")};
    return pattern;
}

const QRegularExpression &netmask()
{
    static const QRegularExpression pattern{
        QStringLiteral(R"(\b((128|192|224|240|248|252|254)\.0\.0\.0)|)"
                       R"((255\.(((0|128|192|224|240|248|252|254)\.0\.0)|)"
                       R"((255\.(((0|128|192|224|240|248|252|254)\.0)|255\.(0|128|192|224|240|248|252|254)))))\b)")};
    return pattern;
}

const QRegularExpression &strictAddress()
{
    static const QRegularExpression pattern{
        QStringLiteral(R"(\b(25[0-5]|2[0-4][0-9]|[01]?[0-9][0-9]?)\.(25[0-5]|2[0-4][0-9]|[01]?[0-9][0-9]?))"
                       R"(\.(25[0-5]|2[0-4][0-9]|[01]?[0-9][0-9]?)\.(25[0-5]|2[0-4][0-9]|[01]?[0-9][0-9]?)\b)")};
    return pattern;
}

const QRegularExpression &looseAddress()
{
    static const QRegularExpression pattern{QStringLiteral(R"(\b([0-9]{1,3}[\.]){3}[0-9]{1,3}\b)")};
    return pattern;
}

const QRegularExpression &octet()
{
    static const QRegularExpression pattern{QStringLiteral(R"(\b([0-9]{1,3}[\.]))")};
    return pattern;
}

const QRegularExpression &hostName()
{
    static const QRegularExpression pattern{QStringLiteral(R"(^(([a-zA-Z0-9]|[a-zA-Z0-9][a-zA-Z0-9\-]*[a-zA-Z0-9])\.)+)"
                                                           R"(([A-Za-z]|[A-Za-z][A-Za-z0-9\-]*[A-Za-z0-9])$)")};
    return pattern;
}

const QRegularExpression &domain()
{
    static const QRegularExpression pattern{
        QStringLiteral(R"(^([a-zA-Z0-9]([a-zA-Z0-9\-]{0,61}[a-zA-Z0-9])?\.)+[a-zA-Z]{2,6}$)")};
    return pattern;
}

QString macInputMask() { return QStringLiteral("HH:HH:HH:HH:HH:HH;_"); }

} // namespace patterns
