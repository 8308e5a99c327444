// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/patterns.h"

#include <QRegularExpressionValidator>
#include <QTest>

using Pattern = const QRegularExpression &(*)();
Q_DECLARE_METATYPE(Pattern)
Q_DECLARE_METATYPE(QValidator::State)

class PatternsTest final : public QObject
{
    Q_OBJECT

private slots:
    void everyPatternIsValid();
    void validatesTexts_data();
    void validatesTexts();
    void octetIsFoundAnywhere_data();
    void octetIsFoundAnywhere();
};

void PatternsTest::everyPatternIsValid()
{
    for (const Pattern pattern : {patterns::subnet, patterns::netmask, patterns::strictAddress, patterns::looseAddress,
                                  patterns::octet, patterns::hostName, patterns::domain}) {
        QVERIFY2(pattern().isValid(), qPrintable(pattern().pattern()));
        QCOMPARE(&pattern(), &pattern());
    }
}

void PatternsTest::validatesTexts_data()
{
    QTest::addColumn<Pattern>("pattern");
    QTest::addColumn<QString>("text");
    QTest::addColumn<QValidator::State>("state");

    constexpr auto whole = QValidator::Acceptable;
    constexpr auto part = QValidator::Intermediate;
    constexpr auto wrong = QValidator::Invalid;
    const auto add = [](const char *name, Pattern pattern, const QString &text, QValidator::State state) {
        QTest::addRow("%s: %s", name, qPrintable(text.left(80))) << pattern << text << state;
    };
    struct Case
    {
        QString text;
        QValidator::State state;
    };
    const auto addAll = [&](const char *name, Pattern pattern, std::initializer_list<Case> cases) {
        for (const Case &aCase : cases)
            add(name, pattern, aCase.text, aCase.state);
    };
    const auto s = [](const char *text) { return QString::fromLatin1(text); };

    addAll("subnet", patterns::subnet,
           {{s(""), part},
            {s("1"), part},
            {s("10."), part},
            {s("10.0.0."), part},
            {s("10.0.0.0"), whole},
            {s("999.999.999.999"), whole},
            {s("10.0.0.0/"), part},
            {s("10.0.0.0/0"), whole},
            {s("10.0.0.0/8"), whole},
            {s("192.168.1.0/29"), whole},
            {s("192.168.1.0/32"), whole},
            {s("192.168.1.0/33"), wrong},
            {s("192.168.1.0/40"), wrong},
            {s("192.168.1.0/08"), wrong},
            {s("192.168.1.0/024"), wrong},
            {s("1000.0.0.0"), wrong},
            {s("10..0"), wrong},
            {s(" 10.0.0.0"), wrong},
            {s("10.0.0.0 "), wrong},
            {s("a"), wrong},
            {s("10.0.0.0.0"), wrong}});

    for (const char *octet : {"128", "192", "224", "240", "248", "252", "254"}) {
        for (const char *mask : {"%1.0.0.0", "255.%1.0.0", "255.255.%1.0", "255.255.255.%1"})
            add("netmask", patterns::netmask, s(mask).arg(s(octet)), whole);
    }
    addAll("netmask", patterns::netmask,
           {{s(""), part},
            {s("255"), part},
            {s("255.255."), part},
            {s("255.0.0.0"), whole},
            {s("255.255.0.0"), whole},
            {s("255.255.255.0"), whole},
            {s("0.0.0.0"), wrong},
            {s("0"), wrong},
            {s("255.255.255.255"), wrong},
            {s("255.255.255.253"), wrong},
            {s("255.0.255.0"), wrong},
            {s("128.128.0.0"), wrong},
            {s("10.0.0.0"), wrong},
            {s("255.255.255.00"), wrong}});

    addAll("strict address", patterns::strictAddress,
           {{s(""), part},
            {s("192.168.1."), part},
            {s("192.168.1.1"), whole},
            {s("0.0.0.0"), whole},
            {s("255.255.255.255"), whole},
            {s("001.010.100.199"), whole},
            {s("256.0.0.1"), wrong},
            {s("192.168.1.256"), wrong},
            {s("192.168.300."), wrong},
            {s("192.168.1.1/24"), wrong},
            {s("192.168.1.1.1"), wrong},
            {s("host"), wrong}});

    addAll("loose address", patterns::looseAddress,
           {{s(""), part},
            {s("10.0.0"), part},
            {s("10.0.0.1"), whole},
            {s("999.999.999.999"), whole},
            {s("256.1.1.1"), whole},
            {s("1000."), wrong},
            {s("10.0.0.1234"), wrong},
            {s("10.0.0.1/8"), wrong},
            {s("10.0.0.1, 10.0.0.2"), wrong},
            {s("::1"), wrong}});

    addAll("host name", patterns::hostName,
           {{s(""), part},
            {s("host1"), part},
            {s("host1."), part},
            {s("host1.example"), whole},
            {s("host1.example.org"), whole},
            {s("a.b"), whole},
            {s("1.a"), whole},
            {s("my-host.example.org1"), whole},
            {s("host.1"), part},
            {s("host.1a.org"), whole},
            {s("host.1 "), wrong},
            {s("host.org-"), part},
            {s("host-"), part},
            {s("host-.org"), wrong},
            {s("-host"), wrong},
            {s("host name"), wrong},
            {s("host_1"), wrong},
            {s("host..org"), wrong}});

    const QString label63{63, QLatin1Char{'x'}};
    addAll("domain", patterns::domain,
           {{s(""), part},
            {s("example"), part},
            {s("example."), part},
            {s("example.o"), part},
            {s("example.org"), whole},
            {s("a.example.museum"), whole},
            {s("example.museums"), part},
            {s("example.museums.org"), whole},
            {s("1.org"), whole},
            {s("example.c0m"), part},
            {s("my-site.org"), whole},
            {s("my-.org"), wrong},
            {s("-site.org"), wrong},
            {s("\"example.org\""), wrong},
            {s("exa mple.org"), wrong},
            {label63 + s(".org"), whole},
            {label63, part},
            {label63 + s("x"), wrong},
            {label63 + s("x.org"), wrong}});
}

void PatternsTest::validatesTexts()
{
    QFETCH(Pattern, pattern);
    QFETCH(QString, text);
    QFETCH(QValidator::State, state);

    const QRegularExpressionValidator validator{pattern()};
    auto position = static_cast<int>(text.size());
    QCOMPARE(validator.validate(text, position), state);
}

void PatternsTest::octetIsFoundAnywhere_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<bool>("found");
    QTest::addRow("address") << QStringLiteral("10.0.0.1") << true;
    QTest::addRow("within words") << QStringLiteral("net 10. x") << true;
    QTest::addRow("no dot") << QStringLiteral("10") << false;
    QTest::addRow("no digit") << QStringLiteral("abc.") << false;
    QTest::addRow("four digits") << QStringLiteral("1000.") << false;
    QTest::addRow("digits that end a word") << QStringLiteral("abc10.") << false;
    QTest::addRow("nothing") << QString{} << false;
}

void PatternsTest::octetIsFoundAnywhere()
{
    QFETCH(QString, text);
    QFETCH(bool, found);
    QCOMPARE(text.contains(patterns::octet()), found);
}

QTEST_APPLESS_MAIN(PatternsTest)
#include "tst_patterns.moc"
