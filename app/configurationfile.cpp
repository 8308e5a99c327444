// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/configurationfile.h"

#include "app/busycursor.h"
#include "app/configcheck.h"
#include "app/pathwatch.h"
#include "app/windowtext.h"
#include "common/fileio.h"
#include "common/paths.h"
#include "config/dhcpdconfigmodel.h"

#include <QMessageBox>
#include <QTextEdit>

ConfigurationFile::ConfigurationFile(DhcpdConfigModel *model, QWidget *window)
    : m_model{model}
    , m_window{window}
{
    m_model->read();
    m_watch = new PathWatch{paths::configuration(), paths::configurationDirectory(), window};
    connect(m_watch, &PathWatch::changed, this, &ConfigurationFile::noteChange);
}

void ConfigurationFile::reload()
{
    const BusyCursor busy{paths::configuration()};
    m_model->reload();
    emit reloaded();
}

void ConfigurationFile::noteChange()
{
    if (!m_ignoreNextChange)
        m_changedOutside = true;
    m_ignoreNextChange = false;
}

SaveResult ConfigurationFile::save()
{
    // Set before anything is asked and left set when the user cancels, deliberately: the next change by others then
    // goes unnoticed once.
    m_ignoreNextChange = true;
    const QByteArray content{m_model->fileContent()};
    if (!askToWrite(content))
        return {SaveResult::Declined};
    const BusyCursor busy{paths::configuration()};
    QString reason;
    if (!write(content, &reason)) {
        m_model->reportUnwritten(paths::configuration(), reason);
        return {SaveResult::Failed, content};
    }

    m_ignoreNextChange = true;
    m_changedOutside = false;
    // A notice that was due from before the write is about a version that is gone.
    m_watch->forget();
    // The notice of the write itself, which the paused watch did not give; a second one if somebody else wrote
    // meanwhile.
    QMetaObject::invokeMethod(this, &ConfigurationFile::noteChange, Qt::QueuedConnection);
    const auto written = fileio::readFile(paths::configuration(), &reason);
    if (written != content)
        QMetaObject::invokeMethod(this, &ConfigurationFile::noteChange, Qt::QueuedConnection);
    m_model->reloadFrom(written, paths::configuration(), reason);
    emit reloaded();
    return {SaveResult::Saved};
}

bool ConfigurationFile::write(const QByteArray &content, QString *reason)
{
    // Nothing replaces a file that does hold something when there is nothing that was read, or could be read again.
    if (content.isNull())
        return false;
    m_watch->pause();
    const bool isWritten{fileio::replaceFile(paths::configuration(), content, reason)};
    m_watch->resume();
    return isWritten;
}

bool ConfigurationFile::askToWrite(const QByteArray &content)
{
    const QString text{
        m_changedOutside
            ? WindowText::tr("The configuration has been changed.\nDo you want to overwrite the configuration?")
            : WindowText::tr("Current configuration in file will be rewrited.\nDo you want to save changes?")};
    QMessageBox box{QMessageBox::Information, WindowText::tr("Information"), text,
                    QMessageBox::Save | QMessageBox::Cancel, m_window};
    box.setDefaultButton(QMessageBox::Save);

    ConfigCheck check{m_window};
    connect(&check, &ConfigCheck::refused, &box, [&box](const QString &complaint, const QString &output) {
        box.setInformativeText(WindowText::tr("The DHCP server refuses this configuration:\n%1").arg(complaint));
        box.setDetailedText(output);
        // Qt leaves the field for it without a name that could be said.
        if (auto *details = box.findChild<QTextEdit *>())
            details->setAccessibleName(WindowText::tr("Answer of the DHCP server"));
    });
    check.start(content);
    return box.exec() == QMessageBox::Save;
}
