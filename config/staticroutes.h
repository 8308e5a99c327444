// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>
#include <QStringList>

/// Static routes between their option, as clients understand it, and the dialog that edits them.
///
/// In the option a route is the length of its prefix, only those octets of the network that the prefix covers, and the
/// gateway (RFC 3442): "24, 192,168,1, 10,0,0,1". The dialog has a mask, a network and a gateway of four octets each.
namespace staticroutes {

/// The value of an option in the words that StaticRouteInputDialog::setRoutes() takes, from networks of four octets as
/// well as from the form above; a value that is no list of routes stays as it is.
QString toDialog(const QString &value);

/// What StaticRouteInputDialog::routes() returns as the words of an option's value. The first word of each route is
/// its mask and the second its network, whatever they look like; a route with one that is none stays as it is.
QStringList fromDialog(const QStringList &words);

/// Whether two values of the option are the same list of routes; false where one is none.
bool areSame(const QString &value, const QString &other);

} // namespace staticroutes
