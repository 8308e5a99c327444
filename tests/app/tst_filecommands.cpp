// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/fmain.h"
#include "app/pathwatch.h"
#include "common/paths.h"
#include "config/dhcpdconfigmodel.h"
#include "server/interfacesdialog.h"
#include "tests/app/testmachine.h"
#include "tests/support/modalboxes.h"
#include "tests/support/realdhcpd.h"
#include "tests/support/temporaryroot.h"
#include "tests/support/text.h"

#include <QAction>
#include <QCheckBox>
#include <QDialogButtonBox>
#include <QDir>
#include <QElapsedTimer>
#include <QFileSystemWatcher>
#include <QHeaderView>
#include <QLabel>
#include <QPushButton>
#include <QRegularExpression>
#include <QSignalSpy>
#include <QTableView>
#include <QTest>
#include <QTreeView>

#include <algorithm>
#include <csignal>
#include <sys/resource.h>
#include <sys/syscall.h>
#include <unistd.h>

namespace {

const QByteArray configuration{R"(default-lease-time 600;
max-lease-time 7200;
option domain-name "example.org";
option ntp-servers 10.0.0.4;
subnet 10.0.0.0 netmask 255.255.255.0 {
    range 10.0.0.10 10.0.0.99;
}
)"};

// The configuration as it is written after it was read.
const QByteArray lastStatement{"subnet 10.0.0.0 netmask 255.255.255.0"};

ModalBoxes::Box reloadQuestion()
{
    return {QMessageBox::Information, QStringLiteral("Information"),
            QStringLiteral("Do you want to reload configuration from file?"), QMessageBox::Yes | QMessageBox::No,
            QMessageBox::Yes};
}

constexpr auto commentLoss = "The comment of the file will not be kept.";

ModalBoxes::Box withLoss(ModalBoxes::Box question, const char *loss)
{
    question.informativeText = text(loss);
    return question;
}

constexpr auto nothingToSave = "The configuration could not be read, so there is nothing to save.";

ModalBoxes::Box cannotWrite(const char *reason)
{
    return errorBox(QStringLiteral("Unable to open file '%1' for write").arg(paths::configuration()), text(reason));
}

/// The window on the configuration, and how often it was notified of a change of the file.
struct Site final
{
    Site(const TestMachine &machine, ModalBoxes &modalBoxes)
        : boxes{modalBoxes}
        , window{machine.openWindow()}
        , tree{window->findChild<QTreeView *>(QStringLiteral("topologyTree"))}
        , model{window->findChild<DhcpdConfigModel *>()}
        , notices{window->findChild<PathWatch *>(), &PathWatch::changed}
    {
    }

    QAction *action(const char *name) const { return window->findChild<QAction *>(QString::fromLatin1(name)); }
    QModelIndex network() const { return model->index(0, 0); }
    bool isModified() const { return action("aSave")->isEnabled(); }

    /// Removes the last statement.
    void modify() const
    {
        tree->setCurrentIndex(model->index(model->rowCount(network()) - 1, 0, network()));
        action("actionRemove")->trigger();
        QVERIFY(isModified());
    }

    void pressSave() const { QTest::keyClick(window.get(), Qt::Key_S, Qt::ControlModifier); }
    void pressReload() const { QTest::keyClick(window.get(), Qt::Key_F5); }

    /// Changes something and saves it; `text` is what the question should say.
    void save(const QString &text) const
    {
        modify();
        boxes.expectBox(saveQuestion(text), QMessageBox::Save);
        pressSave();
        boxes.verify();
    }

    void cancelSave(const QString &text) const
    {
        modify();
        boxes.expectBox(saveQuestion(text), QMessageBox::Cancel);
        pressSave();
        boxes.verify();
    }

    /// Waits until every notice that is due has come.
    void settle() const
    {
        QSignalSpy::size_type before{0};
        do {
            before = notices.count();
            QTest::qWait(250);
        } while (notices.count() != before);
    }

    ModalBoxes &boxes;
    std::unique_ptr<FMain> window;
    QTreeView *tree;
    DhcpdConfigModel *model;
    QSignalSpy notices;
};

/// Changes the file so that there is one notice of it.
void changeOutside(const Site &site)
{
    const QSignalSpy::size_type before{site.notices.count()};
    runOutside(paths::configuration(), R"(echo '# by hand' >>"$1")");
    QTRY_VERIFY(site.notices.count() > before);
    site.settle();
}

/// The watcher from which the window learns of changes of `file`.
const QFileSystemWatcher *watcherOf(const FMain &window, const QString &file)
{
    const auto watchers = window.findChildren<QFileSystemWatcher *>();
    const auto found = std::find_if(watchers.begin(), watchers.end(),
                                    [&file](const auto *watcher) { return watcher->files().contains(file); });
    return found == watchers.end() ? nullptr : *found;
}

/// What happens, once, as soon as a save has renamed its file into place, with nobody watching the file yet.
std::function<void()> afterRename;

/// Makes every write fail while it lives, without any change to a file or directory.
class FullDisk final
{
public:
    FullDisk()
        : m_formerHandler{std::signal(SIGXFSZ, SIG_IGN)}
    {
        getrlimit(RLIMIT_FSIZE, &m_former);
        const rlimit none{0, m_former.rlim_max};
        setrlimit(RLIMIT_FSIZE, &none);
    }
    ~FullDisk()
    {
        setrlimit(RLIMIT_FSIZE, &m_former);
        std::signal(SIGXFSZ, m_formerHandler);
    }
    Q_DISABLE_COPY_MOVE(FullDisk)

private:
    rlimit m_former{};
    void (*m_formerHandler)(int);
};

QList<QByteArray> backups()
{
    QList<QByteArray> contents;
    const QDir folder{paths::backupDirectory()};
    for (const QString &name : folder.entryList(QDir::Files))
        contents.append(readTestFile(folder.filePath(name)));
    return contents;
}

// Closes the window and chooses to save the changes, which fails.
void closeAlthoughNothingCanBeSaved(const Site &site, ModalBoxes &boxes, const char *reason)
{
    boxes.expectDialog<QMessageBox>(
        [](QMessageBox *box) { QTest::mouseClick(box->button(QMessageBox::Yes), Qt::LeftButton); });
    boxes.expectBox(saveQuestion(overwriteText), QMessageBox::Save);
    boxes.expectBox(cannotWrite(reason), QMessageBox::Ok);
    site.window->close();
    boxes.verify();
    QVERIFY(!site.window->isVisible());
}

} // namespace

