// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/orvhelpmenu.h"

#include "platform/manualpage.h"
#include "platform/orvinit.h"

#include <QApplication>
#include <QDialog>
#include <QDialogButtonBox>
#include <QMessageBox>
#include <QTextBrowser>
#include <QVBoxLayout>

OrvHelpMenu::OrvHelpMenu(QWidget *parent)
    : QMenu{tr("&Help"), parent}
{
    addCommand(tr("Manual"), &OrvHelpMenu::showManual)->setShortcut(QKeySequence::HelpContents);
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
        m_manual = new QDialog{parentWidget()};
        m_manual->setAttribute(Qt::WA_DeleteOnClose);
        m_manual->setWindowTitle(tr("Manual"));
        auto *text = new QTextBrowser;
        text->setAccessibleName(m_manual->windowTitle());
        text->setHtml(manualPageHtml());
        auto *buttons = new QDialogButtonBox{QDialogButtonBox::Close};
        connect(buttons, &QDialogButtonBox::rejected, m_manual, &QDialog::reject);
        auto *layout = new QVBoxLayout{m_manual};
        layout->addWidget(text);
        layout->addWidget(buttons);
        m_manual->resize(640, 560);
    }
    m_manual->show();
    m_manual->raise();
    m_manual->activateWindow();
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
