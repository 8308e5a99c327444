// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QHash>
#include <QPair>
#include <QString>
#include <QStringList>
#include <QVector>

#include <variant>
#include <vector>

/// What of bind9 configurations matters for dynamic updates.
namespace bind9 {

struct Zone
{
    QString name;         // without quotes and without a dot at the end
    bool isPrimary{true}; // whether this server is where the zone is changed
    QStringList updaters; // the names of the keys that may update it, as written
};

struct Key
{
    QString name;                                // as written
    QVector<QPair<QString, QString>> statements; // "algorithm" and "secret", each with its word as written
};

/// Zones and keys in the order of the text.
using Contents = std::vector<std::variant<Zone, Key>>;

/// What a text without comments holds, views opened up. The updaters of a zone are those of the zone itself, or of the
/// view or the options around it, with lists that have names (acl) resolved.
Contents readContents(const QString &text);

/// Zones and keys in the form that statements() reads. What it would not keep together is left out.
QString textOf(const Contents &contents);

} // namespace bind9
