// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QMenu>
#include <QPointer>

class HelpWindow;

/// The Help menu of the main window `parent`: the manual page, the handbook, and who made the program. It shows nothing
/// while a modal dialog is open.
class OrvHelpMenu final : public QMenu
{
    Q_OBJECT

public:
    explicit OrvHelpMenu(QWidget *parent);
    Q_DISABLE_COPY_MOVE(OrvHelpMenu)

private:
    QAction *addCommand(const QString &text, void (OrvHelpMenu::*command)());
    void showManual();
    void showHandbook();
    void showAbout();
    void showAboutQt();

    QPointer<HelpWindow> m_manual;
    QPointer<HelpWindow> m_handbook;
};
