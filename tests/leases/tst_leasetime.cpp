// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasetime.h"

#include "leases/leasetimetexts.h"
#include "leases/timeofdaytexts.h"
#include "tests/leases/longtime.h"

#include <QDateTime>
#include <QProcess>
#include <QRandomGenerator>
#include <QTest>

#include <ctime>

namespace {

LeaseTime parsed(const QByteArray &date, const QByteArray &time)
{
    return LeaseTime::parse({date.constData(), static_cast<std::size_t>(date.size())},
                            {time.constData(), static_cast<std::size_t>(time.size())});
}

/// While this exists, the local time zone is another one.
class LocalZone final
{
public:
    explicit LocalZone(const QByteArray &name) { set(name); }
    ~LocalZone() { set(m_old); }
    Q_DISABLE_COPY_MOVE(LocalZone)

private:
    static void set(const QByteArray &name)
    {
        qputenv("TZ", name);
        tzset();
    }

    QByteArray m_old{qgetenv("TZ")};
};

} // namespace

class LeaseTimeTest final : public QObject
{
    Q_OBJECT

private slots:
    void cleanup();
    void takesWhatQtTakes();
    void knowsTheUsualLayout();
    void isShownAsItStands_data();
    void isShownAsItStands();
    void isShownInAnyYear_data();
    void isShownInAnyYear();
    void isShownInTheDefaultLocale_data();
    void isShownInTheDefaultLocale();
    void hasNoTextIfInvalid();
    void remembersNoWrongTexts();
    void namesUtcWhateverTheLocalZone_data();
    void namesUtcWhateverTheLocalZone();
    void knowsAllTimesOfDayInAllLocales();
    void isShownInTheSystemsLocale();
    void followsTheEnvironment_data();
    void followsTheEnvironment();
};

void LeaseTimeTest::cleanup() { QLocale::setDefault(QLocale::c()); }

void LeaseTimeTest::takesWhatQtTakes()
{
    const QString characters{QStringLiteral("0123456789/: -+.aT\t") + QChar{0x663} + QChar{0xA0} + QChar{0}};
    QRandomGenerator random{4};
    int valid{0};
    for (int i{0}; i < 100'000; ++i) {
        QString text{QStringLiteral("2024/02/28 11:45:30")};
        for (int change{random.bounded(3)}; change >= 0; --change) {
            const QString::size_type place{random.bounded(text.size())};
            const QChar character{characters[random.bounded(characters.size())]};
            switch (random.bounded(6)) {
            case 0:
                text.remove(place, 1);
                break;
            case 1:
                text.insert(place, character);
                break;
            default:
                text[place] = character;
            }
        }
        const QStringList words{text.split(QLatin1Char{' '})};
        if (words.size() != 2)
            continue;
        const QDateTime expected{QDateTime::fromString(text, QStringLiteral("yyyy/MM/dd hh:mm:ss"))};
        const LeaseTime time{parsed(words[0].toUtf8(), words[1].toUtf8())};
        // Qt 6 reads years before our era as well.
        const bool isValid{expected.isValid() && expected.date().year() > 0};
        QVERIFY2(time.isValid() == isValid, qPrintable(text));
        if (time.isValid()) {
            ++valid;
            QCOMPARE(time.date(), expected.date());
            QCOMPARE(time.time(), expected.time());
        }
        const QByteArray bytes{text.toUtf8()};
        if (bytes.size() == int{LeaseTime::usualLength} && LeaseTime::hasUsualLayout(bytes.constData())) {
            const LeaseTime usual{LeaseTime::fromUsualLayout(bytes.constData())};
            QVERIFY2(usual.isValid() == expected.isValid(), bytes.constData());
            QCOMPARE(usual.dateKey(), time.dateKey());
            QCOMPARE(usual.timeKey(), time.timeKey());
        }
    }
    QVERIFY(valid > 1000);
}

/// Every byte at every place of a text of the usual layout.
void LeaseTimeTest::knowsTheUsualLayout()
{
    const QByteArray usual{"2024/02/28 19:45:30"};
    QCOMPARE(usual.size(), int{LeaseTime::usualLength});
    for (int place{0}; place < usual.size(); ++place) {
        const bool isDigit{usual[place] >= '0' && usual[place] <= '9'};
        for (int byte{0}; byte < 256; ++byte) {
            QByteArray text{usual};
            text[place] = static_cast<char>(byte);
            const bool isUsual{isDigit ? byte >= '0' && byte <= '9' : text == usual};
            QCOMPARE(LeaseTime::hasUsualLayout(text.constData()), isUsual);
        }
    }
}

