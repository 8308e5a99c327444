// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>

class QRandomGenerator;

/// The text of a lease file of a few blocks as the server writes them, with irregular lines among them, and some lines
/// cut short, changed or joined.
QByteArray irregularLeaseFile(QRandomGenerator &random);

/// A block as the server writes it for an address 10.0.`third`.`fourth`, with values that depend on `version`.
QByteArray leaseBlock(int third, int fourth, int version);
