// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QtGlobal>

class QString;

/// Shows the busy cursor while it exists, for work on a file that is large enough to take longer than a moment.
class BusyCursor final
{
public:
    explicit BusyCursor(const QString &path);
    ~BusyCursor();
    Q_DISABLE_COPY_MOVE(BusyCursor)

private:
    bool m_shown;
};
