// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/fmain.h"
#include "app/plainmessagebox.h"
#include "dialogs/domaininputdialog.h"
#include "dialogs/hostinputdialog.h"
#include "dialogs/ipinputdialog.h"
#include "dialogs/macinputdialog.h"
#include "dialogs/multipleipinputdialog.h"
#include "dialogs/rangeinputdialog.h"
#include "dialogs/sharednetworkinputdialog.h"
#include "dialogs/statementinputdialog.h"
#include "dialogs/staticrouteinputdialog.h"
#include "dialogs/subnetinputdialog.h"
#include "dialogs/timeinputdialog.h"
#include "server/interfacesdialog.h"
#include "tests/app/testmachine.h"
#include "tests/support/dialogdriver.h"
#include "tests/translations/languages.h"

#include <QtWidgets>

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

QString english() { return QStringLiteral("en_US"); }

QString german() { return QStringLiteral("de_DE"); }

QStringList englishAndTranslated() { return QStringList{english()} + translatedLanguages(); }

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

using Dialog = std::unique_ptr<QDialog>;

/// A dialog of the program and, where it has no caption of its own, the window's text that is it.
struct DialogRow
{
    const char *name;
    Dialog (*make)(const QString &caption);
    const char *caption;
};

QString windowText(const char *text) { return QCoreApplication::translate("FMain", text); }

template<typename AnyDialog>
Dialog make(const QString & /*caption*/)
{
    return std::make_unique<AnyDialog>();
}

Dialog makeAddresses(const QString &caption)
{
    auto dialog = std::make_unique<MultipleIpInputDialog>();
    dialog->setLabel(caption);
    return dialog;
}

Dialog makeStatement(const QString &caption)
{
    auto dialog = std::make_unique<StatementInputDialog>();
    dialog->setLabelText(caption);
    return dialog;
}

Dialog makeInterfaces(const QString & /*caption*/)
{
    return std::make_unique<InterfacesDialog>(QMap<QString, bool>{{QStringLiteral("lan0"), true}});
}

Dialog makeNoInterfaces(const QString & /*caption*/)
{
    return std::make_unique<InterfacesDialog>(QMap<QString, bool>{});
}

Dialog makeQuestion(const QString & /*caption*/)
{
    auto box = std::make_unique<PlainMessageBox>(
        QMessageBox::Information, windowText("Information"),
        windowText("Current configuration in file will be rewrited.\nDo you want to save changes?"),
        QMessageBox::Save | QMessageBox::Cancel, nullptr);
    box->setPlainInformativeText(windowText("The carriage returns in lines %1 will become parts of words."));
    box->setDetailedText(QStringLiteral("Details"));
    return box;
}

constexpr DialogRow dialogs[]{
    {"subnet", make<SubnetInputDialog>, ""},
    {"range", make<RangeInputDialog>, ""},
    {"address", make<IpInputDialog>, ""},
    {"gateways", makeAddresses, "Gateways:"},
    {"DNS servers", makeAddresses, "DNS servers:"},
    {"NTP servers", makeAddresses, "NTP servers:"},
    {"host", make<HostInputDialog>, ""},
    {"mac", make<MacInputDialog>, ""},
    {"domain", make<DomainInputDialog>, ""},
    {"shared network", make<SharedNetworkInputDialog>, ""},
    {"time", make<TimeInputDialog>, ""},
    {"static routes", make<StaticRouteInputDialog>, ""},
    {"declaration", makeStatement, "Declaration:"},
    {"parameter", makeStatement, "Parameter:"},
    {"interfaces", makeInterfaces, ""},
    {"no interfaces", makeNoInterfaces, ""},
    {"question", makeQuestion, ""},
};

/// Whether a header shows its titles in full.
bool hasRoom(const QHeaderView &header)
{
    for (int section{0}; section < header.count(); ++section) {
        if (header.sectionSize(section) < header.sectionSizeHint(section))
            return false;
    }
    return true;
}

/// Whether a line edit shows what it says while it is empty.
bool hasRoom(const QLineEdit &field)
{
    const int text{field.fontMetrics().horizontalAdvance(field.placeholderText())};
    return text < field.width() - field.textMargins().left() - field.textMargins().right();
}

