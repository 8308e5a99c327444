// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leaseparser.h"
#include "leases/leasetable.h"
#include "tests/leases/irregularleases.h"
#include "tests/leases/referencereader.h"
#include "tests/support/text.h"

#include <QRandomGenerator>
#include <QTest>

#include <algorithm>

namespace {

/// A row of an address with the values given by their columns, the others empty.
QStringList row(const QString &address, const QMap<int, QString> &values = {})
{
    QStringList texts{address, {}, {}, {}, {}, {}};
    for (auto value = values.cbegin(); value != values.cend(); ++value)
        texts[value.key()] = *value;
    return texts;
}

enum Column
{
    Mac = 1,
    Host,
    State,
    Start,
    End
};

} // namespace

class LeaseParserTest final : public QObject
{
    Q_OBJECT

private slots:
    void readsWholeFiles_data();
    void readsWholeFiles();
    void readsALineOfABlock_data();
    void readsALineOfABlock();
    void readsTheAddress_data();
    void readsTheAddress();
    void agreesWithTheReference();
    void readsTheSameInPieces();
    void readsTheSameCutAnywhere();
    void continuesAfterTheEnd();
    void finishesOnceUntilMoreIsFed();
    void readsVeryLongTexts();
    void sortsInBetweenWithoutLoss();
};

void LeaseParserTest::readsWholeFiles_data()
{
    QTest::addColumn<QByteArray>("file");
    QTest::addColumn<LeaseRows>("rows");

    QTest::addRow("empty") << QByteArray{} << LeaseRows{};
    QTest::addRow("no block") << QByteArray{"# comment\nserver-duid \"\\000\";\n"} << LeaseRows{};
    QTest::addRow("a block that does not end")
        << QByteArray{"lease 10.0.0.1 {\n  binding state free;\n"} << LeaseRows{};
    QTest::addRow("numeric order") << QByteArray{"lease 10.0.0.10 {\n}\nlease 10.0.0.9 {\n}\nlease 9.255.0.1 {\n}\n"
                                                 "lease 192.0.2.1 {\n}\n"}
                                   << LeaseRows{row(text("9.255.0.1")), row(text("10.0.0.9")), row(text("10.0.0.10")),
                                                row(text("192.0.2.1"))};
    QTest::addRow("the last block of an address")
        << QByteArray{"lease 10.0.0.1 {\n  binding state active;\n}\nlease 10.0.0.2 {\n  binding state free;\n}\n"
                      "lease 10.0.0.1 {\n  binding state backup;\n}\n"}
        << LeaseRows{row(text("10.0.0.1"), {{State, text("backup")}}), row(text("10.0.0.2"), {{State, text("free")}})};
    QTest::addRow("values of the block before")
        << QByteArray{"lease 10.0.0.1 {\n  starts 6 2026/11/21 01:05:30;\n  ends 6 2026/11/21 01:15:30;\n"
                      "  binding state active;\n  hardware ethernet 00:0c:01:02:03:04;\n  client-hostname "
                      "\"alpha\";\n}\n"
                      "lease 10.0.0.2 {\n}\n"}
        << LeaseRows{QStringList{text("10.0.0.1"), text("00:0c:01:02:03:04"), text("alpha"), text("active"),
                                 text("01:05:30 UTC 21 Nov 2026"), text("01:15:30 UTC 21 Nov 2026")},
                     QStringList{text("10.0.0.2"), text("00:0c:01:02:03:04"), text("alpha"), text("active"),
                                 text("01:05:30 UTC 21 Nov 2026"), text("01:15:30 UTC 21 Nov 2026")}};
    QTest::addRow("an invalid time replaces the one before")
        << QByteArray{"lease 10.0.0.1 {\n  ends 6 2026/11/21 01:15:30;\n}\nlease 10.0.0.2 {\n  ends never;\n}\n"}
        << LeaseRows{row(text("10.0.0.1"), {{End, text("01:15:30 UTC 21 Nov 2026")}}), row(text("10.0.0.2"))};
    QTest::addRow("blocks without an IPv4 address share a row")
        << QByteArray{"failover peer \"a\" state {\n  my state normal at 6 2012/03/17 05:38:52;\n}\n"
                      "lease 2001:db8::1 {\n}\nlease 10.0.0.1 {\n}\n"}
        << LeaseRows{row(text("2001:db8::1")), row(text("10.0.0.1"))};
    QTest::addRow("the address as it was last written")
        << QByteArray{"lease ::ffff:10.0.0.1 {\n}\nlease 10.0.0.1 {\n}\nlease 10.0.0.2 {\n}\nlease ::ffff:10.0.0.2 "
                      "{\n}\n"}
        << LeaseRows{row(text("10.0.0.1")), row(text("::ffff:10.0.0.2"))};
    QTest::addRow("an end without a block") << QByteArray{"}\n"} << LeaseRows{row({})};
    QTest::addRow("no last line feed") << QByteArray{"lease 10.0.0.1 {\n}"} << LeaseRows{row(text("10.0.0.1"))};
    QTest::addRow("carriage returns") << QByteArray{"lease 10.0.0.1 {\r\n  binding state active;\r\n}\r\n"}
                                      << LeaseRows{row(text("10.0.0.1"), {{State, text("active")}})};
    QTest::addRow("NUL bytes") << QByteArray{QByteArrayLiteral("\0\0\nlease 10.0.0.1 {\n  binding state a\0b;\n}\n\0")}
                               << LeaseRows{row(text("10.0.0.1"), {{State, QString::fromLatin1("a\0b", 3)}})};
    QTest::addRow("a quote does not carry over the line")
        << QByteArray{"lease 10.0.0.1 {\n  uid \"open\n  binding state active;\n}\n"}
        << LeaseRows{row(text("10.0.0.1"), {{State, text("active")}})};
    QTest::addRow("a client cannot invent a row")
        << QByteArray{"lease 10.0.0.1 {\n  uid \"} lease 10.0.0.9 {\";\n  client-hostname \"}\";\n}\n"}
        << LeaseRows{row(text("10.0.0.1"), {{Host, text("}")}})};
    QTest::addRow("a comment is nothing")
        << QByteArray{"# lease 10.0.0.9 {\nlease 10.0.0.1 { # }\n  # hardware ethernet 1;\n#}\n}\n"}
        << LeaseRows{row(text("10.0.0.1"))};
}

