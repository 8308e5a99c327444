// SPDX-License-Identifier: GPL-3.0-or-later
// What the user waits for in the main window: from the last key or click until everything is painted.
#include "app/fmain.h"
#include "bench/inputs.h"
#include "common/paths.h"
#include "dialogs/hostinputdialog.h"

#include <QApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QLineEdit>
#include <QTabWidget>
#include <QTableView>
#include <QTemporaryDir>
#include <QTimer>
#include <QTreeView>

#include <benchmark/benchmark.h>

namespace {

/// The main window on the run's inputs, in a root folder of its own.
class Site final
{
public:
    Site(const QString &configuration, const QString &leases)
    {
        qputenv("ORV_TEST_ROOT", QFile::encodeName(m_root.path()));
        place(configuration, paths::configuration());
        place(leases, paths::leases());
        m_window = std::make_unique<FMain>();
        m_window->show();
        paint();
    }

    FMain &window() { return *m_window; }

    template<typename T>
    T *child(const char *name) const
    {
        return m_window->findChild<T *>(QLatin1String{name});
    }

    static void paint()
    {
        QCoreApplication::sendPostedEvents();
        QCoreApplication::processEvents();
    }

private:
    static void place(const QString &file, const QString &path)
    {
        QDir{}.mkpath(QFileInfo{path}.absolutePath());
        if (file.isEmpty()) {
            QFile empty{path};
            empty.open(QIODevice::WriteOnly);
        } else {
            QFile::copy(file, path);
        }
    }

    QTemporaryDir m_root;
    std::unique_ptr<FMain> m_window;
};

double secondsOf(const QElapsedTimer &timer) { return static_cast<double>(timer.nsecsElapsed()) / 1e9; }

void addHost(benchmark::State &state)
{
    Site site{inputs::configuration(), {}};
    for (auto _ : state) {
        QTreeView *tree{site.child<QTreeView>("topologyTree")};
        tree->setCurrentIndex(tree->model()->index(0, 0));
        QElapsedTimer sinceSave;
        QTimer::singleShot(0, &site.window(), [&site, &sinceSave] {
            HostInputDialog *dialog{site.window().findChild<HostInputDialog *>()};
            dialog->setName(QStringLiteral("new.example.org"));
            sinceSave.start();
            dialog->accept();
        });
        site.window().handleAddHost();
        Site::paint();
        state.SetIterationTime(secondsOf(sinceSave));
    }
}

void searchKey(benchmark::State &state, const QString &before, const QString &text)
{
    Site site{{}, inputs::leases()};
    site.child<QTabWidget>("mainTabWidget")->setCurrentIndex(1);
    Site::paint();
    QLineEdit *search{site.child<QLineEdit>("searchLease")};
    for (auto _ : state) {
        search->setText(before);
        Site::paint();
        QElapsedTimer timer;
        timer.start();
        search->setText(text);
        Site::paint();
        state.SetIterationTime(secondsOf(timer));
    }
}

void appendBlock(benchmark::State &state)
{
    Site site{{}, inputs::leases()};
    site.child<QTabWidget>("mainTabWidget")->setCurrentIndex(1);
    Site::paint();
    int host{};
    for (auto _ : state) {
        QFile leases{paths::leases()};
        leases.open(QIODevice::Append);
        leases.write(QStringLiteral("lease 10.250.0.%1 {\n"
                                    "  starts 6 2026/11/21 01:05:30;\n"
                                    "  ends 6 2026/11/21 01:15:30;\n"
                                    "  binding state active;\n"
                                    "  hardware ethernet 00:0c:01:02:03:04;\n"
                                    "}\n")
                         .arg(host++ % 256)
                         .toLatin1());
        leases.close();
        QElapsedTimer timer;
        timer.start();
        site.window().leaseReload();
        Site::paint();
        state.SetIterationTime(secondsOf(timer));
    }
}

BENCHMARK(addHost)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(appendBlock)->UseManualTime()->Unit(benchmark::kMillisecond)->MinTime(0.2);

void registerSearches()
{
    struct Search
    {
        const char *name;
        const char *before;
        const char *text;
    };
    for (const Search &search :
         {Search{"scattered", "host-1", "host-10"}, Search{"dense", "202", "2026"}, Search{"digit", "", "1"},
          Search{"none", "host", "hostx"}, Search{"cleared", "host-10", ""}}) {
        benchmark::RegisterBenchmark((std::string{"searchKey/"} + search.name).c_str(),
                                     [search](benchmark::State &state) {
                                         searchKey(state, QLatin1String{search.before}, QLatin1String{search.text});
                                     })
            ->UseManualTime()
            ->Unit(benchmark::kMillisecond);
    }
}

const bool registered{(registerSearches(), true)};

} // namespace
