// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/staticroutes.h"
#include "tests/support/text.h"

#include <QTest>

class StaticRoutesTest final : public QObject
{
    Q_OBJECT

private slots:
    void optionGoesToTheDialog_data();
    void optionGoesToTheDialog();
    void dialogGoesToTheOption_data();
    void dialogGoesToTheOption();
    void everyLengthComesBack();
    void routesAreCompared_data();
    void routesAreCompared();
};

void StaticRoutesTest::optionGoesToTheDialog_data()
{
    QTest::addColumn<QString>("value");
    QTest::addColumn<QString>("shown");
    const auto row = [](const char *name, const char *value, const char *shown) {
        QTest::addRow("%s", name) << text(value) << text(shown);
    };
    row("covered octets", "24, 192,168,1, 10,0,0,1", "255,255,255,0, 192,168,1,0, 10,0,0,1");
    row("four octets", "24, 192,168,1,0, 10,0,0,1", "255,255,255,0, 192,168,1,0, 10,0,0,1");
    row("one octet", "8, 10, 10,0,0,1", "255,0,0,0, 10,0,0,0, 10,0,0,1");
    row("length within an octet", "20, 172,16,16, 10,0,0,1", "255,255,240,0, 172,16,16,0, 10,0,0,1");
    row("default route", "0, 10,0,0,1", "0,0,0,0, 0,0,0,0, 10,0,0,1");
    row("default route in four octets", "0, 0,0,0,0, 10,0,0,1", "0,0,0,0, 0,0,0,0, 10,0,0,1");
    row("one address", "32, 10,9,8,7, 10,0,0,1", "255,255,255,255, 10,9,8,7, 10,0,0,1");
    row("two routes", "0, 10,0,0,1, 16, 10,9, 10,0,0,2", "0,0,0,0, 0,0,0,0, 10,0,0,1, 255,255,0,0, 10,9,0,0, 10,0,0,2");
    row("network that looks like a mask", "8, 255, 10,0,0,1", "255,0,0,0, 255,0,0,0, 10,0,0,1");
    row("octets alone", "24,192,168,1,10,0,0,1", "255,255,255,0, 192,168,1,0, 10,0,0,1");
    row("octets alone, with blanks", "8, 10, 10, 0, 0, 1, 0, 10, 0, 0, 2",
        "255,0,0,0, 10,0,0,0, 10,0,0,1, 0,0,0,0, 0,0,0,0, 10,0,0,2");
    for (const char *value :
         {"", "24", "33, 10,0,0,0,0, 10,0,0,1", "24, 192,168, 10,0,0,1", "24, 192,168,1,256, 10,0,0,1",
          "24, net, 10,0,0,1", "24, 192,168,1, 10,0,0", "code 121 = array of unsigned integer 8"})
        row(qPrintable(text("no routes: ") + text(value)), value, value);
}

void StaticRoutesTest::optionGoesToTheDialog()
{
    QFETCH(QString, value);
    QFETCH(QString, shown);
    QCOMPARE(staticroutes::toDialog(value), shown);
}

void StaticRoutesTest::dialogGoesToTheOption_data()
{
    QTest::addColumn<QStringList>("words");
    QTest::addColumn<QString>("value");
    const auto row = [](const char *name, const char *words, const char *value) {
        QTest::addRow("%s", name) << split(words) << text(value);
    };
    row("usual", "24|192,168,1,0|10,0,0,1", "24, 192,168,1, 10,0,0,1");
    row("bits beyond the mask", "20|172,16,31,5|10,0,0,1", "20, 172,16,16, 10,0,0,1");
    row("mask of length 0", "0,0,0,0|0,0,0,0|10,0,0,1", "0, 10,0,0,1");
    row("mask of length 32", "255,255,255,255|10,9,8,7|10,0,0,1", "32, 10,9,8,7, 10,0,0,1");
    row("network taken for a mask", "8|8|10,0,0,1", "8, 255, 10,0,0,1");
    row("network and gateway taken for masks", "2|2|3", "2, 192, 224,0,0,0");
    row("two routes", "8|10,0,0,0|10,0,0,1|16|10,9,0,0|10,0,0,2", "8, 10, 10,0,0,1, 16, 10,9, 10,0,0,2");
    row("no mask", "255,0,255,0|10,0,0,0|10,0,0,1", "255,0,255,0, 10,0,0,0, 10,0,0,1");
    row("no network", "24|10,0|10,0,0,1", "24, 10,0, 10,0,0,1");
    row("nothing", "", "");
}

void StaticRoutesTest::dialogGoesToTheOption()
{
    QFETCH(QStringList, words);
    QFETCH(QString, value);
    QCOMPARE(staticroutes::fromDialog(words).join(text(", ")), value);
}

void StaticRoutesTest::everyLengthComesBack()
{
    for (int length{0}; length <= 32; ++length) {
        const int octets{(length + 7) / 8};
        const QString network{split("203|0|113|7").mid(0, octets).join(QLatin1Char{','})};
        const QString start{octets > 0 ? QString::number(length) + text(", ") + network : QString::number(length)};
        const QString value{start + text(", 10,0,0,1")};
        const QStringList words{staticroutes::toDialog(value).split(text(", "))};
        QCOMPARE(words.size(), 3);
        QCOMPARE(words.at(1).count(QLatin1Char{','}), 3);
        const QString again{staticroutes::fromDialog(words).join(text(", "))};
        QVERIFY2(again.startsWith(QString::number(length) + text(", ")), qPrintable(again));
        QCOMPARE(again.count(QLatin1Char{','}), value.count(QLatin1Char{','}));
    }
}

void StaticRoutesTest::routesAreCompared_data()
{
    QTest::addColumn<QString>("value");
    QTest::addColumn<QString>("other");
    QTest::addColumn<bool>("same");
    QTest::addRow("spelling") << text("24, 192,168,1,0, 10,0,0,1") << text("24, 192,168,1, 10,0,0,1") << true;
    QTest::addRow("gateway") << text("24, 192,168,1, 10,0,0,1") << text("24, 192,168,1, 10,0,0,2") << false;
    QTest::addRow("length") << text("24, 192,168,1, 10,0,0,1") << text("23, 192,168,1, 10,0,0,1") << false;
    QTest::addRow("network") << text("24, 192,168,1, 10,0,0,1") << text("24, 192,168,2, 10,0,0,1") << false;
    QTest::addRow("number") << text("0, 10,0,0,1") << text("0, 10,0,0,1, 0, 10,0,0,1") << false;
    QTest::addRow("no routes") << text("24") << text("24") << false;
}

void StaticRoutesTest::routesAreCompared()
{
    QFETCH(QString, value);
    QFETCH(QString, other);
    QFETCH(bool, same);
    QCOMPARE(staticroutes::areSame(value, other), same);
}

QTEST_GUILESS_MAIN(StaticRoutesTest)
#include "tst_staticroutes.moc"
