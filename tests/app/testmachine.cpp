// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/app/testmachine.h"

#include "app/fmain.h"
#include "common/paths.h"

#include <QFile>
#include <QSettings>
#include <QTest>

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
