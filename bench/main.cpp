// SPDX-License-Identifier: GPL-3.0-or-later
#include <QApplication>

#include <benchmark/benchmark.h>

int main(int argc, char *argv[])
{
    const QApplication application{argc, argv};
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return EXIT_FAILURE;
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return EXIT_SUCCESS;
}
