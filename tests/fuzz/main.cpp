// SPDX-License-Identifier: GPL-3.0-or-later
// Runs a fuzz target once on each file of the folders that are given.
#include "tests/fuzz/fuzztarget.h"

#include <QDir>
#include <QFile>

#include <cstdio>

int main(int argc, char **argv)
{
    LLVMFuzzerInitialize(&argc, &argv);
    int files{0};
    for (int i{1}; i < argc; ++i) {
        const QDir folder{QFile::decodeName(argv[i])};
        for (const QFileInfo &info : folder.entryInfoList(QDir::Files, QDir::Name)) {
            QFile file{info.filePath()};
            if (!file.open(QIODevice::ReadOnly)) {
                std::fprintf(stderr, "%s cannot be read\n", qPrintable(info.filePath()));
                return EXIT_FAILURE;
            }
            const QByteArray content{file.readAll()};
            std::fprintf(stderr, "%s\n", qPrintable(info.filePath())); // the last one before an abort has the fault
            LLVMFuzzerTestOneInput(reinterpret_cast<const std::uint8_t *>(content.constData()),
                                   static_cast<std::size_t>(content.size()));
            ++files;
        }
    }
    std::fprintf(stderr, "%d files\n", files);
    return files > 0 ? EXIT_SUCCESS : EXIT_FAILURE;
}
