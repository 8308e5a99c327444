// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

class QRegularExpression;
class QString;

/// What may be typed into the fields of the dialogs. Each pattern is built once for the whole program and is meant to
/// match a whole text. They only limit what can be typed: the configuration model checks the values.
namespace patterns {

/// An address, its octets not range-checked, with an optional prefix length of 0 to 32: "192.168.1.0/24".
const QRegularExpression &subnet();
/// The dotted contiguous masks from 128.0.0.0 to 255.255.255.254.
const QRegularExpression &netmask();
/// An address with octets of 0 to 255.
const QRegularExpression &strictAddress();
/// An address, its octets not range-checked.
const QRegularExpression &looseAddress();
/// One octet and its dot, to be found anywhere in a text that looks like a dotted number.
const QRegularExpression &octet();
/// A host name of two labels or more.
const QRegularExpression &hostName();
/// A domain name of two labels or more, the last one of 2 to 6 letters.
const QRegularExpression &domain();

/// The input mask of a MAC address: six pairs of hexadecimal digits.
QString macInputMask();

} // namespace patterns
