// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/dhcpdconfigparam.h"

#include "config/parameterkind.h"

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
    : DhcpdConfigStatement{WordList::Buffer{words}, parent}
{
}

DhcpdConfigParam::DhcpdConfigParam(const WordList::Buffer &words, DhcpdConfigDeclaration *parent)
    : DhcpdConfigStatement{words, parent}
{
}

void DhcpdConfigParam::removeChild(DhcpdConfigStatement * /*statement*/) {}

bool DhcpdConfigParam::removeChildren(int /*row*/, int /*count*/) { return false; }

DhcpdConfigStatement *DhcpdConfigParam::child(int /*row*/) const { return nullptr; }

int DhcpdConfigParam::row() const { return parent() ? indexInList() : 0; }

QString DhcpdConfigParam::label() const
{
    const ParameterKind &kind{ParameterKind::of(*this)};
    return kind.label ? tr(kind.label) : word(kind.valuePosition() - 1);
}

QString DhcpdConfigParam::valueText() const
{
    const ParameterKind &kind{ParameterKind::of(*this)};
    return kind.type == ValueType::Seconds ? timeText(word(1).toLongLong()) : joinedWordsFrom(kind.valuePosition());
}
