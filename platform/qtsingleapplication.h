// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#ifdef ORV_INSTALLED_QTSINGLEAPPLICATION
#include <QtSolutions/qtsingleapplication.h>
#else

#include "platform/singleinstance.h"

#include <QApplication>
#include <QPointer>

/// An application of which one instance runs for a user at a time: later ones find it running, send it a message and
/// end. Stands in for the class of the same name where that is not installed, with the same interface.
class QtSingleApplication final : public QApplication
{
    Q_OBJECT

public:
    /// The identity is the executable's name. The last argument is ignored, since a QApplication of Qt 5 always has a
    /// user interface.
    QtSingleApplication(int &argc, char **argv, bool guiEnabled = true);
    Q_DISABLE_COPY_MOVE(QtSingleApplication)

    /// Whether another instance runs; otherwise this one is the first from now on. Where the superuser has no folder
    /// for the lock, nobody can tell: a message says so, and another one counts as running.
    bool isRunning();
    QString id() const;

    /// Sets the window that `activateWindow` brings to the front; with `activateOnMessage` every message does.
    void setActivationWindow(QWidget *window, bool activateOnMessage = true);
    QWidget *activationWindow() const;

public slots:
    /// Sends `message` to the first instance. False when it was not confirmed within `timeout` milliseconds.
    bool sendMessage(const QString &message, int timeout = 5000);
    void activateWindow();

signals:
    void messageReceived(const QString &message);

private:
    QString m_id;
    QString m_directory; // of lock and socket, empty where there is none
    SingleInstance m_instance;
    QPointer<QWidget> m_activationWindow;
};

#endif
