// SPDX-License-Identifier: GPL-3.0-or-later
// Starts like the program itself, and reports on standard output what happens to it.
#include "platform/qtsingleapplication.h"

#include <QEvent>
#include <QMessageBox>
#include <QThread>
#include <QTimer>
#include <QWidget>
#include <QWindow>

#include <cstdio>

namespace {

void tell(const QByteArray &line)
{
    std::puts(line.constData());
    std::fflush(stdout);
}

/// A window that reports, from the moment it is watched, when it comes to the front.
class MainWindow final : public QWidget
{
public:
    void watch() { m_watched = true; }

protected:
    bool event(QEvent *event) override
    {
        const bool handled{QWidget::event(event)};
        if (m_watched && event->type() == QEvent::WindowActivate)
            tell(isMinimized() ? "in front, minimized" : "in front");
        return handled;
    }

private:
    bool m_watched{false};
};

// Tells what a message box says, and closes it.
void answerBox()
{
    auto *box = qobject_cast<QMessageBox *>(QtSingleApplication::activeModalWidget());
    if (!box)
        return;
    tell("box: " + box->text().toUtf8());
    box->accept();
}

} // namespace

// Arguments: for how many milliseconds a later instance waits for the receipt, and for how many the first one is busy
// after it has started.
int main(int argc, char *argv[])
{
    QtSingleApplication application{argc, argv};
    const QStringList arguments{QtSingleApplication::arguments()};
    QTimer boxes;
    QObject::connect(&boxes, &QTimer::timeout, &boxes, answerBox);
    boxes.start(10);
    if (application.isRunning()) {
        boxes.stop();
        const bool sent{application.sendMessage(QStringLiteral("raise"), arguments.value(1).toInt())};
        tell(sent ? "sent" : "not sent");
        tell("windows: " + QByteArray::number(QGuiApplication::topLevelWindows().size()));
        return EXIT_FAILURE;
    }

    boxes.stop();
    MainWindow window;
    QWidget cover;
    window.showMinimized();
    cover.show();
    cover.activateWindow();
    while (!cover.isActiveWindow())
        QtSingleApplication::processEvents(QEventLoop::WaitForMoreEvents);

    QObject::connect(&application, &QtSingleApplication::messageReceived, &application, [](const QString &message) {
        tell("message: " + (message.size() < 100 ? message.toUtf8() : QByteArray::number(message.size())));
    });
    application.setActivationWindow(&window);
    window.watch();
    tell("first");
    QThread::msleep(arguments.value(2).toULong());
    return QtSingleApplication::exec();
}