// In place of the system library's. A save syncs the directory once the new file is there.
int fsync(int descriptor)
{
    const auto result = static_cast<int>(syscall(SYS_fsync, descriptor));
    const QFileInfo synced{QFile::symLinkTarget(QStringLiteral("/proc/self/fd/%1").arg(descriptor))};
    if (afterRename && synced == QFileInfo{paths::configurationDirectory()})
        std::exchange(afterRename, {})();
    return result;
}

class FileCommandsTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void savesWhatTheTreeShows();
    void savingShowsTheWholeTopology();
    void cancelledSaveHidesTheNextChange();
    void savesInARowRewrite();
    void saveTellsWhatIsLost_data();
    void saveTellsWhatIsLost();
    void lossesComeBeforeTheVerdict();
    void lossesOfAnotherVersionAreNotTold();
    void textsAreShownAsTheyAre();
    void outsideChangeIsNoticed_data();
    void outsideChangeIsNoticed();
    void burstOfWritesIsFewNotices();
    void steadyWritingIsNoticedMeanwhile();
    void changeDuringTheQuestionIsAskedAbout_data();
    void changeDuringTheQuestionIsAskedAbout();
    void failedSaveChangesNothing();
    void failedSaveKeepsChangedOutside();
    void changeWhileAFailureIsShownIsNoticed();
    void noticeOfTheReplacedVersionIsDropped();
    void changeRightAfterTheWriteIsNoticed();
    void nothingIsSavedFromNothing_data();
    void nothingIsSavedFromNothing();
    void bytesSurvive_data();
    void bytesSurvive();

    void reloadReadsTheFile();
    void reloadCanBeDeclined();
    void reloadKeepsChangedOutside();
    void reloadOfLeasesAsksNothing();
    void busyCursorShowsWhileMuchIsLoaded_data();
    void busyCursorShowsWhileMuchIsLoaded();
    void busyCursorShowsWhileMuchIsSaved_data() { busyCursorShowsWhileMuchIsLoaded_data(); }
    void busyCursorShowsWhileMuchIsSaved();
    void refusedLoadIsToldWithoutTheBusyCursor();

    void closing_data();
    void closing();
    void closingQuestionHasNoDefault();
    void unwrittenConfigurationIsKept();
    void nothingIsKeptOfNothing();

    void servedInterfaces_data();
    void servedInterfaces();
    void defaultsFileIsReadAgain();

    void verdictOfTheServer_data();
    void verdictOfTheServer();
    void serverSeesWhatIsWritten();
    void answerEndsTheCheck();
    void missingServerSaysNothing();
    void verdictOfTheRealServer_data();
    void verdictOfTheRealServer();

private:
    const QString m_dhcpd{realDhcpd()}; // looked for before a stand-in is in PATH
    std::unique_ptr<TestMachine> m_machine;
    std::unique_ptr<ModalBoxes> m_boxes;
};

void FileCommandsTest::init()
{
    m_boxes = std::make_unique<ModalBoxes>();
    m_machine = std::make_unique<TestMachine>();
    writeTestFile(paths::configuration(), configuration);
}

void FileCommandsTest::cleanup()
{
    m_machine.reset();
    m_boxes.reset();
}

void FileCommandsTest::savesWhatTheTreeShows()
{
    const Site site{*m_machine, *m_boxes};
    site.save(rewriteText);
    QVERIFY(!site.isModified());
    const QByteArray saved{readTestFile(paths::configuration())};
    QCOMPARE(saved, site.model->fileContent());
    QVERIFY(saved.contains("option ntp-servers 10.0.0.4;"));
    QVERIFY(!saved.contains(lastStatement));
    QCOMPARE(backups(), QList<QByteArray>{configuration});
}

void FileCommandsTest::savingShowsTheWholeTopology()
{
    const Site site{*m_machine, *m_boxes};
    site.tree->collapseAll();
    for (int section{0}; section < 2; ++section)
        site.tree->header()->resizeSection(section, site.tree->header()->minimumSectionSize());
    const int narrow{site.tree->header()->sectionSize(0)};
    site.save(rewriteText);
    QCOMPARE(site.tree->currentIndex(), site.network());
    QVERIFY(site.tree->isExpanded(site.network()));
    QVERIFY(site.tree->header()->sectionSize(0) > narrow);
}

void FileCommandsTest::cancelledSaveHidesTheNextChange()
{
    const Site site{*m_machine, *m_boxes};
    site.cancelSave(rewriteText);
    QVERIFY(site.isModified());
    QCOMPARE(readTestFile(paths::configuration()), configuration);
    changeOutside(site);
    site.cancelSave(rewriteText);
    changeOutside(site);
    changeOutside(site);
    site.cancelSave(overwriteText);
}

void FileCommandsTest::saveTellsWhatIsLost_data()
{
    QTest::addColumn<QByteArray>("content");
    QTest::addColumn<QString>("told");
    const auto row = [](const char *name, const QByteArray &content, const char *told) {
        QTest::addRow("%s", name) << content << text(told);
    };
    const QByteArray end{"host first {\n}\nhost last {\n}\n"};
    row("nothing", end, "");
    row("a comment", "# by hand\n" + end, "The comment of the file will not be kept.");
    row("comments", "# by hand\n# and more\n" + end, "The 2 comments of the file will not be kept.");
    row("options of a vendor", "option vend \"s1ip=10.1.29.8;p1=4100;a1=1;\";\n" + end,
        "The quoted text in line 1 will be changed.");
    row("blanks", "\noption a \"a   b\";\noption b \"c\td\";\n" + end,
        "The quoted texts in lines 2 and 3 will be changed.");
    row("address of a page", "filename \"http://x?mac={mac}\";\n" + end, "The quoted text in line 1 will be changed.");
    row("message", "log(info, \"bad range asked\");\n" + end, "The quoted text in line 1 will be changed.");
    row("inches", "option a \"5\\\" disk\";\nping-check true; # really\n" + end,
        "The quoted text in line 1 will be changed.");
    row("carriage returns", QByteArray{end}.replace("\n", "\r\n"),
        "The carriage returns in lines 1, 2, 3 and 4 will become parts of words.");
    row("many lines", QByteArray{"option a \"b;\";\n"}.repeated(12) + end,
        "The quoted texts in lines 1, 2, 3, 4, 5, 6, 7, 8, 9, 10 and 2 more will be changed.");
    row("all", "# a\nb \"c;\";\nd range;\n" + end,
        "The comment of the file will not be kept.\nThe quoted text in line 2 will be changed.\n"
        "The statement in line 3 will be changed.");
}

