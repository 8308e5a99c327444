// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QtGlobal>

class QString;

/// Shows the busy cursor while it exists, for work on so many bytes that it takes longer than a moment.
class BusyCursor final
{
public:
    explicit BusyCursor(qint64 bytes);
    /// For work on the whole file at `path`.
    explicit BusyCursor(const QString &path);
    ~BusyCursor();
    Q_DISABLE_COPY_MOVE(BusyCursor)

private:
    bool m_shown;
};
