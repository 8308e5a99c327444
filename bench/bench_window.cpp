// SPDX-License-Identifier: GPL-3.0-or-later
// What the user waits for in the main window: from the last key or click until everything is painted.
#include "app/fmain.h"
#include "bench/inputs.h"
#include "bench/measurement.h"
#include "common/paths.h"
#include "dialogs/hostinputdialog.h"

#include <QApplication>
#include <QDir>
#include <QFile>
#include <QLineEdit>
#include <QStringList>
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

void addHost(benchmark::State &state)
{
    Site site{inputs::configuration(), {}};
    Measurement adding;
    for (auto _ : state) {
        QTreeView *tree{site.child<QTreeView>("topologyTree")};
        tree->setCurrentIndex(tree->model()->index(0, 0));
        QTimer::singleShot(0, &site.window(), [&site, &adding] {
            HostInputDialog *dialog{site.window().findChild<HostInputDialog *>()};
            dialog->setName(QStringLiteral("new.example.org"));
            adding.begin();
            dialog->accept();
        });
        site.window().handleAddHost();
        Site::paint();
        adding.end();
    }
    adding.report(state);
}

/// The counters of each key have its place in the list as their suffix.
void searchKeys(benchmark::State &state)
{
    Site site{{}, inputs::leases()};
    site.child<QTabWidget>("mainTabWidget")->setCurrentIndex(1);
    Site::paint();
    QLineEdit *search{site.child<QLineEdit>("searchLease")};
    for (auto _ : state) {
        const QStringList keys{inputs::keys()};
        for (int i{0}; i < keys.size(); ++i) {
            const QStringList texts{keys[i].split(QLatin1Char{'\t'})};
            search->setText(texts.first());
            Site::paint();
            Measurement key;
            key.begin();
            search->setText(texts.last());
            Site::paint();
            key.end();
            key.report(state, '_' + std::to_string(i));
        }
    }
}

void appendBlock(benchmark::State &state)
{
    Site site{{}, inputs::leases()};
    site.child<QTabWidget>("mainTabWidget")->setCurrentIndex(1);
    Site::paint();
    int host{};
    Measurement appending;
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
        appending.begin();
        site.window().leaseReload();
        Site::paint();
        appending.end();
    }
    appending.report(state);
}

BENCHMARK(addHost)->Iterations(1);
BENCHMARK(searchKeys)->Iterations(1);
BENCHMARK(appendBlock)->Iterations(10);

} // namespace
