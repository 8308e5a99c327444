// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/handbookviewer.h"

#include "platform/orvinit.h"

#include <QDir>
#include <QFile>
#include <QImage>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QLocale>
#include <QPushButton>
#include <QRegularExpression>
#include <QScrollBar>
#include <QTest>
#include <QTextBrowser>
#include <QXmlStreamReader>

#include <memory>

namespace {

const QStringList languages{QStringLiteral("en"), QStringLiteral("de")};

QString folderOf(const QString &language) { return QStringLiteral(":/handbook/") + language; }

QStringList filesOf(const QString &language, const QString &pattern)
{
    return QDir{folderOf(language)}.entryList({pattern}, QDir::Files, QDir::Name);
}

/// The content of a file. Fails the test when it cannot be read.
QString contentOf(const QString &path)
{
    QFile file{path};
    if (!file.open(QIODevice::ReadOnly))
        QTest::qFail(qPrintable(path + QLatin1String{" cannot be read"}), __FILE__, __LINE__);
    return QString::fromUtf8(file.readAll());
}

QString pageIn(const QString &language, const QString &name)
{
    return contentOf(folderOf(language) + QLatin1Char{'/'} + name);
}

/// What the first group of `pattern` matches in `text`, line feeds in it being blanks.
QStringList matchesOf(const char *pattern, const QString &text)
{
    const QRegularExpression expression{QLatin1String{pattern}, QRegularExpression::MultilineOption |
                                                                    QRegularExpression::DotMatchesEverythingOption};
    QStringList matches;
    QRegularExpressionMatchIterator each{expression.globalMatch(text)};
    while (each.hasNext())
        matches.append(each.next().captured(1).simplified());
    return matches;
}

constexpr const char *heading{R"(^(#+) )"};
constexpr const char *code{R"(^(```.*?)^```$)"};
constexpr const char *target{R"(\]\(([^)]*)\))"}; // of a link or picture
constexpr const char *picture{R"(!\[[^\]]*\]\(([^)]*)\))"};
constexpr const char *wordsOfTheProgram{R"((?<!\*)\*([^*]+)\*(?!\*))"};

/// The text without code, in which marks mean nothing.
QString withoutCode(QString text)
{
    text.remove(QRegularExpression{QStringLiteral("^```.*?^```$"), QRegularExpression::MultilineOption |
                                                                       QRegularExpression::DotMatchesEverythingOption});
    return text.remove(QRegularExpression{QStringLiteral("`[^`]*`")});
}

/// What the program says in a language: its own texts, those of Qt's buttons that it uses, and its entry in the menu.
QStringList textsOfTheProgram(const QString &language)
{
    const bool isEnglish{language == QLatin1String{"en"}};
    QStringList texts{isEnglish ? QStringList{QStringLiteral("Cancel"), QStringLiteral("DHCP Server")}
                                : QStringList{QStringLiteral("Abbrechen"), QStringLiteral("DHCP-Server")}};
    QXmlStreamReader xml{contentOf(QStringLiteral(SOURCE_FOLDER "/translations/orv-admin-dhcp_de.ts"))};
    while (!xml.atEnd()) {
        if (xml.readNext() == QXmlStreamReader::StartElement &&
            xml.name() == (isEnglish ? QLatin1String{"source"} : QLatin1String{"translation"}))
            texts.append(xml.readElementText().remove(QLatin1Char{'&'}));
    }
    return texts;
}

} // namespace

/// The pages of the handbook, and the widget that shows them.
class HandbookTest final : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase() { orvInit("1.0", "A program"); } // which makes the pages known
    void cleanup();

    void languagesHaveTheSameFiles();
    void pagesHaveTheSameParts_data();
    void pagesHaveTheSameParts();
    void whatPagesReferToIsThere_data() { addPages(); }
    void whatPagesReferToIsThere();
    void pagesShowEveryPictureWhole_data();
    void pagesShowEveryPictureWhole();
    void commandsAreThoseOfTheProgram_data() { addPages(); }
    void commandsAreThoseOfTheProgram();

    void speaksTheUsersLanguage_data();
    void speaksTheUsersLanguage();
    void contentsLeadToThePages_data() { addPages(); }
    void contentsLeadToThePages();
    void linksAreFollowedAndLeadBackByTheKeyboard();
    void searchGoesThroughAllPages();
    void searchTellsWhatIsNotThere();
    void returnStaysInTheHandbook();

