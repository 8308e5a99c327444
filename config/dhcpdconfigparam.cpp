// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/dhcpdconfigparam.h"

#include <utility>

namespace {

// Without digit separators: lupdate takes them for quotes and misses the texts between them.
constexpr struct
{
    qint64 seconds;
    const char *text;
} timeUnits[]{
    {2592000, QT_TRANSLATE_NOOP("DhcpdConfigStatement", " mounth ")},
    {86400, QT_TRANSLATE_NOOP("DhcpdConfigStatement", " days ")},
    {3600, QT_TRANSLATE_NOOP("DhcpdConfigStatement", " hours ")},
    {60, QT_TRANSLATE_NOOP("DhcpdConfigStatement", " minutes ")},
    {1, QT_TRANSLATE_NOOP("DhcpdConfigStatement", " seconds ")},
};

QString timeText(qint64 seconds)
{
    QString text;
    for (const auto &unit : timeUnits) {
        if (const qint64 count{seconds / unit.seconds}; count >= 1)
            text += QString::number(count) + DhcpdConfigStatement::tr(unit.text);
        seconds %= unit.seconds;
    }
    return text;
}

} // namespace

DhcpdConfigParam::DhcpdConfigParam(const QStringList &words, DhcpdConfigDeclaration *parent)
    : DhcpdConfigParam{WordList{WordList::Buffer{words}}, parent}
{
}

DhcpdConfigParam::DhcpdConfigParam(WordList words, DhcpdConfigDeclaration *parent)
    : DhcpdConfigStatement{std::move(words), parent}
{
}

void DhcpdConfigParam::removeChild(DhcpdConfigStatement * /*statement*/) {}

bool DhcpdConfigParam::removeChildren(int /*row*/, int /*count*/) { return false; }

DhcpdConfigStatement *DhcpdConfigParam::child(int /*row*/) const { return nullptr; }

int DhcpdConfigParam::row() const { return parent() ? indexInList() : 0; }

QString DhcpdConfigParam::label() const
{
    static constexpr KindLabel options[]{
        {&DhcpdConfigStatement::isRouters, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Gateways")},
        {&DhcpdConfigStatement::isDnsServers, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "DNS servers")},
        {&DhcpdConfigStatement::isDomainName, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Domain name")},
        {&DhcpdConfigStatement::isNtpServers, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "NTP servers")},
        {&DhcpdConfigStatement::isMsStaticRoute, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Static route MS")},
        {&DhcpdConfigStatement::isStaticRoute, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Static route")},
    };
    static constexpr KindLabel parameters[]{
        {&DhcpdConfigStatement::isMacAddress, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "MAC address")},
        {&DhcpdConfigStatement::isMaxLeaseTime, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Max lease time")},
        {&DhcpdConfigStatement::isDefaultLeaseTime, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Default lease time")},
        {&DhcpdConfigStatement::isKey, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Key")},
        {&DhcpdConfigStatement::isAlgorithm, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Key generation algorithm")},
        {&DhcpdConfigStatement::isSecret, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Generated secret")},
        {&DhcpdConfigStatement::isPrimary, QT_TRANSLATE_NOOP("DhcpdConfigStatement", "Master DNS Server")},
    };
    return isOption() ? labelAmong(options, 1) : labelAmong(parameters, 0);
}

QString DhcpdConfigParam::valueText() const
{
    if (isLeaseTime())
        return timeText(word(1).toLongLong());
    return joinedWordsFrom(isOption() || isMacAddress() ? 2 : 1);
}
