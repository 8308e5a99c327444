// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasesearch.h"

#include "leases/dhcpdleasesmodel.h"
#include "tests/leases/irregularleases.h"
#include "tests/leases/referencereader.h"
#include "tests/leases/variedleases.h"
#include "tests/support/temporaryroot.h"

#include <QRandomGenerator>
#include <QTemporaryDir>
#include <QTest>

namespace {

/// A model that has read a lease file of some text.
class LeasesOf final
{
public:
    explicit LeasesOf(const QByteArray &text)
    {
        const QString path{m_folder.filePath(QStringLiteral("dhcpd.leases"))};
        writeTestFile(path, text);
        m_model.reload(path);
        m_cells = rowsOf(m_model);
    }

    const DhcpdLeasesModel *operator->() const { return &m_model; }
    const DhcpdLeasesModel &operator*() const { return m_model; }

    QString cell(int row, int column) const { return m_cells[row][column]; }

private:
    QTemporaryDir m_folder;
    DhcpdLeasesModel m_model;
    LeaseRows m_cells;
};

} // namespace

class LeaseSearchTest final : public QObject
{
    Q_OBJECT

private slots:
    void cleanup() { QLocale::setDefault(QLocale::c()); }

    void findsWhatIsShown_data();
    void findsWhatIsShown();
    void findsAllPlacesOfAnAddress();
    void findsAllPartsOfATime_data();
    void findsAllPartsOfATime();
    void findsInTextsInAnyOrder();
    void looksOnlyAmongTheGiven();
    void findsNothingInAnEmptyTable();
};

void LeaseSearchTest::findsWhatIsShown_data()
{
    QTest::addColumn<QString>("locale");
    for (const char *locale : {"C", "en_US", "de_DE", "ar_EG", "fa_IR", "ja_JP", "tr_TR", "bg_BG", "fr_CA"})
        QTest::addRow("%s", locale) << QString::fromLatin1(locale);
}