void LeaseTimeTest::isShownAsItStands_data()
{
    QTest::addColumn<QByteArray>("zone");
    QTest::addColumn<QByteArray>("date");
    QTest::addRow("skipped in Berlin") << QByteArray{"Europe/Berlin"} << QByteArray{"2026/03/29"};
    QTest::addRow("skipped in New York") << QByteArray{"America/New_York"} << QByteArray{"2026/03/08"};
    QTest::addRow("twice in Berlin") << QByteArray{"Europe/Berlin"} << QByteArray{"2026/10/25"};
    QTest::addRow("UTC") << QByteArray{"UTC"} << QByteArray{"2026/03/29"};
}

void LeaseTimeTest::isShownAsItStands()
{
    QFETCH(const QByteArray, zone);
    QFETCH(const QByteArray, date);
    const LocalZone local{zone};
    const LeaseTime usual{LeaseTime::fromUsualLayout((date + " 02:30:00").constData())};
    for (const LeaseTime time : {parsed(date, "02:30:00"), usual}) {
        QCOMPARE(time.date(), QDate::fromString(QString::fromLatin1(date), QStringLiteral("yyyy/MM/dd")));
        QCOMPARE(time.time(), QTime(2, 30));
        QVERIFY(LeaseTimeTexts{}.text(time).startsWith(QLatin1String{"02:30:00"}));
    }
}

/// Also where a number of seconds since 1970 would be negative, or more than 31 or 32 bits hold.
void LeaseTimeTest::isShownInAnyYear_data()
{
    QTest::addColumn<QByteArray>("date");
    QTest::addColumn<QByteArray>("time");
    QTest::addColumn<QString>("text");
    const auto addRow = [](const char *date, const char *time, const char *text) {
        QTest::addRow("%s %s", date, time) << QByteArray{date} << QByteArray{time} << QString::fromUtf8(text);
    };
    addRow("0001/01/01", "00:00:00", "00:00:00 UTC 1 Jan 0001");
    addRow("1901/12/13", "20:45:51", "20:45:51 UTC 13 Dec 1901");
    addRow("1969/12/31", "23:59:59", "23:59:59 UTC 31 Dec 1969");
    addRow("1970/01/01", "00:00:00", "00:00:00 UTC 1 Jan 1970");
    addRow("2038/01/19", "03:14:08", "03:14:08 UTC 19 Jan 2038");
    addRow("2106/02/07", "06:28:16", "06:28:16 UTC 7 Feb 2106");
    addRow("9999/12/31", "23:59:59", "23:59:59 UTC 31 Dec 9999");
    addRow("0000/01/01", "00:00:00", "");
}

void LeaseTimeTest::isShownInAnyYear()
{
    QFETCH(const QByteArray, date);
    QFETCH(const QByteArray, time);
    QFETCH(const QString, text);
    QCOMPARE(LeaseTimeTexts{}.text(parsed(date, time)), text);
    QCOMPARE(LeaseTimeTexts{}.text(LeaseTime::fromUsualLayout((date + ' ' + time).constData())), text);
}

void LeaseTimeTest::isShownInTheDefaultLocale_data()
{
    QTest::addColumn<QString>("locale");
    for (const char *locale : {"C", "en_US", "en_GB", "de_DE", "ru_RU", "ar_EG", "ja_JP"})
        QTest::addRow("%s", locale) << QString::fromLatin1(locale);
}

void LeaseTimeTest::isShownInTheDefaultLocale()
{
    QFETCH(const QString, locale);
    QLocale::setDefault(QLocale{locale});
    const QDate date{2026, 1, 2};
    const QTime time{13, 4, 5};
    QCOMPARE(LeaseTimeTexts{}.text(parsed("2026/01/02", "13:04:05")),
             longTime(QLocale{locale}, time) + QLatin1Char{' '} +
                 QLocale{locale}.toString(date, QLocale::NarrowFormat));
}

void LeaseTimeTest::hasNoTextIfInvalid()
{
    QVERIFY(!LeaseTime{}.isValid());
    QCOMPARE(LeaseTimeTexts{}.text(LeaseTime{}), QString{});
    QCOMPARE(LeaseTimeTexts{}.text(parsed("never", "")), QString{});
}

void LeaseTimeTest::remembersNoWrongTexts()
{
    LeaseTimeTexts texts;
    const LeaseTime time{parsed("2026/01/02", "13:04:05")};
    const QString english{texts.text(time)};
    QLocale::setDefault(QLocale{QStringLiteral("de_DE")});
    const QString german{texts.text(time)};
    QVERIFY(german != english);
    QCOMPARE(german, LeaseTimeTexts{}.text(time));

    // More days than are remembered.
    for (QDate day{1990, 1, 1}; day.year() < 2030; day = day.addDays(1)) {
        const QByteArray date{day.toString(QStringLiteral("yyyy/MM/dd")).toLatin1()};
        QVERIFY(texts.text(parsed(date, "13:04:05")).endsWith(QLocale{}.toString(day, QLocale::NarrowFormat)));
    }
    QCOMPARE(texts.text(time), german);
}