void LeaseParserTest::readsWholeFiles()
{
    QFETCH(const QByteArray, file);
    QFETCH(const LeaseRows, rows);
    QCOMPARE(parsedRows(file), rows);
    QCOMPARE(referenceRows(file), rows);
}

void LeaseParserTest::readsALineOfABlock_data()
{
    QTest::addColumn<QByteArray>("line");
    QTest::addColumn<int>("column");
    QTest::addColumn<QString>("shown");

    const auto addRow = [](int column, const char *line, const char *shown) {
        QTest::addRow("%s", line) << QByteArray{line} << column << text(shown);
    };
    addRow(Mac, "  hardware ethernet 00:0c:01:02:03:04;", "00:0c:01:02:03:04");
    addRow(Mac, "  hardware token-ring aa:bb;", "aa:bb");
    addRow(Mac, "  hardware ethernet 00:0c", "00:0");
    addRow(Mac, "  hardware ethernet", "");
    addRow(Mac, "  hardware", "");
    addRow(Mac, "hardware ethernet 00:0c:01:02:03:04;", "");
    addRow(Mac, "\thardware ethernet 00:0c:01:02:03:04;", "");
    addRow(Mac, "  hardware ethernet 1; binding state x; starts 6 2026/11/21 01:05:30;", "1");
    addRow(Mac, "  hardware ethernet caf\xc3\xa9", "caf");
    addRow(Mac, "  hardware ethernet caf\xe9", "caf");
    addRow(Mac, "  hardware ethernet caf\xc3\xa9;", "caf\xc3\xa9");
    addRow(Mac, "  hardware ethernet caf\xe9;", "caf\xc3\xa9");
    addRow(Mac, "  hardware ethernet 00:0c:01:02:03:04; \"{\"", "00:0c:01:02:03:04");
    addRow(Mac, "  hardware ethernet 00:0c:01:02:03:04; # {", "00:0c:01:02:03:04");
    addRow(Mac, "  \"hardware\" ethernet 00:0c:01:02:03:04;", "-");
    addRow(Mac, "  hard\"\"ware ethernet 00:0c:01:02:03:04;", "-");
    addRow(Mac, "  Hardware ethernet 00:0c:01:02:03:04;", "-");
    addRow(Host, R"(  client-hostname "alpha";)", "alpha");
    addRow(Host, R"(  client-hostname "";)", "");
    addRow(Host, R"(  client-hostname "with  some space";)", "with  some space");
    addRow(Host, R"(  client-hostname "a;b{c}";)", "a;b{c}");
    addRow(Host, R"(  client-hostname "hardware";)", "hardware");
    addRow(Host, R"(  client-hostname "binding state x";)", "binding state x");
    addRow(Host, R"(  client-hostname "a#b";)", "a#b");
    addRow(Host, R"(  client-hostname "a\"b c";)", R"(a\"b c)");
    addRow(Host, R"(  client-hostname "a\\";)", R"(a\\)");
    addRow(Host, R"(  client-hostname "a\\"; # ")", R"(a\\)");
    addRow(Host, R"(  client-hostname "a\303\251";)", R"(a\303\251)");
    addRow(Host, "  client-hostname \"caf\xc3\xa9\";", "caf\xc3\xa9");
    addRow(Host, "  client-hostname \"caf\xe9\";", "caf\xc3\xa9");
    addRow(Host, R"(  client-hostname "alpha" ;)", "alpha");
    addRow(Host, R"(  client-hostname "no end)", "");
    addRow(Host, R"(  client-hostname "without-end)", "without-e");
    addRow(Host, "  client-hostname bare;", "ar");
    addRow(Host, "  client-hostname b;", "");
    addRow(Host, "  client-hostname", "");
    addRow(Host, R"(client-hostname "alpha";)", "");
    addRow(State, "  binding state active;", "active");
    addRow(State, "  binding state new-one;", "new-one");
    addRow(State, "  binding state two words;", "tw");
    addRow(State, "  binding state free", "fre");
    addRow(State, "  binding state;", "");
    addRow(State, "binding state free;", "");
    addRow(State, "  next binding state free;", "-");
    addRow(State, "  rewind binding state free;", "-");
    addRow(State, "  binding state next;", "-");
    addRow(State, "  binding  state free;", "-");
    addRow(State, "  binding state free; # next", "free");
    addRow(State, "  binding state free; \"rewind\"", "free");
    addRow(Start, "  starts 6 2026/11/21 01:05:30;", "01:05:30 UTC 21 Nov 2026");
    addRow(Start, "  starts x 2026/11/21 01:05:30;", "01:05:30 UTC 21 Nov 2026");
    addRow(Start, "  starts 6 2026/11/21 01:05:30; ends 6 2026/11/22 01:05:30;", "01:05:30 UTC 21 Nov 2026");
    addRow(Start, "starts 6 2026/11/21 01:05:30;", "");
    addRow(Start, "  starts 6 2026/11/31 01:05:30;", "");
    addRow(Start, "  starts 6 2026/11/21 25:05:30;", "");
    addRow(Start, "  next binding state x; starts 6 2026/11/21 01:05:30;", "");
    addRow(Start, "  next starts 2026/11/21 01:05:30; binding state", "01:05:30 UTC 21 Nov 2026");
    addRow(End, "  ends 6 2026/11/21 01:15:30;", "01:15:30 UTC 21 Nov 2026");
    addRow(End, "  ends never;", "");
    addRow(End, "  ends 6 2026/11/21;", "");
    addRow(End, "  ends 6 2026/11/21 01:15:30", "");
    addRow(End, "  ends", "");
    addRow(End, "  next binding state ends;", "");
    addRow(End, "  ends epoch 1795223730; # Sat Nov 21 01:15:30 2026", "");
    addRow(End, "  cltt 6 2026/11/20 01:15:30;", "-");
    addRow(End, "  tstp 6 2026/11/20 01:15:30;", "-");
}

/// The line stands in the second of two blocks, of which the first has "-" or a known time in all columns: a line that
/// is ignored leaves what the block before had.
void LeaseParserTest::readsALineOfABlock()
{
    QFETCH(const QByteArray, line);
    QFETCH(const int, column);
    QFETCH(QString, shown);
    const QByteArray file{
        "lease 10.0.0.1 {\n  starts 1 2001/01/01 01:01:01;\n  ends 1 2001/01/01 01:01:01;\n"
        "  hardware ethernet -;\n  client-hostname \"-\";\n  binding state -;\n}\nlease 10.0.0.2 {\n" +
        line + "\n}\n"};
    const LeaseRows rows{parsedRows(file)};
    QCOMPARE(rows.size(), 2);
    if (shown == QLatin1String{"-"})
        shown = rows[0][column];
    QCOMPARE(rows[1][column], shown);
    QCOMPARE(rows, referenceRows(file));
}

void LeaseParserTest::readsTheAddress_data()
{
    QTest::addColumn<QByteArray>("line");
    QTest::addColumn<QString>("shown");

    const auto addRow = [](const char *line, const char *shown) {
        QTest::addRow("%s", line) << QByteArray{line} << text(shown);
    };
    addRow("lease 10.0.0.1 {", "10.0.0.1");
    addRow("lease 255.255.255.255 {", "255.255.255.255");
    addRow("lease 0.0.0.0 {", "0.0.0.0");
    addRow("lease 10.0.0.1 { binding state free; }", "10.0.0.1");
    addRow("anything 10.0.0.1 {", "10.0.0.1");
    addRow("lease 10.0.0.1{", "");
    addRow("lease {", "");
    addRow("{", "");
    addRow("lease  10.0.0.1 {", "");
    addRow("lease\t10.0.0.1 {", "");
    addRow("lease 10.0.0.1\t{", "");
    addRow("  lease 10.0.0.1 {", "");
    addRow("lease 256.0.0.1 {", "");
    addRow("lease 1000.0.0.1 {", "");
    addRow("lease 10.0.0.1. {", "");
    addRow("lease 10.0.0.1.2 {", "");
    addRow("lease 10..0.1 {", "");
    addRow("lease 010.0.0.1 {", "8.0.0.1");
    addRow("lease 10.1 {", "10.0.0.1");
    addRow("lease 10 {", "0.0.0.10");
    addRow("lease 2001:db8::1 {", "2001:db8::1");
    addRow("lease fe80::1%eth0 {", "fe80::1%eth0");
    addRow("lease ::ffff:10.0.0.1 {", "::ffff:10.0.0.1");
    addRow("failover peer \"dhcp\" state {", "");
    addRow("host ten.example.com {", "");
}

void LeaseParserTest::readsTheAddress()
{
    QFETCH(const QByteArray, line);
    QFETCH(const QString, shown);
    const LeaseRows rows{parsedRows(line + "\n}\n")};
    QCOMPARE(rows, LeaseRows{row(shown)});
    QCOMPARE(rows, referenceRows(line + "\n}\n"));
}

void LeaseParserTest::agreesWithTheReference()
{
    QRandomGenerator random{20'261'121};
    for (int i{0}; i < 6000; ++i) {
        const QByteArray file{irregularLeaseFile(random)};
        const LeaseRows rows{parsedRows(file)};
        QVERIFY2(rows == referenceRows(file), file.constData());
    }
}

void LeaseParserTest::readsTheSameInPieces()
{
    QRandomGenerator random{1};
    for (int i{0}; i < 8; ++i) {
        const QByteArray file{irregularLeaseFile(random)};
        const LeaseRows whole{parsedRows(file)};
        QVector<int> everywhere;
        for (int place{0}; place <= file.size(); ++place) {
            QVERIFY2(parsedRows(file, {place}) == whole, qPrintable(QString::number(place)));
            everywhere.append(place);
        }
        QCOMPARE(parsedRows(file, everywhere), whole);
    }
}

void LeaseParserTest::readsTheSameCutAnywhere()
{
    QRandomGenerator random{2};
    for (int i{0}; i < 8; ++i) {
        const QByteArray file{irregularLeaseFile(random)};
        for (int size{0}; size <= file.size(); ++size)
            QVERIFY2(parsedRows(file.left(size)) == referenceRows(file.left(size)), file.left(size).constData());
    }
}

void LeaseParserTest::continuesAfterTheEnd()
{
    QRandomGenerator random{3};
    int continued{0};
    for (int i{0}; i < 200; ++i) {
        const QByteArray file{irregularLeaseFile(random)};
        const QByteArray::size_type size{random.bounded(file.size() + 1)};
        LeaseTable table;
        LeaseParser parser{table};
        parser.feed({file.constData(), static_cast<std::size_t>(size)});
        parser.finish();
        table.settleAll();
        QCOMPARE(rowsOf(table), referenceRows(file.left(size)));
        if (!parser.canContinue())
            continue;
        ++continued;
        parser.feed({file.constData() + size, static_cast<std::size_t>(file.size() - size)});
        parser.finish();
        table.settleAll();
        QVERIFY2(rowsOf(table) == referenceRows(file), file.constData());
    }
    QVERIFY(continued > 100);
}

/// The line that is cut sets the end of the lease; as a whole it sets the state instead.
void LeaseParserTest::finishesOnceUntilMoreIsFed()
{
    const QByteArray first{"lease 10.0.0.1 {\n  ends 6 2026/11/21 01:15:30;\n}\nlease 10.0.0.2 {\n"};
    const QByteArray cut{"  ends 6 2026/11/22 01:15:30;"};
    const QByteArray rest{" binding state\n}\n"};
    LeaseTable table;
    LeaseParser parser{table};
    const auto feed = [&parser](const QByteArray &text) {
        parser.feed({text.constData(), static_cast<std::size_t>(text.size())});
    };
    feed(first + cut);
    parser.finish();
    parser.finish();
    QVERIFY(parser.canContinue());
    feed(rest);
    parser.finish();
    table.settleAll();
    QCOMPARE(rowsOf(table), referenceRows(first + cut + rest));

    // A block that such a line ends is taken once.
    parser.clear();
    feed("}");
    parser.finish();
    parser.finish();
    QVERIFY(!parser.canContinue());
    QCOMPARE(table.size(), 0);
    table.settleAll();
    QCOMPARE(table.size(), 1);
}

void LeaseParserTest::readsVeryLongTexts()
{
    for (const int size : {254, 255, 256, 70'000}) {
        const QByteArray name(size, 'x');
        const QByteArray file{"lease 10.0.0.1 {\n  client-hostname \"" + name +
                              "\";\n}\nlease 10.0.0.2 {\n  binding state " + name + ";\n}\n"};
        const LeaseRows rows{parsedRows(file)};
        QCOMPARE(rows.size(), 2);
        QCOMPARE(rows[1][Host], QString::fromLatin1(name));
        QCOMPARE(rows[1][State], QString::fromLatin1(name));
    }
}

/// More blocks than are kept until they are sorted, of few addresses.
void LeaseParserTest::sortsInBetweenWithoutLoss()
{
    LeaseTable table;
    LeaseParser parser{table};
    QByteArray piece;
    for (int i{0}; i < 4096; ++i)
        piece += "lease 10.0.1." + QByteArray::number(i % 200) + " {\n}\n";
    for (int i{0}; i < 400; ++i) {
        parser.feed({piece.constData(), static_cast<std::size_t>(piece.size())});
        const QByteArray other{leaseBlock(i / 200, i % 200, i)};
        parser.feed({other.constData(), static_cast<std::size_t>(other.size())});
    }
    parser.finish();
    table.settleAll();
    const LeaseRows rows{rowsOf(table)};
    QCOMPARE(rows.size(), 400);
    QCOMPARE(rows[0][0], text("10.0.0.0"));
    QCOMPARE(rows[0][Host], text("host-0"));
    QCOMPARE(rows[207][0], text("10.0.1.7"));
    QCOMPARE(rows[207][Host], text("host-398")); // the name carried over from the block before
    QCOMPARE(rows[399][0], text("10.0.1.199"));
    QCOMPARE(rows[399][Host], text("host-399"));
}

QTEST_GUILESS_MAIN(LeaseParserTest)
#include "tst_leaseparser.moc"
