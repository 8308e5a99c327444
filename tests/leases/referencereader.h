// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QStringList>
#include <QVector>

class LeaseTable;
class QAbstractItemModel;

/// Rows of six texts each, in the order of the addresses.
using LeaseRows = QVector<QStringList>;

/// What a lease file's text says, by a slow reader that follows the rules of the format one by one and shares nothing
/// with the product's. Times are read as local ones: run it where the local clock skips no hour.
LeaseRows referenceRows(const QByteArray &text);

/// The rows of a table and of a model.
LeaseRows rowsOf(const LeaseTable &table);
LeaseRows rowsOf(const QAbstractItemModel &model);

/// The rows that the product's parser makes of a text given in pieces that end at the given places.
LeaseRows parsedRows(const QByteArray &text, const QVector<int> &places = {});
