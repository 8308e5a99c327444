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

    /// Installs a shell script of these lines in place of the program of that name.
    void install(const QString &name, const QByteArray &lines) const;
    /// The path of a file beside the programs, in which they leave something for the test; to them it is
    /// "${0%/*}/name".
    QString file(const QString &name) const;

private:
    QTemporaryDir m_folder;
    QByteArray m_oldPath;
};

/// The machine that a main window under test sees, with nothing of the one that runs the test: files in a folder of its
/// own, a stopped DHCP service that does as it is told, a DHCP server that accepts every configuration, no packages and
/// no settings.
class TestMachine final
{
public:
    explicit TestMachine(FakeSystemctl::State server = FakeSystemctl::Stopped);
    ~TestMachine();
    Q_DISABLE_COPY_MOVE(TestMachine)

    /// Makes and shows the main window, and waits until it is active.
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

/// The question before the configuration is saved, of a file that is as the program left it or has changed since.
inline const QString rewriteText{
    QStringLiteral("Current configuration in file will be rewrited.\nDo you want to save changes?")};
inline const QString overwriteText{
    QStringLiteral("The configuration has been changed.\nDo you want to overwrite the configuration?")};
ModalBoxes::Box saveQuestion(const QString &text = rewriteText);

/// The box that says that the configuration could not be read.
ModalBoxes::Box cannotRead(const QString &reason = QStringLiteral("No such file or directory"));

/// Runs a shell command with `path` as its argument and `input` on its standard input; meanwhile the event loop runs.
/// Fails the test when the command fails.
void runOutside(const QString &path, const QByteArray &command, const QByteArray &input = {});