private:
    static void addPages();
    void open(const QString &locale);
    template<typename Widget>
    Widget *find() const
    {
        return m_viewer->findChild<Widget *>();
    }
    QString pageName() const { return find<QTextBrowser>()->source().fileName(); }
    void search(const QString &text);

    std::unique_ptr<HandbookViewer> m_viewer;
};

void HandbookTest::cleanup()
{
    m_viewer.reset();
    QLocale::setDefault(QLocale::c());
}

void HandbookTest::addPages()
{
    QTest::addColumn<QString>("language");
    QTest::addColumn<QString>("name");
    for (const QString &language : languages) {
        for (const QString &name : filesOf(language, QStringLiteral("*.md")))
            QTest::addRow("%s/%s", qPrintable(language), qPrintable(name)) << language << name;
    }
}

void HandbookTest::open(const QString &locale)
{
    QLocale::setDefault(QLocale{locale});
    m_viewer = std::make_unique<HandbookViewer>();
    m_viewer->resize(QSize{1080, 660} * m_viewer->logicalDpiX() / 96);
    m_viewer->show();
    m_viewer->activateWindow();
    if (!QTest::qWaitForWindowActive(m_viewer.get()))
        QTest::qFail("the window is not active", __FILE__, __LINE__);
}

void HandbookTest::search(const QString &text)
{
    auto *field = find<QLineEdit>();
    field->clear();
    QTest::keyClicks(field, text);
    QTest::keyClick(field, Qt::Key_Return);
}

void HandbookTest::languagesHaveTheSameFiles()
{
    QVERIFY(filesOf(languages.first(), QStringLiteral("*.md")).size() >= 8);
    QCOMPARE(filesOf(languages.last(), QStringLiteral("*")), filesOf(languages.first(), QStringLiteral("*")));
}

void HandbookTest::pagesHaveTheSameParts_data()
{
    QTest::addColumn<QString>("name");
    for (const QString &name : filesOf(languages.first(), QStringLiteral("*.md")))
        QTest::addRow("%s", qPrintable(name)) << name;
}

void HandbookTest::pagesHaveTheSameParts()
{
    QFETCH(QString, name);
    const QString english{pageIn(languages.first(), name)};
    const QString german{pageIn(languages.last(), name)};
    QVERIFY(english.startsWith(QLatin1String{"# "}));
    QCOMPARE(matchesOf(heading, english).count(QStringLiteral("#")), 1);
    for (const char *part : {heading, code, target})
        QCOMPARE(matchesOf(part, german), matchesOf(part, english));
}

void HandbookTest::whatPagesReferToIsThere()
{
    QFETCH(QString, language);
    QFETCH(QString, name);
    for (const QString &file : matchesOf(target, pageIn(language, name)))
        QVERIFY2(filesOf(language, QStringLiteral("*")).contains(file), qPrintable(file));
}

void HandbookTest::pagesShowEveryPictureWhole_data()
{
    QTest::addColumn<QString>("language");
    for (const QString &language : languages)
        QTest::addRow("%s", qPrintable(language)) << language;
}

void HandbookTest::pagesShowEveryPictureWhole()
{
    QFETCH(QString, language);
    open(language);
    auto *contents = find<QListWidget>();
    auto *page = find<QTextBrowser>();
    QStringList shown;
    for (int row{0}; row < contents->count(); ++row) {
        contents->setCurrentRow(row);
        for (const QString &file : matchesOf(picture, pageIn(language, pageName()))) {
            const QVariant data{page->loadResource(QTextDocument::ImageResource, QUrl{file})};
            QVERIFY2(!QImage::fromData(data.toByteArray()).isNull(), qPrintable(file));
            shown.append(file);
        }
        QTRY_VERIFY2(!page->horizontalScrollBar()->isVisible(), qPrintable(pageName() + QLatin1String{" is too wide"}));
    }
    shown.sort();
    QCOMPARE(shown, filesOf(language, QStringLiteral("*.png")));
}

void HandbookTest::commandsAreThoseOfTheProgram()
{
    QFETCH(QString, language);
    QFETCH(QString, name);
    const QStringList texts{textsOfTheProgram(language)};
    for (const QString &words : matchesOf(wordsOfTheProgram, withoutCode(pageIn(language, name))))
        QVERIFY2(texts.contains(words), qPrintable(words));
}

void HandbookTest::speaksTheUsersLanguage_data()
{
    QTest::addColumn<QString>("locale");
    QTest::addColumn<QString>("title");
    QTest::addRow("English") << QStringLiteral("en_GB") << QStringLiteral("First start");
    QTest::addRow("German") << QStringLiteral("de_DE") << QStringLiteral("Der erste Start");
    QTest::addRow("German of Austria") << QStringLiteral("de_AT") << QStringLiteral("Der erste Start");
    QTest::addRow("a language without a handbook") << QStringLiteral("fi_FI") << QStringLiteral("First start");
    QTest::addRow("no language") << QStringLiteral("C") << QStringLiteral("First start");
}

