// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>
#include <QStringList>
#include <QVector>

/// Reading what a local bind9 name server lets be updated: its zones, and the keys that may update them.
///
/// A statement list holds two words of each statement in turn. A zone takes six: "zone" and its name, "primary" and the
/// address of the name server, "key" and its name. A key takes six: "key" and its name, "algorithm", "secret".
namespace bind9 {

/// A zone of the name server that the DHCP server cannot be made to update, and why.
struct LeftOutZone
{
    enum class Reason
    {
        NotPrimary,  ///< the zone is a copy of that of another server, or none of its own
        NoUpdateKey, ///< no key may update it: nobody, or addresses only
        RefusedName, ///< the DHCP server does not accept its name
        UnknownKey,  ///< its key is neither in the files nor in the configuration
        RefusedKey,  ///< the DHCP server does not accept the name, the algorithm or the secret of its key
        KeyBehind    ///< its key is declared in the configuration, but behind the place of adding
    };

    QString name; // without quotes and without a dot at the end
    Reason reason;
    QString key; // the first that may update the zone, without quotes; empty where there is none
};

struct Preparation
{
    QStringList statements; // what DhcpdConfigModel::addBind9() takes
    QVector<LeftOutZone> leftOut;
};

/// What the DHCP server accepts, of the file at `path` and the files that it includes: whole zones and keys. It knows
/// the keys named `knownKeys`. Of the others among `allKeys`, which are those of its whole configuration, no copy is
/// made, and no zone refers to them. Empty when the file cannot be read.
Preparation prepared(const QString &path, const QStringList &knownKeys, const QStringList &allKeys = {});

/// The same of a text without comments.
Preparation preparedText(const QString &text, const QStringList &knownKeys, const QStringList &allKeys = {});

/// What of a text without comments matters, in the form that statements() reads: the headings of zones with the keys
/// that may update them, and key blocks. Everything else in the blocks is left out, and views are opened up.
QString zonesAndKeys(const QString &text);

/// The statement list of `text`. Knows no other comments than those that begin with a slash, and takes every statement
/// for one of a zone or a key, deliberately: zonesAndKeys() leaves it nothing else.
QStringList statements(const QString &text);

/// Of a statement list the whole zones and keys, each zone with the first of its keys that there is, in the list or
/// among `knownKeys`, and behind that key. A zone without such a key is left out. Algorithms lose their quotes.
QStringList usable(const QStringList &statements, const QStringList &knownKeys);

} // namespace bind9
