// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/pathwatch.h"

#include "tests/support/temporaryroot.h"

#include <QDir>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>

#include <memory>

class PathWatchTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void noticesTheFile();
    void watchesDirectoryThatIsMadeAgain_data();
    void watchesDirectoryThatIsMadeAgain();
    void watchesDirectoryThatIsMadeLater();
    void noticesNothingBesideTheDirectory();
    void noticesNothingWhilePaused();
    void noticesASlowReceiverLessOften();

private:
    QString path(const char *below) const { return m_root->filePath(QString::fromLatin1(below)); }
    void expectNotice();
    void expectNone();

    std::unique_ptr<QTemporaryDir> m_root;
    std::unique_ptr<QObject> m_parent;
    PathWatch *m_watch{};
    std::unique_ptr<QSignalSpy> m_notices;
};

void PathWatchTest::init()
{
    m_root = std::make_unique<QTemporaryDir>();
    QVERIFY(QDir{}.mkpath(path("lib/dhcp")));
    writeTestFile(path("lib/dhcp/leases"), "1");
    m_parent = std::make_unique<QObject>();
    m_watch = new PathWatch{path("lib/dhcp/leases"), path("lib/dhcp/"), m_parent.get()};
    m_notices = std::make_unique<QSignalSpy>(m_watch, &PathWatch::changed);
}

void PathWatchTest::cleanup()
{
    m_notices.reset();
    m_parent.reset();
    m_root.reset();
}

// There is a notice, and none after it.
void PathWatchTest::expectNotice()
{
    QTRY_VERIFY(!m_notices->isEmpty());
    QTest::qWait(500);
    m_notices->clear();
}

void PathWatchTest::expectNone()
{
    QTest::qWait(500);
    QCOMPARE(m_notices->size(), 0);
}

#define EXPECT(WHAT)                                                                                                   \
    do {                                                                                                               \
        WHAT();                                                                                                        \
        if (QTest::currentTestFailed())                                                                                \
            return;                                                                                                    \
    } while (false)

void PathWatchTest::noticesTheFile()
{
    writeTestFile(path("lib/dhcp/leases"), "2");
    EXPECT(expectNotice);
    QVERIFY(QFile::remove(path("lib/dhcp/leases")));
    EXPECT(expectNotice);
    writeTestFile(path("lib/dhcp/leases"), "3");
    EXPECT(expectNotice);
}

void PathWatchTest::watchesDirectoryThatIsMadeAgain_data()
{
    QTest::addColumn<QString>("removed");
    QTest::addColumn<bool>("isRenamed");
    QTest::addRow("removed") << QStringLiteral("lib/dhcp") << false;
    QTest::addRow("renamed") << QStringLiteral("lib/dhcp") << true;
    QTest::addRow("removed with the folder above") << QStringLiteral("lib") << false;
}

void PathWatchTest::watchesDirectoryThatIsMadeAgain()
{
    QFETCH(const QString, removed);
    QFETCH(const bool, isRenamed);
    const QString gone{m_root->filePath(removed)};
    for (int round{0}; round < 2; ++round) {
        if (isRenamed)
            QVERIFY(QDir{}.rename(gone, gone + QString::number(round)));
        else
            QVERIFY(QDir{gone}.removeRecursively());
        EXPECT(expectNotice);
        QVERIFY(QDir{}.mkpath(path("lib/dhcp")));
        EXPECT(expectNotice);
        writeTestFile(path("lib/dhcp/leases"), "2");
        EXPECT(expectNotice);
        writeTestFile(path("lib/dhcp/leases"), "3");
        EXPECT(expectNotice);
    }
}

void PathWatchTest::watchesDirectoryThatIsMadeLater()
{
    PathWatch watch{path("srv/a/b/file"), path("srv/a/b/"), m_parent.get()};
    QSignalSpy notices{&watch, &PathWatch::changed};
    for (const char *folder : {"srv", "srv/a", "srv/a/b"}) {
        QCOMPARE(notices.size(), 0);
        QVERIFY(QDir{}.mkdir(path(folder)));
        QTest::qWait(300);
    }
    QTRY_VERIFY(!notices.isEmpty());
    notices.clear();
    writeTestFile(path("srv/a/b/file"), "1");
    QTRY_VERIFY(!notices.isEmpty());
}

void PathWatchTest::noticesNothingBesideTheDirectory()
{
    writeTestFile(path("lib/other"), "1");
    QVERIFY(QDir{}.mkpath(path("lib/folder/below")));
    EXPECT(expectNone);
    QVERIFY(QDir{path("lib/dhcp")}.removeRecursively());
    EXPECT(expectNotice);
    writeTestFile(path("lib/another"), "1");
    EXPECT(expectNone);
}

void PathWatchTest::noticesNothingWhilePaused()
{
    m_watch->pause();
    QVERIFY(QDir{path("lib/dhcp")}.removeRecursively());
    QVERIFY(QDir{}.mkpath(path("lib/dhcp")));
    EXPECT(expectNone);
    m_watch->resume();
    writeTestFile(path("lib/dhcp/leases"), "2");
    EXPECT(expectNotice);
}

void PathWatchTest::noticesASlowReceiverLessOften()
{
    QElapsedTimer sinceNotice;
    QVector<qint64> pauses;
    connect(m_watch, &PathWatch::changed, this, [&] {
        if (sinceNotice.isValid())
            pauses += sinceNotice.elapsed();
        if (pauses.isEmpty())
            QTest::qSleep(200);
        writeTestFile(path("lib/dhcp/leases"), QByteArray::number(pauses.size()));
        sinceNotice.start();
    });
    writeTestFile(path("lib/dhcp/leases"), "2");
    QTRY_VERIFY(pauses.size() >= 2);
    QVERIFY2(pauses.first() >= 550, // three times as long; timers may be a little early
             qPrintable(QString::number(pauses.first())));
    QVERIFY2(pauses.at(1) < pauses.first(), qPrintable(QString::number(pauses.at(1))));
    m_watch->pause();
}

QTEST_GUILESS_MAIN(PathWatchTest)
#include "tst_pathwatch.moc"
