// SPDX-License-Identifier: GPL-3.0-or-later
// start empty|program: prints the milliseconds from the start of the process to the first painted window, which is an
// empty main window or the program's.
#include "app/fmain.h"
#include "platform/orvinit.h"

#include <QApplication>
#include <QTimer>

#include <cstdio>
#include <ctime>

namespace {

/// Ends the program when the window that it filters has been painted.
class FirstPaint final : public QObject
{
public:
    using QObject::QObject;

    bool eventFilter(QObject * /*watched*/, QEvent *event) override
    {
        if (event->type() == QEvent::Paint)
            QTimer::singleShot(0, qApp, &QCoreApplication::quit);
        return false;
    }
};

/// The processor time that the process has used since its start, which child processes and other programs do not count
/// in.
double milliseconds()
{
    timespec time{};
    clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &time);
    return static_cast<double>(time.tv_sec) * 1e3 + static_cast<double>(time.tv_nsec) / 1e6;
}

} // namespace

int main(int argc, char *argv[])
{
    const bool isEmpty = argc > 1 && qstrcmp(argv[1], "empty") == 0;
    const QApplication application{argc, argv};
    std::unique_ptr<QMainWindow> window;
    if (isEmpty) {
        window = std::make_unique<QMainWindow>();
    } else {
        orvInit("", "");
        window = std::make_unique<FMain>();
    }
    FirstPaint firstPaint;
    window->installEventFilter(&firstPaint);
    window->show();
    const int status = QApplication::exec();
    std::printf("%.2f\n", milliseconds());
    return status;
}
