// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

class QLineEdit;
class QRegularExpression;
class QString;

/// What the fields of several dialogs have in common.
namespace fields {

/// Only texts of `pattern`, and what may become one, can be typed into `field`.
void restrain(QLineEdit *field, const QRegularExpression &pattern);
/// `field` takes the digits of a MAC address between colons.
void restrainToMac(QLineEdit *field);
/// `field` never gets too narrow to show a text as wide as `widest`.
void widenFor(QLineEdit *field, const QString &widest);
/// `field` never gets too narrow to show an address.
void widenForAddress(QLineEdit *field);
/// `field` never gets too narrow to show a usual full host or domain name.
void widenForName(QLineEdit *field);

} // namespace fields