void LeaseTimeTest::namesUtcWhateverTheLocalZone_data()
{
    QTest::addColumn<QByteArray>("zone");
    QTest::addColumn<QString>("locale");
    QTest::addColumn<QString>("text");
    const auto addRow = [](const char *zone, const char *locale, const char *text) {
        QTest::addRow("%s in %s", locale, zone)
            << QByteArray{zone} << QString::fromUtf8(locale) << QString::fromUtf8(text);
    };
    for (const char *zone : {"UTC", "CET-1", "CET-1CEST,0/0,J365/23", "Asia/Kolkata", "<+0330>-3:30"}) {
        addRow(zone, "C", "13:04:05 UTC 2 Jan 2026");
        addRow(zone, "de_DE", "13:04:05 UTC 02.01.26");
        addRow(zone, "en_US", "1:04:05 PM UTC 1/2/26");
    }
}

void LeaseTimeTest::namesUtcWhateverTheLocalZone()
{
    QFETCH(const QByteArray, zone);
    QFETCH(const QString, locale);
    QFETCH(const QString, text);
    const LocalZone local{zone};
    QLocale::setDefault(QLocale{locale});
    QCOMPARE(LeaseTimeTexts{}.text(parsed("2026/01/02", "13:04:05")), text);
}

void LeaseTimeTest::knowsAllTimesOfDayInAllLocales()
{
    QRandomGenerator random{5};
    const QList<QLocale> locales{
        QLocale::matchingLocales(QLocale::AnyLanguage, QLocale::AnyScript, QLocale::AnyCountry)};
    QVERIFY(locales.size() > 100);
    for (const QLocale &locale : locales) {
        const TimeOfDayTexts texts{locale};
        for (int second{0}; second < 24 * 60 * 60; second += random.bounded(1, 1000)) {
            const QTime time{QTime::fromMSecsSinceStartOfDay(second * 1000)};
            QCOMPARE(texts.text(time), longTime(locale, time));
        }
    }
}

/// Whatever that is here; the next test runs this one in other environments.
void LeaseTimeTest::isShownInTheSystemsLocale()
{
    const QLocale locale{QLocale::system()};
    QLocale::setDefault(locale);
    for (const int hour : {0, 4, 12, 23}) {
        const QTime time{hour, 16, 38};
        const LeaseTime leaseTime{
            parsed("2026/01/02", QLocale::c().toString(time, QStringLiteral("hh:mm:ss")).toLatin1())};
        QCOMPARE(LeaseTimeTexts{}.text(leaseTime),
                 longTime(locale, time) + QLatin1Char{' '} + locale.toString(QDate{2026, 1, 2}, QLocale::NarrowFormat));
    }
}

void LeaseTimeTest::followsTheEnvironment_data()
{
    QTest::addColumn<QStringList>("variables");
    QTest::newRow("one language") << QStringList{QStringLiteral("LANG=de_DE.UTF-8")};
    QTest::newRow("other times") << QStringList{QStringLiteral("LANG=ar_EG.UTF-8"),
                                                QStringLiteral("LC_TIME=en_US.UTF-8")};
    QTest::newRow("other digits of times")
        << QStringList{QStringLiteral("LANG=en_US.UTF-8"), QStringLiteral("LC_TIME=fa_IR.UTF-8")};
    QTest::newRow("other numbers") << QStringList{QStringLiteral("LANG=en_US.UTF-8"),
                                                  QStringLiteral("LC_NUMERIC=fa_IR")};
    QTest::newRow("all") << QStringList{QStringLiteral("LANG=en_US"), QStringLiteral("LC_TIME=de_DE"),
                                        QStringLiteral("LC_ALL=fa_IR")};
    QTest::newRow("none") << QStringList{};
}

void LeaseTimeTest::followsTheEnvironment()
{
    QFETCH(const QStringList, variables);
    QProcessEnvironment environment{QProcessEnvironment::systemEnvironment()};
    for (const char *variable : {"LC_ALL", "LC_TIME", "LC_NUMERIC", "LANG", "LANGUAGE"})
        environment.remove(QString::fromLatin1(variable));
    for (const QString &variable : variables)
        environment.insert(variable.section(QLatin1Char{'='}, 0, 0), variable.section(QLatin1Char{'='}, 1));
    QProcess itself;
    itself.setProcessEnvironment(environment);
    itself.start(QCoreApplication::applicationFilePath(), {QStringLiteral("isShownInTheSystemsLocale")});
    QVERIFY(itself.waitForFinished(-1));
    QVERIFY2(itself.exitStatus() == QProcess::NormalExit && itself.exitCode() == 0,
             itself.readAllStandardOutput().constData());
}

QTEST_GUILESS_MAIN(LeaseTimeTest)
#include "tst_leasetime.moc"