void HandbookTest::speaksTheUsersLanguage()
{
    QFETCH(QString, locale);
    QFETCH(QString, title);
    open(locale);
    QCOMPARE(find<QListWidget>()->currentItem()->text(), title);
    QVERIFY(find<QTextBrowser>()->toPlainText().startsWith(title));
    QCOMPARE(find<QTextBrowser>()->accessibleName(), title);
}

void HandbookTest::contentsLeadToThePages()
{
    QFETCH(QString, language);
    QFETCH(QString, name);
    open(language);
    const QStringList::size_type row{filesOf(language, QStringLiteral("*.md")).indexOf(name)};
    auto *contents = find<QListWidget>();
    for (QStringList::size_type i{0}; i < row; ++i)
        QTest::keyClick(contents, Qt::Key_Down);
    QCOMPARE(pageName(), name);
    const QString title{contents->currentItem()->text()};
    QVERIFY(pageIn(language, name).startsWith(QLatin1String{"# "} + title + QLatin1Char{'\n'}));
    QVERIFY(find<QTextBrowser>()->toPlainText().startsWith(title + QLatin1Char{'\n'}));
}

void HandbookTest::linksAreFollowedAndLeadBackByTheKeyboard()
{
    open(languages.first());
    auto *page = find<QTextBrowser>();
    auto *back = find<QPushButton>();
    QVERIFY(!back->isEnabled());

    page->setFocus();
    QTest::keyClick(page, Qt::Key_Tab); // to the first link
    QTest::keyClick(page, Qt::Key_Return);
    QCOMPARE(pageName(), QStringLiteral("6-saving.md"));
    QCOMPARE(find<QListWidget>()->currentRow(), 5);
    QVERIFY(back->isEnabled());

    QTest::keyClick(m_viewer.get(), Qt::Key_Left, Qt::AltModifier);
    QTRY_COMPARE(pageName(), QStringLiteral("1-first-start.md"));
    QCOMPARE(find<QListWidget>()->currentRow(), 0);
    QVERIFY(!back->isEnabled());
}

void HandbookTest::searchGoesThroughAllPages()
{
    open(languages.first());
    QTest::keyClick(m_viewer.get(), Qt::Key_F, Qt::ControlModifier);
    QTRY_VERIFY(find<QLineEdit>()->hasFocus());
    const QString text{QStringLiteral("semicolon")};
    QStringList pages;
    search(text);
    do {
        QVERIFY(!find<QLabel>()->isVisible());
        QCOMPARE(find<QTextBrowser>()->textCursor().selectedText(), text);
        pages.append(pageName());
        QTest::keyClick(find<QLineEdit>(), Qt::Key_Return);
    } while (pageName() != pages.first());
    QCOMPARE(pages, QStringList({QStringLiteral("5-dynamic-dns.md"), QStringLiteral("6-saving.md"),
                                 QStringLiteral("8-server-does-not-start.md")}));
}

void HandbookTest::searchTellsWhatIsNotThere()
{
    open(languages.first());
    search(QStringLiteral("first start"));
    QVERIFY(!find<QLabel>()->isVisible());
    search(QStringLiteral("nowhere to be found"));
    QVERIFY(find<QLabel>()->isVisible());
    QCOMPARE(find<QLabel>()->text(), QStringLiteral("Not found"));
    QCOMPARE(pageName(), QStringLiteral("1-first-start.md"));
    QTest::keyClick(find<QLineEdit>(), Qt::Key_Backspace);
    QVERIFY(!find<QLabel>()->isVisible());
}

// In a window with a default button, which Return would press.
void HandbookTest::returnStaysInTheHandbook()
{
    QWidget window;
    auto *viewer = new HandbookViewer{&window};
    window.show();
    for (QWidget *widget : {static_cast<QWidget *>(viewer->findChild<QLineEdit *>()),
                            static_cast<QWidget *>(viewer->findChild<QListWidget *>())}) {
        QKeyEvent key{QEvent::KeyPress, Qt::Key_Return, Qt::NoModifier};
        QCoreApplication::sendEvent(widget, &key);
        QVERIFY(key.isAccepted());
    }
}

QTEST_MAIN(HandbookTest)
#include "tst_handbook.moc"
