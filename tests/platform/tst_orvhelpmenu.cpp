// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/orvhelpmenu.h"

#include "platform/orvinit.h"
#include "tests/support/modalboxes.h"

#include <QAction>
#include <QDialogButtonBox>
#include <QDir>
#include <QLineEdit>
#include <QListWidget>
#include <QMainWindow>
#include <QMenuBar>
#include <QPushButton>
#include <QScreen>
#include <QTest>
#include <QTextBrowser>

#include <memory>

namespace {

/// The macros of a bundled manual page, one for each heading, paragraph, tag and emphasis.
QStringList macrosOf(const QString &language)
{
    QFile page{QStringLiteral(":/man/") + language};
    if (!page.open(QIODevice::ReadOnly))
        return {};
    QStringList macros;
    while (!page.atEnd()) {
        const QString line{QString::fromUtf8(page.readLine()).trimmed()};
        if (line.startsWith(QLatin1Char{'.'}))
            macros.append(line.section(QLatin1Char{' '}, 0, 0));
    }
    return macros;
}

} // namespace

class OrvHelpMenuTest final : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase() { orvInit("2.1.6+ci1", "Configure <DHCP> server"); }
    void init();
    void cleanup() { m_window.reset(); }

    void entries();
    void aboutTellsNameVersionDescriptionAndLicence();
    void aboutQtIsShown();
    void manualIsThePage();
    void manualIsInTheLanguageOfTheLocale_data();
    void manualIsInTheLanguageOfTheLocale();
    void everyPageHasAllOfTheEnglishOne_data();
    void everyPageHasAllOfTheEnglishOne();
    void handbookShowsItsFirstPage();
    void windowsAreOpenedOnce_data();
    void windowsAreOpenedOnce();
    void nothingOpensUnderADialog();

private:
    QAction *entry(const QString &text) const;
    QList<QDialog *> dialogs() const { return m_window->findChildren<QDialog *>(); }

    std::unique_ptr<QMainWindow> m_window;
    OrvHelpMenu *m_menu{nullptr};
};

void OrvHelpMenuTest::init()
{
    m_window = std::make_unique<QMainWindow>();
    m_menu = new OrvHelpMenu{m_window.get()};
    m_window->menuBar()->addMenu(m_menu);
    m_window->show();
}

QAction *OrvHelpMenuTest::entry(const QString &text) const
{
    for (QAction *action : m_menu->actions()) {
        if (action->text() == text)
            return action;
    }
    qFatal("no entry %s", qPrintable(text));
}

void OrvHelpMenuTest::entries()
{
    QCOMPARE(m_menu->title(), QStringLiteral("&Help"));
    QCOMPARE(m_menu->parentWidget(), m_window.get());
    QStringList texts;
    for (const QAction *action : m_menu->actions())
        texts.append(action->isSeparator() ? QStringLiteral("-") : action->text());
    QCOMPARE(texts, QStringList({QStringLiteral("Manual"), QStringLiteral("Handbook"), QStringLiteral("-"),
                                 QStringLiteral("About tst_orvhelpmenu"), QStringLiteral("About Qt")}));
}

void OrvHelpMenuTest::aboutTellsNameVersionDescriptionAndLicence()
{
    ModalBoxes boxes;
    boxes.expectDialog<QMessageBox>([this](QMessageBox *box) {
        QCOMPARE(box->windowTitle(), QStringLiteral("About tst_orvhelpmenu"));
        QCOMPARE(box->parentWidget(), m_window.get());
        for (const char *text : {"tst_orvhelpmenu", "2.1.6+ci1", "Configure &lt;DHCP&gt; server",
                                 "GNU General Public License, version 3 or later"})
            QVERIFY2(box->text().contains(QLatin1String{text}), text);
        QTest::keyClick(box, Qt::Key_Return);
    });
    entry(QStringLiteral("About tst_orvhelpmenu"))->trigger();
    boxes.verify();
}

void OrvHelpMenuTest::aboutQtIsShown()
{
    ModalBoxes boxes;
    boxes.expectDialog<QMessageBox>([this](QMessageBox *box) {
        QCOMPARE(box->windowTitle(), QStringLiteral("About Qt"));
        QCOMPARE(box->parentWidget(), m_window.get());
        QTest::keyClick(box, Qt::Key_Return);
    });
    entry(QStringLiteral("About Qt"))->trigger();
    boxes.verify();
}

void OrvHelpMenuTest::manualIsThePage()
{
    entry(QStringLiteral("Manual"))->trigger();
    QCOMPARE(dialogs().size(), 1);
    QDialog *manual{dialogs().constFirst()};
    QVERIFY(manual->isVisible());
    QCOMPARE(manual->windowTitle(), QStringLiteral("Manual"));
    const auto *browser = manual->findChild<QTextBrowser *>();
    QVERIFY(browser->isReadOnly());
    const QString text{browser->toPlainText().simplified()};
    for (const char *part :
         {"NAME orv-admin-dhcp - configure the ISC DHCP server SYNOPSIS", "The tab Topology shows the server's",
          "FILES /etc/dhcp/dhcpd.conf The server's configuration, read and written.",
          "1 Another instance was running already", "SEE ALSO dhcpd (8), dhcpd.conf (5),"})
        QVERIFY2(text.contains(QLatin1String{part}), part);
    QVERIFY2(!text.contains(QLatin1Char{'\\'}), "an escape was left");
    QVERIFY2(!text.contains(QLatin1String{" ."}), "a macro was left");

    QTest::mouseClick(manual->findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Close), Qt::LeftButton);
    QTRY_VERIFY(dialogs().isEmpty());
}

