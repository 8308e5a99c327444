// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDir>
#include <QString>
#include <QStringList>

/// The languages of the translations in the program, as their files are named, "de" or "pt_BR". English is not among
/// them: its translation is empty.
inline QStringList translatedLanguages()
{
    const QString prefix{QStringLiteral("orv-admin-dhcp_")};
    const QString suffix{QStringLiteral(".qm")};
    QStringList languages;
    for (const QString &name : QDir{QStringLiteral(":/i18n")}.entryList({prefix + QLatin1Char{'*'} + suffix}))
        languages.append(name.mid(prefix.size()).chopped(suffix.size()));
    languages.removeAll(QStringLiteral("en"));
    return languages;
}
