// SPDX-License-Identifier: GPL-3.0-or-later
// libFuzzer target: of any defaults file, the served interfaces are those between the quotes of the last line that has
// the key and can be taken apart.
#include "common/textencoding.h"
#include "server/dhcpservermanager.h"
#include "tests/fuzz/fuzztarget.h"
#include "tests/support/temporaryroot.h"

#include <QCoreApplication>
#include <QSet>

#include <memory>

#include <sys/mman.h>
#include <unistd.h>

namespace {

struct Machine
{
    TemporaryRoot root;
    DhcpServerManager manager;
    int file{memfd_create("defaults", MFD_CLOEXEC)};
};

std::unique_ptr<Machine> machine;

// Finds the names by searching, without taking lines apart. Nothing where the last line with the key is not as usual.
bool findServed(const QString &text, QSet<QString> &served)
{
    const QString::size_type key{text.lastIndexOf(QLatin1String{"INTERFACESv4"})};
    if (key < 0)
        return true;
    const QString::size_type lineBegin{text.lastIndexOf(QLatin1Char{'\n'}, key) + 1};
    const QString::size_type lineEnd{text.indexOf(QLatin1Char{'\n'}, key)};
    const QString line{text.mid(lineBegin, lineEnd < 0 ? -1 : lineEnd - lineBegin)};
    const QString::size_type begin{line.indexOf(QLatin1String{"=\""}) + 2};
    const QString::size_type end{line.indexOf(QLatin1Char{'"'}, begin)};
    if (begin < 2 || end < 0 || line.left(end).count(QLatin1Char{'='}) != 1 ||
        line.left(begin).count(QLatin1Char{'"'}) != 1)
        return false;
    if (end > begin) {
        for (const QString &name : line.mid(begin, end - begin).split(QLatin1Char{' '}))
            served.insert(name);
    }
    return true;
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int *argc, char ***argv)
{
    static const QCoreApplication application{*argc, *argv};
    machine = std::make_unique<Machine>();
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    require(ftruncate(machine->file, 0) == 0);
    require(pwrite(machine->file, data, size, 0) == static_cast<ssize_t>(size));
    machine->manager.collectSystemInterfaces();
    machine->manager.readInterfacesFile(QStringLiteral("/proc/self/fd/%1").arg(machine->file));

    const QByteArray bytes{reinterpret_cast<const char *>(data), static_cast<int>(size)};
    QSet<QString> expected;
    if (!findServed(TextEncoding::detect(bytes).decode(bytes), expected))
        return 0;
    QSet<QString> served;
    const QMap<QString, bool> &interfaces{machine->manager.interfaces()};
    for (auto entry = interfaces.cbegin(); entry != interfaces.cend(); ++entry) {
        if (entry.value())
            served.insert(entry.key());
    }
    require(served == expected);
    return 0;
}
