// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QMessageBox>

/// A message box that shows its texts as they are: what comes from a file, a client or another program is no markup.
class PlainMessageBox final : public QMessageBox
{
public:
    PlainMessageBox(Icon icon, const QString &title, const QString &text, StandardButtons buttons, QWidget *parent);
    Q_DISABLE_COPY_MOVE(PlainMessageBox)

    /// As setInformativeText(), which would interpret the text, and which a screen reader does not say in an open box.
    void setPlainInformativeText(const QString &text);
};
