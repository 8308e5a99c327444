// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>

/// A window with something to read beside the main window, which can be used meanwhile. It is gone when it is closed.
class HelpWindow final : public QDialog
{
    Q_OBJECT

public:
    /// Shows `content`, at first in `size`, which grows with the screen's resolution as texts and pictures do, or in as
    /// much of it as the screen has room for.
    HelpWindow(const QString &title, QWidget *content, QSize size, QWidget *parent);
    Q_DISABLE_COPY_MOVE(HelpWindow)

    /// Shows the window, above all others.
    void bringUp();
};
