// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "tests/support/fakesystemctl.h"
#include "tests/support/modalboxes.h"
#include "tests/support/temporaryroot.h"

#include <QByteArray>
#include <QString>
#include <QTemporaryDir>

#include <memory>

class FMain;

/// Programs that are found first through PATH while this object lives.
class FakePrograms final
{
public:
    FakePrograms();
    ~FakePrograms();
    Q_DISABLE_COPY_MOVE(FakePrograms)

    /// Makes the lines of a shell script a program, in place of the one of that name.
    void install(const QString &name, const QByteArray &lines) const;
    /// The path of a file beside the programs, where they leave what a test looks for ("${0%/*}/name" for them).
    QString file(const QString &name) const;

private:
    QTemporaryDir m_folder;
    QByteArray m_oldPath;
};

/// The machine that a main window under test runs on, with nothing of the one that runs the test: files in a folder of
/// its own, a stopped DHCP service that obeys, a DHCP server that finds no fault with any configuration, no package,
/// and no settings.
class TestMachine final
{
public:
    explicit TestMachine(FakeSystemctl::State server = FakeSystemctl::Stopped);
    ~TestMachine();
    Q_DISABLE_COPY_MOVE(TestMachine)

    /// Makes the main window, shows it and waits until it is active.
    std::unique_ptr<FMain> openWindow() const;

    const FakePrograms &programs() const { return m_programs; }
    FakeSystemctl &systemctl() { return m_systemctl; }

private:
    TemporaryRoot m_root;
    FakePrograms m_programs;
    FakeSystemctl m_systemctl;
    QTemporaryDir m_settings;
};

/// Clicks a tab of the window: 0 is the topology, 1 the leases.
void clickTab(const FMain &window, int tab);

/// Whether every window shows that the program is busy.
bool isCursorBusy();

/// The box that tells that the configuration could not be read.
ModalBoxes::Box cannotRead();

/// Runs a shell command with `path` as its argument and `input` as its input, while the windows go on. Fails the test
/// when the command does.
void runOutside(const QString &path, const QByteArray &command, const QByteArray &input = {});
