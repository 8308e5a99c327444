// SPDX-License-Identifier: GPL-3.0-or-later
// The main window while another program appends to the lease file. Usage: orv_bench_busy SECONDS FILTER
//
// Prints a line when the window is ready, and after the seconds the share of one processor that it took and the
// milliseconds of processor time of the longest stall, in which nothing that the user did would have been answered.
#include "app/fmain.h"
#include "bench/processortime.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QLineEdit>
#include <QTabWidget>
#include <QTimer>

#include <algorithm>
#include <cstdio>

namespace {

/// Measures the longest time, of the processor's that the program used, between two turns of the event loop.
class Stalls final
{
public:
    Stalls()
    {
        QObject::connect(&m_beat, &QTimer::timeout, &m_beat, [this] { note(); });
        m_beat.setTimerType(Qt::PreciseTimer);
        m_beat.start(beatMilliseconds);
    }

    double longestMilliseconds() const { return m_longest; }

private:
    static constexpr int beatMilliseconds{5};

    void note()
    {
        const double now{processorMilliseconds()};
        m_longest = std::max(m_longest, now - m_last);
        m_last = now;
    }

    QTimer m_beat;
    double m_last{processorMilliseconds()};
    double m_longest{};
};

} // namespace

int main(int argc, char *argv[])
{
    const QApplication application{argc, argv};
    const QStringList arguments{QCoreApplication::arguments()};
    FMain window;
    window.findChild<QTabWidget *>(QStringLiteral("mainTabWidget"))->setCurrentIndex(1);
    window.findChild<QLineEdit *>(QStringLiteral("searchLease"))->setText(arguments.value(2));
    window.show();
    QCoreApplication::processEvents();

    Stalls stalls;
    const double before{processorMilliseconds()};
    QElapsedTimer time;
    time.start();
    std::puts("ready");
    std::fflush(stdout);
    QTimer::singleShot(arguments.value(1).toInt() * 1000, qApp, &QCoreApplication::quit);
    QApplication::exec();

    const auto elapsed = static_cast<double>(time.nsecsElapsed()) / 1e6;
    std::printf("%.4f %.1f\n", (processorMilliseconds() - before) / elapsed, stalls.longestMilliseconds());
    return EXIT_SUCCESS;
}
