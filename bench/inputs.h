// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>
#include <QStringList>

namespace benchmark {
class State;
}

namespace inputs {

/// The campus configuration and lease file that the run works on.
QString configuration();
QString leases();

/// The keys typed into the search field: of each, the text before and after it with a tab between.
QStringList keys();

/// The bytes of memory in use on the heap.
double heapBytes();

/// Reports `bytes` of memory as counter "bytes_per_byte", for each byte of the file at `path`.
void reportMemory(benchmark::State &state, double bytes, const QString &path);

} // namespace inputs
