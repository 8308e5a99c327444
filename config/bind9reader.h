// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>
#include <QStringList>

/// Reading what a local bind9 name server lets be updated: its zones, and the keys that may update them.
///
/// A statement list holds two words of each statement in turn. A zone takes six: "zone" and its name, "primary" and the
/// address of the name server, "key" and its name. A key takes six: "key" and its name, "algorithm", "secret".
namespace bind9 {

/// What DhcpdConfigModel::addBind9() takes, of the file at `path` and the files that it includes: whole zones and keys
/// that the DHCP server accepts where it knows the keys named `knownKeys`. Empty when there are none, or when the file
/// cannot be read.
QStringList prepared(const QString &path, const QStringList &knownKeys);

/// The statement list of the zones and keys in the file at `path` and the files that it includes; empty when it cannot
/// be read.
QStringList readFile(const QString &path);

/// `text` without its comments (//, #, and /* */, for which a space stays).
QString withoutComments(const QString &text);

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
