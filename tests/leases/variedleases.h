// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QStringList>

class QAbstractItemModel;
class QRandomGenerator;

/// The text of a lease file of so many blocks with few addresses in common, whose cells hold what is hard to find:
/// letters whose other case is unusual, bytes of several encodings, long names, invalid times and addresses other than
/// IPv4.
QByteArray variedLeaseFile(QRandomGenerator &random, int blocks);

/// Texts to look for in a table: parts of its cells, some with the case of their letters changed, and some that are
/// hard.
QStringList searchTexts(QRandomGenerator &random, const QAbstractItemModel &table, int count);