void FileCommandsTest::saveTellsWhatIsLost()
{
    QFETCH(QByteArray, content);
    QFETCH(QString, told);
    writeTestFile(paths::configuration(), content);
    const Site site{*m_machine, *m_boxes};
    site.modify();
    m_boxes->expectBox(withLoss(saveQuestion(), qPrintable(told)), QMessageBox::Save);
    site.pressSave();
    m_boxes->verify();

    site.save(rewriteText); // there is nothing left to tell
}

void FileCommandsTest::lossesComeBeforeTheVerdict()
{
    m_machine->programs().install(QStringLiteral("dhcpd"), R"(echo "$3 line 2: no such thing"; exit 1)");
    writeTestFile(paths::configuration(), "# by hand\n" + configuration);
    const Site site{*m_machine, *m_boxes};
    site.modify();
    m_boxes->expectDialog<QMessageBox>([](QMessageBox *box) {
        QCOMPARE(box->informativeText(), text("The comment of the file will not be kept."));
        QTRY_COMPARE(box->informativeText(), text("The comment of the file will not be kept.\n"
                                                  "The DHCP server refuses this configuration:\n"
                                                  "line 2: no such thing"));
        QTest::mouseClick(box->button(QMessageBox::Cancel), Qt::LeftButton);
    });
    site.pressSave();
    m_boxes->verify();
}

void FileCommandsTest::lossesOfAnotherVersionAreNotTold()
{
    writeTestFile(paths::configuration(), "# by hand\n" + configuration);
    const Site site{*m_machine, *m_boxes};
    writeTestFile(paths::configuration(), configuration + "# another one\n");
    site.settle();
    site.save(overwriteText);
}

void FileCommandsTest::textsAreShownAsTheyAre()
{
    m_machine->programs().install(QStringLiteral("dhcpd"), R"(echo "$3 line 2: <b>no</b> &lt; such"; exit 1)");
    const Site site{*m_machine, *m_boxes};
    site.modify();
    const auto compareFormats = [](QMessageBox *box) {
        const auto labels = box->findChildren<QLabel *>(QRegularExpression{QStringLiteral("^qt_msgbox_(label|info)")});
        QVERIFY(!labels.isEmpty());
        for (const QLabel *label : labels)
            QCOMPARE(label->textFormat(), Qt::PlainText);
    };
    m_boxes->expectDialog<QMessageBox>([&](QMessageBox *box) {
        QTRY_VERIFY(box->informativeText().contains(text("line 2: <b>no</b> &lt; such")));
        compareFormats(box);
        QTest::mouseClick(box->button(QMessageBox::Cancel), Qt::LeftButton);
    });
    site.pressSave();
    m_boxes->verify();

    m_boxes->expectDialog<QMessageBox>([&](QMessageBox *box) {
        QCOMPARE(box->text(), text("<h1>X</h1>"));
        compareFormats(box);
        QTest::mouseClick(box->button(QMessageBox::Ok), Qt::LeftButton);
    });
    emit site.model->error(text("<h1>X</h1>"));
    m_boxes->verify();
}

void FileCommandsTest::savesInARowRewrite()
{
    const Site site{*m_machine, *m_boxes};
    site.save(rewriteText);
    site.settle();
    site.save(rewriteText);
    site.settle();
    QCOMPARE(site.notices.count(), 0);
    // Neither of the two hides a change by somebody else.
    changeOutside(site);
    site.save(overwriteText);
    site.save(rewriteText);
}

void FileCommandsTest::outsideChangeIsNoticed_data()
{
    QTest::addColumn<QByteArray>("command");
    QTest::addRow("written in place") << QByteArray{R"(echo 'max-lease-time 1;' >"$1")"};
    QTest::addRow("appended to") << QByteArray{R"(echo 'max-lease-time 1;' >>"$1")"};
    QTest::addRow("replaced") << QByteArray{R"(cp "$1" "$1.new"; mv "$1.new" "$1")"};
    QTest::addRow("replaced, the old one kept") << QByteArray{R"(ln "$1" "$1~"; cp "$1" "$1.new"; mv "$1.new" "$1")"};
    QTest::addRow("removed") << QByteArray{R"(rm "$1")"};
    QTest::addRow("removed and back at once") << QByteArray{R"(cp "$1" "$1.old"; rm "$1"; mv "$1.old" "$1")"};
    QTest::addRow("removed and back later") << QByteArray{R"(mv "$1" "$1.old"; sleep 0.5; mv "$1.old" "$1")"};
    QTest::addRow("another file made") << QByteArray{R"(echo >"$1.other")"};
}

void FileCommandsTest::outsideChangeIsNoticed()
{
    QFETCH(QByteArray, command);
    const Site site{*m_machine, *m_boxes};
    runOutside(paths::configuration(), command);
    QTRY_VERIFY(site.notices.count() > 0);
    site.settle();
    changeOutside(site); // the file that is there now is being watched
    site.save(overwriteText);
    QCOMPARE(readTestFile(paths::configuration()), site.model->fileContent());
    changeOutside(site); // and so is the one that was saved
    site.save(overwriteText);
}

