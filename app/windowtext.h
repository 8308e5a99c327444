// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QCoreApplication>

/// The translations of the main window's texts, for the classes that it is made of: they all are in its context.
class WindowText final
{
    Q_DECLARE_TR_FUNCTIONS(FMain)

public:
    WindowText() = delete;
};
