// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/qtsingleapplication.h"

#include "platform/runtimedirectory.h"

#include <QFileInfo>
#include <QWidget>

QtSingleApplication::QtSingleApplication(int &argc, char **argv, bool /*guiEnabled*/)
    : QApplication{argc, argv}
    , m_id{QFileInfo{applicationFilePath()}.fileName()}
    , m_instance{runtimeDirectory(), m_id}
{
    connect(&m_instance, &SingleInstance::messageReceived, this, &QtSingleApplication::messageReceived);
}

bool QtSingleApplication::isRunning() { return m_instance.isOtherRunning(); }

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
