// SPDX-License-Identifier: GPL-3.0-or-later
// Linked into a program with a main window: when the window has been painted for the first time, prints the
// milliseconds of processor time used since the start of the process, and ends the program.
#include "bench/processortime.h"

#include <QCoreApplication>
#include <QEvent>
#include <QGuiApplication>
#include <QMainWindow>
#include <QTimer>

#include <cstdio>
#include <cstdlib>

namespace {

void report()
{
    QGuiApplication::sync(); // what was drawn is on the display
    std::printf("%.2f\n", processorMilliseconds());
    std::fflush(stdout);
    QCoreApplication::quit();
}

/// Sees every event of the application and waits for the first that paints.
class FirstPaint final : public QObject
{
public:
    using QObject::QObject;

    bool eventFilter(QObject *watched, QEvent *event) override
    {
        if (event->type() != QEvent::Paint)
            return false;
        if (!qobject_cast<QMainWindow *>(watched)) {
            std::fprintf(stderr, "The first thing painted is a %s\n", watched->metaObject()->className());
            std::_Exit(EXIT_FAILURE);
        }
        QCoreApplication::instance()->removeEventFilter(this);
        QTimer::singleShot(0, this, report);
        return false;
    }
};

void waitForFirstPaint()
{
    QCoreApplication *application{QCoreApplication::instance()};
    application->installEventFilter(new FirstPaint{application});
}

} // namespace

Q_COREAPP_STARTUP_FUNCTION(waitForFirstPaint)