void FileCommandsTest::burstOfWritesIsFewNotices()
{
    Site site{*m_machine, *m_boxes};
    QElapsedTimer timer;
    timer.start();
    runOutside(paths::configuration(), R"(i=0; while [ $i -lt 1000 ]; do echo '# again' >>"$1"; i=$((i + 1)); done)");
    site.settle();
    QVERIFY(site.notices.count() > 0);
    // Each notice covers a tenth of a second, however long the writes took.
    QVERIFY(site.notices.count() <= timer.elapsed() / 100 + 1);
    site.notices.clear();
    changeOutside(site);
    QCOMPARE(site.notices.count(), 1);
}

void FileCommandsTest::steadyWritingIsNoticedMeanwhile()
{
    const Site site{*m_machine, *m_boxes};
    runOutside(paths::configuration(),
               R"(i=0; while [ $i -lt 100 ]; do echo '# again' >>"$1"; sleep 0.02; i=$((i + 1)); done)");
    QVERIFY(site.notices.count() > 1);
}

void FileCommandsTest::changeDuringTheQuestionIsAskedAbout_data()
{
    QTest::addColumn<bool>("saved");
    QTest::addRow("saved") << true;
    QTest::addRow("cancelled") << false;
}

void FileCommandsTest::changeDuringTheQuestionIsAskedAbout()
{
    QFETCH(bool, saved);
    const Site site{*m_machine, *m_boxes};
    site.modify();
    ModalBoxes &boxes{*m_boxes};
    boxes.expectDialog<QMessageBox>([&site](QMessageBox *box) {
        changeOutside(site);
        QTest::mouseClick(box->button(QMessageBox::Save), Qt::LeftButton);
    });
    boxes.expectBox(saveQuestion(overwriteText), saved ? QMessageBox::Save : QMessageBox::Cancel);
    site.pressSave();
    boxes.verify();
    site.settle();
    QCOMPARE(readTestFile(paths::configuration()), saved ? site.model->fileContent() : configuration + "# by hand\n");
    QCOMPARE(site.isModified(), !saved);
    site.save(saved ? rewriteText : overwriteText);
}

void FileCommandsTest::failedSaveChangesNothing()
{
    const Site site{*m_machine, *m_boxes};
    site.modify();
    const QByteArray unsaved{site.model->fileContent()};
    ModalBoxes &boxes{*m_boxes};
    std::unique_ptr<FullDisk> disk;
    boxes.expectDialog<QMessageBox>([&disk](QMessageBox *box) {
        disk = std::make_unique<FullDisk>();
        QTest::mouseClick(box->button(QMessageBox::Save), Qt::LeftButton);
    });
    boxes.expectBox(cannotWrite("File too large"), QMessageBox::Ok);
    site.pressSave();
    disk.reset();
    boxes.verify();
    QVERIFY(site.isModified());
    QCOMPARE(site.model->fileContent(), unsaved);
    QCOMPARE(readTestFile(paths::configuration()), configuration);

    // There was no write, so there is no notice of it, and the next change is still taken for the program's own, as
    // after a cancelled save.
    site.settle();
    changeOutside(site);
    site.save(rewriteText);
}

void FileCommandsTest::failedSaveKeepsChangedOutside()
{
    const Site site{*m_machine, *m_boxes};
    runOutside(paths::configuration(), R"(rm "$1"; mkdir "$1")");
    site.settle();
    site.modify();
    ModalBoxes &boxes{*m_boxes};
    boxes.expectBox(saveQuestion(overwriteText), QMessageBox::Save);
    boxes.expectBox(cannotWrite("Is a directory"), QMessageBox::Ok);
    site.pressSave();
    boxes.verify();
    QVERIFY(site.isModified());
    QVERIFY(QFileInfo{paths::configuration()}.isDir());
    runOutside(paths::configuration(), R"(rmdir "$1")");
    site.settle();
    site.save(overwriteText);
    QCOMPARE(readTestFile(paths::configuration()), site.model->fileContent());
}

void FileCommandsTest::changeWhileAFailureIsShownIsNoticed()
{
    const Site site{*m_machine, *m_boxes};
    site.modify();
    ModalBoxes &boxes{*m_boxes};
    std::unique_ptr<FullDisk> disk;
    boxes.expectDialog<QMessageBox>([&disk](QMessageBox *box) {
        disk = std::make_unique<FullDisk>();
        QTest::mouseClick(box->button(QMessageBox::Save), Qt::LeftButton);
    });
    boxes.expectDialog<QMessageBox>([&disk, &site](QMessageBox *box) {
        disk.reset();
        QCOMPARE(box->text(), cannotWrite("").text);
        changeOutside(site); // taken for the program's own
        changeOutside(site);
        QTest::mouseClick(box->button(QMessageBox::Ok), Qt::LeftButton);
    });
    site.pressSave();
    boxes.verify();
    site.save(overwriteText);
}

void FileCommandsTest::noticeOfTheReplacedVersionIsDropped()
{
    const Site site{*m_machine, *m_boxes};
    site.modify();
    ModalBoxes &boxes{*m_boxes};
    boxes.expectDialog<QMessageBox>([&site](QMessageBox *box) {
        // Saved as soon as the system tells of the change, before that becomes a notice.
        QSignalSpy told{watcherOf(*site.window, paths::configuration()), &QFileSystemWatcher::fileChanged};
        writeTestFile(paths::configuration(), "# by hand\n");
        QVERIFY(told.wait());
        QTest::mouseClick(box->button(QMessageBox::Save), Qt::LeftButton);
    });
    boxes.expectBox(saveQuestion(overwriteText), QMessageBox::Save);
    site.pressSave();
    boxes.verify();
    site.settle();
    site.save(rewriteText);
}

void FileCommandsTest::changeRightAfterTheWriteIsNoticed()
{
    const Site site{*m_machine, *m_boxes};
    const QByteArray others{"group others {\n}\ngroup more {\n}\n"};
    afterRename = [&others] { writeTestFile(paths::configuration(), others); };
    site.save(rewriteText);
    QVERIFY(!afterRename);
    site.settle();
    QCOMPARE(readTestFile(paths::configuration()), others);
    QVERIFY(site.model->fileContent().contains("group others"));
    site.save(overwriteText);
    site.save(rewriteText);
}

