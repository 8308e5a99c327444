// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/support/temporaryroot.h"

#include "common/paths.h"

#include <QDir>
#include <QFile>
#include <QTest>

TemporaryRoot::TemporaryRoot()
{
    qputenv("ORV_TEST_ROOT", QFile::encodeName(m_folder.path()));
    for (const QString &file : {paths::configuration(), paths::leases(), paths::serverDefaults(),
                                paths::bind9LocalConfiguration(), paths::backupDirectory()})
        QDir{}.mkpath(QFileInfo{file}.absolutePath());
}

TemporaryRoot::~TemporaryRoot() { qunsetenv("ORV_TEST_ROOT"); }

QString TemporaryRoot::path(const QString &path) const { return m_folder.path() + path; }

void writeTestFile(const QString &path, const QByteArray &content)
{
    QFile file{path};
    QVERIFY2(file.open(QIODevice::WriteOnly), qPrintable(path));
    QCOMPARE(file.write(content), qint64{content.size()});
}

QByteArray readTestFile(const QString &path)
{
    QFile file{path};
    if (!file.open(QIODevice::ReadOnly)) {
        QTest::qFail(qPrintable(QStringLiteral("cannot read ") + path), __FILE__, __LINE__);
        return {};
    }
    return file.readAll();
}
