// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/qtsingleapplication.h"

#include "platform/runtimedirectory.h"

#include <QFileInfo>
#include <QMessageBox>
#include <QWidget>

#include <unistd.h>

QtSingleApplication::QtSingleApplication(int &argc, char **argv, bool /*guiEnabled*/)
    : QApplication{argc, argv}
    , m_id{QFileInfo{applicationFilePath()}.fileName()}
    , m_directory{runtimeDirectory()}
    , m_instance{m_directory, m_id}
{
    connect(&m_instance, &SingleInstance::messageReceived, this, &QtSingleApplication::messageReceived);
}

bool QtSingleApplication::isRunning()
{
    if (!m_directory.isEmpty() || geteuid() != 0)
        return m_instance.isOtherRunning();
    QMessageBox::critical(nullptr, tr("Error"),
                          tr("The program does not start, since it cannot tell whether it is running already: there is "
                             "no folder '%1' that only the superuser can enter.")
                              .arg(ownRuntimeDirectory()));
    return true;
}

QString QtSingleApplication::id() const { return m_id; }

void QtSingleApplication::setActivationWindow(QWidget *window, bool activateOnMessage)
{
    m_activationWindow = window;
    disconnect(this, &QtSingleApplication::messageReceived, this, &QtSingleApplication::activateWindow);
    if (activateOnMessage)
        connect(this, &QtSingleApplication::messageReceived, this, &QtSingleApplication::activateWindow);
}

QWidget *QtSingleApplication::activationWindow() const { return m_activationWindow; }

bool QtSingleApplication::sendMessage(const QString &message, int timeout) { return m_instance.send(message, timeout); }

void QtSingleApplication::activateWindow()
{
    if (!m_activationWindow)
        return;
    m_activationWindow->setWindowState(m_activationWindow->windowState() & ~Qt::WindowMinimized);
    m_activationWindow->raise();
    m_activationWindow->activateWindow();
}
