// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/fmain.h"
#include "tests/app/testmachine.h"

#include <QAction>
#include <QLibraryInfo>
#include <QLocale>
#include <QMap>
#include <QMenu>
#include <QMenuBar>
#include <QMessageBox>
#include <QPushButton>
#include <QTest>
#include <QTranslator>

#include <memory>

namespace {

/// A translation, installed for as long as it lives if it is there.
class Language final
{
public:
    Language(const QString &locale, const QString &name, const QString &folder)
        : m_installed{m_translator.load(QLocale{locale}, name, QStringLiteral("_"), folder) &&
                      QCoreApplication::installTranslator(&m_translator)}
    {
    }

    bool isInstalled() const { return m_installed; }

    /// The program's, and Qt's own.
    static std::unique_ptr<Language> program(const QString &locale)
    {
        return std::make_unique<Language>(locale, QStringLiteral("orv-admin-dhcp"), QStringLiteral(":/i18n"));
    }
    static std::unique_ptr<Language> qt(const QString &locale)
    {
        return std::make_unique<Language>(locale, QStringLiteral("qtbase"),
                                          QLibraryInfo::location(QLibraryInfo::TranslationsPath));
    }

private:
    QTranslator m_translator;
    bool m_installed;
};

QString german() { return QStringLiteral("de_DE"); }

QStringList textsOf(const QList<QAction *> &actions)
{
    QStringList texts;
    for (const QAction *action : actions)
        texts.append(action->text());
    return texts;
}

/// Fails the test when two of the actions have the same mnemonic.
void compareLetters(const QList<QAction *> &actions)
{
    QMap<QString, QString> texts;
    for (const QAction *action : actions) {
        const QString letter{QKeySequence::mnemonic(action->text()).toString()};
        if (letter.isEmpty())
            continue;
        QVERIFY2(!texts.contains(letter), qPrintable(texts.value(letter) + QLatin1String{" | "} + action->text()));
        texts.insert(letter, action->text());
    }
}

} // namespace

/// The window, and Qt's boxes, as somebody with a German desktop sees them.
class GermanInterfaceTest final : public QObject
{
    Q_OBJECT

private slots:
    void everyLetterOfAMenuIsItsOwn_data();
    void everyLetterOfAMenuIsItsOwn();
    void shortcutsAreThoseOfEnglish_data();
    void shortcutsAreThoseOfEnglish();
    void buttonsOfBoxesAreGerman();
};

void GermanInterfaceTest::everyLetterOfAMenuIsItsOwn_data()
{
    QTest::addColumn<QString>("locale");
    QTest::addColumn<QString>("titles");
    QTest::addRow("English") << QStringLiteral("en_US") << QStringLiteral("&File,Server,&Help");
    QTest::addRow("German") << german() << QStringLiteral("&Datei,Server,&Hilfe");
}

void GermanInterfaceTest::everyLetterOfAMenuIsItsOwn()
{
    QFETCH(QString, locale);
    const auto language = Language::program(locale);
    const TestMachine machine;
    const auto window = machine.openWindow();
    const QList<QAction *> menus{window->menuBar()->actions()};

    QTEST(textsOf(menus).join(QLatin1Char{','}), "titles");
    compareLetters(menus);
    for (const QMenu *menu : window->findChildren<QMenu *>())
        compareLetters(menu->actions());
}

void GermanInterfaceTest::shortcutsAreThoseOfEnglish_data()
{
    QTest::addColumn<QString>("action");
    QTest::addColumn<QKeySequence>("keys");
    QTest::addRow("reload") << QStringLiteral("aReload") << QKeySequence{Qt::Key_F5};
    QTest::addRow("save") << QStringLiteral("aSave") << QKeySequence{int{Qt::CTRL} + Qt::Key_S};
    QTest::addRow("start or stop") << QStringLiteral("actionStartStopServer")
                                   << QKeySequence{int{Qt::CTRL} + Qt::Key_R};
}

// Qt's translation calls the key "Strg".
void GermanInterfaceTest::shortcutsAreThoseOfEnglish()
{
    QFETCH(QString, action);
    const auto qt = Language::qt(german());
    const auto program = Language::program(german());
    const TestMachine machine;
    const auto window = machine.openWindow();
    QTEST(window->findChild<QAction *>(action)->shortcut(), "keys");
}

void GermanInterfaceTest::buttonsOfBoxesAreGerman()
{
    const auto qt = Language::qt(german());
    if (!qt->isInstalled())
        QSKIP("Qt's own translations are not installed (package qttranslations5-l10n)");
    const auto program = Language::program(german());
    const QMessageBox box{QMessageBox::Question, {}, {}, QMessageBox::Yes | QMessageBox::No | QMessageBox::Save};
    QCOMPARE(box.button(QMessageBox::Yes)->text(), QStringLiteral("&Ja"));
    QCOMPARE(box.button(QMessageBox::No)->text(), QStringLiteral("&Nein"));
    QCOMPARE(box.button(QMessageBox::Save)->text(), QStringLiteral("Speichern"));
}

QTEST_MAIN(GermanInterfaceTest)
#include "tst_germaninterface.moc"