/// Whether the texts of a widget are shown in full.
bool hasRoom(const QWidget &widget)
{
    if (const auto *header = qobject_cast<const QHeaderView *>(&widget))
        return hasRoom(*header);
    if (const auto *field = qobject_cast<const QLineEdit *>(&widget))
        return hasRoom(*field);
    if (qobject_cast<const QLineEdit *>(widget.parentWidget()))
        return true; // what is inside a line edit shows icons only
    if (const auto *label = qobject_cast<const QLabel *>(&widget); label && label->wordWrap())
        return label->height() >= label->heightForWidth(label->width());
    QSize needed;
    if (qobject_cast<const QGroupBox *>(&widget))
        needed = widget.minimumSizeHint();
    else if (qobject_cast<const QLabel *>(&widget) || qobject_cast<const QAbstractButton *>(&widget) ||
             qobject_cast<const QAbstractSpinBox *>(&widget) || qobject_cast<const QTabBar *>(&widget) ||
             qobject_cast<const QMenuBar *>(&widget))
        needed = widget.sizeHint();
    return widget.width() >= needed.width() && widget.height() >= needed.height();
}

/// Fails the test when a text in the window is cut off, by its widget or by the window.
void compareRoom(const QWidget &window)
{
    for (const QWidget *widget : window.findChildren<QWidget *>()) {
        if (!widget->isVisible() || widget->window() != &window)
            continue;
        const QString name{QLatin1String{widget->metaObject()->className()} + QLatin1Char{' '} + widget->objectName()};
        QVERIFY2(hasRoom(*widget), qPrintable(name));
        if (qobject_cast<const QLabel *>(widget) || qobject_cast<const QAbstractButton *>(widget)) {
            const QRect place{widget->mapTo(&window, QPoint{}), widget->size()};
            QVERIFY2(window.rect().contains(place), qPrintable(name));
        }
    }
}

/// The texts of a file dialog.
QStringList fileDialogTexts()
{
    QFileDialog dialog;
    dialog.setOption(QFileDialog::DontUseNativeDialog);
    QStringList texts;
    for (const QLabel *label : dialog.findChildren<QLabel *>())
        texts.append(label->text());
    for (const QPushButton *button : dialog.findChildren<QPushButton *>())
        texts.append(button->text());
    for (const QToolButton *button : dialog.findChildren<QToolButton *>())
        texts.append(button->toolTip());
    texts.removeAll(QString{});
    return texts;
}

/// The texts of the buttons with which the program's boxes and dialogs are answered, but for "OK" and "No", which other
/// languages write alike.
QStringList buttonTexts()
{
    const QMessageBox box{
        QMessageBox::Question, {}, {}, QMessageBox::Yes | QMessageBox::Save | QMessageBox::Cancel | QMessageBox::Close};
    QStringList texts;
    for (const QAbstractButton *button : box.buttons())
        texts.append(button->text());
    return texts;
}

} // namespace

Q_DECLARE_METATYPE(const DialogRow *)

/// The window, its dialogs and Qt's boxes, as somebody with a desktop in another language sees them.
class TranslatedInterfaceTest final : public QObject
{
    Q_OBJECT

private slots:
    void menusHaveTheirTitles_data();
    void menusHaveTheirTitles();
    void everyLetterOfAMenuIsItsOwn_data();
    void everyLetterOfAMenuIsItsOwn();
    void shortcutsAreThoseOfEnglish_data();
    void shortcutsAreThoseOfEnglish();
    void buttonsOfBoxesAreGerman();
    void textsOfQtAreTranslated_data();
    void textsOfQtAreTranslated();
    void everyTextOfADialogHasRoom_data();
    void everyTextOfADialogHasRoom();
    void everyTextOfTheWindowHasRoom_data();
    void everyTextOfTheWindowHasRoom();
};

void TranslatedInterfaceTest::menusHaveTheirTitles_data()
{
    QTest::addColumn<QString>("locale");
    QTest::addColumn<QString>("titles");
    QTest::addRow("English") << english() << QStringLiteral("&File,Server,&Help");
    QTest::addRow("German") << german() << QStringLiteral("&Datei,Server,&Hilfe");
}

void TranslatedInterfaceTest::menusHaveTheirTitles()
{
    QFETCH(QString, locale);
    const auto language = Language::program(locale);
    const TestMachine machine;
    const auto window = machine.openWindow();
    QTEST(textsOf(window->menuBar()->actions()).join(QLatin1Char{','}), "titles");
}

void TranslatedInterfaceTest::everyLetterOfAMenuIsItsOwn_data()
{
    QTest::addColumn<QString>("locale");
    for (const QString &locale : englishAndTranslated())
        QTest::addRow("%s", qPrintable(locale)) << locale;
}

