// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/app/testmachine.h"

#include "app/fmain.h"
#include "common/paths.h"

#include <QCursor>
#include <QFile>
#include <QGuiApplication>
#include <QProcess>
#include <QSettings>
#include <QTabBar>
#include <QTabWidget>
#include <QTest>

namespace {

constexpr int patience{60'000}; // milliseconds until a command that does not end fails the test

} // namespace

FakePrograms::FakePrograms()
    : m_oldPath{qgetenv("PATH")}
{
    qputenv("PATH", QFile::encodeName(m_folder.path()) + ':' + m_oldPath);
}

FakePrograms::~FakePrograms() { qputenv("PATH", m_oldPath); }

void FakePrograms::install(const QString &name, const QByteArray &lines) const
{
    writeTestFile(file(name), "#!/bin/sh\n" + lines);
    QVERIFY(QFile::setPermissions(file(name), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
}

QString FakePrograms::file(const QString &name) const { return m_folder.filePath(name); }

TestMachine::TestMachine(FakeSystemctl::State server)
    : m_systemctl{server}
{
    m_programs.install(QStringLiteral("dhcpd"), "exit 0\n");
    m_programs.install(QStringLiteral("dpkg-query"), "exit 1\n");
    writeTestFile(paths::configuration(), {});
    writeTestFile(paths::serverDefaults(), "INTERFACESv4=\"\"\n");
    QSettings::setPath(QSettings::NativeFormat, QSettings::UserScope, m_settings.path());
}

TestMachine::~TestMachine() = default;

std::unique_ptr<FMain> TestMachine::openWindow() const
{
    auto window = std::make_unique<FMain>();
    window->show();
    window->activateWindow();
    if (!QTest::qWaitForWindowActive(window.get()))
        QTest::qFail("the main window never became active", __FILE__, __LINE__);
    return window;
}

void clickTab(const FMain &window, int tab)
{
    auto *bar = window.findChild<QTabWidget *>(QStringLiteral("mainTabWidget"))->tabBar();
    QTest::mouseClick(bar, Qt::LeftButton, {}, bar->tabRect(tab).center());
}

bool isCursorBusy()
{
    const QCursor *cursor{QGuiApplication::overrideCursor()};
    return cursor && cursor->shape() == Qt::WaitCursor;
}

ModalBoxes::Box saveQuestion(const QString &text)
{
    return {QMessageBox::Information, QStringLiteral("Information"), text, QMessageBox::Save | QMessageBox::Cancel,
            QMessageBox::Save};
}

ModalBoxes::Box cannotRead(const QString &reason)
{
    return errorBox(QStringLiteral("Unable to open file '%1' for read").arg(paths::configuration()), reason);
}

void runOutside(const QString &path, const QByteArray &command, const QByteArray &input)
{
    QProcess shell;
    shell.start(QStringLiteral("sh"),
                {QStringLiteral("-ec"), QString::fromLatin1(command), QStringLiteral("sh"), path});
    shell.write(input);
    shell.closeWriteChannel();
    QTRY_COMPARE_WITH_TIMEOUT(shell.state(), QProcess::NotRunning, patience);
    QCOMPARE(shell.exitCode(), 0);
}
