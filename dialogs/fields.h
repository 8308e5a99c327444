// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

class QLineEdit;
class QRegularExpression;
class QString;

/// What the fields of several dialogs have in common.
namespace fields {

/// Lets only texts that match `pattern`, or may come to, be typed into `field`.
void validate(QLineEdit *field, const QRegularExpression &pattern);
/// Lets only the digits of a MAC address be typed into `field`, between the colons that it shows.
void maskAsMac(QLineEdit *field);
/// `field` never gets too narrow to show a text as wide as `widest`.
void widenFor(QLineEdit *field, const QString &widest);
/// `field` never gets too narrow to show an address.
void widenForAddress(QLineEdit *field);
/// `field` never gets too narrow to show a usual full host or domain name.
void widenForName(QLineEdit *field);

} // namespace fields