void TranslatedInterfaceTest::everyLetterOfAMenuIsItsOwn()
{
    QFETCH(QString, locale);
    const auto language = Language::program(locale);
    const TestMachine machine;
    const auto window = machine.openWindow();
    compareLetters(window->menuBar()->actions());
    for (const QMenu *menu : window->findChildren<QMenu *>())
        compareLetters(menu->actions());
}

void TranslatedInterfaceTest::shortcutsAreThoseOfEnglish_data()
{
    QTest::addColumn<QString>("locale");
    QTest::addColumn<QString>("action");
    QTest::addColumn<QKeySequence>("keys");
    for (const QString &locale : translatedLanguages()) {
        const auto add = [&locale](const char *name, const char *action, const QKeySequence &keys) {
            QTest::addRow("%s, %s", qPrintable(locale), name) << locale << QString::fromLatin1(action) << keys;
        };
        add("reload", "aReload", Qt::Key_F5);
        add("save", "aSave", int{Qt::CTRL} + Qt::Key_S);
        add("start or stop", "actionStartStopServer", int{Qt::CTRL} + Qt::Key_R);
    }
}

// Qt's translations call the key otherwise, "Strg" in German.
void TranslatedInterfaceTest::shortcutsAreThoseOfEnglish()
{
    QFETCH(QString, locale);
    QFETCH(QString, action);
    const auto qt = Language::qt(locale);
    const auto program = Language::program(locale);
    const TestMachine machine;
    const auto window = machine.openWindow();
    QTEST(window->findChild<QAction *>(action)->shortcut(), "keys");
}

void TranslatedInterfaceTest::buttonsOfBoxesAreGerman()
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

void TranslatedInterfaceTest::textsOfQtAreTranslated_data()
{
    QTest::addColumn<QString>("locale");
    for (const QString &locale : translatedLanguages())
        QTest::addRow("%s", qPrintable(locale)) << locale;
}

void TranslatedInterfaceTest::textsOfQtAreTranslated()
{
    if (!Language::qt(german())->isInstalled())
        QSKIP("Qt's own translations are not installed (package qttranslations5-l10n)");
    QFETCH(QString, locale);
    const QStringList inEnglish{buttonTexts() + fileDialogTexts()};
    const auto qt = Language::qt(locale);
    const auto program = Language::program(locale);
    const QStringList translated{buttonTexts() + fileDialogTexts()};
    QCOMPARE(translated.size(), inEnglish.size());
    for (const QString &text : translated)
        QVERIFY2(!inEnglish.contains(text), qPrintable(text));
}

void TranslatedInterfaceTest::everyTextOfADialogHasRoom_data()
{
    QTest::addColumn<QString>("locale");
    QTest::addColumn<const DialogRow *>("row");
    for (const QString &locale : englishAndTranslated()) {
        for (const DialogRow &row : dialogs)
            QTest::addRow("%s, %s", qPrintable(locale), row.name) << locale << &row;
    }
}

void TranslatedInterfaceTest::everyTextOfADialogHasRoom()
{
    QFETCH(QString, locale);
    QFETCH(const DialogRow *, row);
    const auto qt = Language::qt(locale);
    const auto program = Language::program(locale);
    const Dialog dialog{row->make(windowText(row->caption))};
    driver::open(*dialog);
    compareRoom(*dialog);
    QVERIFY(dialog->screen()->availableSize().width() >= dialog->width());
}

void TranslatedInterfaceTest::everyTextOfTheWindowHasRoom_data() { everyLetterOfAMenuIsItsOwn_data(); }

void TranslatedInterfaceTest::everyTextOfTheWindowHasRoom()
{
    QFETCH(QString, locale);
    const auto qt = Language::qt(locale);
    const auto program = Language::program(locale);
    const TestMachine machine;
    const auto window = machine.openWindow();
    for (const int tab : {1, 0}) {
        clickTab(*window, tab);
        compareRoom(*window);
    }
    for (QMenu *menu : window->findChildren<QMenu *>()) {
        menu->popup(window->pos());
        QVERIFY(QTest::qWaitForWindowExposed(menu));
        for (QAction *action : menu->actions())
            QVERIFY2(menu->rect().contains(menu->actionGeometry(action)), qPrintable(action->text()));
        QVERIFY(menu->width() >= menu->sizeHint().width() && menu->height() >= menu->sizeHint().height());
        menu->close();
    }
}

QTEST_MAIN(TranslatedInterfaceTest)
#include "tst_translatedinterface.moc"
