// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/orvhelpmenu.h"

#include "platform/handbookviewer.h"
#include "platform/helpwindow.h"
#include "platform/manualpage.h"
#include "platform/orvinit.h"

#include <QApplication>
#include <QMessageBox>
#include <QTextBrowser>

OrvHelpMenu::OrvHelpMenu(QWidget *parent)
    : QMenu{tr("&Help"), parent}
{
    addCommand(tr("Manual"), &OrvHelpMenu::showManual)->setShortcut(QKeySequence::HelpContents);
    addCommand(tr("Handbook"), &OrvHelpMenu::showHandbook);
    addSeparator();
    addCommand(tr("About %1").arg(QCoreApplication::applicationName()), &OrvHelpMenu::showAbout);
    addCommand(tr("About Qt"), &OrvHelpMenu::showAboutQt);
}

QAction *OrvHelpMenu::addCommand(const QString &text, void (OrvHelpMenu::*command)())
{
    return addAction(text, this, [this, command] {
        // A desktop's global menu and a screen reader come past an open dialog, which would cover what is shown.
        if (!QApplication::activeModalWidget())
            (this->*command)();
    });
}

void OrvHelpMenu::showManual()
{
    if (!m_manual) {
        auto *text = new QTextBrowser;
        text->setAccessibleName(tr("Manual"));
        text->setHtml(manualPageHtml());
        m_manual = new HelpWindow{tr("Manual"), text, {640, 560}, parentWidget()};
    }
    m_manual->bringUp();
}

void OrvHelpMenu::showHandbook()
{
    if (!m_handbook)
        m_handbook = new HelpWindow{tr("Handbook"), new HandbookViewer, {1100, 720}, parentWidget()};
    m_handbook->bringUp();
}

void OrvHelpMenu::showAbout()
{
    const QString name{QCoreApplication::applicationName()};
    const QString licence{tr("Free software under the GNU General Public License, version 3 or later. There is no "
                             "warranty, to the extent permitted by law.")};
    const QString description{tr(orvDescription().toUtf8().constData())};
    QMessageBox::about(parentWidget(), tr("About %1").arg(name),
                       QStringLiteral("<h3>%1 %2</h3><p>%3</p><p>%4</p>")
                           .arg(name.toHtmlEscaped(), QCoreApplication::applicationVersion().toHtmlEscaped(),
                                description.toHtmlEscaped(), licence.toHtmlEscaped()));
}

void OrvHelpMenu::showAboutQt() { QMessageBox::aboutQt(parentWidget()); }