void OrvHelpMenuTest::manualIsInTheLanguageOfTheLocale_data()
{
    QTest::addColumn<QString>("beginning");
    for (const char *locale : {"C", "en_GB", "pl_PL", "pt_BR"})
        QTest::addRow("%s", locale) << QStringLiteral("NAME orv-admin-dhcp - configure the ISC DHCP server SYNOPSIS ");
    for (const char *locale : {"de_DE", "de_AT"}) {
        QTest::addRow("%s", locale) << QStringLiteral(
            "BEZEICHNUNG orv-admin-dhcp - den ISC-DHCP-Server konfigurieren ÜBERSICHT ");
    }
    for (const char *locale : {"es_ES", "es_MX"}) {
        QTest::addRow("%s", locale) << QStringLiteral(
            "NOMBRE orv-admin-dhcp - configurar el servidor DHCP de ISC SINOPSIS ");
    }
    for (const char *locale : {"fr_FR", "fr_CA"}) {
        QTest::addRow("%s", locale) << QStringLiteral(
            "NOM orv-admin-dhcp - configurer le serveur DHCP de l’ISC SYNOPSIS ");
    }
}

void OrvHelpMenuTest::manualIsInTheLanguageOfTheLocale()
{
    QFETCH(QString, beginning);
    const QLocale before;
    QLocale::setDefault(QLocale{QString::fromLatin1(QTest::currentDataTag())});
    entry(QStringLiteral("Manual"))->trigger();
    QLocale::setDefault(before);
    const QString text{dialogs().constFirst()->findChild<QTextBrowser *>()->toPlainText().simplified()};
    QVERIFY2(text.startsWith(beginning), qPrintable(text.left(beginning.size())));
    QVERIFY(text.endsWith(QLatin1String{"systemctl (1)"}));
    QVERIFY2(!text.contains(QLatin1Char{'\\'}), "an escape was left");
    QVERIFY2(!text.contains(QLatin1String{" ."}), "a macro was left");
}

void OrvHelpMenuTest::everyPageHasAllOfTheEnglishOne_data()
{
    QTest::addColumn<QString>("page");
    for (const QString &page : QDir{QStringLiteral(":/man")}.entryList())
        QTest::addRow("%s", qPrintable(page)) << page;
}

void OrvHelpMenuTest::everyPageHasAllOfTheEnglishOne()
{
    QFETCH(QString, page);
    QStringList missing{macrosOf(QStringLiteral("en"))};
    QVERIFY(!missing.isEmpty());
    for (const QString &macro : macrosOf(page)) {
        if (!missing.isEmpty() && macro == missing.constFirst())
            missing.removeFirst();
    }
    QCOMPARE(missing, QStringList{});
}

void OrvHelpMenuTest::handbookShowsItsFirstPage()
{
    entry(QStringLiteral("Handbook"))->trigger();
    QCOMPARE(dialogs().size(), 1);
    QDialog *handbook{dialogs().constFirst()};
    QVERIFY(handbook->isVisible());
    QCOMPARE(handbook->windowTitle(), QStringLiteral("Handbook"));
    const auto *page = handbook->findChild<QTextBrowser *>();
    QVERIFY(page->toPlainText().startsWith(QStringLiteral("First start\n")));
    const QSize screen{handbook->screen()->availableSize()};
    QCOMPARE(handbook->size().boundedTo(screen), handbook->size());
    QCOMPARE(handbook->focusWidget(), handbook->findChild<QListWidget *>());

    auto *search = handbook->findChild<QLineEdit *>();
    QTest::keyClicks(search, QStringLiteral("bind9"));
    QTest::keyClick(search, Qt::Key_Return);
    QVERIFY(handbook->isVisible());
    QVERIFY(page->toPlainText().startsWith(QStringLiteral("Dynamic DNS with bind9\n")));
    QTest::keyClick(search, Qt::Key_Escape);
    QTRY_VERIFY(dialogs().isEmpty());
}

void OrvHelpMenuTest::windowsAreOpenedOnce_data()
{
    QTest::addColumn<QString>("text");
    for (const char *text : {"Manual", "Handbook"})
        QTest::addRow("%s", text) << QString::fromLatin1(text);
}

void OrvHelpMenuTest::windowsAreOpenedOnce()
{
    QFETCH(QString, text);
    entry(text)->trigger();
    entry(text)->trigger();
    QCOMPARE(dialogs().size(), 1);
    dialogs().constFirst()->close();
    QTRY_VERIFY(dialogs().isEmpty());
    entry(text)->trigger();
    QCOMPARE(dialogs().size(), 1);
}

void OrvHelpMenuTest::nothingOpensUnderADialog()
{
    QMessageBox open{m_window.get()};
    ModalBoxes boxes; // fails the test when another one opens
    boxes.expectDialog<QMessageBox>([this](QMessageBox *box) {
        for (QAction *action : m_menu->actions())
            action->trigger();
        QCOMPARE(dialogs(), QList<QDialog *>{box});
        QTest::keyClick(box, Qt::Key_Escape);
    });
    open.exec();
    boxes.verify();
}

QTEST_MAIN(OrvHelpMenuTest)
#include "tst_orvhelpmenu.moc"
