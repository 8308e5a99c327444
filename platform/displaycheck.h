// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QtGlobal>

/// Lives while the application object is made. Where that fails for want of a display, the process ends with status 1
/// and a line on the standard error that says why; Qt would abort it.
class DisplayCheck final
{
public:
    DisplayCheck();
    ~DisplayCheck();
    Q_DISABLE_COPY_MOVE(DisplayCheck)
};