void FileCommandsTest::nothingIsSavedFromNothing_data()
{
    QTest::addColumn<bool>("missingAtStart");
    QTest::addRow("missing at the start") << true;
    QTest::addRow("missing at a reload") << false;
}

void FileCommandsTest::nothingIsSavedFromNothing()
{
    QFETCH(bool, missingAtStart);
    ModalBoxes &boxes{*m_boxes};
    const auto remove = [&boxes] {
        QVERIFY(QFile::remove(paths::configuration()));
        boxes.expectBox(cannotRead(), QMessageBox::Ok);
    };
    if (missingAtStart)
        remove();
    const Site site{*m_machine, *m_boxes};
    if (!missingAtStart) {
        boxes.expectBox(reloadQuestion(), QMessageBox::Yes);
        remove();
        site.pressReload();
    }
    boxes.verify();
    QCOMPARE(site.model->rowCount(), 0);

    // No command adds anything, or opens a dialog that could.
    for (QAction *action : site.window->findChildren<QAction *>(QRegularExpression{QStringLiteral("^aAdd")})) {
        action->setEnabled(true);
        action->trigger();
    }
    QCOMPARE(site.model->rowCount(), 0);

    writeTestFile(paths::configuration(), configuration); // somebody puts it back
    site.settle();
    boxes.expectBox(saveQuestion(overwriteText), QMessageBox::Save);
    boxes.expectBox(cannotWrite(nothingToSave), QMessageBox::Ok);
    site.window->save();
    boxes.verify();
    QCOMPARE(readTestFile(paths::configuration()), configuration);
}

void FileCommandsTest::bytesSurvive_data()
{
    QTest::addColumn<QByteArray>("statement");
    QTest::addRow("ASCII") << QByteArray{"option domain-name \"b\\374ro.example.org\";\n"};
    QTest::addRow("UTF-8") << QByteArray{"option domain-name \"b\xC3\xBCro.example.org\";\n"};
    QTest::addRow("Latin-1") << QByteArray{"option domain-name \"b\xFCro.example.org\";\n"};
    QTest::addRow("mixed") << QByteArray{"option domain-name \"b\xFCro b\xC3\xBCro \x80\x9F.example.org\";\n"};
}

void FileCommandsTest::bytesSurvive()
{
    QFETCH(QByteArray, statement);
    writeTestFile(paths::configuration(), statement + configuration);
    const Site site{*m_machine, *m_boxes};
    for (int round{0}; round < 2; ++round) {
        site.save(rewriteText);
        const QByteArray saved{readTestFile(paths::configuration())};
        QVERIFY2(saved.contains(statement), saved.constData());
    }
}

void FileCommandsTest::reloadReadsTheFile()
{
    const Site site{*m_machine, *m_boxes};
    site.modify();
    writeTestFile(paths::configuration(), "group {\n    host a {\n    }\n}\n");
    site.tree->collapseAll();
    ModalBoxes &boxes{*m_boxes};
    boxes.expectBox(reloadQuestion(), QMessageBox::Yes);
    site.pressReload();
    boxes.verify();
    QVERIFY(!site.isModified());
    QCOMPARE(site.model->rowCount(site.network()), 1);
    QCOMPARE(site.tree->currentIndex(), site.network());
    QVERIFY(site.tree->isExpanded(site.network()));
    QVERIFY(site.tree->isExpanded(site.model->index(0, 0, site.network())));
}

void FileCommandsTest::reloadCanBeDeclined()
{
    for (const auto answer : {Qt::Key_Escape, Qt::Key_N}) {
        const Site site{*m_machine, *m_boxes};
        site.modify();
        const QByteArray unsaved{site.model->fileContent()};
        ModalBoxes &boxes{*m_boxes};
        if (answer == Qt::Key_Escape)
            boxes.expectBox(reloadQuestion(), answer);
        else
            boxes.expectBox(reloadQuestion(), QMessageBox::No);
        site.pressReload();
        boxes.verify();
        QVERIFY(site.isModified());
        QCOMPARE(site.model->fileContent(), unsaved);
    }
}

void FileCommandsTest::reloadKeepsChangedOutside()
{
    const Site site{*m_machine, *m_boxes};
    changeOutside(site);
    ModalBoxes &boxes{*m_boxes};
    boxes.expectBox(reloadQuestion(), QMessageBox::Yes);
    site.pressReload();
    boxes.verify();
    site.settle();
    site.modify();
    boxes.expectBox(withLoss(saveQuestion(overwriteText), commentLoss), QMessageBox::Save);
    site.pressSave();
    boxes.verify();
    site.save(rewriteText);
}

void FileCommandsTest::reloadOfLeasesAsksNothing()
{
    // A directory that is not there at the start is not watched.
    QVERIFY(QDir{paths::leaseDirectory()}.removeRecursively());
    const Site site{*m_machine, *m_boxes};
    clickTab(*site.window, 1);
    QVERIFY(QDir{}.mkpath(paths::leaseDirectory()));
    writeTestFile(paths::leases(), "lease 10.0.0.10 {\n}\n");
    const auto *leases = site.window->findChild<QTableView *>(QStringLiteral("dhcpdLeaseTable"))->model();
    QCOMPARE(leases->rowCount(), 0);
    site.pressReload();
    QCOMPARE(leases->rowCount(), 1);
}

void FileCommandsTest::busyCursorShowsWhileMuchIsLoaded_data()
{
    QTest::addColumn<int>("size");
    QTest::addColumn<bool>("busy");
    QTest::addRow("small") << 1'000 << false;
    QTest::addRow("large") << 5'000'000 << true;
}

void FileCommandsTest::busyCursorShowsWhileMuchIsLoaded()
{
    QFETCH(int, size);
    QFETCH(bool, busy);
    writeTestFile(paths::configuration(), configuration + '#' + QByteArray(size, 'x') + '\n');
    const Site site{*m_machine, *m_boxes};
    bool wasBusy{false};
    connect(site.model, &DhcpdConfigModel::dataChanged, this, [&wasBusy] { wasBusy = isCursorBusy(); });
    ModalBoxes &boxes{*m_boxes};
    boxes.expectBox(reloadQuestion(), QMessageBox::Yes);
    site.pressReload();
    boxes.verify();
    QCOMPARE(wasBusy, busy);
    QVERIFY(!QGuiApplication::overrideCursor());
}

