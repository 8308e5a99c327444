// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>

class QRandomGenerator;

/// The text of a lease file of a few blocks as the server writes them, with odd lines among theirs, and some lines cut
/// short, changed or joined.
QByteArray oddLeaseFile(QRandomGenerator &random);

/// A block as the server writes it for an address 10.0.`third`.`fourth`, with values that depend on `version`.
QByteArray leaseBlock(int third, int fourth, int version);