/// Every cell is searched for every text, alone and all at once.
void LeaseSearchTest::findsWhatIsShown()
{
    QFETCH(const QString, locale);
    QLocale::setDefault(QLocale{locale});
    QRandomGenerator random{7};
    const LeasesOf leases{variedLeaseFile(random, 90)};
    QVERIFY(leases->rowCount() > 60);
    int found{0};
    for (const QString &text : searchTexts(random, *leases, 120)) {
        for (const Qt::CaseSensitivity sensitivity : {Qt::CaseSensitive, Qt::CaseInsensitive}) {
            const std::unique_ptr<LeaseSearch> search{leases->search({text, sensitivity})};
            const LeaseHits hits{search->find()};
            QVector<bool> isInRow(leases->rowCount());
            for (int column{0}; column < leases->columnCount(); ++column) {
                const LeaseHits columnHits{search->find(static_cast<LeaseColumn>(column))};
                bool isInColumn{false};
                for (int row{0}; row < leases->rowCount(); ++row) {
                    const QString cell{leases.cell(row, column)};
                    const bool expected{cell.contains(text, sensitivity)};
                    QVERIFY2(columnHits.contains(row) == expected,
                             qPrintable(QStringLiteral("'%1' in '%2'").arg(text, cell)));
                    isInRow[row] = isInRow[row] || expected;
                    isInColumn = isInColumn || expected;
                    found += expected ? 1 : 0;
                }
                QCOMPARE(columnHits.isEmpty(), !isInColumn);
            }
            for (int row{0}; row < leases->rowCount(); ++row) {
                QCOMPARE(search->contains(row), isInRow[row]);
                QCOMPARE(hits.contains(row), isInRow[row]);
            }
            QCOMPARE(hits.isEmpty(), !isInRow.contains(true));
        }
    }
    QVERIFY(found > 10'000);
}

void LeaseSearchTest::findsAllPlacesOfAnAddress()
{
    const LeasesOf leases{"lease 10.210.0.255 {\n}\n"};
    const QString address{QStringLiteral("10.210.0.255")};
    QCOMPARE(leases.cell(0, DhcpdLeasesModel::Address), address);
    for (int begin{0}; begin < address.size(); ++begin) {
        for (int length{1}; length <= address.size() - begin; ++length) {
            for (const char *added : {"", ".", "0", "1", "5", "255", "x"}) {
                for (const QString &text : {address.mid(begin, length) + QString::fromLatin1(added),
                                            QString::fromLatin1(added) + address.mid(begin, length)}) {
                    const std::unique_ptr<LeaseSearch> search{leases->search({text, Qt::CaseSensitive})};
                    QVERIFY2(search->find(LeaseColumn::Address).contains(0) == address.contains(text),
                             qPrintable(text));
                }
            }
        }
    }
}

void LeaseSearchTest::findsAllPartsOfATime_data() { findsWhatIsShown_data(); }

void LeaseSearchTest::findsAllPartsOfATime()
{
    QFETCH(const QString, locale);
    QLocale::setDefault(QLocale{locale});
    const LeasesOf leases{"lease 10.0.0.1 {\n  starts 6 2026/11/02 13:04:05;\n}\n"};
    const QString time{leases.cell(0, DhcpdLeasesModel::Start)};
    QVERIFY(time.size() > 10);
    for (int begin{0}; begin < time.size(); ++begin) {
        for (int length{1}; length <= time.size() - begin; ++length) {
            const QString part{time.mid(begin, length)};
            for (const QString &text : {part, part + QLatin1Char{' '}, QLatin1Char{' '} + part, part.toLower()}) {
                for (const Qt::CaseSensitivity sensitivity : {Qt::CaseSensitive, Qt::CaseInsensitive}) {
                    QVERIFY2(leases->search({text, sensitivity})->find(LeaseColumn::Start).contains(0) ==
                                 time.contains(text, sensitivity),
                             qPrintable(text));
                }
            }
        }
    }
}

/// Leases whose texts were read in another order than they are shown, and names that were taken over from before.
void LeaseSearchTest::findsInTextsInAnyOrder()
{
    QByteArray text;
    for (int i{0}; i < 2000; ++i) {
        text += "lease 10.0." + QByteArray::number(i * 7 % 251) + '.' + QByteArray::number(i * 11 % 241) + " {\n";
        if (i % 5 == 0)
            text += "  client-hostname \"" + QByteArray(i * 13 % 90, 'a') + QByteArray::number(i) + "\";\n";
        if (i % 3 == 0)
            text += "  binding state state" + QByteArray::number(i % 50) + ";\n";
        text += "}\n";
    }
    const LeasesOf leases{text};
    for (const char *wanted : {"100", "a5", "aaaaaa1", "state48", "e3", "state", "q", "1990", "5", "A1"}) {
        const QString needle{QString::fromLatin1(wanted)};
        const LeaseHits hits{leases->search({needle, Qt::CaseSensitive})->find()};
        for (int row{0}; row < leases->rowCount(); ++row) {
            bool expected{false};
            for (int column{0}; column < leases->columnCount(); ++column)
                expected = expected || leases.cell(row, column).contains(needle);
            QVERIFY2(hits.contains(row) == expected, wanted);
        }
    }
}

void LeaseSearchTest::looksOnlyAmongTheGiven()
{
    const LeasesOf leases{leaseBlock(0, 1, 0) + leaseBlock(0, 2, 1) + leaseBlock(0, 3, 2)};
    const LeaseHits active{leases->search({QStringLiteral("active"), Qt::CaseSensitive})->find()};
    const LeaseHits hosts{
        leases->search({QStringLiteral("HOST"), Qt::CaseInsensitive})->find(LeaseColumn::HostName, &active)};
    QVERIFY(hosts.contains(0));
    QVERIFY(!hosts.contains(1));
    QVERIFY(hosts.contains(2));
    QVERIFY(!hosts.isEmpty());
}

void LeaseSearchTest::findsNothingInAnEmptyTable()
{
    const LeasesOf leases{QByteArray{}};
    for (const char *text : {"", "1", "host"}) {
        const std::unique_ptr<LeaseSearch> search{leases->search({QString::fromLatin1(text), Qt::CaseInsensitive})};
        QVERIFY(search->find().isEmpty());
        QVERIFY(search->find(LeaseColumn::HostName).isEmpty());
    }
}

QTEST_GUILESS_MAIN(LeaseSearchTest)
#include "tst_leasesearch.moc"