void FileCommandsTest::busyCursorShowsWhileMuchIsSaved()
{
    QFETCH(int, size);
    QFETCH(bool, busy);
    writeTestFile(paths::configuration(), configuration + '#' + QByteArray(size, 'x') + '\n');
    const Site site{*m_machine, *m_boxes};
    site.modify();
    const FullDisk full; // so that a message comes up while the file is being written
    bool wasBusy{false};
    connect(site.model, &DhcpdConfigModel::error, this, [&wasBusy] { wasBusy = isCursorBusy(); });
    ModalBoxes &boxes{*m_boxes};
    boxes.expectBox(withLoss(saveQuestion(), commentLoss), QMessageBox::Save);
    boxes.expectDialog<QMessageBox>([](QMessageBox *box) {
        QCOMPARE(box->text(), cannotWrite("").text);
        QVERIFY(!isCursorBusy());
        QTest::mouseClick(box->button(QMessageBox::Ok), Qt::LeftButton);
    });
    site.pressSave();
    boxes.verify();
    QCOMPARE(wasBusy, busy);
    QVERIFY(!QGuiApplication::overrideCursor());
}

void FileCommandsTest::refusedLoadIsToldWithoutTheBusyCursor()
{
    const Site site{*m_machine, *m_boxes};
    writeTestFile(paths::configuration(), QByteArray{"group {\n"}.repeated(600'000)); // nested too deep
    ModalBoxes &boxes{*m_boxes};
    boxes.expectBox(reloadQuestion(), QMessageBox::Yes);
    boxes.expectDialog<QMessageBox>([](QMessageBox *box) {
        QCOMPARE(box->text(), cannotRead().text);
        QCOMPARE(QGuiApplication::overrideCursor()->shape(), Qt::ArrowCursor);
        QTest::mouseClick(box->button(QMessageBox::Ok), Qt::LeftButton);
    });
    site.pressReload();
    boxes.verify();
    QVERIFY(!QGuiApplication::overrideCursor());
}

void FileCommandsTest::closing_data()
{
    QTest::addColumn<bool>("modified");
    QTest::addColumn<QVector<int>>("answers"); // to each question in turn
    QTest::addColumn<bool>("closed");
    QTest::addColumn<bool>("saved");
    QTest::addRow("nothing unsaved") << false << QVector<int>{} << true << false;
    QTest::addRow("yes, save") << true << QVector<int>{QMessageBox::Yes, QMessageBox::Save} << true << true;
    QTest::addRow("yes, cancel") << true << QVector<int>{QMessageBox::Yes, QMessageBox::Cancel} << true << false;
    QTest::addRow("no") << true << QVector<int>{QMessageBox::No} << true << false;
    QTest::addRow("cancel") << true << QVector<int>{QMessageBox::Cancel} << false << false;
    QTest::addRow("box closed") << true << QVector<int>{QMessageBox::NoButton} << false << false;
}

void FileCommandsTest::closing()
{
    QFETCH(bool, modified);
    QFETCH(QVector<int>, answers);
    QFETCH(bool, closed);
    QFETCH(bool, saved);
    const Site site{*m_machine, *m_boxes};
    if (modified)
        site.modify();

    ModalBoxes &boxes{*m_boxes};
    QStringList texts;
    for (const int answer : answers) {
        boxes.expectDialog<QMessageBox>([&texts, answer](QMessageBox *box) {
            texts.append(box->text());
            if (answer == QMessageBox::NoButton)
                box->close();
            else
                QTest::mouseClick(box->button(static_cast<QMessageBox::StandardButton>(answer)), Qt::LeftButton);
        });
    }
    site.action("aExit")->trigger();
    boxes.verify();
    QCOMPARE(texts,
             (QStringList{QStringLiteral("There are unsaved changes, save?"), rewriteText}).mid(0, answers.size()));
    QCOMPARE(!site.window->isVisible(), closed);
    QCOMPARE(readTestFile(paths::configuration()) != configuration, saved);
    QCOMPARE(backups().size(), saved ? 1 : 0);
}

void FileCommandsTest::closingQuestionHasNoDefault()
{
    const Site site{*m_machine, *m_boxes};
    site.modify();
    ModalBoxes &boxes{*m_boxes};
    boxes.expectDialog<QMessageBox>([](QMessageBox *box) {
        QCOMPARE(box->icon(), QMessageBox::Question);
        QCOMPARE(box->windowTitle(), QStringLiteral("Confirmation"));
        QCOMPARE(box->standardButtons(), QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel);
        QVERIFY(!box->defaultButton());
        QTest::keyClick(box, Qt::Key_Escape);
    });
    site.window->close();
    boxes.verify();
    QVERIFY(site.window->isVisible());
}

void FileCommandsTest::unwrittenConfigurationIsKept()
{
    const Site site{*m_machine, *m_boxes};
    runOutside(paths::configuration(), R"(rm "$1"; mkdir "$1")");
    site.settle();
    site.modify();
    const QByteArray unsaved{site.model->fileContent()};
    closeAlthoughNothingCanBeSaved(site, *m_boxes, "Is a directory");
    QCOMPARE(backups(), QList<QByteArray>{unsaved});
}

void FileCommandsTest::nothingIsKeptOfNothing()
{
    const Site site{*m_machine, *m_boxes};
    ModalBoxes &boxes{*m_boxes};
    QVERIFY(QFile::remove(paths::configuration()));
    boxes.expectBox(reloadQuestion(), QMessageBox::Yes);
    boxes.expectBox(cannotRead(), QMessageBox::Ok);
    site.pressReload();
    boxes.verify();
    QVERIFY(site.isModified());
    site.settle();
    closeAlthoughNothingCanBeSaved(site, boxes, nothingToSave);
    QCOMPARE(backups(), QList<QByteArray>{});
    QVERIFY(!QFile::exists(paths::configuration()));
}

void FileCommandsTest::servedInterfaces_data()
{
    QTest::addColumn<bool>("changed");
    QTest::addColumn<bool>("accepted");
    QTest::addColumn<bool>("saved");
    QTest::addRow("cancelled") << true << false << false;
    QTest::addRow("accepted, not saved") << true << true << false;
    QTest::addRow("saved") << true << true << true;
    QTest::addRow("saved without a change") << false << true << true;
}

void FileCommandsTest::servedInterfaces()
{
    QFETCH(bool, changed);
    QFETCH(bool, accepted);
    QFETCH(bool, saved);
    // Names that sort behind those of any machine: only the very last is written without a space behind it.
    const QByteArray before{"# kept\nINTERFACESv4=\"zz7 zz8\"  \nINTERFACESv6=\"\""};
    const QByteArray after{"# kept\nINTERFACESv4=\"zz8\"\nINTERFACESv6=\"\""};
    writeTestFile(paths::serverDefaults(), before);
    const Site site{*m_machine, *m_boxes};

    ModalBoxes &boxes{*m_boxes};
    boxes.expectDialog<InterfacesDialog>([&site, changed, accepted](InterfacesDialog *dialog) {
        QCOMPARE(dialog->windowTitle(), QStringLiteral("Select interfaces"));
        QCOMPARE(dialog->parent(), site.window.get());
        for (QCheckBox *box : dialog->findChildren<QCheckBox *>()) {
            QCOMPARE(box->isChecked(), box->text().startsWith(QStringLiteral("zz")));
            if (changed && box->text() == QStringLiteral("zz7"))
                QTest::keyClick(box, Qt::Key_Space);
        }
        auto *buttons = dialog->findChild<QDialogButtonBox *>();
        QTest::mouseClick(buttons->button(accepted ? QDialogButtonBox::Save : QDialogButtonBox::Cancel),
                          Qt::LeftButton);
    });
    if (accepted)
        boxes.expectBox(saveQuestion(), saved ? QMessageBox::Save : QMessageBox::Cancel);
    site.action("actionInterfaces")->trigger();
    boxes.verify();
    QCOMPARE(readTestFile(paths::serverDefaults()), changed && saved ? after : before);
}

void FileCommandsTest::defaultsFileIsReadAgain()
{
    writeTestFile(paths::serverDefaults(), "INTERFACESv4=\"zz7\"\n");
    const Site site{*m_machine, *m_boxes};
    writeTestFile(paths::serverDefaults(), "INTERFACESv4=\"zz9\"\n");
    ModalBoxes &boxes{*m_boxes};
    QStringList checked;
    boxes.expectDialog<InterfacesDialog>([&checked](InterfacesDialog *dialog) {
        for (const QCheckBox *box : dialog->findChildren<QCheckBox *>()) {
            if (box->isChecked())
                checked.append(box->text());
        }
        QTest::keyClick(dialog, Qt::Key_Escape);
    });
    site.action("actionInterfaces")->trigger();
    boxes.verify();
    QCOMPARE(checked, QStringList{QStringLiteral("zz9")});
}

namespace {

const QByteArray banner{"Internet Systems Consortium DHCP Server 4.4.3-P1\n"
                        "For info, please visit https://www.isc.org/software/dhcp/\n"};

/// The script of a DHCP server that leaves its process id and the text that it was given, prints `output`, in which
/// "$3" is the path of that text, and ends with `commands`.
QByteArray server(const QByteArray &output, const QByteArray &end)
{
    return "here=${0%/*}\n"
           "printf '%s ' \"$1\" \"$2\" >\"$here/arguments\"\n"
           "cat \"$3\" >\"$here/candidate\"\n"
           "cat <<END\n" +
           output +
           "END\n"
           "echo $$ >\"$here/process.new\"; mv \"$here/process.new\" \"$here/process\"\n" +
           end + "\n";
}

constexpr int verdictMilliseconds{120'000}; // how long a test waits at most for the real server's

/// Whether the server that was asked has ended; false before it was asked.
bool hasEnded(const TestMachine &machine)
{
    QFile file{machine.programs().file(QStringLiteral("process"))};
    if (!file.open(QIODevice::ReadOnly))
        return false;
    return kill(file.readAll().trimmed().toInt(), 0) != 0;
}

} // namespace

void FileCommandsTest::verdictOfTheServer_data()
{
    QTest::addColumn<QByteArray>("output");
    QTest::addColumn<QByteArray>("end");
    QTest::addColumn<QString>("complaint"); // null: none
    QTest::addRow("accepted") << banner << QByteArray{"exit 0"} << QString{};
    QTest::addRow("accepted with a warning") << banner + "WARNING: no subnet\n" << QByteArray{"exit 0"} << QString{};
    QTest::addRow("refused") << banner + "WARNING: old\n$3 line 3: semicolon expected.\n  x\n  ^\n$3 line 9: bad.\n"
                             << QByteArray{"exit 1"} << QStringLiteral("line 3: semicolon expected.");
    QTest::addRow("refused without a line")
        << banner + "No subnet declaration for lan0.\nexiting.\n"
        << QByteArray{"exit 1"} << QStringLiteral("No subnet declaration for lan0.");
    QTest::addRow("refused without a word") << QByteArray{} << QByteArray{"exit 1"} << QString{};
    QTest::addRow("text out of reach") << banner + "Can't open $3: Permission denied\n"
                                       << QByteArray{"exit 1"} << QString{};
    QTest::addRow("dies") << banner + "$3 line 3: semicolon expected.\n" << QByteArray{"kill -SEGV $$"} << QString{};
}

void FileCommandsTest::verdictOfTheServer()
{
    QFETCH(QByteArray, output);
    QFETCH(QByteArray, end);
    QFETCH(QString, complaint);
    m_machine->programs().install(QStringLiteral("dhcpd"), server(output, end));
    const Site site{*m_machine, *m_boxes};
    site.modify();

    ModalBoxes &boxes{*m_boxes};
    boxes.expectDialog<QMessageBox>([&](QMessageBox *box) {
        QTRY_VERIFY(hasEnded(*m_machine));
        if (complaint.isNull()) {
            QCOMPARE(box->informativeText(), QString{});
            QCOMPARE(box->detailedText(), QString{});
        } else {
            QTRY_COMPARE(box->informativeText(),
                         QStringLiteral("The DHCP server refuses this configuration:\n") + complaint);
            // Everything that the server said, with the path that it was given.
            const QString detail{box->detailedText()};
            const QString said{QString::fromLatin1(output)};
            QVERIFY(QRegularExpression{QRegularExpression::anchoredPattern(QRegularExpression::escape(said).replace(
                                           QStringLiteral("\\$3"), QStringLiteral("/proc/self/fd/[0-9]+")))}
                        .match(detail)
                        .hasMatch());
        }
        QCOMPARE(box->icon(), QMessageBox::Information);
        QCOMPARE(box->windowTitle(), QStringLiteral("Information"));
        QCOMPARE(box->text(), rewriteText);
        QCOMPARE(box->standardButtons(), QMessageBox::Save | QMessageBox::Cancel);
        QCOMPARE(box->defaultButton(), box->button(QMessageBox::Save));
        QTest::mouseClick(box->button(QMessageBox::Save), Qt::LeftButton);
    });
    site.pressSave();
    boxes.verify();
    // The user decides, whatever the server says.
    QVERIFY(!site.isModified());
    QCOMPARE(readTestFile(paths::configuration()), site.model->fileContent());
}

void FileCommandsTest::serverSeesWhatIsWritten()
{
    writeTestFile(paths::configuration(), "option domain-name \"b\xFCro.example.org\";\n" + configuration);
    m_machine->programs().install(QStringLiteral("dhcpd"), server({}, "exit 0"));
    const Site site{*m_machine, *m_boxes};
    site.modify();
    ModalBoxes &boxes{*m_boxes};
    boxes.expectDialog<QMessageBox>([&](QMessageBox *box) {
        QTRY_VERIFY(hasEnded(*m_machine));
        QTest::mouseClick(box->button(QMessageBox::Save), Qt::LeftButton);
    });
    site.pressSave();
    boxes.verify();
    QCOMPARE(readTestFile(m_machine->programs().file(QStringLiteral("arguments"))), QByteArray{"-t -cf "});
    QCOMPARE(readTestFile(m_machine->programs().file(QStringLiteral("candidate"))),
             readTestFile(paths::configuration()));
}

void FileCommandsTest::answerEndsTheCheck()
{
    m_machine->programs().install(QStringLiteral("dhcpd"), server("$3 line 1: late.\n", "exec sleep 60"));
    const Site site{*m_machine, *m_boxes};
    site.modify();
    ModalBoxes &boxes{*m_boxes};
    boxes.expectDialog<QMessageBox>([&](QMessageBox *box) {
        QTRY_VERIFY(QFile::exists(m_machine->programs().file(QStringLiteral("process"))));
        QVERIFY(!hasEnded(*m_machine));
        QCOMPARE(box->informativeText(), QString{});
        QTest::mouseClick(box->button(QMessageBox::Save), Qt::LeftButton);
    });
    site.pressSave();
    boxes.verify();
    QVERIFY(!site.isModified());
    QTRY_VERIFY(hasEnded(*m_machine));
}

void FileCommandsTest::missingServerSaysNothing()
{
    if (QFile::exists(QStringLiteral("/usr/sbin/dhcpd")))
        QSKIP("a DHCP server is installed in /usr/sbin, where it is always found");
    const Site site{*m_machine, *m_boxes};
    const QByteArray path{qgetenv("PATH")};
    qputenv("PATH", QFile::encodeName(QFileInfo{paths::configurationDirectory()}.absolutePath()));
    site.cancelSave(rewriteText);
    qputenv("PATH", path);
}

void FileCommandsTest::verdictOfTheRealServer_data()
{
    QTest::addColumn<QByteArray>("statement");
    QTest::addColumn<int>("hosts");
    QTest::addColumn<bool>("accepted");
    QTest::addRow("accepted") << QByteArray{"min-lease-time 60;\n"} << 0 << true;
    QTest::addRow("refused") << QByteArray{"no-such-statement 5;\n"} << 0 << false;
    QTest::addRow("accepted, a campus") << QByteArray{"min-lease-time 60;\n"} << 100'000 << true;
    QTest::addRow("refused, a campus") << QByteArray{"no-such-statement 5;\n"} << 100'000 << false;
}

void FileCommandsTest::verdictOfTheRealServer()
{
    QFETCH(QByteArray, statement);
    QFETCH(int, hosts);
    QFETCH(bool, accepted);
    if (m_dhcpd.isEmpty())
        QSKIP("no DHCP server found (in ORV_TOOLS_DIR, PATH or /usr/sbin)");
    m_machine->programs().install(QStringLiteral("dhcpd"), "\"" + QFile::encodeName(m_dhcpd) +
                                                               "\" \"$@\"\nstatus=$?\n"
                                                               "echo $$ >\"${0%/*}/process\"\nexit $status\n");
    QByteArray text{statement + configuration};
    for (int host{0}; host < hosts; ++host)
        text += "host campus-" + QByteArray::number(host) + " {\n}\n";
    writeTestFile(paths::configuration(), text);
    const Site site{*m_machine, *m_boxes};
    site.modify();
    const QString complaint{complaintOf(m_dhcpd, site.model->fileContent())};
    QCOMPARE(complaint.isEmpty(), accepted);

    ModalBoxes &boxes{*m_boxes};
    boxes.expectDialog<QMessageBox>([&](QMessageBox *box) {
        QTRY_VERIFY_WITH_TIMEOUT(hasEnded(*m_machine), verdictMilliseconds);
        if (complaint.isEmpty()) {
            QCOMPARE(box->informativeText(), QString{});
        } else {
            QTRY_COMPARE(box->informativeText(),
                         QStringLiteral("The DHCP server refuses this configuration:\n") + complaint);
            QVERIFY(box->detailedText().contains(QStringLiteral("Internet Systems Consortium DHCP Server")));
        }
        QTest::mouseClick(box->button(QMessageBox::Cancel), Qt::LeftButton);
    });
    site.pressSave();
    boxes.verify();
}

QTEST_MAIN(FileCommandsTest)
#include "tst_filecommands.moc"
