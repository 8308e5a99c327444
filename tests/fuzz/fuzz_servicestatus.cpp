// SPDX-License-Identifier: GPL-3.0-or-later
// libFuzzer target: whatever systemctl says about the service, the state follows from it, and only from what it says of
// the unit's activity. Each input is a process of its own, so this one is slow.
#include "server/dhcpservermanager.h"
#include "tests/fuzz/fuzztarget.h"
#include "tests/support/temporaryroot.h"

#include <QCoreApplication>
#include <QFile>

#include <memory>

namespace {

struct Machine
{
    TemporaryRoot root;
    QTemporaryDir folder;
    DhcpServerManager manager;
};

std::unique_ptr<Machine> machine;

QString path(const char *name) { return machine->folder.filePath(QString::fromLatin1(name)); }

QString stateAfter(const QByteArray &status)
{
    writeTestFile(path("status"), status);
    machine->manager.checkRunning();
    return machine->manager.serverStateText();
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int *argc, char ***argv)
{
    static const QCoreApplication application{*argc, *argv};
    machine = std::make_unique<Machine>();
    writeTestFile(path("systemctl"), "#!/bin/sh\nexec cat \"${0%/*}/status\"\n");
    require(QFile::setPermissions(path("systemctl"), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    qputenv("PATH", QFile::encodeName(machine->folder.path()) + ':' + qgetenv("PATH"));
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const QByteArray status{reinterpret_cast<const char *>(data), static_cast<int>(size)};
    const QString before{machine->manager.serverStateText()};
    const QString after{stateAfter(status)};
    if (status.contains("Active: active (running)"))
        require(machine->manager.isServerRunning());
    if (!status.contains("Active: "))
        require(after == before);
    require(stateAfter(status) == after);
    return 0;
}
